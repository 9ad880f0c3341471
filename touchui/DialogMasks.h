#pragma once

#include <QMargins>
#include <QRect>

class QWidget;

// The two masks that darken a window and keep fingers off it: one while another process shows a dialog above
// it, one while a message box is up. GUI thread.
class DialogMasks
{
public:
    // What a press on a mask does: it reaches the owner as well, as any press on a plain child does, or not.
    enum class Press { ReachesOwner, EndsHere };

    // The masks cover the owner but for the margins. The owner owns them, and outlives this object; they are
    // made at first use, in the size that the owner has then.
    explicit DialogMasks(QWidget* owner, const QMargins& margins = QMargins(),
                         Press press = Press::ReachesOwner);

    // Touches reach the owner again when neither mask shows.
    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);

    // Returns a new dark child of the owner that covers the area, in the owner's coordinates. It takes no
    // focus and is raised, and the caller shows or hides it.
    static QWidget* createMask(QWidget* owner, const QRect& area);
    // Gives the widget the colour of a mask as its background.
    static void darken(QWidget* widget);

private:
    void setShown(QWidget*& mask, bool show);

    QWidget* m_owner;
    QMargins m_margins;
    Press m_press;
    QWidget* m_dialogMask = nullptr;
    QWidget* m_messageMask = nullptr;
};
