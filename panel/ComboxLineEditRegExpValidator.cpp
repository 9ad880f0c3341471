#include "panel/ComboxLineEditRegExpValidator.h"

QValidator::State ComboxLineEditRegExpValidator::validate(QString& input, int& position) const
{
    const bool valid = QRegularExpressionValidator::validate(input, position) == Acceptable;
    Q_EMIT validText(valid);
    return valid ? Acceptable : Invalid;
}
