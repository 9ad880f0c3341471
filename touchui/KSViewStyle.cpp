#include "touchui/KSViewStyle.h"

#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"
#include "touchui/KSVIEW.h"

#include <QIcon>
#include <QPainter>
#include <QPixmapCache>
#include <QStyleOptionHeader>
#include <QStyleOptionViewItem>

namespace
{

constexpr int HEADER_ARROW_SIZE = 16;
constexpr int OPERATION_BORDER = 2;
constexpr qreal DISABLED_ICON_OPACITY = 0.4;
const QColor PRESSED_HEADER(0, 129, 255, 70);

QString indicatorPath(const char* family, bool enabled, bool pressed)
{
    const char* state = !enabled ? "Disabled" : pressed ? "Pressed" : "Rest";
    return QStringLiteral(":/Views/%1_%2").arg(QLatin1String(family), QLatin1String(state));
}

QRect centeredSquare(const QRect& area, int size)
{
    return QRect(area.left() + (area.width() - size) / 2, area.top() + (area.height() - size) / 2, size,
                 size);
}

} // namespace

KSViewStyle::KSViewStyle(KSTreeView* view) : m_view(view)
{
    setParent(view);
}

QPixmap KSViewStyle::picture(const QString& path)
{
    QPixmap pixmap;
    if (!QPixmapCache::find(path, &pixmap)) {
        pixmap.load(path);
        QPixmapCache::insert(path, pixmap);
    }
    return pixmap;
}

QColor KSViewStyle::color(int role) const
{
    return m_view->getDesignAttribute(static_cast<KSVIEW::enumDesignAttributeRole>(role)).value<QColor>();
}

QColor KSViewStyle::headerTextColor(int section) const
{
    const auto* model = qobject_cast<KSTreeModel*>(m_view->model());
    const QColor own = model != nullptr ? model->getHeaderTextColor(section) : QColor();
    return own.isValid() ? own : color(KSVIEW::DesignHeaderTextColor);
}

int KSViewStyle::length(int role) const
{
    return m_view->getDesignAttribute(static_cast<KSVIEW::enumDesignAttributeRole>(role)).toInt();
}

void KSViewStyle::drawCentered(QPainter* painter, const QRect& rect, const QString& path) const
{
    const QPixmap pixmap = picture(path);
    if (pixmap.isNull())
        return;
    QSize size = pixmap.size();
    if (size.width() > rect.width() || size.height() > rect.height())
        size.scale(rect.size(), Qt::KeepAspectRatio);
    painter->drawPixmap(QRect(rect.left() + (rect.width() - size.width()) / 2,
                              rect.top() + (rect.height() - size.height()) / 2, size.width(), size.height()),
                        pixmap);
}

void KSViewStyle::drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                              const QWidget* widget) const
{
    const auto* header = qstyleoption_cast<const QStyleOptionHeader*>(option);
    const auto* item = qstyleoption_cast<const QStyleOptionViewItem*>(option);
    if (header != nullptr && element == CE_Header) {
        drawHeaderSection(painter, *header);
        drawHeaderLabel(painter, *header);
        drawHeaderArrow(painter, *header);
    } else if (header != nullptr && element == CE_HeaderSection) {
        drawHeaderSection(painter, *header);
    } else if (header != nullptr && element == CE_HeaderLabel) {
        drawHeaderLabel(painter, *header);
    } else if (element == CE_HeaderEmptyArea) {
        painter->drawPixmap(option->rect, picture(QStringLiteral(":/Views/Header_Main_1")));
    } else if (item != nullptr && element == CE_ItemViewItem) {
        drawViewItem(painter, *item);
    } else {
        QCommonStyle::drawControl(element, option, painter, widget);
    }
}

void KSViewStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                                const QWidget* widget) const
{
    switch (element) {
    case PE_IndicatorHeaderArrow:
        if (const auto* header = qstyleoption_cast<const QStyleOptionHeader*>(option))
            drawHeaderArrow(painter, *header);
        break;
    case PE_IndicatorBranch:
        if (option->state & State_Children) {
            const bool enabled = option->state & State_Enabled;
            const bool pressed = option->state & State_Sunken;
            if (option->state & State_Open)
                drawCollapseIndicator(painter, option->rect, enabled, pressed);
            else
                drawExpandIndicator(painter, option->rect, enabled, pressed);
        }
        break;
    case PE_PanelItemViewRow: // the view draws the row's background over its full width
    case PE_PanelItemViewItem:
    case PE_FrameFocusRect:
        break;
    default:
        QCommonStyle::drawPrimitive(element, option, painter, widget);
    }
}

