#pragma once

#include <QRegularExpressionValidator>

// Accepts complete values only: input that more typing could complete is refused as well, since the soft
// keyboard collects the typing and sends the whole text.
class ComboxLineEditRegExpValidator : public QRegularExpressionValidator
{
    Q_OBJECT
public:
    using QRegularExpressionValidator::QRegularExpressionValidator;

    State validate(QString& input, int& position) const override;

Q_SIGNALS:
    void validText(bool valid) const;
};
