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

// Sends random input to a page: fingers that press, move, lift and are cancelled, several at once and on
// several windows, and the mouse. The same seed gives the same input. The filter is that of the application.
class Monkey
{
public:
    Monkey(KSAppEventFilter* filter, quint32 seed);

    // Carries out the number of steps, lifts all fingers now and then and at the end, and waits until nothing
    // moves. Returns one line for each problem: a touch lock that is still held, a widget that stays pressed,
    // a list that keeps moving.
    QStringList play(GalleryPage& page, int steps);
    // Returns a checksum of the input so far, which is the same for the same seed, page and number of steps.
    quint32 inputChecksum() const { return m_input; }
    // Returns one line for each widget of the process that is not at rest.
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
    QList<QRect> m_targets; // rectangles of the page's widgets, in coordinates of the page
    quint32 m_input = 2166136261U;
};
