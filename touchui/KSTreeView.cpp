#include "touchui/KSTreeView.h"

#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSTreeHeaderView.h"
#include "touchui/KSTreeModel.h"
#include "touchui/TreeCheckStates.h"

#include <QApplication>
#include <QFontMetrics>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>
#include <QTouchEvent>

namespace
{

// Wide enough for a finger, and without arrow buttons.
const char SCROLL_BAR_STYLE[] =
    "QScrollBar { margin: 0px; border: 0px; background-color: rgb(51, 51, 51) }"
    "QScrollBar:vertical { width: 32px } QScrollBar:horizontal { height: 32px }"
    "QScrollBar::add-line, QScrollBar::sub-line { width: 0px; height: 0px }"
    "QScrollBar::handle:vertical { min-height: 42px } QScrollBar::handle:horizontal { min-width: 42px }";

} // namespace

QStringList KSTreeView::s_checkBoxImagesPath = {
    QStringLiteral(":/CheckBox/Checkbox_On_Rest"),
    QStringLiteral(":/CheckBox/Checkbox_On_Pressed"),
    QStringLiteral(":/CheckBox/Checkbox_On_Disabled"),
    QStringLiteral(":/CheckBox/Checkbox_Off_Rest"),
    QStringLiteral(":/CheckBox/Checkbox_Off_Pressed"),
    QStringLiteral(":/CheckBox/Checkbox_Off_Disabled"),
    QStringLiteral(":/CheckBox/Checkbox_Partial_Rest"),
    QStringLiteral(":/CheckBox/Checkbox_Partial_Pressed"),
    QStringLiteral(":/CheckBox/Checkbox_Partial_Disabled"),
};

KSTreeView::KSTreeView(QWidget* parent)
    : QTreeView(parent)
    , m_viewStyle(std::make_unique<KSViewStyle>(this))
    , m_delegate(new CustomTreeDelegete(this))
{
    setStyle(m_viewStyle.get());
    setItemDelegate(m_delegate);
    setHeader(new KSTreeHeaderView(this));
    initScrollBars();
    setFrameShape(QFrame::NoFrame);
    viewport()->setStyleSheet(QStringLiteral("background-color: rgb(51, 51, 51)"));
    setAttribute(Qt::WA_AcceptTouchEvents);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    setIndentation(getDesignAttribute(KSVIEW::DesignIndentation).toInt());
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setExpandsOnDoubleClick(false);
    setTextElideMode(Qt::ElideRight);
    connect(&m_finger, &OneFinger::held, this, &KSTreeView::slotHold);
    connect(&m_finger, &OneFinger::cancelled, this, &KSTreeView::rest);
    connect(&m_flicker, &Flicker::started, this, &KSTreeView::motionStarted);
    connect(&m_flicker, &Flicker::ticked, this, [this] { changeScrollBarValue(getDistance().y()); });
    connect(&m_flicker, &Flicker::ended, this, &KSTreeView::showLastRowWhole);
    connect(this, &KSTreeView::editorEvent, this,
            static_cast<void (QAbstractItemView::*)(const QModelIndex&)>(&QAbstractItemView::edit));
}

KSTreeView::~KSTreeView()
{
    setStyle(nullptr); // this view's style is destroyed before the base class
}

void KSTreeView::initScrollBars()
{
    setVerticalScrollBar(new KSScrollBar(Qt::Vertical, this));
    setHorizontalScrollBar(new KSScrollBar(Qt::Horizontal, this));
    for (QScrollBar* bar : {verticalScrollBar(), horizontalScrollBar()})
        bar->setStyleSheet(QLatin1String(SCROLL_BAR_STYLE));
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
}

void KSTreeView::setModel(QAbstractItemModel* model)
{
    cancelPress();
    stopFlick();
    m_treeModel = qobject_cast<KSTreeModel*>(model);
    m_loadingMarks.setModel(m_treeModel);
    QTreeView::setModel(model);
}

