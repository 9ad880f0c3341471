#include "touchui/ComboBoxField.h"

#include <QComboBox>
#include <QLineEdit>

ComboBoxField::ComboBoxField(QComboBox& box) : LineEditField(*box.lineEdit()), m_box(box)
{
}

// The box, as a rule: its owner may have given the line edit another parent.
QObject* ComboBoxField::closeReceiver()
{
    return m_box.lineEdit()->parent();
}
