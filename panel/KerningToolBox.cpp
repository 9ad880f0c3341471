#include "panel/KerningToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "touchui/KSPushbutton.h"

#include <QHBoxLayout>
#include <QLabel>

#include <algorithm>

KerningToolBox::KerningToolBox(QWidget* parent) : ToolBox(parent)
{
    m_label = addLabel(QSize(ALIGNLABEL_WIDTH, WIDGET_HEIGHT));
    m_smaller =
        addButton(LeftPiece, QSize(SMALLERBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_KerningSmaller"));
    m_larger =
        addButton(RightPiece, QSize(LARGERBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_KerningLarger"));

    QHBoxLayout* row = addRow(WIDGET_HEIGHT);
    row->addWidget(m_label);
    row->addSpacing(SPACING_BEWTEEN_ALIGNLABEL_AND_SMALLERBUTTON);
    row->addWidget(m_smaller);
    row->addWidget(addSeparator(SWITCHSEPARATOR_WIDTH, WIDGET_HEIGHT));
    row->addWidget(m_larger);
    row->addSpacing(SPACING_BEWTEEN_LARGERBUTTON_AND_ALIGNBUTTON);

    connect(m_smaller, &QAbstractButton::clicked, this, &KerningToolBox::setFontSpaceSmaller);
    connect(m_larger, &QAbstractButton::clicked, this, &KerningToolBox::setFontSpaceLarger);
    translateText();
}

void KerningToolBox::setFontSpaceSmaller()
{
    changeLevel(std::max<int>(m_level - 1, DOUBLESMALL));
}

void KerningToolBox::setFontSpaceLarger()
{
    changeLevel(std::min<int>(m_level + 1, DOUBLEBIGGER));
}

void KerningToolBox::changeLevel(int level)
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    m_level = level;
    matchToKerningIndex(level);
    Q_EMIT kerningChange(level, TextObjectConstants::PropertyKerning);
}

void KerningToolBox::matchToKerningIndex(int level)
{
    setButtonEnabled(m_smaller, level != DOUBLESMALL);
    setButtonEnabled(m_larger, level != DOUBLEBIGGER);
}

void KerningToolBox::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    matchToKerningIndex(m_level);
}

void KerningToolBox::resetInitializeStyle()
{
    m_level = NORMAL;
    ToolBox::resetInitializeStyle();
}

void KerningToolBox::translateText()
{
    m_label->setText(tr("Space"));
}