QVariant KSTreeView::getDefaultDesignAttribute(KSVIEW::enumDesignAttributeRole role) const
{
    switch (role) {
    case KSVIEW::DesignRowHeight:
        return 48;
    case KSVIEW::DesignHeaderHeight:
        return 44;
    case KSVIEW::DesignIndentation:
        return 40;
    case KSVIEW::DesignIndicatorSize:
    case KSVIEW::DesignCheckBoxSize:
    case KSVIEW::DesignIconSize:
        return 28;
    case KSVIEW::DesignItemSpacing:
        return 10;
    case KSVIEW::DesignFontSize:
        return 24;
    case KSVIEW::DesignTextColor:
    case KSVIEW::DesignHeaderTextColor:
        return QColor(220, 220, 220);
    case KSVIEW::DesignSelectedTextColor:
        return QColor(255, 255, 255);
    case KSVIEW::DesignDisabledTextColor:
        return QColor(102, 102, 102);
    case KSVIEW::DesignOperationColor:
        return QColor(0, 186, 230);
    case KSVIEW::DesignAttributeCount:
        break;
    }
    return QVariant();
}

QVariant KSTreeView::getDesignAttribute(KSVIEW::enumDesignAttributeRole role) const
{
    const auto found = m_designAttributes.constFind(role);
    return found != m_designAttributes.constEnd() ? *found : getDefaultDesignAttribute(role);
}

void KSTreeView::setDesignAttribute(KSVIEW::enumDesignAttributeRole role, const QVariant& value)
{
    m_designAttributes.insert(role, value);
    setIndentation(getDesignAttribute(KSVIEW::DesignIndentation).toInt());
    scheduleDelayedItemsLayout();
    viewport()->update();
    header()->viewport()->update();
}

int KSTreeView::rowHeightOf(const QModelIndex& index) const
{
    const int own = m_treeModel != nullptr ? m_treeModel->getItemHeight(index) : 0;
    return own > 0 ? own : getDesignAttribute(KSVIEW::DesignRowHeight).toInt();
}

QColor KSTreeView::headerTextColor(int section) const
{
    const QColor own = m_treeModel != nullptr ? m_treeModel->getHeaderTextColor(section) : QColor();
    return own.isValid() ? own : getDesignAttribute(KSVIEW::DesignHeaderTextColor).value<QColor>();
}

bool KSTreeView::insertRows(int row, int count, const QModelIndex& parent)
{
    return model() != nullptr && model()->insertRows(row, count, parent);
}

bool KSTreeView::moveToSibling(QModelIndex sibling)
{
    const QModelIndex current = currentIndex();
    if (!current.isValid() || !sibling.isValid() || sibling.model() != model() ||
        current.parent() != sibling.parent())
        return false;
    const int behind = sibling.row() + 1;
    if (behind == current.row() || behind == current.row() + 1)
        return true; // it is there already, or it is the sibling itself
    return model()->moveRow(current.parent(), current.row(), sibling.parent(), behind);
}

// --- Geometry -----------------------------------------------------------------------------------------

QRect KSTreeView::firstCellRect(const QModelIndex& index) const
{
    return visualRect(index.siblingAtColumn(0));
}

KSViewStyle::FirstColumnLayout KSTreeView::getLayoutForFirstColumn(const QRect& cell,
                                                                   const QModelIndex& index) const
{
    const QModelIndex first = index.siblingAtColumn(0);
    const bool checkable = m_checkBoxVisible && m_treeModel != nullptr && m_treeModel->getCheckable(first);
    const bool hasIcon =
        first.data(Qt::DecorationRole).isValid() || first.data(KSVIEW::ItemLoadingRole).toInt() > 0;
    const bool recording = m_treeModel != nullptr && m_treeModel->isRecording(first);
    return m_viewStyle->layoutFirstColumn(cell, checkable, hasIcon, recording);
}

QRect KSTreeView::getCheckBoxRect(const QModelIndex& index) const
{
    const QRect cell = firstCellRect(index);
    return cell.isValid() ? getLayoutForFirstColumn(cell, index).checkBox : QRect();
}

QRect KSTreeView::getCheckBoxRectForTouch(const QModelIndex& index) const
{
    const QRect box = getCheckBoxRect(index);
    if (box.isNull())
        return QRect();
    const QRect row = getIndexVisualRect(index);
    const int margin = getDesignAttribute(KSVIEW::DesignItemSpacing).toInt() / 2;
    return QRect(box.left() - margin, row.top(), box.width() + 2 * margin, row.height());
}

QRect KSTreeView::getIndicatorRect(const QModelIndex& index) const
{
    const QRect cell = firstCellRect(index);
    if (!cell.isValid() || !model()->hasChildren(index.siblingAtColumn(0)))
        return QRect();
    return getLayoutForFirstColumn(cell, index).indicator;
}

