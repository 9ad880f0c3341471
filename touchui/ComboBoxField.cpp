#include "touchui/ComboBoxField.h"

#include <QComboBox>
#include <QLineEdit>

ComboBoxField::ComboBoxField(QComboBox& box) : LineEditField(*box.lineEdit()), m_box(box)
{
}

// Normally returns the box; its owner may have given the line edit another parent.
QObject* ComboBoxField::closeReceiver()
{
    return m_box.lineEdit()->parent();
}
