#pragma once

#include "touchui/NineSlice.h"
#include "touchui/OneFinger.h"

#include <QComboBox>
#include <QEvent>
#include <QPixmap>

#include <array>

class CustomComboBoxDelegate;
class CustomComboBoxView;
class OutsidePressFilter;

// A combo box that is operated with one finger and painted from pictures. Its list is a separate window that
// closes when a row is chosen, on a press outside, and when another process takes the touch. It is not a Qt
// popup, so other widgets still receive touches.
class KSCombobox : public QComboBox
{
    Q_OBJECT
public:
    // Set to true for rows that setUSBEnabled enables and disables.
    static constexpr int USB_ROLE = Qt::UserRole + 100;

    explicit KSCombobox(QWidget* parent = nullptr);
    ~KSCombobox() override;

    void showPopup() override;
    void hidePopup() override;
    CustomComboBoxView* listView() const { return m_view; }

    // If false, the list does not open.
    void setPopupEnable(bool enable) { m_popupEnable = enable; }
    // Makes the list wide enough for the longest text instead of as wide as the box.
    void setListWidthByText(bool byText) { m_listWidthByText = byText; }
    // Opens the list above the box if there is room, else below.
    void setPopupUpper(bool upper) { m_popupUpper = upper; }
    // Shows colours in the rows and in the box, see CustomComboBoxDelegate.
    void setColorPallete(bool on);
    // Enables or disables the rows with USB_ROLE.
    void setUSBEnabled(bool enabled);
    // Sets the pictures of the closed box: path + "_Left", "_Center", "_Pulldown", and the same with
    // "_Pressed" and "_Disable".
    void setBackgroundImagesPath(const QString& path);
    // These also hide an open list.
    void setEnabled(bool enabled);
    void setDisabled(bool disabled);

    // Returns the width of the list for a box and a longest text of these widths, in pixels.
    static int listWidth(int width, int textWidth, bool byText, bool withScrollBar);

Q_SIGNALS:
    // Emitted before the list opens, even if it then cannot.
    void signalPopupShow();
    // Emitted when the list was opened or closed.
    void signalShowComboxList(bool shown);

protected:
    bool event(QEvent* event) override;
    bool eventFilter(QObject* obj, QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;
    void moveEvent(QMoveEvent* event) override;

    virtual void setListWidth(int width, int textWidth);
    virtual void adjustPopupListSize();
    virtual void adjustPopupListPostion();
    virtual void drawPopListTranslucent(QWidget* popup);
    // Draws the text of a box that is not editable; font and pen of painter are set.
    virtual void drawText(QPainter& painter, const QRect& area);
    // Handles the keys of the list: Escape closes, Return chooses, Up and Down move the cursor.
    virtual bool KeyEventFilter(QObject* obj, QEvent* event);
    virtual bool handlePopupWidgetEvent(QObject* obj, QEvent* event);

private:
    using Slices = std::array<QPixmap, 3>;

    void initPopup();
    void choose(const QModelIndex& index);
    void popupHidden();
    void setPressed(bool pressed);
    void sendMouse(QEvent::Type type);
    void comeUp();
    int longestTextWidth() const;

    OneFinger m_finger{this};   // first: the making of the others sends events that it looks at
    QWidget* m_popup = nullptr; // the list's window, owned by the base class
    CustomComboBoxView* m_view;
    CustomComboBoxDelegate* m_delegate;
    OutsidePressFilter* m_outsidePress = nullptr;
    Slices m_rest;
    Slices m_pressedSlices;
    Slices m_disabledSlices;
    bool m_popupEnable = true;
    bool m_listWidthByText = false;
    bool m_popupUpper = false;
    bool m_pressed = false;
    bool m_shown = false; // the last signalShowComboxList() was sent with true
};
