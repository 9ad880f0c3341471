#pragma once

#include <QObject>
#include <QPoint>

class QWidget;

// Keeps a frameless window at the position that the program has set, and corrects Qt's record of its
// position.
//
// If a window manager takes over a window while Qt queries its position from the display server, Qt keeps a
// wrong position for the lifetime of the window. Mouse events contain their position in the window, but touch
// positions are calculated from the recorded one and would miss every button.
//
// A child of the window that it watches. GUI thread.
class WindowPlaceKeeper : public QObject
{
    Q_OBJECT

public:
    explicit WindowPlaceKeeper(QWidget* window);

    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void check();

    QWidget* m_window;
    QPoint m_place; // the position set by the program, global
    int m_tries = 0;
};
