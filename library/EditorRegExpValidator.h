#pragma once

#include <QRegularExpressionValidator>

// Validates a folder name and reports why it is refused. GUI thread.
class EditorRegExpValidator : public QRegularExpressionValidator
{
    Q_OBJECT

public:
    explicit EditorRegExpValidator(const QString& pattern, QObject* parent = nullptr);

    // Returns the result of the pattern and emits one of the signals.
    State validate(QString& input, int& position) const override;

Q_SIGNALS:
    void longText() const;
    void invalidText() const;
    void validText() const;
};
