#pragma once

#include "touchui/DialogMasks.h"
#include "touchui/OneFinger.h"

#include <QDialog>
#include <QList>
#include <QPixmap>
#include <QPoint>
#include <QRect>
#include <QString>

class ColorButton;
class KSPushbutton;
class QLabel;
class QPainter;

// A palette of thirty colours, for the text and for its edge. A tap on a colour previews it at once; OK keeps
// it, Cancel restores the colour from when the palette was opened. Dragging the palette itself moves it
// within the titler's window. Not modal. GUI thread only.
class ColorPalette : public QDialog
{
    Q_OBJECT
public:
    static constexpr int ROW_COUNT = 3;
    static constexpr int CULUMN_COUNT = 10;
    static constexpr int PALETTE_WIDTH = 640;
    static constexpr int PALETTE_HEIGHT = 333;
    static constexpr int USELESS_VALUE = -1;
    static constexpr int PALETTE_LABEL_WIDTH = 226;
    static constexpr int PALETTE_LABEL_HEIGHT = 30;
    static constexpr int OK_CANCEL_WIDTH = 160;
    static constexpr int OK_CANCEL_HEIGHT = 48;
    static constexpr QRect TOPLINE_RECT{QPoint(2, 50), QPoint(637, 53)};
    static constexpr QRect BOTTOMLINE_RECT{QPoint(2, 262), QPoint(637, 265)};
    static const QString PALETTE_LABEL_STYLE;

    enum State { PREVIEW = 0, OK = 1, CANCEL = 2 };

    explicit ColorPalette(QWidget* parent);

    // Selects the colour, "#rrggbb", and remembers it for Cancel; a colour that is not in the table selects
    // nothing.
    void setCurrentColor(const QString& color);
    QString currentColor() const { return m_currentColor; }
    // Returns the index of the selected button, USELESS_VALUE without one.
    int currentIndex() const { return m_currentIndex; }
    const QList<QString>& colors() const { return m_colors; }

    // Shows or hides a mask; while it is shown the palette ignores touches.
    void showDialogMask(bool show);
    void showMessageMask(bool show);

    void translateText();

public Q_SLOTS:
    // Sets the area in which the palette can be moved, in global coordinates.
    void setTitlerWindowRect(QRect rect) { m_titlerWindowRect = rect; }
    // Cancels, also on Escape; does nothing while the palette is hidden.
    void reject() override;

Q_SIGNALS:
    void sendColorValue(QString color, int state);

protected:
    bool event(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void initColorValueList();
    void createButtons();
    void createLayout();
    void select(int index);
    void styleButton(int index);
    void colorButtonPressed(int index);
    void colorButtonReleased(int index);
    void setColorValue(int index);
    void okClicked();
    void cancelClicked();
    // Hides the palette and removes the mask from the soft keyboard.
    void closePalette();
    void drawFocusBoundingRect(QPainter& painter) const;
    void drawHorizontalLine(QPainter& painter, const QRect& line) const;
    void putBack();
    void startDrag(const QPoint& local, const QPoint& global);
    void drag(const QPoint& global);

    QList<QString> m_colors;
    QList<ColorButton*> m_buttons;
    QLabel* m_title = nullptr;
    KSPushbutton* m_ok = nullptr;
    KSPushbutton* m_cancel = nullptr;
    QString m_currentColor;
    QString m_colorAtOpen;
    int m_currentIndex = USELESS_VALUE;
    QRect m_titlerWindowRect;
    OneFinger m_finger{this};
    QPoint m_dragOrigin;
    QPoint m_placeAtPress;
    QString m_pressedObjectName;
    QPixmap m_background;
    DialogMasks m_masks{this, QMargins(), DialogMasks::Press::EndsHere};
    QPixmap m_separator;
};
