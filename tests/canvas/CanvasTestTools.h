// Makes records and items for the tests of the canvas.
#pragma once

#include "canvas/GraphicsText.h"
#include "canvas/InputLanguageFonts.h"
#include "canvas/TextObjectConstants.h"
#include "document/TText.h"

#include <QString>
#include <QTextCursor>
#include <QTextDocument>
#include <memory>
#include <vector>

inline TextStyle makeStyle(const QString& text, const char* family = "KST", int size = 96)
{
    TextStyle style;
    style.setText(text.toStdString());
    style.setFontFamily(family);
    style.setFontSize(size);
    return style;
}

// Returns a record as another program would write it, with one style per UTF-16 unit: the first unit of a
// pair has the whole text.
inline TText makeRecord(const QString& text, int id = 1, const char* family = "KST", int size = 96)
{
    TText record;
    record.setTextObjectID(id);
    record.setText(text.toStdString());
    record.setXValue(300.0F);
    record.setYValue(200.0F);
    record.setZValue(1.0F);
    std::vector<TextStyle*> items;
    for (int i = 0; i < text.size(); ++i) {
        if (text.at(i).isLowSurrogate())
            items.push_back(new TextStyle(makeStyle(QString(), family, size)));
        else
            items.push_back(
                new TextStyle(makeStyle(text.mid(i, text.at(i).isHighSurrogate() ? 2 : 1), family, size)));
    }
    record.setTextItems(std::move(items));
    return record;
}

// Returns the source of a style change: count copies of the style.
inline TText makeSource(const TextStyle& style, int count)
{
    TText source;
    std::vector<TextStyle*> items;
    for (int i = 0; i < count; ++i)
        items.push_back(new TextStyle(style));
    source.setTextItems(std::move(items));
    return source;
}

inline QString textOfStyles(const TText& record)
{
    QString text;
    for (const TextStyle* style : record.textItems())
        text += QString::fromStdString(style->getText());
    return text;
}

inline bool inStep(const GraphicsText& item)
{
    return int(item.getItemTText()->textItems().size()) == item.document()->characterCount() - 1 &&
           textOfStyles(*item.getItemTText()) == item.toPlainText();
}

// Connects the document so that typed text is read back into the record, as the scene does.
inline void connectDocument(GraphicsText& item)
{
    QObject::connect(item.document(), &QTextDocument::contentsChange, &item,
                     &GraphicsText::slotObjectDocumentChange);
}

inline void typeText(GraphicsText& item, const QString& text)
{
    QTextCursor cursor = item.textCursor();
    cursor.insertText(text);
    item.setTextCursor(cursor);
}

inline void typeTextAt(GraphicsText& item, int position, const QString& text)
{
    QTextCursor cursor = item.textCursor();
    cursor.setPosition(position);
    item.setTextCursor(cursor);
    typeText(item, text);
}

inline void selectRange(GraphicsText& item, int anchor, int position)
{
    QTextCursor cursor = item.textCursor();
    cursor.setPosition(anchor);
    cursor.setPosition(position, QTextCursor::KeepAnchor);
    item.setTextCursor(cursor);
}
