#pragma once

#include <QObject>
#include <QPointer>

class QWidget;

// Knows whether the field with the input focus is handling the release of a key. GUI thread only.
class KeyReleaseWatch : public QObject
{
    Q_OBJECT
public:
    // Watches this widget instead of the last one; null watches nothing.
    void watch(QWidget* widget);
    bool isReleasing() const { return m_releasing; }

    bool eventFilter(QObject* object, QEvent* event) override;

private:
    QPointer<QWidget> m_widget;
    bool m_releasing = false;
};
