#include "panel/TextColorToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "panel/ColorButton.h"

#include <QHBoxLayout>

const QString TextColorToolBox::DEFAULT_COLORVALUE = QStringLiteral("#FFFFFF");

TextColorToolBox::TextColorToolBox(QWidget* parent) : ToolBox(parent)
{
    m_button = new ColorButton(this);
    m_button->setFixedSize(COLORBUTTON_WIDTH, COLORBUTTON_HEIGHT);
    m_button->setObjectName(QStringLiteral("TextColor"));
    addRow(COLORBUTTON_HEIGHT)->addWidget(m_button);
    connectLooks(m_button);
    connect(m_button, &QAbstractButton::clicked, this, &TextColorToolBox::clicked);
    setColor(DEFAULT_COLORVALUE);
}

void TextColorToolBox::setColor(const QString& color)
{
    m_color = color;
    m_button->setFace(getRgbaValue(color), COLORBUTTON_STYLE);
}

void TextColorToolBox::getColorValue(const QString& color, int state)
{
    setColor(color);
    Q_EMIT textColorChange(color, TextObjectConstants::PropertyColor, state);
}

QString TextColorToolBox::getRgbaValue(const QString& color) const
{
    return ColorButton::getRgbaValue(color);
}

void TextColorToolBox::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    m_button->setEnabled(true);
}

void TextColorToolBox::setWidgetDisabled()
{
    ToolBox::setWidgetDisabled();
    m_button->setEnabled(false);
}

void TextColorToolBox::resetInitializeStyle()
{
    setColor(DEFAULT_COLORVALUE);
    ToolBox::resetInitializeStyle();
}
