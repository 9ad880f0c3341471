#include "library/EditorRegExpValidator.h"

#include "library/FolderNameRules.h"

EditorRegExpValidator::EditorRegExpValidator(const QString& pattern, QObject* parent)
    : QRegularExpressionValidator(QRegularExpression(pattern), parent)
{
}

QValidator::State EditorRegExpValidator::validate(QString& input, int& position) const
{
    const State state = QRegularExpressionValidator::validate(input, position);
    if (FolderNameRules::isTooLong(input))
        Q_EMIT longText();
    else if (state == Invalid)
        Q_EMIT invalidText();
    else
        Q_EMIT validText();
    return state;
}
