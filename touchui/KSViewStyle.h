#pragma once

#include <QCommonStyle>
#include <QPixmap>

class KSTreeView;
class QStyleOptionHeader;
class QStyleOptionViewItem;

// All painting of a KSTreeView and its header, from the pictures under ":/Views" and ":/Picker". Rectangles
// are in viewport coordinates. A picture that is missing is not drawn.
class KSViewStyle : public QCommonStyle
{
    Q_OBJECT
public:
    // Where the parts of a row's first cell stand; what is absent is null.
    struct FirstColumnLayout {
        QRect indicator;
        QRect checkBox;
        QRect icon;
        QRect mark; // the recording mark at the end
        QRect text;
    };

    // The view reads the design values; it owns this style and outlives it.
    explicit KSViewStyle(KSTreeView* view);

    // Every element is looked up by this path, also CE_Header, CE_ItemViewItem and PE_IndicatorBranch.
    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget = nullptr) const override;
    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* widget = nullptr) const override;

    void drawHeaderSection(QPainter* painter, const QStyleOptionHeader& option) const;
    void drawHeaderLabel(QPainter* painter, const QStyleOptionHeader& option) const;
    void drawHeaderArrow(QPainter* painter, const QStyleOptionHeader& option) const;
    // Of a collapsed row, and of an expanded one.
    void drawExpandIndicator(QPainter* painter, const QRect& rect, bool enabled, bool pressed) const;
    void drawCollapseIndicator(QPainter* painter, const QRect& rect, bool enabled, bool pressed) const;
    void drawSelectedBackground(QPainter* painter, const QRect& rect) const;
    // Along the lower edge, along the right edge.
    void drawHorizontalSeparator(QPainter* painter, const QRect& rect) const;
    void drawVerticalSeparator(QPainter* painter, const QRect& rect) const;
    void drawViewItem(QPainter* painter, const QStyleOptionViewItem& option) const;
    void drawViewItemText(QPainter* painter, const QStyleOptionViewItem& option, const QRect& rect) const;
    // The border of the row that is being edited.
    void drawOperationFocus(QPainter* painter, const QRect& rect) const;

    // cell: the cell behind its indentation.
    FirstColumnLayout layoutFirstColumn(const QRect& cell, bool hasCheckBox, bool hasIcon,
                                        bool hasMark) const;
    // The text of a cell beside the first column.
    QRect textRect(const QRect& cell) const;
    QFont itemFont(const QStyleOptionViewItem& option) const;

private:
    static QPixmap picture(const QString& path);
    void drawCentered(QPainter* painter, const QRect& rect, const QString& path) const;
    QColor color(int role) const;
    int length(int role) const;

    KSTreeView* m_view;
};
