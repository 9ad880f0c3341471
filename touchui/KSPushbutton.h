#pragma once

#include "touchui/TouchEventButton.h"

#include <QPixmap>
#include <QStringList>

class QPainter;

// A touch button that is painted from pictures: three slices, left, centre and right, for each state.
//
// The picture string is "<folder>:<left>:<centre>:<right>:..." with three names for each state in the order
// of _enumButtonState; a name stands for ":/<folder>/<name>", and the slice of an empty name is not drawn.
// The background picture, the icon, the movable picture and the text are drawn over the slices.
//
// pressed(int) and signalReleased(bool, int) hide signals of the base classes; connect those through the base
// class.
class KSPushbutton : public TouchEventButton
{
    Q_OBJECT
public:
    enum _enumButtonState {
        ButtonRest = 0,
        ButtonPressed = 1,
        ButtonDisabled = 2,
        ButtonSelectedRest = 3,
        ButtonSelectedPressed = 4,
        ButtonSelectedDisabled = 5,
        ButtonStateCount
    };
    using enumButtonState = _enumButtonState;

    // The picture string of the standard button, which is 48 pixels high.
    static constexpr char STANDARD_IMAGES[] =
        "TextToolPanel_Buttons:Button_48_Rest_Left:Button_48_Rest_Center:Button_48_Rest_Right:"
        "Button_48_Pressed_Left:Button_48_Pressed_Center:Button_48_Pressed_Right:"
        "Button_48_Disabled_Left:Button_48_Disabled_Center:Button_48_Disabled_Right:"
        "Button_48selected_Rest_Left:Button_48selected_Rest_Center:Button_48selected_Rest_Right:"
        "Button_48selected_Pressed_Left:Button_48selected_Pressed_Center:Button_48selected_Pressed_Right:"
        "Button_48selected_Disabled_Left:Button_48selected_Disabled_Center:Button_48selected_Disabled_Right";

    explicit KSPushbutton(const QString& images, QWidget* parent = nullptr);
    KSPushbutton(const QString& images, const QString& text, QWidget* parent = nullptr);
    explicit KSPushbutton(QWidget* parent = nullptr);

    // Ignored if state is out of range.
    void changeButtonState(_enumButtonState state);
    void changeButtonState(int state);
    _enumButtonState buttonState() const { return m_state; }
    // Returns the state that is shown: the current state unless auto state is off.
    _enumButtonState paintedState() const { return m_paintedState; }
    // If false, the button keeps showing its present state.
    void setAutoState(bool autoState);

    // Changes between the normal and the selected variant of the state.
    void setSelected(bool selected);
    bool isSelected() const { return m_state >= ButtonSelectedRest; }

    void setImage(const QString& images);
    void setMovableImage(const QPixmap& image, const QPoint& position = QPoint());
    void setBackgroudImage(const QPixmap& image);
    // Frees the slices, the movable picture and the background picture.
    void cleanImages();

    void setTextAlignment(Qt::Alignment alignment);
    void setButtonId(int id) { m_buttonId = id; }
    int buttonId() const { return m_buttonId; }

Q_SIGNALS:
    void signalReleased(bool outside, int buttonId);
    void pressed(int buttonId);

protected:
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void init();
    void drawImage(QPainter& painter, _enumButtonState state);
    void drawIcon(QPainter& painter);
    void drawText(QPainter& painter);
    const QPixmap& slice(int index);

    QStringList m_imageNames;
    QList<QPixmap> m_slices; // loaded on first use, in the order of the names
    _enumButtonState m_state = ButtonRest;
    _enumButtonState m_paintedState = ButtonRest;
    bool m_autoState = true;
    QPixmap m_movableImage;
    QPoint m_movablePosition;
    QPixmap m_backgroundImage;
    Qt::Alignment m_textAlignment = Qt::AlignCenter;
    int m_buttonId = -1;
};
