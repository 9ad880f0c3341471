#pragma once

#include <QMargins>
#include <QRect>

class QWidget;

// The two masks that darken a window and block touches on it: one while another process shows a dialog above
// it, one while a message box is shown. GUI thread.
class DialogMasks
{
public:
    // Selects whether a press on a mask is also passed on to the owner, as with any child widget, or ends at
    // the mask.
    enum class Press { ReachesOwner, EndsHere };

    // The masks cover the owner except for the margins. The owner owns them and must outlive this object;
    // they are created when they are first shown, in the owner's size at that time.
    explicit DialogMasks(QWidget* owner, const QMargins& margins = QMargins(),
                         Press press = Press::ReachesOwner);

    // The owner receives touches again when neither mask is shown.
    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);

    // Creates a dark child of the owner that covers the area, in the owner's coordinates. It takes no focus
    // and is raised; the caller shows and hides it.
    static QWidget* createMask(QWidget* owner, const QRect& area);
    // Gives the widget the background colour of a mask.
    static void darken(QWidget* widget);

private:
    void setShown(QWidget*& mask, bool show);

    QWidget* m_owner;
    QMargins m_margins;
    Press m_press;
    QWidget* m_dialogMask = nullptr;
    QWidget* m_messageMask = nullptr;
};
