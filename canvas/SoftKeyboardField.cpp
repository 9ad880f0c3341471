#include "canvas/SoftKeyboardField.h"

#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"

#include <QStringList>
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

QString SoftKeyboardField::getDataInfo(const SubCommonDefine::tagSoftKeyBoardInitData& data)
{
    const QStringList fields{
        QString::number(data.fieldKind),      QString::fromStdWString(data.title),
        QString::number(data.keyboardType),   QString::number(data.maxLength),
        QString::fromStdWString(data.text),   QString::number(data.textLength),
        QString::number(data.selectionStart), QString::number(data.selectionEnd),
        QString::number(data.selectionMode),  QString::fromStdWString(data.limitCondition),
        QString::number(data.lastValue)};
    return fields.join(QLatin1Char('#'));
}

QString SoftKeyboardField::newText(const QString& title, const QString& text)
{
    return getDataInfo(fieldData(title, text, NewTextKeyboard));
}

QString SoftKeyboardField::doubleClick(const QString& title, const QString& text)
{
    return getDataInfo(fieldData(title, text, EditKeyboard));
}

QString SoftKeyboardField::commonState(const QString& title, const QString& text, const GraphicsText& item)
{
    SubCommonDefine::tagSoftKeyBoardInitData data = fieldData(title, text, EditKeyboard);
    data.textLength = item.textCursor().position();
    data.selectionStart = getCursorSelectionStartPosition(item);
    data.selectionEnd = item.textCursor().position();
    data.selectionMode = item.isHandleCaret() ? 1 : 0;
    return getDataInfo(data);
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
