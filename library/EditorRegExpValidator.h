#pragma once

#include <QRegularExpressionValidator>

// Tells why a folder name is refused. GUI thread.
class EditorRegExpValidator : public QRegularExpressionValidator
{
    Q_OBJECT

public:
    explicit EditorRegExpValidator(const QString& pattern, QObject* parent = nullptr);

    // The verdict of the pattern; every call sends one of the signals.
    State validate(QString& input, int& position) const override;

Q_SIGNALS:
    void longText() const;
    void invalidText() const;
    void validText() const;
};