QRect KSTreeView::indicatorRectForTouch(const QModelIndex& index) const
{
    const QRect indicator = getIndicatorRect(index);
    if (indicator.isNull())
        return QRect();
    const QRect row = getIndexVisualRect(index);
    const int width = getDesignAttribute(KSVIEW::DesignIndentation).toInt();
    return QRect(indicator.center().x() - width / 2, row.top(), width, row.height());
}

QRect KSTreeView::getIndexVisualRect(const QModelIndex& index) const
{
    const QRect cell = firstCellRect(index);
    return cell.isValid() ? QRect(0, cell.top(), viewport()->width(), cell.height()) : QRect();
}

QRect KSTreeView::getEmptyArea() const
{
    int top = 0;
    if (model() != nullptr) {
        QModelIndex last = rootIndex();
        for (;;) {
            const bool open = last == rootIndex() || isExpanded(last);
            const int rows = open ? model()->rowCount(last) : 0;
            if (rows == 0)
                break;
            last = model()->index(rows - 1, 0, last);
        }
        if (last != rootIndex())
            top = visualRect(last).bottom() + 1;
    }
    return top < viewport()->height() ? QRect(0, top, viewport()->width(), viewport()->height() - top)
                                      : QRect();
}

bool KSTreeView::isTextElide(const QModelIndex& index) const
{
    const QRect cell = visualRect(index);
    if (!cell.isValid())
        return false;
    const QRect text =
        index.column() == 0 ? getLayoutForFirstColumn(cell, index).text : m_viewStyle->textRect(cell);
    QStyleOptionViewItem option;
    initViewItemOption(&option);
    option.index = index;
    const QVariant font = index.data(Qt::FontRole);
    if (font.isValid())
        option.font = qvariant_cast<QFont>(font).resolve(option.font);
    return QFontMetrics(m_viewStyle->itemFont(option))
               .horizontalAdvance(index.data(Qt::DisplayRole).toString()) > text.width();
}

// --- Painting -----------------------------------------------------------------------------------------

void KSTreeView::paintEvent(QPaintEvent* event)
{
    QTreeView::paintEvent(event);
    QPainter painter(viewport());
    drawOnEmptyArea(&painter);
}

void KSTreeView::drawOnEmptyArea(QPainter* painter)
{
    const QRect area = getEmptyArea();
    const int height = getDesignAttribute(KSVIEW::DesignRowHeight).toInt();
    for (int y = area.top(); !area.isNull() && height > 0 && y <= area.bottom(); y += height)
        drawEmptyRow(painter, QRect(area.left(), y, area.width(), height));
}

void KSTreeView::drawEmptyRow(QPainter* painter, const QRect& rect)
{
    m_viewStyle->drawHorizontalSeparator(painter, rect);
}

void KSTreeView::drawRow(QPainter* painter, const QStyleOptionViewItem& option,
                         const QModelIndex& index) const
{
    const QRect row(0, option.rect.top(), viewport()->width(), option.rect.height());
    const bool selected =
        selectionModel() != nullptr && selectionModel()->isRowSelected(index.row(), index.parent());
    if (selected)
        m_viewStyle->drawSelectedBackground(painter, row);
    QTreeView::drawRow(painter, option, index);
    m_viewStyle->drawHorizontalSeparator(painter, row);
    if (m_renameIndex.isValid() && m_renameIndex.row() == index.row() &&
        m_renameIndex.parent() == index.parent())
        m_viewStyle->drawOperationFocus(painter, row);
}

void KSTreeView::drawBranches(QPainter* painter, const QRect&, const QModelIndex& index) const
{
    if (!model()->hasChildren(index))
        return;
    QStyleOption option;
    option.rect = getIndicatorRect(index);
    option.state = QStyle::State_Children;
    option.state.setFlag(QStyle::State_Open, isExpanded(index));
    option.state.setFlag(QStyle::State_Enabled, isUsable(index));
    option.state.setFlag(QStyle::State_Sunken, isIndicatorPressed(index));
    m_viewStyle->drawPrimitive(QStyle::PE_IndicatorBranch, &option, painter, this);
}

bool KSTreeView::isUsable(const QModelIndex& index) const
{
    return isEnabled() && index.isValid() && (model()->flags(index) & Qt::ItemIsEnabled);
}

