#pragma once

#include <QRegularExpressionValidator>

// Lets only finished values into a field: what could become one by more typing is refused, too, since the
// soft keyboard collects the typing and sends the whole text.
class ComboxLineEditRegExpValidator : public QRegularExpressionValidator
{
    Q_OBJECT
public:
    using QRegularExpressionValidator::QRegularExpressionValidator;

    State validate(QString& input, int& position) const override;

Q_SIGNALS:
    void validText(bool valid) const;
};
