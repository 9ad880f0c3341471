#include "panel/BoldToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "touchui/KSPushbutton.h"

#include <QHBoxLayout>
#include <QLabel>

BoldToolBox::BoldToolBox(QWidget* parent) : ToolBox(parent)
{
    m_label = addLabel(QSize(LABEL_WIDTH, WIDGET_HEIGHT));
    m_button = addButton(Whole, QSize(BUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_Bold"));

    QHBoxLayout* row = addRow(WIDGET_HEIGHT);
    row->addWidget(m_label);
    row->addSpacing(SPACING_BETWEEN_LABEL_AND_BOLDBTN);
    row->addWidget(m_button);
    row->addSpacing(SPACING_BETWEEN_BOLDBTN_AND_ITALICBTN);

    connect(m_button, &QAbstractButton::clicked, this, &BoldToolBox::boldBtnClicked);
    translateText();
}

void BoldToolBox::boldBtnClicked()
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    setFontBold(m_bold == 1 ? 0 : 1);
    Q_EMIT boldChange(m_bold, TextObjectConstants::PropertyBold);
}

void BoldToolBox::setFontBold(int bold)
{
    m_bold = bold == 1 ? 1 : 0;
    setButtonSelected(m_button, m_bold == 1);
}

void BoldToolBox::resetInitializeStyle()
{
    setFontBold(0);
    ToolBox::resetInitializeStyle();
}

void BoldToolBox::translateText()
{
    m_label->setText(tr("Style"));
}
