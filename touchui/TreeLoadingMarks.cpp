#include "touchui/TreeLoadingMarks.h"

#include "touchui/KSTreeModel.h"
#include "touchui/KSVIEW.h"

namespace
{

constexpr int STEP_INTERVAL = 100; // ms

} // namespace

TreeLoadingMarks::TreeLoadingMarks()
{
    m_timer.setInterval(STEP_INTERVAL);
    connect(&m_timer, &QTimer::timeout, this, &TreeLoadingMarks::turn);
}

QString TreeLoadingMarks::imagePath(int step)
{
    const int count = KSVIEW::LOADING_IMAGE_COUNT;
    const int number = ((step - 1) % count + count) % count + 1;
    return QStringLiteral(":/Views/Loading_Icon-%1").arg(number, 2, 10, QLatin1Char('0'));
}

void TreeLoadingMarks::setModel(KSTreeModel* model)
{
    if (m_model != nullptr)
        disconnect(m_model, nullptr, this, nullptr);
    m_model = model;
    if (m_model != nullptr)
        connect(m_model, &QAbstractItemModel::dataChanged, this, &TreeLoadingMarks::startIfLoading);
}

void TreeLoadingMarks::startIfLoading(const QModelIndex& topLeft, const QModelIndex&, const QList<int>& roles)
{
    if (roles.contains(KSVIEW::ItemLoadingRole) && topLeft.data(KSVIEW::ItemLoadingRole).toInt() > 0)
        start();
}

void TreeLoadingMarks::start()
{
    if (m_model != nullptr && !m_timer.isActive())
        m_timer.start();
}

void TreeLoadingMarks::restartIfActive()
{
    if (m_timer.isActive())
        m_timer.start();
}

void TreeLoadingMarks::turn()
{
    const QModelIndexList loading =
        m_model != nullptr ? m_model->madeIndexesWith(KSVIEW::ItemLoadingRole) : QModelIndexList();
    if (loading.isEmpty()) {
        m_timer.stop();
        return;
    }
    for (const QModelIndex& index : loading) {
        const int step = index.data(KSVIEW::ItemLoadingRole).toInt();
        m_model->setData(index, step % KSVIEW::LOADING_IMAGE_COUNT + 1, KSVIEW::ItemLoadingRole);
    }
}