bool KSTreeView::isIndicatorPressed(const QModelIndex& index) const
{
    return m_pressedIndicator.isValid() && m_pressedIndicator == index.siblingAtColumn(0);
}

// --- Editing ------------------------------------------------------------------------------------------

bool KSTreeView::edit(const QModelIndex& index, EditTrigger trigger, QEvent* event)
{
    const bool opened = QTreeView::edit(index, trigger, event);
    if (opened && state() == QAbstractItemView::EditingState)
        setRenameIndex(index);
    return opened;
}

void KSTreeView::setRenameIndex(QModelIndex index)
{
    m_renameIndex = index;
    viewport()->update();
}

void KSTreeView::closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint)
{
    setRenameIndex(QModelIndex());
    QTreeView::closeEditor(editor, hint);
}

void KSTreeView::closeEditorState(QWidget* editor, QAbstractItemDelegate::EndEditHint hint)
{
    if (editor == nullptr || editor->parentWidget() != viewport() || !m_renameIndex.isValid())
        return;
    if (hint != QAbstractItemDelegate::RevertModelCache)
        commitData(editor);
    closeEditor(editor, hint);
}

// Skips the base class, which would make the first row current.
void KSTreeView::focusInEvent(QFocusEvent* event)
{
    QAbstractScrollArea::focusInEvent(event);
    viewport()->update();
}

void KSTreeView::keyPressEvent(QKeyEvent* event)
{
    switch (event->key()) {
    case Qt::Key_Space:
    case Qt::Key_Home:
    case Qt::Key_End:
    case Qt::Key_Left:
    case Qt::Key_Right:
    case Qt::Key_Up:
    case Qt::Key_Down:
    case Qt::Key_PageUp:
    case Qt::Key_PageDown:
        event->accept();
        return;
    default:
        QTreeView::keyPressEvent(event);
    }
}

// --- Check boxes --------------------------------------------------------------------------------------

KSTreeView::CheckBoxImage KSTreeView::getCheckBoxImageType(const QModelIndex& index) const
{
    int family = OffRest;
    switch (index.data(Qt::CheckStateRole).toInt()) {
    case Qt::Checked:
        family = OnRest;
        break;
    case Qt::PartiallyChecked:
        family = PartialRest;
        break;
    default:
        break;
    }
    int state = 0;
    if (!isUsable(index))
        state = OnDisabled;
    else if (m_pressedCheckBox.isValid() && m_pressedCheckBox == index.siblingAtColumn(0))
        state = OnPressed;
    return static_cast<CheckBoxImage>(family + state);
}

void KSTreeView::changeCheckState(const QModelIndex& index)
{
    const QModelIndex first = index.siblingAtColumn(0);
    if (m_treeModel != nullptr && isUsable(first) && m_treeModel->getCheckable(first))
        TreeCheckStates(*m_treeModel).toggle(first);
}

void KSTreeView::changeChildrenCheckState(const QModelIndex& index, Qt::CheckState state)
{
    if (m_treeModel != nullptr)
        TreeCheckStates(*m_treeModel).setChildren(index, state);
}

void KSTreeView::changeParentsCheckState(const QModelIndex& index)
{
    if (m_treeModel != nullptr)
        TreeCheckStates(*m_treeModel).updateParents(index);
}

void KSTreeView::changeCheckStateByNumber(const QModelIndex& index, int number)
{
    if (m_treeModel != nullptr)
        TreeCheckStates(*m_treeModel).setByNumber(index, number);
}

void KSTreeView::setCheckBoxVisible(bool visible)
{
    m_checkBoxVisible = visible;
    m_pressedCheckBox = QModelIndex();
    viewport()->update();
}

// --- Loading and recording ----------------------------------------------------------------------------

QString KSTreeView::getLoadingImagePath(int step) const
{
    return TreeLoadingMarks::imagePath(step);
}

void KSTreeView::dataChanged(const QModelIndex& topLeft, const QModelIndex& bottomRight,
                             const QList<int>& roles)
{
    QTreeView::dataChanged(topLeft, bottomRight, roles);
    if (roles.contains(KSVIEW::ItemLoadingRole) && topLeft.data(KSVIEW::ItemLoadingRole).toInt() > 0)
        m_loadingMarks.start();
}

void KSTreeView::slotUpdateLoadingIcon()
{
    m_loadingMarks.turn();
}

