#include "touchui/InputField.h"

#include "touchui/CanvasTextField.h"
#include "touchui/ComboBoxField.h"
#include "touchui/LineEditField.h"

#include <QComboBox>
#include <QGraphicsView>
#include <QLineEdit>

std::unique_ptr<InputField> InputField::of(QWidget* widget)
{
    if (auto* view = qobject_cast<QGraphicsView*>(widget))
        return std::make_unique<CanvasTextField>(*view);
    if (auto* edit = qobject_cast<QLineEdit*>(widget))
        return std::make_unique<LineEditField>(*edit);
    auto* box = qobject_cast<QComboBox*>(widget);
    if (box != nullptr && box->lineEdit() != nullptr)
        return std::make_unique<ComboBoxField>(*box);
    return nullptr;
}

QWidget* InputField::takerOfText(QObject* object)
{
    auto* widget = qobject_cast<QWidget*>(object);
    const bool takesText = widget != nullptr && (widget->testAttribute(Qt::WA_InputMethodEnabled) ||
                                                 qobject_cast<QGraphicsView*>(widget) != nullptr);
    return takesText ? widget : nullptr;
}
