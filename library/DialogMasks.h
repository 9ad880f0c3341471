// The two masks that darken a dialog and keep fingers off it: one while another process shows a dialog above
// it, one while a message box is up. GUI thread.
#pragma once

#include <QRect>

class QWidget;

class DialogMasks
{
public:
    // The area in the owner's coordinates. The owner owns the masks, which are made at first use, and
    // outlives this object.
    DialogMasks(QWidget* owner, const QRect& area);

    // Touches reach the owner again once neither mask shows.
    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);

private:
    void setShown(QWidget*& mask, bool show);

    QWidget* mOwner;
    QRect mArea;
    QWidget* mDialogMask = nullptr;
    QWidget* mMessageMask = nullptr;
};
