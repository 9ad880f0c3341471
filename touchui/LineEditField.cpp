#include "touchui/LineEditField.h"

#include "touchui/FieldName.h"
#include "touchui/TypedTextLog.h"

#include <QLineEdit>
#include <QRegularExpressionValidator>

#include <algorithm>

namespace
{

constexpr int FIELD_KIND = 1;
constexpr int UNLIMITED_LENGTH = 32767; // the default of QLineEdit

QString patternOf(const QLineEdit& edit)
{
    const auto* validator = qobject_cast<const QRegularExpressionValidator*>(edit.validator());
    return validator == nullptr ? QString() : validator->regularExpression().pattern();
}

} // namespace

SubCommonDefine::tagSoftKeyBoardInitData LineEditField::describe() const
{
    SubCommonDefine::tagSoftKeyBoardInitData data;
    data.fieldKind = FIELD_KIND;
    FieldName::readShort(m_edit.objectName(), data);
    if (m_edit.maxLength() < UNLIMITED_LENGTH)
        data.maxLength = m_edit.maxLength();
    data.text = m_edit.text().toStdWString();
    data.textLength = static_cast<int>(m_edit.text().size());
    data.selectionStart = m_edit.selectionStart();
    data.selectionEnd = data.selectionStart + static_cast<int>(m_edit.selectedText().size());
    data.limitCondition = patternOf(m_edit).toStdWString();
    return data;
}

void LineEditField::enter(const QString& text)
{
    TypedTextLog::write(text);
    m_edit.selectAll();
    m_edit.insert(text);
    m_edit.end(false);
}

bool LineEditField::judge(const QString& text)
{
    if (m_edit.validator() == nullptr)
        return false;
    QLineEdit scratch;
    scratch.setValidator(m_edit.validator());
    scratch.insert(text);
    return true;
}

void LineEditField::select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos)
{
    const int length = static_cast<int>(m_edit.text().size());
    const int begin = std::clamp(pos.begin, 0, length);
    const int end = std::clamp(pos.end, 0, length);
    switch (pos.mode) {
    case 0:
        m_edit.deselect();
        m_edit.setCursorPosition(std::clamp(pos.current, 0, length));
        break;
    case 1:
        m_edit.setSelection(begin, end - begin);
        break;
    case 2:
        m_edit.selectAll();
        break;
    default:
        break;
    }
}

QObject* LineEditField::keyReceiver()
{
    return &m_edit;
}

QObject* LineEditField::closeReceiver()
{
    return &m_edit;
}
