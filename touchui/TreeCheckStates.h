#pragma once

#include <QModelIndex>

class KSTreeModel;

// The check boxes of a tree model: a row's state goes down to the rows below it and makes the states of the
// rows above it. Rows that are not checkable keep theirs. GUI thread only.
class TreeCheckStates
{
public:
    // The model is not owned.
    explicit TreeCheckStates(KSTreeModel& model) : m_model(model) {}

    // Gives the row the other state, and with it all below and above it. A partial one becomes checked.
    void toggle(const QModelIndex& index);
    void setChildren(const QModelIndex& index, Qt::CheckState state);
    void updateParents(const QModelIndex& index);
    // Sets a row's state by how many of its children are on or partial: none, all and each of them on, else.
    void setByNumber(const QModelIndex& index, int number);

private:
    KSTreeModel& m_model;
};
