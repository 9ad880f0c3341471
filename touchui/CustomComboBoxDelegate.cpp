#include "touchui/CustomComboBoxDelegate.h"

#include "touchui/CustomComboBoxView.h"

#include <QBrush>
#include <QIcon>
#include <QPainter>
#include <QtMath>

namespace
{

constexpr int SWATCH_MARGIN = 8;
constexpr int ICON_SIZE = 32;
const QColor TEXT_COLOR(220, 220, 220);
const QColor DISABLED_COLOR(102, 102, 102);
const QColor SWATCH_BORDER(18, 18, 18);

QColor asColor(const QVariant& value)
{
    if (value.userType() == QMetaType::QBrush)
        return value.value<QBrush>().color();
    return value.userType() == QMetaType::QColor ? value.value<QColor>() : QColor();
}

} // namespace

CustomComboBoxDelegate::CustomComboBoxDelegate(QObject* parent)
    : QAbstractItemDelegate(parent), m_cursor(QStringLiteral(":/Menu/List_Cursor"))
{
}

QColor CustomComboBoxDelegate::rowColor(const QModelIndex& index)
{
    QColor color = asColor(index.data(Qt::BackgroundRole));
    if (!color.isValid())
        color = asColor(index.data(Qt::DecorationRole));
    if (!color.isValid()) {
        const QString text = index.data(Qt::DisplayRole).toString();
        if (QColor::isValidColor(text))
            color.setNamedColor(text);
    }
    return color;
}

bool CustomComboBoxDelegate::paintCursor(QPainter* painter, const QStyleOptionViewItem& option,
                                         const QModelIndex& index) const
{
    const bool enabled = (index.flags() & Qt::ItemIsEnabled) && (option.state & QStyle::State_Enabled);
    const auto* view = qobject_cast<const CustomComboBoxView*>(option.widget);
    const QModelIndex pressed = view != nullptr ? view->pressedIndex() : QModelIndex();
    const bool marked = pressed.isValid() ? pressed == index : bool(option.state & QStyle::State_Selected);
    if (marked && enabled) {
        painter->save();
        painter->setRenderHint(QPainter::SmoothPixmapTransform);
        painter->drawPixmap(option.rect, m_cursor);
        painter->restore();
    }
    return enabled;
}

void CustomComboBoxDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                                   const QModelIndex& index) const
{
    const bool enabled = paintCursor(painter, option, index);
    painter->save();
    QRect area = option.rect.adjusted(TEXT_MARGIN, 0, -TEXT_MARGIN, 0);
    if (m_colorPallete && rowColor(index).isValid()) {
        const QRect swatch = area.adjusted(0, SWATCH_MARGIN, 0, -SWATCH_MARGIN);
        painter->fillRect(swatch, SWATCH_BORDER);
        painter->fillRect(swatch.adjusted(1, 1, -1, -1), rowColor(index));
        painter->restore();
        return;
    }
    const QIcon icon = index.data(Qt::DecorationRole).value<QIcon>();
    if (!icon.isNull()) {
        const QRect place(area.x(), area.y() + (area.height() - ICON_SIZE) / 2, ICON_SIZE, ICON_SIZE);
        icon.paint(painter, place, Qt::AlignCenter, enabled ? QIcon::Normal : QIcon::Disabled);
        area.setLeft(place.right() + 1 + TEXT_MARGIN);
    }
    const QVariant font = index.data(Qt::FontRole);
    painter->setFont(font.isValid() ? font.value<QFont>() : option.font);
    painter->setPen(enabled ? TEXT_COLOR : DISABLED_COLOR);
    const QString text = painter->fontMetrics().elidedText(index.data(Qt::DisplayRole).toString(),
                                                           Qt::ElideRight, area.width());
    painter->drawText(area, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine, text);
    painter->restore();
}

QSize CustomComboBoxDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    const QString text = index.data(Qt::DisplayRole).toString();
    const int width = qCeil(QFontMetricsF(option.font).horizontalAdvance(text));
    return QSize(width + 2 * TEXT_MARGIN, qMax(ROW_HEIGHT, option.fontMetrics.height() + 8));
}
