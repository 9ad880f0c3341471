// Makes text objects for the tests of lists.
#pragma once

#include "document/TText.h"
#include "document/TextStyle.h"

#include <QString>
#include <QStringList>
#include <vector>

// Returns a text object with one run for each part, whose size is 40 for the first part, 50 for the second
// and so on.
inline TText textOf(const QStringList& parts, int id = 1)
{
    TText text;
    std::vector<TextStyle*> items;
    int size = 40;
    for (const QString& part : parts) {
        auto* style = new TextStyle;
        style->setText(part.toStdString());
        style->setFontSize(size);
        items.push_back(style);
        size += 10;
    }
    text.setTextItems(items);
    text.setText(parts.join(QString()).toStdString());
    text.setTextObjectID(id);
    text.setXValue(200.0F);
    text.setYValue(100.0F);
    text.setZValue(1.0F);
    return text;
}

// Returns the styles as "Anna:40 é:50", one word for each group of the same size.
inline QString sizesOf(const TText& text)
{
    QString result;
    int last = -1;
    for (const TextStyle* style : text.textItems()) {
        if (style->getFontSize() != last && last >= 0)
            result += QStringLiteral(":%1 ").arg(last);
        last = style->getFontSize();
        result += QString::fromStdString(style->getText());
    }
    return last < 0 ? result : result + QStringLiteral(":%1").arg(last);
}
