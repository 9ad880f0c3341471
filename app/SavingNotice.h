// Darkens a window and says that it is saving, while the GUI thread waits. The owner hides it. GUI thread
// only.
#pragma once

#include <QLabel>

class SavingNotice : public QLabel
{
    Q_OBJECT

public:
    // A hidden child of the window, which owns it.
    explicit SavingNotice(QWidget* window);

    // Covers the window and is on the screen when the call returns, without a turn of the event loop.
    void showAtOnce();
};
