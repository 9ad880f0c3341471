#include "canvas/SoftKeyboardField.h"

#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"
#include "touchui/FieldName.h"

#include <QTextCursor>

using namespace TextObjectConstants;

namespace
{

constexpr int NEW_TEXT_KEYBOARD = 0;
constexpr int EDIT_KEYBOARD = 1;
constexpr int WHOLE_TEXT_SELECTED = 2;

SubCommonDefine::tagSoftKeyBoardInitData fieldData(const QString& title, const QString& text,
                                                   int keyboardType)
{
    SubCommonDefine::tagSoftKeyBoardInitData data;
    data.fieldKind = 0;
    data.title = title.toStdWString();
    data.keyboardType = keyboardType;
    data.maxLength = CHARACTER_LIMIT;
    data.text = text.toStdWString();
    data.textLength = -1;
    data.selectionStart = -1;
    data.selectionEnd = -1;
    data.selectionMode = WHOLE_TEXT_SELECTED;
    data.lastValue = CHARACTER_LIMIT;
    return data;
}

} // namespace

QString SoftKeyboardField::newText(const QString& title, const QString& text)
{
    return FieldName::write(fieldData(title, text, NEW_TEXT_KEYBOARD));
}

QString SoftKeyboardField::doubleClick(const QString& title, const QString& text)
{
    return FieldName::write(fieldData(title, text, EDIT_KEYBOARD));
}

QString SoftKeyboardField::commonState(const QString& title, const QString& text, const GraphicsText& item)
{
    SubCommonDefine::tagSoftKeyBoardInitData data = fieldData(title, text, EDIT_KEYBOARD);
    data.textLength = item.textCursor().position();
    data.selectionStart = getCursorSelectionStartPosition(item);
    data.selectionEnd = item.textCursor().position();
    data.selectionMode = item.isHandleCaret() ? 1 : 0;
    return FieldName::write(data);
}

int SoftKeyboardField::getCursorSelectionStartPosition(const GraphicsText& item)
{
    const QTextCursor cursor = item.textCursor();
    if (cursor.position() == cursor.selectionEnd())
        return cursor.selectionStart();
    if (cursor.position() == cursor.selectionStart())
        return cursor.selectionEnd();
    return 0;
}
