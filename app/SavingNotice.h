#pragma once

#include <QLabel>

// Darkens a window and shows that it is saving, while the GUI thread is blocked. The owner hides it. GUI
// thread only.
class SavingNotice : public QLabel
{
    Q_OBJECT

public:
    // Makes a hidden child of the window, which owns it.
    explicit SavingNotice(QWidget* window);

    // Covers the window and paints at once, without returning to the event loop.
    void showAtOnce();
};
