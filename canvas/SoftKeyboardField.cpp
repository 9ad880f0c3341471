#include "canvas/SoftKeyboardField.h"

#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"
#include "touchui/FieldName.h"

#include <QTextCursor>

using namespace TextObjectConstants;

namespace
{

constexpr int NewTextKeyboard = 0;
constexpr int EditKeyboard = 1;
constexpr int WholeTextSelected = 2;

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
    data.selectionMode = WholeTextSelected;
    data.lastValue = CHARACTER_LIMIT;
    return data;
}

} // namespace

QString SoftKeyboardField::newText(const QString& title, const QString& text)
{
    return FieldName::write(fieldData(title, text, NewTextKeyboard));
}

QString SoftKeyboardField::doubleClick(const QString& title, const QString& text)
{
    return FieldName::write(fieldData(title, text, EditKeyboard));
}

QString SoftKeyboardField::commonState(const QString& title, const QString& text, const GraphicsText& item)
{
    SubCommonDefine::tagSoftKeyBoardInitData data = fieldData(title, text, EditKeyboard);
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
