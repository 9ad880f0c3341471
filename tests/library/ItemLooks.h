#pragma once

#include "library/ArchiveItem.h"
#include "library/TemplateItem.h"
#include "library/TitleLines.h"

#include <QStringList>

// Returns the part of an item that shows its texts; null before its contents were made.
inline TitleLines* textArea(const ArchiveItem* item)
{
    return qobject_cast<TitleLines*>(item->getRightChild());
}

// Returns the text lines that an item of the list shows; none before its contents were made.
inline QStringList textLines(const ArchiveItem* item)
{
    const TitleLines* area = textArea(item);
    return area ? area->lines() : QStringList();
}

// Returns whether the template has the frame of the selected one.
inline bool hasSelectedStyle(const TemplateItem* item)
{
    return item->styleSheet().contains(QStringLiteral("border: 4px solid rgb(0, 129, 255)"));
}
