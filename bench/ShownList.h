#pragma once

#include "library/ArchiveList.h"

#include <QLabel>

// The title list with its label, shown in the size that it has in the window.
class ShownList
{
public:
    ShownList();

    // Opens the folder and waits until the titles in view are complete.
    void open(const QString& folder);
    // Makes the items of all titles with their child widgets.
    void completeAll();

    // Does at once what the event loop would do: layouts, queued calls, updates and the paint events of the
    // window.
    static void show(QWidget& window);

private:
    QLabel m_label;

public:
    ArchiveList list;
};
