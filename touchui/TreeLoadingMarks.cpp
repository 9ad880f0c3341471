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
