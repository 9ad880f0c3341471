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

// A combo box for one finger, painted from pictures. Its list is a window of its own that closes by a choice,
// by a press outside and when another process takes the touch; it is no popup of Qt's, so touches go on
// reaching everything else.
class KSCombobox : public QComboBox
{
    Q_OBJECT
public:
    // A row with this role set to true is one that setUSBEnabled switches.
    static constexpr int USBRole = Qt::UserRole + 100;

    explicit KSCombobox(QWidget* parent = nullptr);
    ~KSCombobox() override;

    void showPopup() override;
    void hidePopup() override;
    bool isPopupVisible() const;
    CustomComboBoxView* listView() const { return m_view; }

    // While off, the list does not open.
    void setPopupEnable(bool enable) { m_popupEnable = enable; }
    // The list is wide enough for the longest text instead of as wide as the box.
    void setListWidthByText(bool byText) { m_listWidthByText = byText; }
    // The list opens above the box. Without room it opens on the other side.
    void setPopupUpper(bool upper) { m_popupUpper = upper; }
    // Rows and box show colours, see CustomComboBoxDelegate.
    void setColorPallete(bool on);
    // Enables or disables the rows of USBRole.
    void setUSBEnabled(bool enabled);
    // The pictures of the closed box: path + "_Left", "_Center", "_Pulldown", and the same after "_Pressed"
    // and "_Disable".
    void setBackgroundImagesPath(const QString& path);
    // These hide an open list, too.
    void setEnabled(bool enabled);
    void setDisabled(bool disabled);

    // The width of the list for a box and a longest text of these widths, in pixels.
    static int listWidth(int width, int textWidth, bool byText, bool withScrollBar);

Q_SIGNALS:
    // The list is about to open, if it can.
    void signalPopupShow();
    // The list has been opened or closed.
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
    // The text of the closed box that cannot be typed in; painter has font and pen.
    virtual void drawText(QPainter& painter, const QRect& area);
    // Keys for the list: Escape closes, Return chooses, Up and Down move the cursor.
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

    QWidget* m_popup = nullptr; // the list's window, owned by the base
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
    bool m_shown = false; // signalShowComboxList(true) was sent last
    OneFinger m_finger{this};
};
