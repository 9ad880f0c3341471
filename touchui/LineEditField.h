#pragma once

#include "touchui/InputField.h"

class QLineEdit;

// A line edit, whose text is entered with Enter.
class LineEditField : public InputField
{
public:
    explicit LineEditField(QLineEdit& edit) : m_edit(edit) {}

    // Combines the object name with the properties of the line edit.
    SubCommonDefine::tagSoftKeyBoardInitData describe() const override;
    bool keepsKeyboard() const override { return false; }
    // Replaces the content.
    void enter(const QString& text) override;
    bool judge(const QString& text) override;
    void select(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& pos) override;
    QObject* keyReceiver() override;
    QObject* closeReceiver() override;

private:
    QLineEdit& m_edit;
};
