#pragma once

#include <QObject>
#include <QRect>
#include <QTimer>

// Shows a balloon with the full text of a name that its row shows elided. The balloon hides after a time. GUI
// thread only.
class ElidedTextTip : public QObject
{
    Q_OBJECT
public:
    ElidedTextTip();

    // row is in global coordinates; textWidth is the width in pixels that the row has for the name.
    void show(const QRect& row, const QString& text, int textWidth);
    // Hides the balloon if it was shown by this object.
    void hide();
    // Restarts the time until the balloon hides, if it is visible.
    void restartIfActive();

private:
    QTimer m_timer;
    bool m_shown = false;
};
