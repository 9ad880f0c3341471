#include "touchui/TreeCheckStates.h"

#include "touchui/KSTreeModel.h"
#include "touchui/KSVIEW.h"

void TreeCheckStates::toggle(const QModelIndex& index)
{
    const bool on = index.data(Qt::CheckStateRole).toInt() == Qt::Checked;
    const Qt::CheckState state = on ? Qt::Unchecked : Qt::Checked;
    m_model.setData(index, static_cast<int>(state), Qt::CheckStateRole);
    setChildren(index, state);
    updateParents(index);
}

// Children that do not exist yet take the state of their parent when they are created.
void TreeCheckStates::setChildren(const QModelIndex& index, Qt::CheckState state)
{
    if (!m_model.areChildrenMade(index))
        return;
    const int rows = m_model.rowCount(index);
    int number = 0;
    for (int row = 0; row < rows; ++row) {
        const QModelIndex child = m_model.index(row, 0, index);
        if (m_model.getCheckable(child)) {
            m_model.setData(child, static_cast<int>(state), Qt::CheckStateRole);
            setChildren(child, state);
            number += state == Qt::Unchecked ? 0 : 1;
        }
    }
    m_model.setData(index, number, KSVIEW::OnOrPartialChildrenNumberRole);
}

void TreeCheckStates::updateParents(const QModelIndex& index)
{
    for (QModelIndex parent = index.parent(); parent.isValid(); parent = parent.parent()) {
        int number = 0;
        for (int row = 0; row < m_model.rowCount(parent); ++row) {
            const QModelIndex child = m_model.index(row, 0, parent);
            number += child.data(Qt::CheckStateRole).toInt() == Qt::Unchecked ? 0 : 1;
        }
        m_model.setData(parent, number, KSVIEW::OnOrPartialChildrenNumberRole);
        setByNumber(parent, number);
    }
}

void TreeCheckStates::setByNumber(const QModelIndex& index, int number)
{
    if (!m_model.getCheckable(index))
        return;
    int checkable = 0;
    bool partial = false;
    for (int row = 0; row < m_model.rowCount(index); ++row) {
        const QModelIndex child = m_model.index(row, 0, index);
        checkable += m_model.getCheckable(child) ? 1 : 0;
        partial = partial || child.data(Qt::CheckStateRole).toInt() == Qt::PartiallyChecked;
    }
    Qt::CheckState state = Qt::PartiallyChecked;
    if (number <= 0)
        state = Qt::Unchecked;
    else if (number >= checkable && !partial)
        state = Qt::Checked;
    m_model.setData(index, static_cast<int>(state), Qt::CheckStateRole);
}
