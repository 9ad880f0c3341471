#pragma once

#include <QObject>
#include <QString>
#include <QTimer>

class KSTreeModel;

// Turns the marks of a tree's rows that are loading. A row's loading role holds the step that its mark shows,
// from 1 on; 0 is not loading. GUI thread only.
class TreeLoadingMarks : public QObject
{
    Q_OBJECT
public:
    TreeLoadingMarks();

    // step counts from 1 to 8; others are taken round.
    static QString imagePath(int step);

    // The model is not owned. Null turns nothing.
    void setModel(KSTreeModel* model) { m_model = model; }
    void start();
    void stop() { m_timer.stop(); }
    // Starts the time of a step once more, if the marks turn.
    void restartIfActive();

public Q_SLOTS:
    // Shows the next step of each mark; stops when no row is loading any more.
    void turn();

private:
    KSTreeModel* m_model = nullptr;
    QTimer m_timer;
};
