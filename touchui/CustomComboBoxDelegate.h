#pragma once

#include <QAbstractItemDelegate>
#include <QPixmap>

// Paints the rows of a combo box's list: the cursor behind the current or pressed row, an icon, the text.
class CustomComboBoxDelegate : public QAbstractItemDelegate
{
    Q_OBJECT
public:
    explicit CustomComboBoxDelegate(QObject* parent = nullptr);

    static constexpr int ROW_HEIGHT = 56;
    static constexpr int TEXT_MARGIN = 14;

    // If on, each row shows a rectangle in its colour: that of Qt::BackgroundRole, else of
    // Qt::DecorationRole, else the colour that its text names.
    void setColorPallete(bool on) { m_colorPallete = on; }
    bool colorPallete() const { return m_colorPallete; }

    void paint(QPainter* painter, const QStyleOptionViewItem& option,
               const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;

    // Returns an invalid colour for a row without a colour.
    static QColor rowColor(const QModelIndex& index);

protected:
    // Paints the cursor behind the current or pressed row. Returns whether the row is enabled.
    bool paintCursor(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const;

private:
    QPixmap m_cursor;
    bool m_colorPallete = false;
};
