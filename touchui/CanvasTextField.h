#pragma once

#include "touchui/InputField.h"

#include <QGraphicsItem>

class QGraphicsTextItem;
class QGraphicsView;

// The text that is being edited on a canvas. The graphics view has the input focus; the keyboard stays open
// even while no text is being edited.
class CanvasTextField : public InputField
{
public:
    // The QGraphicsItem::type() of the texts of a canvas.
    static constexpr int ITEM_TYPE = QGraphicsItem::UserType + 10;

    // Returns the text that is being edited: enabled, with text editor interaction, and a child of another
    // item. Null if there is none.
    static QGraphicsTextItem* editedText(const QGraphicsView& view);

    explicit CanvasTextField(QGraphicsView& view) : m_view(view) {}

    // Returns the contents of the text's object name.
    SubCommonDefine::tagSoftKeyBoardInitData describe() const override;
    bool keepsKeyboard() const override { return true; }
    // Inserts the text at the cursor.
    void enter(const QString& text) override;
    // Always true: typed text is already in the item.
    bool judge(const QString&) override { return true; }
    // Sends a KSSoftKeyboardCursorSettingEvent to the text.
    void select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos) override;
    QObject* keyReceiver() override;
    QObject* closeReceiver() override;

private:
    QGraphicsView& m_view;
};
