#pragma once

#include <QObject>
#include <QPointer>
#include <QString>
#include <QTimer>

class KSTreeModel;

// Animates the marks of a tree's rows that are loading. A row's loading role contains the step that its mark
// shows, beginning with 1; 0 if it is not loading. GUI thread only.
class TreeLoadingMarks : public QObject
{
    Q_OBJECT
public:
    TreeLoadingMarks();

    // step counts from 1 to 8; other values wrap around.
    static QString imagePath(int step);

    // Sets the model, which is not owned; null for none. The animation starts when one of its rows begins to
    // load.
    void setModel(KSTreeModel* model);
    void start();
    void stop() { m_timer.stop(); }
    // Restarts the time of a step if the animation is running.
    void restartIfActive();

public Q_SLOTS:
    // Shows the next step of each mark; stops when no row is loading.
    void turn();

private:
    void startIfLoading(const QModelIndex& topLeft, const QModelIndex& bottomRight, const QList<int>& roles);

    QPointer<KSTreeModel> m_model;
    QTimer m_timer;
};
