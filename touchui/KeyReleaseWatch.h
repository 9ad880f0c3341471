#pragma once

#include <QObject>
#include <QPointer>

class QWidget;

// Tracks whether the field with the input focus is handling the release of a key. GUI thread only.
class KeyReleaseWatch : public QObject
{
    Q_OBJECT
public:
    // Watches this widget instead of the previous one; null stops watching.
    void watch(QWidget* widget);
    bool isReleasing() const { return m_releasing; }

    bool eventFilter(QObject* object, QEvent* event) override;

private:
    QPointer<QWidget> m_widget;
    bool m_releasing = false;
};
