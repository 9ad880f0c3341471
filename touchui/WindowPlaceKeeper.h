// Keeps a frameless window where the program has put it, and what Qt knows of its place true.
//
// A window manager that takes a window over while Qt asks the display server for its place makes Qt believe
// in a place where the window is not, for as long as the window lives. A mouse brings its own place in the
// window along; touches are counted from where Qt believes the window to be, and would miss every button.
//
// A child of the window that it watches. GUI thread.
#pragma once

#include <QObject>
#include <QPoint>

class QWidget;

class WindowPlaceKeeper : public QObject
{
    Q_OBJECT

public:
    explicit WindowPlaceKeeper(QWidget* window);

    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void check();

    QWidget* mWindow;
    QPoint mPlace; // where the program has put the window, global
    int mTries = 0;
};
