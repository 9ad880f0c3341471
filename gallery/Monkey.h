#pragma once

#include "gallery/Fingers.h"
#include "gallery/GalleryPage.h"

#include <QList>
#include <QPoint>
#include <QRandomGenerator>
#include <QRect>
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
    // Plays so many steps, lifting everything now and then and at the end, and waits until nothing moves.
    // What is wrong then, a line each: a stuck touch lock, a widget that is left pressed, a list that still
    // runs.
    QStringList play(GalleryPage& page, int steps);
    // Of all that was played, the same for the same seed, page and number of steps.
    quint32 inputChecksum() const { return m_input; }
    // What is not at rest in any widget of the process, a line each.
    static QStringList leftovers();

private:
    void step(const GalleryPage& page);
    void press(const GalleryPage& page);
    void move();
    void lift();
    void mouse(const GalleryPage& page);
    void note(int action, int finger, const QPoint& place);
    int number(int below) { return static_cast<int>(m_random.bounded(below)); }
    QList<QWidget*> windows(const GalleryPage& page) const;
    QWidget* windowAt(const GalleryPage& page, const QPoint& place) const;
    QPoint anyPoint(const GalleryPage& page);
    QString holders() const;

    KSAppEventFilter* m_filter;
    QRandomGenerator m_random;
    Fingers m_fingers;
    QList<QRect> m_targets; // the widgets of the page, in its coordinates
    quint32 m_input = 2166136261U;
};
