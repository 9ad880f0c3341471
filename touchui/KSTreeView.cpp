#include "touchui/KSTreeView.h"

#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSTreeHeaderView.h"
#include "touchui/KSTreeModel.h"

#include <QFontMetrics>
#include <QKeyEvent>
#include <QPainter>

namespace
{

constexpr int LOADING_INTERVAL = 100;
constexpr int TOOLTIP_TIME = 3000;

// As wide as a finger, and without arrows.
const char SCROLL_BAR_STYLE[] =
    "QScrollBar { margin: 0px; border: 0px; background-color: rgb(51, 51, 51) }"
    "QScrollBar:vertical { width: 32px } QScrollBar:horizontal { height: 32px }"
    "QScrollBar::add-line, QScrollBar::sub-line { width: 0px; height: 0px }"
    "QScrollBar::handle:vertical { min-height: 42px } QScrollBar::handle:horizontal { min-width: 42px }";

} // namespace

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
    m_singleShotTimer.setSingleShot(true);
    m_singleShotTimer.setInterval(TOOLTIP_TIME);
    connect(&m_singleShotTimer, &QTimer::timeout, this, &KSTreeView::hideElidedText);
    m_loadingTimer.setInterval(LOADING_INTERVAL);
    connect(&m_loadingTimer, &QTimer::timeout, this, &KSTreeView::slotUpdateLoadingIcon);
    connect(this, &KSTreeView::editorEvent, this,
            static_cast<void (QAbstractItemView::*)(const QModelIndex&)>(&QAbstractItemView::edit));
}

KSTreeView::~KSTreeView()
{
    setStyle(nullptr); // ours goes before the widget does
}

void KSTreeView::initScrollBars()
{
    setVerticalScrollBar(new KSScrollBar(Qt::Vertical, this));
    setHorizontalScrollBar(new KSScrollBar(Qt::Horizontal, this));
    for (QScrollBar* bar : {verticalScrollBar(), horizontalScrollBar()}) {
        bar->setStyleSheet(QLatin1String(SCROLL_BAR_STYLE));
    }
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
}

void KSTreeView::setModel(QAbstractItemModel* model)
{
    cancelPress();
    stopFlick();
    m_treeModel = qobject_cast<KSTreeModel*>(model);
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
        current.parent() != sibling.parent()) {
        return false;
    }
    const int behind = sibling.row() + 1;
    if (behind == current.row() || behind == current.row() + 1) {
        return true; // it is there, or it is the sibling itself
    }
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
    if (box.isNull()) {
        return QRect();
    }
    const QRect row = getIndexVisualRect(index);
    const int margin = getDesignAttribute(KSVIEW::DesignItemSpacing).toInt() / 2;
    return QRect(box.left() - margin, row.top(), box.width() + 2 * margin, row.height());
}

QRect KSTreeView::getIndicatorRect(const QModelIndex& index) const
{
    const QRect cell = firstCellRect(index);
    if (!cell.isValid() || !model()->hasChildren(index.siblingAtColumn(0))) {
        return QRect();
    }
    return getLayoutForFirstColumn(cell, index).indicator;
}

QRect KSTreeView::indicatorRectForTouch(const QModelIndex& index) const
{
    const QRect indicator = getIndicatorRect(index);
    if (indicator.isNull()) {
        return QRect();
    }
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
            if (rows == 0) {
                break;
            }
            last = model()->index(rows - 1, 0, last);
        }
        if (last != rootIndex()) {
            top = visualRect(last).bottom() + 1;
        }
    }
    return top < viewport()->height() ? QRect(0, top, viewport()->width(), viewport()->height() - top)
                                      : QRect();
}

bool KSTreeView::isTextElide(const QModelIndex& index) const
{
    const QRect cell = visualRect(index);
    if (!cell.isValid()) {
        return false;
    }
    const QRect text =
        index.column() == 0 ? getLayoutForFirstColumn(cell, index).text : m_viewStyle->textRect(cell);
    QStyleOptionViewItem option;
    initViewItemOption(&option);
    option.index = index;
    const QVariant font = index.data(Qt::FontRole);
    if (font.isValid()) {
        option.font = qvariant_cast<QFont>(font).resolve(option.font);
    }
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
    for (int y = area.top(); !area.isNull() && height > 0 && y <= area.bottom(); y += height) {
        drawEmptyRow(painter, QRect(area.left(), y, area.width(), height));
    }
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
    if (selected) {
        m_viewStyle->drawSelectedBackground(painter, row);
    }
    QTreeView::drawRow(painter, option, index);
    m_viewStyle->drawHorizontalSeparator(painter, row);
    if (m_renameIndex.isValid() && m_renameIndex.row() == index.row() &&
        m_renameIndex.parent() == index.parent()) {
        m_viewStyle->drawOperationFocus(painter, row);
    }
}

void KSTreeView::drawBranches(QPainter* painter, const QRect&, const QModelIndex& index) const
{
    if (!model()->hasChildren(index)) {
        return;
    }
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
    if (opened && state() == QAbstractItemView::EditingState) {
        setRenameIndex(index);
    }
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
    if (editor == nullptr || editor->parentWidget() != viewport() || !m_renameIndex.isValid()) {
        return;
    }
    if (hint != QAbstractItemDelegate::RevertModelCache) {
        commitData(editor);
    }
    closeEditor(editor, hint);
}

// The base would make the first row current, which nobody has chosen.
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