void KSTreeView::clearAllLoadingState()
{
    m_loadingMarks.stop();
    if (m_treeModel != nullptr)
        m_treeModel->setAttributeOfAll(KSVIEW::ItemLoadingRole, 0);
}

void KSTreeView::clearRecording()
{
    if (m_treeModel != nullptr)
        m_treeModel->setAttributeOfAll(KSVIEW::ItemRecordingRole, false);
}

void KSTreeView::showElidedText(const QModelIndex& index)
{
    const QRect row = getIndexVisualRect(index);
    const QRect cell = visualRect(index);
    const QRect text =
        index.column() == 0 ? getLayoutForFirstColumn(cell, index).text : m_viewStyle->textRect(cell);
    m_elidedText.show(QRect(viewport()->mapToGlobal(row.topLeft()), row.size()),
                      index.data(Qt::DisplayRole).toString(), text.width());
}

// --- Touch --------------------------------------------------------------------------------------------

bool KSTreeView::event(QEvent* event)
{
    if (OneFinger::isTouch(event))
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    return event->type() == QEvent::Gesture || QTreeView::event(event);
}

bool KSTreeView::viewportEvent(QEvent* event)
{
    if (OneFinger::isTouch(event))
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    return event->type() == QEvent::Gesture || QTreeView::viewportEvent(event);
}

bool KSTreeView::onTouchEvent(QTouchEvent* event)
{
    event->accept();
    switch (m_finger.follow(event)) {
    case OneFinger::Step::Begin:
        return onTouchBeginEvent(event);
    case OneFinger::Step::Move:
        return onTouchUpdateEvent(event);
    case OneFinger::Step::End:
        return onTouchEndEvent(event);
    case OneFinger::Step::None:
        return true;
    }
    return true;
}

QPoint KSTreeView::fingerPosition() const
{
    return m_finger.positionIn(viewport()).toPoint();
}

bool KSTreeView::onTouchBeginEvent(QTouchEvent*)
{
    const QPoint point = fingerPosition();
    const bool brake = isAutoFilck();
    m_flicker.begin(point);
    if (!brake)
        sendMouse(QEvent::MouseButtonPress, point);
    return true;
}

bool KSTreeView::onTouchUpdateEvent(QTouchEvent*)
{
    const QPoint point = fingerPosition();
    m_flicker.follow(point);
    sendMouse(QEvent::MouseMove, point);
    return true;
}

bool KSTreeView::onTouchEndEvent(QTouchEvent* event)
{
    m_flicker.lift(fingerPosition());
    onTranslateTouchEndEventToMouse(event);
    return true;
}

void KSTreeView::onTranslateTouchEndEventToMouse(QTouchEvent*)
{
    sendMouse(QEvent::MouseButtonRelease, fingerPosition());
}

// Ends the press without a tap and stops any motion.
void KSTreeView::rest()
{
    m_flicker.cancel();
    cancelPress();
    m_elidedText.hide();
}

void KSTreeView::sendMouse(QEvent::Type type, const QPoint& point)
{
    QMouseEvent mouse = OneFinger::mouseEvent(type, point, viewport()->mapToGlobal(point));
    m_sendingMouse = true;
    if (type == QEvent::MouseButtonPress)
        mousePressEvent(&mouse);
    else if (type == QEvent::MouseButtonRelease)
        mouseReleaseEvent(&mouse);
    else
        mouseMoveEvent(&mouse);
    m_sendingMouse = false;
}

// --- Mouse, including touches that are passed on as mouse events --------------------------------------

void KSTreeView::mousePressEvent(QMouseEvent* event)
{
    event->accept();
    const QPoint point = event->position().toPoint();
    if (event->button() != Qt::LeftButton || (!m_sendingMouse && m_finger.isDown()))
        return;
    if (!m_sendingMouse) {
        const bool brake = isAutoFilck();
        m_flicker.begin(point);
        if (brake)
            return;
    }
    beginPress(point);
}

void KSTreeView::mouseMoveEvent(QMouseEvent* event)
{
    event->accept();
    const QPoint point = event->position().toPoint();
    if (!m_sendingMouse && (event->buttons() & Qt::LeftButton) && !m_finger.isDown())
        m_flicker.follow(point);
    if (m_pressState == NotPressed)
        return;
    if ((point - m_pressPoint).manhattanLength() > QApplication::startDragDistance()) {
        m_finger.stopHold();
        m_moved = true;
    }
    if (m_pressedCheckBox.isValid() && !getCheckBoxRectForTouch(m_pressedCheckBox).contains(point)) {
        m_pressedCheckBox = QModelIndex();
        viewport()->update();
    }
    if (m_pressedIndicator.isValid() && !indicatorRectForTouch(m_pressedIndicator).contains(point)) {
        m_pressedIndicator = QModelIndex();
        viewport()->update();
    }
}

