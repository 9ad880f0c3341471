// Check boxes, loading and recording marks of the tree, and the balloon of a shortened name.
#include "touchui/KSToolTip.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

QStringList KSTreeView::s_checkBoxImagesPath = {
    QStringLiteral(":/CheckBox/Checkbox_On_Rest"),
    QStringLiteral(":/CheckBox/Checkbox_On_Pressed"),
    QStringLiteral(":/CheckBox/Checkbox_On_Disabled"),
    QStringLiteral(":/CheckBox/Checkbox_Off_Rest"),
    QStringLiteral(":/CheckBox/Checkbox_Off_Pressed"),
    QStringLiteral(":/CheckBox/Checkbox_Off_Disabled"),
    QStringLiteral(":/CheckBox/Checkbox_Partial_Rest"),
    QStringLiteral(":/CheckBox/Checkbox_Partial_Pressed"),
    QStringLiteral(":/CheckBox/Checkbox_Partial_Disabled"),
};

// --- Check state --------------------------------------------------------------------------------------

KSTreeView::CheckBoxImage KSTreeView::getCheckBoxImageType(const QModelIndex& index) const
{
    int family = OffRest;
    switch (index.data(Qt::CheckStateRole).toInt()) {
    case Qt::Checked:
        family = OnRest;
        break;
    case Qt::PartiallyChecked:
        family = PartialRest;
        break;
    default:
        break;
    }
    int state = 0;
    if (!isUsable(index)) {
        state = OnDisabled;
    } else if (m_pressedCheckBox.isValid() && m_pressedCheckBox == index.siblingAtColumn(0)) {
        state = OnPressed;
    }
    return static_cast<CheckBoxImage>(family + state);
}

void KSTreeView::changeCheckState(const QModelIndex& index)
{
    const QModelIndex first = index.siblingAtColumn(0);
    if (m_treeModel == nullptr || !isUsable(first) || !m_treeModel->getCheckable(first)) {
        return;
    }
    const bool on = first.data(Qt::CheckStateRole).toInt() == Qt::Checked;
    const Qt::CheckState state = on ? Qt::Unchecked : Qt::Checked;
    m_treeModel->setData(first, static_cast<int>(state), Qt::CheckStateRole);
    changeChildrenCheckState(first, state);
    changeParentsCheckState(first);
}

// Children that have not been made yet take the state of their parent when they are.
void KSTreeView::changeChildrenCheckState(const QModelIndex& index, Qt::CheckState state)
{
    if (m_treeModel == nullptr || !m_treeModel->areChildrenMade(index)) {
        return;
    }
    const int rows = m_treeModel->rowCount(index);
    int number = 0;
    for (int row = 0; row < rows; ++row) {
        const QModelIndex child = m_treeModel->index(row, 0, index);
        if (m_treeModel->getCheckable(child)) {
            m_treeModel->setData(child, static_cast<int>(state), Qt::CheckStateRole);
            changeChildrenCheckState(child, state);
            number += state == Qt::Unchecked ? 0 : 1;
        }
    }
    m_treeModel->setData(index, number, KSVIEW::OnOrPartialChildrenNumberRole);
}

void KSTreeView::changeParentsCheckState(const QModelIndex& index)
{
    if (m_treeModel == nullptr) {
        return;
    }
    for (QModelIndex parent = index.parent(); parent.isValid(); parent = parent.parent()) {
        int number = 0;
        for (int row = 0; row < m_treeModel->rowCount(parent); ++row) {
            const QModelIndex child = m_treeModel->index(row, 0, parent);
            number += child.data(Qt::CheckStateRole).toInt() == Qt::Unchecked ? 0 : 1;
        }
        m_treeModel->setData(parent, number, KSVIEW::OnOrPartialChildrenNumberRole);
        changeCheckStateByNumber(parent, number);
    }
}

void KSTreeView::changeCheckStateByNumber(const QModelIndex& index, int number)
{
    if (m_treeModel == nullptr || !m_treeModel->getCheckable(index)) {
        return;
    }
    int checkable = 0;
    bool partial = false;
    for (int row = 0; row < m_treeModel->rowCount(index); ++row) {
        const QModelIndex child = m_treeModel->index(row, 0, index);
        checkable += m_treeModel->getCheckable(child) ? 1 : 0;
        partial = partial || child.data(Qt::CheckStateRole).toInt() == Qt::PartiallyChecked;
    }
    Qt::CheckState state = Qt::PartiallyChecked;
    if (number <= 0) {
        state = Qt::Unchecked;
    } else if (number >= checkable && !partial) {
        state = Qt::Checked;
    }
    m_treeModel->setData(index, static_cast<int>(state), Qt::CheckStateRole);
}

void KSTreeView::setCheckBoxVisible(bool visible)
{
    m_checkBoxVisible = visible;
    m_pressedCheckBox = QModelIndex();
    viewport()->update();
}

// --- Loading and recording ----------------------------------------------------------------------------

QString KSTreeView::getLoadingImagePath(int step) const
{
    const int count = KSVIEW::LOADING_IMAGE_COUNT;
    const int number = ((step - 1) % count + count) % count + 1;
    return QStringLiteral(":/Views/Loading_Icon-%1").arg(number, 2, 10, QLatin1Char('0'));
}

void KSTreeView::dataChanged(const QModelIndex& topLeft, const QModelIndex& bottomRight,
                             const QList<int>& roles)
{
    QTreeView::dataChanged(topLeft, bottomRight, roles);
    if (m_treeModel != nullptr && roles.contains(KSVIEW::ItemLoadingRole) && !m_loadingTimer.isActive() &&
        topLeft.data(KSVIEW::ItemLoadingRole).toInt() > 0) {
        m_loadingTimer.start();
    }
}

void KSTreeView::slotUpdateLoadingIcon()
{
    const QModelIndexList loading =
        m_treeModel != nullptr ? m_treeModel->madeIndexesWith(KSVIEW::ItemLoadingRole) : QModelIndexList();
    if (loading.isEmpty()) {
        m_loadingTimer.stop();
        return;
    }
    for (const QModelIndex& index : loading) {
        const int step = index.data(KSVIEW::ItemLoadingRole).toInt();
        m_treeModel->setData(index, step % KSVIEW::LOADING_IMAGE_COUNT + 1, KSVIEW::ItemLoadingRole);
    }
}

void KSTreeView::clearAllLoadingState()
{
    m_loadingTimer.stop();
    if (m_treeModel != nullptr) {
        m_treeModel->setAttributeOfAll(KSVIEW::ItemLoadingRole, 0);
    }
}

void KSTreeView::clearRecording()
{
    if (m_treeModel != nullptr) {
        m_treeModel->setAttributeOfAll(KSVIEW::ItemRecordingRole, false);
    }
}

// --- Shortened names ----------------------------------------------------------------------------------

void KSTreeView::showElidedText(const QModelIndex& index)
{
    const QRect row = getIndexVisualRect(index);
    const QRect cell = visualRect(index);
    const QRect text =
        index.column() == 0 ? getLayoutForFirstColumn(cell, index).text : m_viewStyle->textRect(cell);
    KSToolTip::showTextForTreeView(QRect(viewport()->mapToGlobal(row.topLeft()), row.size()),
                                   index.data(Qt::DisplayRole).toString(), text.width());
    m_elidedTextShown = true;
    m_singleShotTimer.start();
}

void KSTreeView::hideElidedText()
{
    m_singleShotTimer.stop();
    if (m_elidedTextShown) {
        m_elidedTextShown = false;
        KSToolTip::hideText();
    }
}
