#pragma once

#include "gallery/Fingers.h"
#include "gallery/GalleryPage.h"

#include <QRandomGenerator>
#include <QStringList>

class KSAppEventFilter;
class QWidget;

// Plays at random with a page: fingers that press, move, lift and are taken away, several at once and on
// several windows, and the mouse. The same seed plays the same game. The filter is the application's.
class Monkey
{
public:
    Monkey(KSAppEventFilter* filter, quint32 seed);

    // Plays so many steps, lifts everything and waits until nothing moves. What is wrong then, a line each:
    // a stuck touch lock, a widget that is left pressed, a finger that a list still follows.
    QStringList play(GalleryPage& page, int steps);

private:
    void step(GalleryPage& page);
    void press(GalleryPage& page);
    void move();
    void mouse(GalleryPage& page);
    int number(int below) { return static_cast<int>(m_random.bounded(below)); }
    QList<QWidget*> windows(const GalleryPage& page) const;
    QPoint anyPoint(QWidget* window);
    QStringList leftovers(const GalleryPage& page) const;

    KSAppEventFilter* m_filter;
    QRandomGenerator m_random;
    Fingers m_fingers;
};
