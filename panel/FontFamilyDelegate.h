#pragma once

#include "touchui/CustomComboBoxDelegate.h"

#include <QString>
#include <array>
#include <utility>

// Paints a row of the font list: the display name of a family in that family.
class FontFamilyDelegate : public CustomComboBoxDelegate
{
    Q_OBJECT
public:
    static constexpr int FAMILY_COUNT = 9;
    // Pairs of stored family and display name.
    static const std::array<std::pair<QString, QString>, FAMILY_COUNT> REPLACE_FAMILY_LIST;

    using CustomComboBoxDelegate::CustomComboBoxDelegate;

    // Returns the display name of a stored family, which for most is the family itself.
    static QString changeFamilyName(const QString& family);

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;

private:
    static QFont rowFont(const QStyleOptionViewItem& option, const QString& family);
};
