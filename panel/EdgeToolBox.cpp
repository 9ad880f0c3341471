#include "panel/EdgeToolBox.h"

#include "canvas/TextObjectConstants.h"
#include "panel/ColorButton.h"
#include "panel/EdgeSizeSlider.h"

#include <QHBoxLayout>
#include <QLabel>

const QString EdgeToolBox::DEFAULT_COLORVALUE = QStringLiteral("#393939");

namespace
{

constexpr int PREVIEW = 0;
constexpr int COMMITTED = 1;
const char PX_STYLE[] = "QLabel {color:rgb(220, 220, 220); font:20px;}";
const char PX_DISABLED_STYLE[] = "QLabel {color:rgb(40, 40, 40); font:20px;}";

} // namespace

EdgeToolBox::EdgeToolBox(QWidget* parent) : ToolBox(parent)
{
    m_edge.setEdgeWidth(DEFAULT_SLIDERVALUE);
    m_edge.setEdgeColor(DEFAULT_COLORVALUE.toStdString());

    m_label = addLabel(QSize(EDGELABEL_WIDTH, WIDGET_HEIGHT));
    m_offButton = addButton(LeftPiece, QSize(OFFBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_EdgeOff"));
    m_onButton = addButton(RightPiece, QSize(ONBUTTON_WIDTH, WIDGET_HEIGHT), iconPath("Icon_EdgeOn"));
    m_widthButton = addButton(Whole, QSize(EDGEWIDTHBUTTON_WIDTH, WIDTHBTN_HEIGHT));
    m_widthButton->setObjectName(QStringLiteral("EdgeWidth"));
    m_pxLabel = addLabel(QSize(PXLABEL_WIDTH, WIDGET_HEIGHT), QString::fromLatin1(PX_STYLE),
                         QString::fromLatin1(PX_DISABLED_STYLE));
    m_pxLabel->setAlignment(Qt::AlignCenter);
    m_colorButton = new ColorButton(this);
    m_colorButton->setFixedSize(EDGECOLORBUTTON_WIDTH, WIDGET_HEIGHT);
    m_colorButton->setObjectName(QStringLiteral("EdgeColor"));
    connectLooks(m_colorButton);
    m_slider = new EdgeSizeSlider(this);

    QHBoxLayout* row = addRow(WIDTHBTN_HEIGHT);
    row->addWidget(m_label);
    row->addSpacing(SPACING_BEWTEEN_EDGELABEL_AND_OFFBUTTON);
    row->addWidget(m_offButton);
    row->addWidget(addSeparator(SWITCHSEPARATOR_WIDTH, WIDGET_HEIGHT));
    row->addWidget(m_onButton);
    row->addSpacing(SPACING_BEWTEEN_ONBUTTON_AND_WIDTHBUTTON);
    row->addWidget(m_widthButton);
    row->addWidget(m_pxLabel);
    row->addSpacing(SPACING_BEWTEEN_PXLABEL_AND_COLORBUTTON);
    row->addWidget(m_colorButton);

    connect(m_onButton, &QAbstractButton::clicked, this, &EdgeToolBox::onEdgeBtnClicked);
    connect(m_offButton, &QAbstractButton::clicked, this, &EdgeToolBox::offEdgeBtnClicked);
    connect(m_widthButton, &QAbstractButton::clicked, this, &EdgeToolBox::edgeWidthBtnClicked);
    connect(m_colorButton, &QAbstractButton::clicked, this, &EdgeToolBox::clicked);
    connect(m_slider, &QMenu::aboutToShow, this, &EdgeToolBox::getSliderValueBeforeChanged);
    connect(m_slider, &QMenu::aboutToHide, this, &EdgeToolBox::edgeWidthChangedForSave);
    connect(m_slider, &EdgeSizeSlider::sliderValueSignal, this, &EdgeToolBox::edgeWidthChangedForPreview);
    translateText();
    setEdge(0, m_edge, false);
}

QString EdgeToolBox::getColor() const
{
    return QString::fromStdString(m_edge.getEdgeColor());
}

QString EdgeToolBox::getRgbaValue(const QString& color) const
{
    return ColorButton::getRgbaValue(color);
}

// Actions of the operator

void EdgeToolBox::onEdgeBtnClicked()
{
    switchEdge(true);
}

void EdgeToolBox::offEdgeBtnClicked()
{
    switchEdge(false);
}

void EdgeToolBox::switchEdge(bool on)
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    m_on = on;
    showSwitch();
    Q_EMIT edgeChange(on ? 1 : 0, m_edge, TextObjectConstants::PropertyEdge, COMMITTED, SWITCH);
}

void EdgeToolBox::edgeWidthBtnClicked()
{
    Q_EMIT signalClearSizeBoxLineEditFocus(true);
    m_slider->popup(m_widthButton->mapToGlobal(QPoint(0, m_widthButton->height())));
    Q_EMIT signalShowEdgeSlider(true);
}

void EdgeToolBox::getSliderValueBeforeChanged()
{
    m_valueBeforeDrag = m_slider->value();
}

void EdgeToolBox::edgeWidthChangedForPreview(int value)
{
    m_edge.setEdgeWidth(value);
    showWidth();
    Q_EMIT edgeChange(1, m_edge, TextObjectConstants::PropertyEdgeWidthPreview, PREVIEW, WIDTH);
}

// Turns the whole drag into one undo step.
void EdgeToolBox::edgeWidthChangedForSave()
{
    Q_EMIT signalShowEdgeSlider(false);
    if (m_slider->value() != m_valueBeforeDrag) {
        m_edge.setEdgeWidth(m_slider->value());
        Q_EMIT edgeChange(1, m_edge, TextObjectConstants::PropertyEdgeWidthOrColor, COMMITTED, WIDTH);
    }
}

void EdgeToolBox::getColorValue(const QString& color, int state)
{
    m_edge.setEdgeColor(color.toStdString());
    showColor();
    Q_EMIT edgeChange(1, m_edge, TextObjectConstants::PropertyEdgeWidthOrColor, state, COLOR);
}

bool EdgeToolBox::sliderIsShown() const
{
    return m_slider->isVisible();
}

void EdgeToolBox::hideEdgeSliderMenu()
{
    if (sliderIsShown())
        m_slider->close();
}

// Showing values

void EdgeToolBox::setEdge(int on, const TEdge& edge, bool preview)
{
    m_on = on != 0;
    m_edge = edge;
    if (!preview)
        m_slider->setValue(edge.getEdgeWidth());
    showWidth();
    showColor();
    if (isBoxEnabled())
        showSwitch();
}

void EdgeToolBox::showSwitch()
{
    KSPushbutton* chosen = m_on ? m_onButton : m_offButton;
    KSPushbutton* other = m_on ? m_offButton : m_onButton;
    setButtonChosen(chosen);
    setButtonSelected(other, false);
    setButtonEnabled(other, true);
    setButtonEnabled(m_widthButton, m_on);
    m_colorButton->setEnabled(m_on);
}

void EdgeToolBox::showWidth()
{
    m_widthButton->setText(QString::number(m_edge.getEdgeWidth()));
}

void EdgeToolBox::showColor()
{
    m_colorButton->setFace(getRgbaValue(getColor()), COLORBUTTON_STYLE);
}

void EdgeToolBox::setWidgetEnabled()
{
    ToolBox::setWidgetEnabled();
    showSwitch();
}

void EdgeToolBox::setWidgetDisabled()
{
    ToolBox::setWidgetDisabled();
    m_colorButton->setEnabled(false);
}

void EdgeToolBox::resetInitializeStyle()
{
    hideEdgeSliderMenu();
    TEdge edge;
    edge.setEdgeWidth(DEFAULT_SLIDERVALUE);
    edge.setEdgeColor(DEFAULT_COLORVALUE.toStdString());
    setEdge(0, edge, false);
    ToolBox::resetInitializeStyle();
}

void EdgeToolBox::translateText()
{
    m_label->setText(tr("Edge"));
    m_pxLabel->setText(tr("px"));
    m_slider->translateText();
}
