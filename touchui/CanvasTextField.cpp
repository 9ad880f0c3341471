#include "touchui/CanvasTextField.h"

#include "touchui/FieldName.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"
#include "touchui/TypedTextLog.h"

#include <QCoreApplication>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QTextCursor>

QGraphicsTextItem* CanvasTextField::editedText(const QGraphicsView& view)
{
    const QList<QGraphicsItem*> items = view.items();
    for (QGraphicsItem* item : items) {
        if (item->type() != ITEM_TYPE || item->parentItem() == nullptr || !item->isEnabled())
            continue;
        auto* text = qobject_cast<QGraphicsTextItem*>(item->toGraphicsObject());
        if (text != nullptr && text->textInteractionFlags() == Qt::TextEditorInteraction)
            return text;
    }
    return nullptr;
}

SubCommonDefine::tagSoftKeyBoardInitData CanvasTextField::describe() const
{
    SubCommonDefine::tagSoftKeyBoardInitData data;
    if (const QGraphicsTextItem* text = editedText(m_view))
        FieldName::read(text->objectName(), data);
    return data;
}

void CanvasTextField::enter(const QString& text)
{
    if (QGraphicsTextItem* item = editedText(m_view)) {
        TypedTextLog::write(text);
        QTextCursor cursor = item->textCursor();
        cursor.insertText(text);
    }
}

void CanvasTextField::select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos)
{
    if (QGraphicsTextItem* item = editedText(m_view)) {
        KSSoftKeyboardCursorSettingEvent event(pos.begin, pos.end, pos.current, pos.mode);
        QCoreApplication::sendEvent(item, &event);
    }
}

QObject* CanvasTextField::keyReceiver()
{
    return &m_view;
}

QObject* CanvasTextField::closeReceiver()
{
    return editedText(m_view);
}
