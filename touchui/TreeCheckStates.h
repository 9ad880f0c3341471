#pragma once

#include <QModelIndex>

class KSTreeModel;

// Updates the check boxes of a tree model: the state of a row is passed to the rows below it and determines
// the states of the rows above it. Rows that are not checkable keep their state. GUI thread only.
class TreeCheckStates
{
public:
    // The model is not owned.
    explicit TreeCheckStates(KSTreeModel& model) : m_model(model) {}

    // Toggles the row and updates the rows below and above it. A partially checked row becomes checked.
    void toggle(const QModelIndex& index);
    void setChildren(const QModelIndex& index, Qt::CheckState state);
    void updateParents(const QModelIndex& index);
    // Sets a row's state from the number of its children that are checked or partially checked: unchecked for
    // 0, checked if all are checked, else partially checked.
    void setByNumber(const QModelIndex& index, int number);

private:
    KSTreeModel& m_model;
};
