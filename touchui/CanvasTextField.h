#pragma once

#include "touchui/InputField.h"

#include <QGraphicsItem>

class QGraphicsTextItem;
class QGraphicsView;

// The text that is edited on a canvas. The graphics view has the input focus, and keeps the keyboard also
// while no text of it is edited.
class CanvasTextField : public InputField
{
public:
    // What QGraphicsItem::type() is of the texts of a canvas.
    static constexpr int ITEM_TYPE = QGraphicsItem::UserType + 10;

    // The text that is edited: enabled, with text editor interaction, and the child of another item. Null
    // when there is none.
    static QGraphicsTextItem* editedText(const QGraphicsView& view);

    explicit CanvasTextField(QGraphicsView& view) : m_view(view) {}

    // What the text's object name says.
    SubCommonDefine::tagSoftKeyBoardInitData describe() const override;
    bool keepsKeyboard() const override { return true; }
    // Inserts at the cursor.
    void enter(const QString& text) override;
    // Always true: whatever is typed is in the text already.
    bool judge(const QString&) override { return true; }
    // Sends the text a KSSoftKeyboardCursorSettingEvent.
    void select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos) override;
    QObject* keyReceiver() override;
    QObject* closeReceiver() override;

private:
    QGraphicsView& m_view;
};
