// The title list with its label, shown at the size that it has in the window.
#pragma once

#include "library/ArchiveList.h"

#include <QLabel>

class ShownList
{
public:
    ShownList();

    // Opens the folder and waits until the titles in view are complete.
    void open(const QString& folder);
    // Makes and completes the items of all titles.
    void completeAll();

    // What the program does at once: layouts, queued calls, updates and the paint events of the window.
    static void show(QWidget& window);

private:
    QLabel mLabel;

public:
    ArchiveList list;
};
