#pragma once

#include <QCommonStyle>
#include <QPixmap>

class KSTreeView;
class QStyleOptionHeader;
class QStyleOptionViewItem;

// Paints a KSTreeView and its header with the pictures under ":/Views" and ":/Picker". Rectangles are in
// viewport coordinates. Missing pictures are not drawn.
class KSViewStyle : public QCommonStyle
{
    Q_OBJECT
public:
    // The positions of the parts in the first cell of a row; the rectangle of a missing part is null.
    struct FirstColumnLayout {
        QRect indicator;
        QRect checkBox;
        QRect icon;
        QRect mark; // the recording mark at the end
        QRect text;
    };

    // The view provides the design values; it owns this style.
    explicit KSViewStyle(KSTreeView* view);

    // Draws every element, including CE_Header, CE_ItemViewItem and PE_IndicatorBranch.
    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                     const QWidget* widget = nullptr) const override;
    void drawPrimitive(PrimitiveElement element, const QStyleOption* option, QPainter* painter,
                       const QWidget* widget = nullptr) const override;

    void drawHeaderSection(QPainter* painter, const QStyleOptionHeader& option) const;
    void drawHeaderLabel(QPainter* painter, const QStyleOptionHeader& option) const;
    void drawHeaderArrow(QPainter* painter, const QStyleOptionHeader& option) const;
    // Draw the indicator of a collapsed row and of an expanded row, respectively.
    void drawExpandIndicator(QPainter* painter, const QRect& rect, bool enabled, bool pressed) const;
    void drawCollapseIndicator(QPainter* painter, const QRect& rect, bool enabled, bool pressed) const;
    void drawSelectedBackground(QPainter* painter, const QRect& rect) const;
    // Draw a line at the bottom edge and at the right edge, respectively.
    void drawHorizontalSeparator(QPainter* painter, const QRect& rect) const;
    void drawVerticalSeparator(QPainter* painter, const QRect& rect) const;
    void drawViewItem(QPainter* painter, const QStyleOptionViewItem& option) const;
    void drawViewItemText(QPainter* painter, const QStyleOptionViewItem& option, const QRect& rect) const;
    // Draws the border of the row that is being edited.
    void drawOperationFocus(QPainter* painter, const QRect& rect) const;

    // cell is the rectangle of the cell without its indentation.
    FirstColumnLayout layoutFirstColumn(const QRect& cell, bool hasCheckBox, bool hasIcon,
                                        bool hasMark) const;
    // Returns the text rectangle of a cell outside the first column.
    QRect textRect(const QRect& cell) const;
    QFont itemFont(const QStyleOptionViewItem& option) const;

private:
    static QPixmap picture(const QString& path);
    void drawCentered(QPainter* painter, const QRect& rect, const QString& path) const;
    QColor color(int role) const;
    QColor headerTextColor(int section) const;
    int length(int role) const;

    KSTreeView* m_view;
};
