#pragma once

#include "tests/canvas/CanvasFixture.h"
#include "tests/canvas/StyleProperties.h"

#include <QRandomGenerator>

// An operator who edits at random, for tests. The same seed gives the same edits.
class RandomEditor
{
public:
    RandomEditor(Canvas& canvas, quint32 seed, int longestText)
        : m_canvas(canvas), m_random(seed), m_longestText(longestText)
    {
    }

    // Carries out one edit of a kind that is possible now.
    void edit()
    {
        switch (below(16)) {
        case 0:
            create();
            break;
        case 1:
            remove();
            break;
        case 2:
            moveByPanel();
            break;
        case 3:
            drag();
            break;
        case 4:
            m_canvas.tap(anyPoint());
            break;
        case 5:
            closeKeyboard();
            break;
        case 6:
        case 7:
        case 8:
            type();
            break;
        case 9:
            erase();
            break;
        case 10:
            select();
            break;
        case 11:
            silence();
            break;
        default:
            style();
            break;
        }
    }

    // Ends the current edit, as the buttons of the window do before an undo.
    void leave()
    {
        if (m_canvas.scene->itemIsEditorInteraction())
            m_canvas.scene->clearItemsSelectionAndFocus();
        else if (m_canvas.scene->itemIsSelectionMode())
            m_canvas.scene->clearItemsSelectionMode();
    }

    int below(int limit) { return m_random.bounded(limit); }

private:
    GraphicsText* anyText()
    {
        const QList<GraphicsText*> texts = m_canvas.scene->getTextItemList();
        return texts.isEmpty() ? nullptr : texts.at(below(int(texts.size())));
    }
    // Returns a position of the cursor that is not inside a surrogate pair.
    int anyPosition(const GraphicsText& item)
    {
        const int position = below(item.document()->characterCount());
        return item.document()->characterAt(position).isLowSurrogate() ? position - 1 : position;
    }
    QPoint anyPoint() { return QPoint(below(1280), below(720)); }
    GraphicsText* editing()
    {
        const QList<GraphicsText*> texts = m_canvas.scene->getTextItemList();
        for (GraphicsText* item : texts)
            if (item->textInteractionFlags() == Qt::TextEditorInteraction)
                return item;
        GraphicsText* item = anyText();
        if (!item)
            return nullptr;
        leave();
        item->initNewTextSelectAll();
        return item;
    }
    void makeSolid(GraphicsText* item)
    {
        leave();
        item->changeItemToSolidLineState();
    }

    void create()
    {
        m_canvas.scene->slotInsertNewTextItem();
        if (below(4) != 0)
            type();
    }
    void remove()
    {
        GraphicsText* item = anyText();
        if (!item || below(3) == 0)
            return;
        makeSolid(item);
        m_canvas.scene->deleteSelectedItems();
    }
    void moveByPanel()
    {
        GraphicsText* item = anyText();
        if (!item)
            return;
        makeSolid(item);
        TText source = *item->getItemTText();
        if (source.textItems().empty())
            source.setTextItems({new TextStyle(makeStyle(""))});
        source.setXValue(float(below(1600) - 200));
        source.setYValue(float(below(1000) - 150));
        m_canvas.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertyPosition, 1);
    }
    void drag()
    {
        GraphicsText* item = anyText();
        if (!item)
            return;
        makeSolid(item);
        const QPoint from = m_canvas.view.mapFromScene(item->mapToScene(item->layoutRect().center()));
        m_canvas.drag(from, anyPoint());
    }
    void closeKeyboard()
    {
        if (GraphicsText* item = editing()) {
            QEvent close(QEvent::Type(1100));
            QCoreApplication::sendEvent(item, &close);
        }
    }
    void type()
    {
        static const QStringList pieces{QStringLiteral("a"),       QStringLiteral("Wide"),
                                        QString::fromUtf8("快讯"), QString::fromUtf8("속"),
                                        QString::fromUtf8("😀"),    QString::fromUtf8("e\u0301"),
                                        QStringLiteral("\n"),      QStringLiteral(" x")};
        GraphicsText* item = editing();
        if (!item)
            return;
        QTextCursor cursor = item->textCursor();
        const int length = item->document()->characterCount();
        if (below(3) == 0)
            cursor.setPosition(anyPosition(*item));
        if (length > m_longestText || below(8) == 0)
            cursor.setPosition(anyPosition(*item), QTextCursor::KeepAnchor);
        item->setTextCursor(cursor);
        cursor = item->textCursor();
        cursor.insertText(pieces.at(below(int(pieces.size()))));
        item->setTextCursor(cursor);
    }
    void erase()
    {
        GraphicsText* item = editing();
        if (!item)
            return;
        QTextCursor cursor = item->textCursor();
        if (below(10) == 0)
            cursor.select(QTextCursor::Document);
        else if (below(2) == 0)
            cursor.setPosition(anyPosition(*item));
        if (cursor.hasSelection())
            cursor.removeSelectedText();
        else
            cursor.deletePreviousChar();
        item->setTextCursor(cursor);
    }
    void select()
    {
        if (GraphicsText* item = editing()) {
            const int length = item->document()->characterCount();
            item->getSelectionInfo(below(length), below(length), below(length), below(3));
        }
    }
    // Turns typing into an undo step, as happens after some seconds without a key.
    void silence()
    {
        const QList<GraphicsText*> texts = m_canvas.scene->getTextItemList();
        for (GraphicsText* item : texts)
            item->pushLastEditTextIntoStack();
    }
    // Returns what the panel would send now: the styles of the selection, in which the caller changes one
    // property.
    TText sent(const GraphicsText& item) const
    {
        TText source = *item.getItemTText();
        const QTextCursor cursor = item.textCursor();
        if (cursor.hasSelection()) {
            std::vector<TextStyle*> selected;
            const int count = int(source.textItems().size());
            for (int i = cursor.selectionStart(); i < cursor.selectionEnd() && i < count; ++i)
                selected.push_back(new TextStyle(*source.textItems()[size_t(i)]));
            source.releaseVectorTextStyle();
            source.setTextItems(std::move(selected));
        }
        if (source.textItems().empty())
            source.setTextItems({new TextStyle(makeStyle(""))});
        return source;
    }
    void style()
    {
        const bool asObject = below(2) == 0;
        GraphicsText* item = asObject ? anyText() : editing();
        if (!item)
            return;
        if (asObject)
            makeSolid(item);
        const int id = below(11);
        const TText original = sent(*item);
        const bool preview = !StyleProperties::isOverall(id) && below(3) == 0 && item->getStatusId() != 2;
        if (preview)
            for (int i = 0; i < 3; ++i)
                send(original, id, below(2), 0);
        if (preview && below(2) == 0) {
            TText cancel = original;
            m_canvas.scene->slotChangeObjectTextStyle(&cancel, id, 2);
        } else {
            send(original, id, below(2), 1);
        }
    }
    void send(const TText& original, int id, int value, int undoFlag)
    {
        TText source = original;
        StyleProperties::set(id, source, value);
        m_canvas.scene->slotChangeObjectTextStyle(&source, id, undoFlag);
    }

    Canvas& m_canvas;
    QRandomGenerator m_random;
    int m_longestText;
};
