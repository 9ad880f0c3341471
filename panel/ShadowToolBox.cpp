#include "panel/ShadowToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "touchui/KSPushbutton.h"

#include <QHBoxLayout>
#include <QLabel>

namespace
{

constexpr int NONE = 0;
constexpr int RIGHT_DOWN = 1;
constexpr int CENTER_DOWN = 2;
constexpr int LEFT_DOWN = 3;

} // namespace

ShadowToolBox::ShadowToolBox(QWidget* parent) : ToolBox(parent)
{
    m_label = addLabel(QSize(SHADOWLABEL_WIDTH, WIDGET_HEIGHT));
    m_off = addButton(LeftPiece, QSize(OFFBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_ShadowOff"));
    m_right = addButton(MiddlePiece, QSize(RIGHTBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_ShadowRight"));
    m_center =
        addButton(MiddlePiece, QSize(CENTERBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_ShadowCenter"));
    m_left = addButton(RightPiece, QSize(LEFTBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_ShadowLeft"));

    QHBoxLayout* row = addRow(WIDGET_HEIGHT);
    row->addWidget(m_label);
    row->addSpacing(SPACING_BETWEEN_SHADOWLABEL_AND_OFFBUTTON);
    row->addWidget(m_off);
    for (KSPushbutton* button : {m_right, m_center, m_left}) {
        row->addWidget(addSeparator(SWITCHSEPARATOR_WIDTH, WIDGET_HEIGHT));
        row->addWidget(button);
    }

    connect(m_off, &QAbstractButton::clicked, this, &ShadowToolBox::setNoneShadow);
    connect(m_right, &QAbstractButton::clicked, this, &ShadowToolBox::setRightDownShadow);
    connect(m_center, &QAbstractButton::clicked, this, &ShadowToolBox::setCenterDownShadow);
    connect(m_left, &QAbstractButton::clicked, this, &ShadowToolBox::setLeftDownShadow);
    translateText();
}

void ShadowToolBox::setNoneShadow()
{
    setOffShadowStyle();
    changeShadow(NONE);
}

void ShadowToolBox::setRightDownShadow()
{
    setRightShadowStyle();
    changeShadow(RIGHT_DOWN);
}

void ShadowToolBox::setCenterDownShadow()
{
    setCenterShadowStyle();
    changeShadow(CENTER_DOWN);
}

void ShadowToolBox::setLeftDownShadow()
{
    setLeftShadowStyle();
    changeShadow(LEFT_DOWN);
}

void ShadowToolBox::changeShadow(int style)
{
    m_style = style;
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    Q_EMIT shadowChange(style, TextObjectConstants::PropertyShadow);
}

void ShadowToolBox::setOffShadowStyle()
{
    setSelected(m_off);
}

void ShadowToolBox::setRightShadowStyle()
{
    setSelected(m_right);
}

void ShadowToolBox::setCenterShadowStyle()
{
    setSelected(m_center);
}

void ShadowToolBox::setLeftShadowStyle()
{
    setSelected(m_left);
}

void ShadowToolBox::setSelected(const KSPushbutton* selected)
{
    for (KSPushbutton* button : {m_off, m_right, m_center, m_left})
        setButtonSelected(button, button == selected);
}

void ShadowToolBox::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    switch (m_style) {
    case NONE:
        setOffShadowStyle();
        break;
    case RIGHT_DOWN:
        setRightShadowStyle();
        break;
    case CENTER_DOWN:
        setCenterShadowStyle();
        break;
    case LEFT_DOWN:
        setLeftShadowStyle();
        break;
    default:
        setSelected(nullptr);
        break;
    }
}

void ShadowToolBox::resetInitializeStyle()
{
    m_style = NONE;
    setSelected(nullptr);
    ToolBox::resetInitializeStyle();
}

void ShadowToolBox::translateText()
{
    m_label->setText(tr("Shadow"));
}
