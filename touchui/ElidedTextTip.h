#pragma once

#include <QObject>
#include <QRect>
#include <QTimer>

// The balloon with a name that its row shows shortened; it leaves by itself. GUI thread only.
class ElidedTextTip : public QObject
{
    Q_OBJECT
public:
    ElidedTextTip();

    // row is global; textWidth is what the row has for the name, in pixels.
    void show(const QRect& row, const QString& text, int textWidth);
    // Hides the balloon that this object shows; another's stays.
    void hide();
    // Starts its time once more, if it shows.
    void restartIfActive();

private:
    QTimer m_timer;
    bool m_shown = false;
};
