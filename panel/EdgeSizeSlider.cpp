#include "panel/EdgeSizeSlider.h"

#include "panel/EdgeToolBox.h"
#include "support/LogManager.h"
#include "touchui/KSSLider.h"
#include "touchui/OutsidePressFilter.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPainter>
#include <QSignalBlocker>
#include <QWidgetAction>

namespace
{

constexpr int FRAME = 9;
constexpr int BEGIN_LABEL_WIDTH = 24;
const char SLIDER_IMAGES[] = "Slider:Slider_S_Handle_Rest:Slider_S_Handle_Pressed:Slider_S_Handle_Rest:"
                             "Slider_H_S_Left:Slider_H_S_Center:Slider_H_S_Right";
const char LABEL_STYLE[] = "QLabel {color:rgb(220, 220, 220); font:20px;}";

} // namespace

EdgeSizeSlider::EdgeSizeSlider(QWidget* parent)
    : QMenu(parent)
    , m_frame(SliceFrame::family(QStringLiteral(":/Dialog/dialog_base_")))
    , m_outsidePress(new OutsidePressFilter(this, this))
{
    setWindowFlags(Qt::ToolTip | Qt::FramelessWindowHint | Qt::NoDropShadowWindowHint |
                   Qt::WindowDoesNotAcceptFocus);
    setAttribute(Qt::WA_TranslucentBackground);
    setAttribute(Qt::WA_ShowWithoutActivating);
    setStyleSheet(
        QStringLiteral("QMenu {border:0; background:transparent; padding:%1px; margin:0;}").arg(FRAME));
    auto* action = new QWidgetAction(this);
    action->setDefaultWidget(createContent());
    addAction(action);

    connect(m_outsidePress, &OutsidePressFilter::pressedOutside, this, &QWidget::close);
    connect(m_slider, &QSlider::valueChanged, this, &EdgeSizeSlider::sliderValueSignal);
    connect(m_slider, &KSSLider::signalDrawTip, this, &EdgeSizeSlider::drawToolTip);
    connect(m_slider, &KSSLider::signalMouseRelease, this, &EdgeSizeSlider::slotSliderMouseRelease);
    translateText();
}

EdgeSizeSlider::~EdgeSizeSlider()
{
    m_outsidePress->stop();
}

// Creates the slider with the ends of its range as labels on both sides.
QWidget* EdgeSizeSlider::createContent()
{
    auto* content = new QWidget;
    content->setAttribute(Qt::WA_NoMousePropagation); // a press beside the slider must not reach the menu
    auto* begin = new QLabel(QString::number(SLIDER_RANGE_BEGIN), content);
    begin->setFixedWidth(BEGIN_LABEL_WIDTH);
    m_endLabel = new QLabel(content);
    m_endLabel->setFixedWidth(EDGELABEL_WIDTH);
    for (QLabel* label : {begin, m_endLabel}) {
        label->setAlignment(Qt::AlignCenter);
        label->setStyleSheet(QString::fromLatin1(LABEL_STYLE));
    }

    m_slider = new KSSLider(QString::fromLatin1(SLIDER_IMAGES), Qt::Horizontal, content);
    m_slider->setRange(SLIDER_RANGE_BEGIN, SLIDER_RANGE_END);
    m_slider->setPageStep(1);
    m_slider->setTick(1, QSlider::TicksBelow);
    m_slider->setFixedSize(EDGESLIDER_WIDTH, EDGESLIDER_HEIGHT);

    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(0);
    row->addWidget(begin);
    row->addWidget(m_slider);
    row->addWidget(m_endLabel);
    content->setFixedSize(BEGIN_LABEL_WIDTH + EDGESLIDER_WIDTH + EDGELABEL_WIDTH,
                          EdgeToolBox::EDGESLIDER_HEIGHT - 2 * FRAME);
    return content;
}

void EdgeSizeSlider::translateText()
{
    m_endLabel->setText(QString::number(SLIDER_RANGE_END) + tr("px"));
}

void EdgeSizeSlider::setValue(int value)
{
    const QSignalBlocker silent(m_slider);
    m_slider->setValue(value);
}

int EdgeSizeSlider::value() const
{
    return m_slider->value();
}

void EdgeSizeSlider::drawToolTip()
{
    m_slider->DrawTipText(QString::number(m_slider->sliderPosition()));
}

void EdgeSizeSlider::slotSliderMouseRelease()
{
    LOG_USER_OPERATE(L"Text Property Area", 200, L"Adjust Edge Width to ");
}

void EdgeSizeSlider::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    m_frame.paint(painter, rect());
}

void EdgeSizeSlider::showEvent(QShowEvent* event)
{
    QMenu::showEvent(event);
    m_outsidePress->start();
}

void EdgeSizeSlider::resizeEvent(QResizeEvent* event)
{
    QMenu::resizeEvent(event);
    setMask(m_frame.mask(size()));
}

void EdgeSizeSlider::hideEvent(QHideEvent* event)
{
    m_outsidePress->stop();
    QMenu::hideEvent(event);
}