void KSTreeView::mouseReleaseEvent(QMouseEvent* event)
{
    event->accept();
    const QPoint point = event->position().toPoint();
    if (event->button() != Qt::LeftButton || (!m_sendingMouse && m_finger.isDown()))
        return;
    if (!m_sendingMouse)
        m_flicker.lift(point);
    const bool isTap = m_pressState == Pressed && !m_moved &&
                       (point - m_pressPoint).manhattanLength() <= QApplication::startDragDistance();
    if (isTap)
        tap(point);
    cancelPress();
}

void KSTreeView::mouseDoubleClickEvent(QMouseEvent* event)
{
    mousePressEvent(event);
}

void KSTreeView::beginPress(const QPoint& point)
{
    cancelPress();
    m_pressState = Pressed;
    m_pressPoint = point;
    const QModelIndex index = indexAt(point);
    m_pressIndex = index;
    if (!isUsable(index))
        return;
    const QModelIndex first = index.siblingAtColumn(0);
    if (getCheckBoxRectForTouch(first).contains(point))
        m_pressedCheckBox = first;
    else if (indicatorRectForTouch(first).contains(point))
        m_pressedIndicator = first;
    else
        m_finger.startHold(m_holdInterval);
    viewport()->update();
}

void KSTreeView::cancelPress()
{
    m_finger.stopHold();
    m_pressState = NotPressed;
    m_moved = false;
    m_pressIndex = QModelIndex();
    m_pressedCheckBox = QModelIndex();
    m_pressedIndicator = QModelIndex();
    viewport()->update();
}

// Uses what was pressed, even if the list has moved by a few pixels since. Receivers may change the model.
void KSTreeView::tap(const QPoint& point)
{
    const QPersistentModelIndex index = m_pressIndex;
    if (m_pressedCheckBox.isValid()) {
        if (getCheckBoxRectForTouch(m_pressedCheckBox).contains(point))
            changeCheckState(m_pressedCheckBox);
    } else if (m_pressedIndicator.isValid()) {
        if (indicatorRectForTouch(m_pressedIndicator).contains(point))
            setExpanded(m_pressedIndicator, !isExpanded(m_pressedIndicator));
    } else if (isUsable(index)) {
        makeCurrent(index);
        if (index.isValid())
            Q_EMIT signalCurrentChangedByTouch(index);
        if (index.isValid())
            Q_EMIT clicked(index);
    }
}

void KSTreeView::makeCurrent(const QModelIndex& index)
{
    const QPersistentModelIndex kept = index;
    setCurrentIndex(index);
    if (kept.isValid())
        Q_EMIT pressed(kept);
}

void KSTreeView::slotHold()
{
    if (m_pressState != Pressed || !isUsable(m_pressIndex))
        return;
    m_pressState = Held;
    const QPersistentModelIndex index = m_pressIndex;
    makeCurrent(index);
    if (index.isValid() && isTextElide(index))
        showElidedText(index);
    if (index.isValid())
        Q_EMIT signalPressedAndHold(index);
}

// --- Motion -------------------------------------------------------------------------------------------

void KSTreeView::motionStarted()
{
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_finger.stopHold();
    m_elidedText.hide();
}

void KSTreeView::showLastRowWhole()
{
    if (verticalScrollBar()->value() == verticalScrollBar()->maximum())
        scrollToBottom();
}

QPoint KSTreeView::getDistance()
{
    return isAutoFilck() ? getFlickDistance() : getDragDistance();
}

void KSTreeView::changeScrollBarValue(int offset)
{
    QScrollBar* bar = verticalScrollBar();
    bar->setValue(FlickMotion::scrolledValue(bar->value(), offset, bar->minimum(), bar->maximum()));
}

void KSTreeView::hideEvent(QHideEvent* event)
{
    rest();
    QTreeView::hideEvent(event);
}

void KSTreeView::allTimersReset()
{
    m_finger.restartHold();
    m_elidedText.restartIfActive();
    m_loadingMarks.restartIfActive();
}
