#include "touchui/KSTreeView.h"

#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSTreeHeaderView.h"
#include "touchui/KSTreeModel.h"
#include "touchui/TreeCheckStates.h"

#include <QFontMetrics>
#include <QKeyEvent>
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

QRect firstCellRect(const QTreeView& tree, const QModelIndex& index)
{
    return tree.visualRect(index.siblingAtColumn(0));
}

QScrollBar* makeScrollBar(Qt::Orientation orientation, QWidget* parent)
{
    auto* bar = new KSScrollBar(orientation, parent);
    bar->setStyleSheet(QLatin1String(SCROLL_BAR_STYLE));
    return bar;
}

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
    , m_viewStyle(new KSViewStyle(this))
    , m_delegate(new CustomTreeDelegete(this, m_viewStyle))
{
    setStyle(m_viewStyle);
    setItemDelegate(m_delegate);
    setHeader(new KSTreeHeaderView(this, m_viewStyle));
    setVerticalScrollBar(makeScrollBar(Qt::Vertical, this));
    setHorizontalScrollBar(makeScrollBar(Qt::Horizontal, this));
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
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
    connect(&m_touch, &TreeTouch::pressed, this, &QAbstractItemView::pressed);
    connect(&m_touch, &TreeTouch::clicked, this, &QAbstractItemView::clicked);
    connect(this, &KSTreeView::editorEvent, this,
            static_cast<void (QAbstractItemView::*)(const QModelIndex&)>(&QAbstractItemView::edit));
}

void KSTreeView::setModel(QAbstractItemModel* model)
{
    m_touch.cancelPress();
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
    const QRect cell = firstCellRect(*this, index);
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
    const QRect cell = firstCellRect(*this, index);
    if (!cell.isValid() || !model()->hasChildren(index.siblingAtColumn(0)))
        return QRect();
    return getLayoutForFirstColumn(cell, index).indicator;
}

QRect KSTreeView::getIndexVisualRect(const QModelIndex& index) const
{
    const QRect cell = firstCellRect(*this, index);
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
    const QRect text = m_delegate->textRect(cell, index);
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
    option.state.setFlag(QStyle::State_Enabled, m_touch.isUsable(index));
    option.state.setFlag(QStyle::State_Sunken, isIndicatorPressed(index));
    m_viewStyle->drawPrimitive(QStyle::PE_IndicatorBranch, &option, painter, this);
}

bool KSTreeView::isIndicatorPressed(const QModelIndex& index) const
{
    return m_touch.isIndicatorPressed(index);
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
    if (!m_touch.isUsable(index))
        state = OnDisabled;
    else if (m_touch.isCheckBoxPressed(index))
        state = OnPressed;
    return static_cast<CheckBoxImage>(family + state);
}

void KSTreeView::changeCheckState(const QModelIndex& index)
{
    const QModelIndex first = index.siblingAtColumn(0);
    if (m_treeModel != nullptr && m_touch.isUsable(first) && m_treeModel->getCheckable(first))
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
    m_touch.releaseCheckBox();
    viewport()->update();
}

// --- Loading and recording ----------------------------------------------------------------------------

QString KSTreeView::getLoadingImagePath(int step) const
{
    return TreeLoadingMarks::imagePath(step);
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

// --- Touch --------------------------------------------------------------------------------------------

bool KSTreeView::event(QEvent* event)
{
    if (OneFinger::isTouch(event))
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    if (event->type() == QEvent::Hide)
        m_touch.rest();
    return event->type() == QEvent::Gesture || QTreeView::event(event);
}

bool KSTreeView::viewportEvent(QEvent* event)
{
    if (OneFinger::isTouch(event))
        return onTouchEvent(static_cast<QTouchEvent*>(event));
    return event->type() == QEvent::Gesture || m_touch.takesMouse(event) || QTreeView::viewportEvent(event);
}

bool KSTreeView::onTouchEvent(QTouchEvent* event)
{
    event->accept();
    switch (m_touch.follow(event)) {
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

bool KSTreeView::onTouchBeginEvent(QTouchEvent*)
{
    m_touch.fingerPressed();
    return true;
}

bool KSTreeView::onTouchUpdateEvent(QTouchEvent*)
{
    m_touch.fingerMoved();
    return true;
}

bool KSTreeView::onTouchEndEvent(QTouchEvent* event)
{
    m_touch.fingerLifted();
    onTranslateTouchEndEventToMouse(event);
    return true;
}

void KSTreeView::onTranslateTouchEndEventToMouse(QTouchEvent*)
{
    m_touch.endFingerPress();
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

void KSTreeView::allTimersReset()
{
    m_touch.restartTimers();
    m_loadingMarks.restartIfActive();
}
