#include "panel/ItalicToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "touchui/KSPushbutton.h"

#include <QHBoxLayout>

ItalicToolBox::ItalicToolBox(QWidget* parent) : ToolBox(parent)
{
    m_button = addButton(Whole, QSize(ITALICBUTTON_WIDTH, ITALICBUTTON_HEIGHT), iconPath("Icon_Italic"));
    addRow(ITALICBUTTON_HEIGHT)->addWidget(m_button);
    connect(m_button, &QAbstractButton::clicked, this, &ItalicToolBox::italicBtnClicked);
}

void ItalicToolBox::italicBtnClicked()
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    setFontItalic(m_italic == 1 ? 0 : 1);
    Q_EMIT italicChange(m_italic, TextObjectConstants::PropertyItalic);
}

void ItalicToolBox::setFontItalic(int italic)
{
    m_italic = italic == 1 ? 1 : 0;
    setButtonSelected(m_button, m_italic == 1);
}

void ItalicToolBox::resetInitializeStyle()
{
    setFontItalic(0);
    ToolBox::resetInitializeStyle();
}
