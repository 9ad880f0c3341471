#include "bench/ShownList.h"

#include "library/ArchiveItem.h"

#include <QCoreApplication>

namespace
{

const QSize LIST_SIZE(549, 997);

} // namespace

ShownList::ShownList() : list(&m_label, false)
{
    list.setFixedSize(LIST_SIZE);
    list.show();
    show(list);
}

void ShownList::open(const QString& folder)
{
    list.refreshArchiveList(folder);
    while (list.count() > 0 && !list.archiveItem(list.lastVisibleItem())->hasChildWidgets())
        show(list);
    show(list);
}

void ShownList::completeAll()
{
    for (int i = 0; i < list.count(); ++i)
        list.archiveItem(i);
    while (list.count() > 0 && !list.archiveItem(list.count() - 1)->hasChildWidgets())
        show(list);
    show(list);
}

void ShownList::show(QWidget& window)
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(&window, QEvent::UpdateRequest);
}