void KSViewStyle::drawHeaderSection(QPainter* painter, const QStyleOptionHeader& option) const
{
    painter->drawPixmap(option.rect, picture(QStringLiteral(":/Views/Header_Main_1")));
    if (option.state & State_Sunken)
        painter->fillRect(option.rect, PRESSED_HEADER);
    const bool last =
        option.position == QStyleOptionHeader::End || option.position == QStyleOptionHeader::OnlyOneSection;
    if (!last)
        drawVerticalSeparator(painter, option.rect);
}

void KSViewStyle::drawHeaderLabel(QPainter* painter, const QStyleOptionHeader& option) const
{
    const int spacing = length(KSVIEW::DesignItemSpacing);
    QRect rect = option.rect.adjusted(spacing, 0, -spacing, 0);
    if (option.sortIndicator != QStyleOptionHeader::None)
        rect.adjust(0, 0, -HEADER_ARROW_SIZE - spacing, 0);
    QFont font = painter->font();
    font.setPixelSize(length(KSVIEW::DesignFontSize));
    painter->save();
    painter->setFont(font);
    painter->setPen(headerTextColor(option.section));
    painter->drawText(rect, static_cast<int>(Qt::AlignVCenter | Qt::AlignLeft) | Qt::TextSingleLine,
                      QFontMetrics(font).elidedText(option.text, Qt::ElideRight, rect.width()));
    painter->restore();
}

void KSViewStyle::drawHeaderArrow(QPainter* painter, const QStyleOptionHeader& option) const
{
    if (option.sortIndicator == QStyleOptionHeader::None)
        return;
    // Qt's "down" is the ascending order, for which the arrow points up here.
    const bool ascending = option.sortIndicator == QStyleOptionHeader::SortDown;
    QRect rect = option.rect;
    rect.setLeft(rect.right() + 1 - HEADER_ARROW_SIZE - length(KSVIEW::DesignItemSpacing));
    rect.setWidth(HEADER_ARROW_SIZE);
    drawCentered(painter, rect,
                 ascending ? QStringLiteral(":/Picker/Picker_Allow_Up_Rest")
                           : QStringLiteral(":/Picker/Picker_Allow_Dn_Rest"));
}

void KSViewStyle::drawExpandIndicator(QPainter* painter, const QRect& rect, bool enabled, bool pressed) const
{
    drawCentered(painter, rect, indicatorPath("Parts_011", enabled, pressed));
}

void KSViewStyle::drawCollapseIndicator(QPainter* painter, const QRect& rect, bool enabled,
                                        bool pressed) const
{
    drawCentered(painter, rect, indicatorPath("Parts_012", enabled, pressed));
}

void KSViewStyle::drawSelectedBackground(QPainter* painter, const QRect& rect) const
{
    painter->drawPixmap(rect, picture(QStringLiteral(":/Views/List_Cursor")));
}

void KSViewStyle::drawHorizontalSeparator(QPainter* painter, const QRect& rect) const
{
    const QPixmap line = picture(QStringLiteral(":/Views/Separator_H"));
    if (!line.isNull()) {
        painter->drawPixmap(
            QRect(rect.left(), rect.bottom() + 1 - line.height(), rect.width(), line.height()), line);
    }
}

void KSViewStyle::drawVerticalSeparator(QPainter* painter, const QRect& rect) const
{
    const QPixmap line = picture(QStringLiteral(":/Views/Separator_V"));
    if (!line.isNull()) {
        painter->drawPixmap(QRect(rect.right() + 1 - line.width(), rect.top(), line.width(), rect.height()),
                            line);
    }
}

