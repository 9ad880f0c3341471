#pragma once

#include "library/TemplateItem.h"

#include <QLabel>
#include <QStringList>

// Returns the text lines that an item of the list shows; none before its contents were made.
inline QStringList textLines(const QWidget* item)
{
    QStringList lines;
    const QList<QLabel*> labels = item->findChildren<QLabel*>();
    for (const QLabel* label : labels) {
        const bool isHandle = label->parentWidget() == item;
        if (!isHandle)
            lines.append(label->text());
    }
    return lines;
}

// Returns whether the template has the frame of the selected one.
inline bool hasSelectedStyle(const TemplateItem* item)
{
    return item->styleSheet().contains(QStringLiteral("border: 4px solid rgb(0, 129, 255)"));
}
