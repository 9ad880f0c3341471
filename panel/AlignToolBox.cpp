#include "panel/AlignToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "touchui/KSPushbutton.h"

#include <QHBoxLayout>

namespace
{

constexpr int LEFT = -1;
constexpr int CENTER = 0;
constexpr int RIGHT = 1;

} // namespace

const QString AlignToolBox::ALIGNLEFT_ICON_PATH = iconPath("Icon_AlignLeft");
const QString AlignToolBox::ALIGNCENTER_ICON_PATH = iconPath("Icon_AlignCenter");
const QString AlignToolBox::ALIGNRIGHT_ICON_PATH = iconPath("Icon_AlignRight");
const QString AlignToolBox::ALIGNLEFT_ICON_SELECTED_PATH =
    ALIGNLEFT_ICON_PATH + QLatin1String(SELECTED_SUFFIX);
const QString AlignToolBox::ALIGNCENTER_ICON_SELECTED_PATH =
    ALIGNCENTER_ICON_PATH + QLatin1String(SELECTED_SUFFIX);
const QString AlignToolBox::ALIGNRIGHT_ICON_SELECTED_PATH =
    ALIGNRIGHT_ICON_PATH + QLatin1String(SELECTED_SUFFIX);
const QString AlignToolBox::ALIGNLEFT_ICON_DISABLED_PATH =
    ALIGNLEFT_ICON_PATH + QLatin1String(DISABLED_SUFFIX);
const QString AlignToolBox::ALIGNCENTER_ICON_DISABLED_PATH =
    ALIGNCENTER_ICON_PATH + QLatin1String(DISABLED_SUFFIX);
const QString AlignToolBox::ALIGNRIGHT_ICON_DISABLED_PATH =
    ALIGNRIGHT_ICON_PATH + QLatin1String(DISABLED_SUFFIX);

AlignToolBox::AlignToolBox(QWidget* parent) : ToolBox(parent)
{
    m_left = addButton(LeftPiece, QSize(LEFTBUTTON_WIDTH, BUTTON_HEIGHT), ALIGNLEFT_ICON_PATH);
    m_center = addButton(MiddlePiece, QSize(CENTERBUTTON_WIDTH, BUTTON_HEIGHT), ALIGNCENTER_ICON_PATH);
    m_right = addButton(RightPiece, QSize(RIGHTBUTTON_WIDTH, BUTTON_HEIGHT), ALIGNRIGHT_ICON_PATH);

    QHBoxLayout* row = addRow(BUTTON_HEIGHT);
    row->addWidget(m_left);
    row->addWidget(addSeparator(SWITCHSEPARATOR_WIDTH, BUTTON_HEIGHT));
    row->addWidget(m_center);
    row->addWidget(addSeparator(SWITCHSEPARATOR_WIDTH, BUTTON_HEIGHT));
    row->addWidget(m_right);

    connect(m_left, &QAbstractButton::clicked, this, &AlignToolBox::leftBtnClicked);
    connect(m_center, &QAbstractButton::clicked, this, &AlignToolBox::centerBtnClicked);
    connect(m_right, &QAbstractButton::clicked, this, &AlignToolBox::rightBtnClicked);
}

void AlignToolBox::leftBtnClicked()
{
    setLeftButtonSelected();
    changeAlign(LEFT);
}

void AlignToolBox::centerBtnClicked()
{
    setCenterButtonSelected();
    changeAlign(CENTER);
}

void AlignToolBox::rightBtnClicked()
{
    setRightButtonSelected();
    changeAlign(RIGHT);
}

void AlignToolBox::changeAlign(int align)
{
    m_align = align;
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    Q_EMIT alignChange(align, TextObjectConstants::PropertyAlign);
}

void AlignToolBox::setLeftButtonSelected()
{
    setSelected(m_left);
}

void AlignToolBox::setCenterButtonSelected()
{
    setSelected(m_center);
}

void AlignToolBox::setRightButtonSelected()
{
    setSelected(m_right);
}

void AlignToolBox::setSelected(const KSPushbutton* selected)
{
    for (KSPushbutton* button : {m_left, m_center, m_right})
        setButtonSelected(button, button == selected);
}

void AlignToolBox::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    switch (m_align) {
    case LEFT:
        setLeftButtonSelected();
        break;
    case CENTER:
        setCenterButtonSelected();
        break;
    case RIGHT:
        setRightButtonSelected();
        break;
    default:
        setSelected(nullptr);
        break;
    }
}

void AlignToolBox::resetInitializeStyle()
{
    m_align = LEFT;
    setSelected(nullptr);
    ToolBox::resetInitializeStyle();
}