void KSViewStyle::drawViewItem(QPainter* painter, const QStyleOptionViewItem& option) const
{
    if (option.index.column() != 0) {
        drawViewItemText(painter, option, textRect(option.rect));
        return;
    }
    const FirstColumnLayout layout = m_view->getLayoutForFirstColumn(option.rect, option.index);
    if (!layout.checkBox.isNull()) {
        drawCentered(painter, layout.checkBox,
                     KSTreeView::s_checkBoxImagesPath.value(m_view->getCheckBoxImageType(option.index)));
    }
    if (!layout.icon.isNull()) {
        const int loading = option.index.data(KSVIEW::ItemLoadingRole).toInt();
        if (loading > 0) {
            drawCentered(painter, layout.icon, m_view->getLoadingImagePath(loading));
        } else {
            const bool enabled = option.state & State_Enabled;
            painter->save();
            painter->setOpacity(enabled ? 1.0 : DISABLED_ICON_OPACITY);
            option.icon.paint(painter, layout.icon, Qt::AlignCenter);
            painter->restore();
        }
    }
    if (!layout.mark.isNull())
        drawCentered(painter, layout.mark, QStringLiteral(":/Views/Recording_Icon"));
    drawViewItemText(painter, option, layout.text);
}

QFont KSViewStyle::itemFont(const QStyleOptionViewItem& option) const
{
    QFont font = option.font;
    if (!option.index.data(Qt::FontRole).isValid())
        font.setPixelSize(length(KSVIEW::DesignFontSize));
    return font;
}

void KSViewStyle::drawViewItemText(QPainter* painter, const QStyleOptionViewItem& option,
                                   const QRect& rect) const
{
    if (option.text.isEmpty() || rect.width() <= 0)
        return;
    int role = KSVIEW::DesignTextColor;
    if (!(option.state & State_Enabled))
        role = KSVIEW::DesignDisabledTextColor;
    else if (option.state & State_Selected)
        role = KSVIEW::DesignSelectedTextColor;
    const QFont font = itemFont(option);
    painter->save();
    painter->setFont(font);
    painter->setPen(color(role));
    painter->drawText(rect, static_cast<int>(option.displayAlignment) | Qt::TextSingleLine,
                      QFontMetrics(font).elidedText(option.text, Qt::ElideRight, rect.width()));
    painter->restore();
}

void KSViewStyle::drawOperationFocus(QPainter* painter, const QRect& rect) const
{
    painter->save();
    QPen pen(color(KSVIEW::DesignOperationColor), OPERATION_BORDER);
    pen.setJoinStyle(Qt::MiterJoin);
    painter->setPen(pen);
    painter->setBrush(Qt::NoBrush);
    painter->drawRect(rect.adjusted(1, 1, -1, -1));
    painter->restore();
}

KSViewStyle::FirstColumnLayout KSViewStyle::layoutFirstColumn(const QRect& cell, bool hasCheckBox,
                                                              bool hasIcon, bool hasMark) const
{
    const int spacing = length(KSVIEW::DesignItemSpacing);
    const int indentation = length(KSVIEW::DesignIndentation);
    FirstColumnLayout layout;
    layout.indicator =
        centeredSquare(QRect(cell.left() - indentation, cell.top(), indentation, cell.height()),
                       length(KSVIEW::DesignIndicatorSize));
    int left = cell.left();
    const auto place = [&](int size) {
        const QRect square = centeredSquare(QRect(left, cell.top(), size, cell.height()), size);
        left += size + spacing;
        return square;
    };
    if (hasCheckBox)
        layout.checkBox = place(length(KSVIEW::DesignCheckBoxSize));
    if (hasIcon)
        layout.icon = place(length(KSVIEW::DesignIconSize));
    int right = cell.right() - spacing;
    if (hasMark) {
        const int size = length(KSVIEW::DesignIconSize);
        layout.mark = centeredSquare(QRect(right + 1 - size, cell.top(), size, cell.height()), size);
        right -= size + spacing;
    }
    layout.text = QRect(QPoint(left, cell.top()), QPoint(qMax(left - 1, right), cell.bottom()));
    return layout;
}

QRect KSViewStyle::textRect(const QRect& cell) const
{
    const int spacing = length(KSVIEW::DesignItemSpacing);
    return cell.adjusted(spacing, 0, -spacing, 0);
}
