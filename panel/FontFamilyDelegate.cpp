#include "panel/FontFamilyDelegate.h"

#include "touchui/CustomComboBoxView.h"

#include <QPainter>
#include <QtMath>

#include <algorithm>

const std::array<std::pair<QString, QString>, FontFamilyDelegate::FAMILY_COUNT>
    FontFamilyDelegate::REPLACE_FAMILY_LIST{{
        {QStringLiteral("KST"), QStringLiteral("KST Medium")},
        {QStringLiteral("KST Japanese Pro"), QStringLiteral("KST Japanese Pro Regular")},
        {QStringLiteral("URW Gothic L"), QStringLiteral("URW Gothic L Book")},
        {QStringLiteral("URW Chancery L"), QStringLiteral("URW Chancery L Medium Italic")},
        {QStringLiteral("URW Palladio L"), QStringLiteral("URW Palladio L Medium")},
        {QStringLiteral("IPAPGothic"), QStringLiteral("IPA Pゴシック")},
        {QStringLiteral("IPAPMincho"), QStringLiteral("IPA P明朝")},
        {QStringLiteral("IPAGothic"), QStringLiteral("IPA ゴシック")},
        {QStringLiteral("IPAMincho"), QStringLiteral("IPA 明朝")},
    }};

namespace
{

const QColor TEXT_COLOR(220, 220, 220);

} // namespace

QString FontFamilyDelegate::changeFamilyName(const QString& family)
{
    const auto found = std::find_if(REPLACE_FAMILY_LIST.begin(), REPLACE_FAMILY_LIST.end(),
                                    [&family](const auto& pair) { return pair.first == family; });
    return found == REPLACE_FAMILY_LIST.end() ? family : found->second;
}

QFont FontFamilyDelegate::rowFont(const QStyleOptionViewItem& option, const QString& family)
{
    QFont font(option.font);
    font.setFamily(family);
    return font;
}

void FontFamilyDelegate::paint(QPainter* painter, const QStyleOptionViewItem& option,
                               const QModelIndex& index) const
{
    const QString family = index.data(Qt::DisplayRole).toString();
    paintCursor(painter, option, index);
    painter->save();
    painter->setFont(rowFont(option, family));
    painter->setPen(TEXT_COLOR);
    const QRect area = option.rect.adjusted(TEXT_MARGIN, 0, -TEXT_MARGIN, 0);
    painter->drawText(
        area, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine,
        painter->fontMetrics().elidedText(changeFamilyName(family), Qt::ElideRight, area.width()));
    painter->restore();
}

QSize FontFamilyDelegate::sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    const QString family = index.data(Qt::DisplayRole).toString();
    const QFontMetricsF metrics(rowFont(option, family));
    return QSize(qCeil(metrics.horizontalAdvance(changeFamilyName(family))) + 2 * TEXT_MARGIN, ROW_HEIGHT);
}
