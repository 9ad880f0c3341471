#pragma once

#include "touchui/LineEditField.h"

class QComboBox;

// The line edit of an editable combo box.
class ComboBoxField : public LineEditField
{
public:
    // The box must be editable.
    explicit ComboBoxField(QComboBox& box);

    QObject* closeReceiver() override;

private:
    QComboBox& m_box;
};
