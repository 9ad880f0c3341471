#include "touchui/FieldName.h"

#include <QStringList>

using SubCommonDefine::tagSoftKeyBoardInitData;

namespace
{

constexpr QLatin1Char SEPARATOR('#');
constexpr int PARTS = 11;
constexpr int BEFORE_TEXT = 4;
constexpr int AFTER_TEXT = PARTS - BEFORE_TEXT - 1;

void setNumber(int& field, const QString& text)
{
    bool ok = false;
    const int number = text.toInt(&ok);
    if (ok)
        field = number;
}

} // namespace

QString FieldName::write(const tagSoftKeyBoardInitData& data)
{
    const QStringList parts{
        QString::number(data.fieldKind),      QString::fromStdWString(data.title),
        QString::number(data.keyboardType),   QString::number(data.maxLength),
        QString::fromStdWString(data.text),   QString::number(data.textLength),
        QString::number(data.selectionStart), QString::number(data.selectionEnd),
        QString::number(data.selectionMode),  QString::fromStdWString(data.limitCondition),
        QString::number(data.lastValue)};
    return parts.join(SEPARATOR);
}

// The text, which is in the middle, may contain separators itself.
void FieldName::read(const QString& name, tagSoftKeyBoardInitData& data)
{
    const QStringList parts = name.split(SEPARATOR);
    if (parts.size() < PARTS) {
        readShort(name, data);
        return;
    }
    const qsizetype after = parts.size() - AFTER_TEXT;
    setNumber(data.fieldKind, parts.at(0));
    data.title = parts.at(1).toStdWString();
    setNumber(data.keyboardType, parts.at(2));
    setNumber(data.maxLength, parts.at(3));
    data.text = parts.mid(BEFORE_TEXT, after - BEFORE_TEXT).join(SEPARATOR).toStdWString();
    setNumber(data.textLength, parts.at(after));
    setNumber(data.selectionStart, parts.at(after + 1));
    setNumber(data.selectionEnd, parts.at(after + 2));
    setNumber(data.selectionMode, parts.at(after + 3));
    data.limitCondition = parts.at(after + 4).toStdWString();
    setNumber(data.lastValue, parts.at(after + 5));
}

void FieldName::readShort(const QString& name, tagSoftKeyBoardInitData& data)
{
    const QStringList parts = name.split(SEPARATOR);
    if (parts.size() < 2)
        return;
    setNumber(data.keyboardType, parts.at(0));
    data.title = parts.at(1).toStdWString();
    if (parts.size() == 3) {
        data.selectionMode = 2;
    } else if (parts.size() >= 4) {
        setNumber(data.selectionMode, parts.at(2));
        setNumber(data.lastValue, parts.at(3));
    }
}
