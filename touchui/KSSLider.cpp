#include "touchui/KSSLider.h"

#include "touchui/KSSliderStyle.h"
#include "touchui/KSToolTip.h"

#include <QMetaMethod>
#include <QMouseEvent>
#include <QPainter>
#include <QStringList>
#include <QStyleOptionSlider>

namespace
{

constexpr int FINGER_MARGIN = 8;
constexpr int COMFORTABLE_LENGTH = 200;

} // namespace

KSSLider::KSSLider(QWidget* parent) : KSSLider(QString(), Qt::Horizontal, parent)
{
}

KSSLider::KSSLider(const QString& images, Qt::Orientation orientation, QWidget* parent)
    : QSlider(orientation, parent), m_style(new KSSliderStyle)
{
    m_style->setParent(this);
    setStyle(m_style);
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFocusPolicy(Qt::NoFocus);
    connect(&m_finger, &OneFinger::acted, this, &KSSLider::sendMouse);
    connect(&m_finger, &OneFinger::cancelled, this, &KSSLider::letGo);
    Initialization(images, orientation);
}

void KSSLider::Initialization(const QString& images, Qt::Orientation orientation)
{
    const QStringList names = images.split(QLatin1Char(':'));
    const auto picture = [&names](qsizetype index) {
        const QString name = names.value(index);
        return name.isEmpty() ? QPixmap() : QPixmap(QStringLiteral(":/%1/%2").arg(names.constFirst(), name));
    };
    KSSliderStyle::Images pictures;
    for (std::size_t i = 0; i < pictures.handle.size(); ++i) {
        pictures.handle[i] = picture(1 + qsizetype(i));
        pictures.groove[i] = picture(4 + qsizetype(i));
    }
    m_style->setImages(pictures);
    setOrientation(orientation);
    updateGeometry();
    update();
}

void KSSLider::setTick(int interval, QSlider::TickPosition position)
{
    setTickInterval(qMax(interval, 0));
    setTickPosition(interval > 0 ? position : QSlider::NoTicks);
    updateGeometry();
}

QRect KSSLider::getTickRect(int value) const
{
    QStyleOptionSlider option;
    initStyleOption(&option);
    return m_style->tickRect(option, qBound(minimum(), value, maximum()));
}

QRect KSSLider::handleRect() const
{
    QStyleOptionSlider option;
    initStyleOption(&option);
    return m_style->subControlRect(QStyle::CC_Slider, &option, QStyle::SC_SliderHandle, this);
}

void KSSLider::changeHandleRect(QRect& rect) const
{
    rect.adjust(-FINGER_MARGIN, -FINGER_MARGIN, FINGER_MARGIN, FINGER_MARGIN);
}

void KSSLider::setReponse(bool response)
{
    m_response = response;
    if (!m_response) {
        m_finger.cancel();
        letGo();
    }
}

void KSSLider::ShowTip()
{
    if (isSignalConnected(QMetaMethod::fromSignal(&KSSLider::signalDrawTip)))
        Q_EMIT signalDrawTip(this);
    else
        DrawTipText(QString::number(sliderPosition()));
}

void KSSLider::DrawTipText(const QString& text)
{
    const QRect handle = handleRect();
    KSToolTip::showTextForSlider(QRect(mapToGlobal(handle.topLeft()), handle.size()), text);
    Q_EMIT signalDrawTipText(text);
}

QSize KSSLider::sizeHint() const
{
    const QSize handle = m_style->handleSize();
    const int bands = ((tickPosition() & TicksAbove) ? KSSliderStyle::TICK_BAND : 0) +
                      ((tickPosition() & TicksBelow) ? KSSliderStyle::TICK_BAND : 0);
    return orientation() == Qt::Horizontal
               ? QSize(qMax(COMFORTABLE_LENGTH, handle.width()), handle.height() + bands)
               : QSize(handle.width() + bands, qMax(COMFORTABLE_LENGTH, handle.height()));
}

QSize KSSLider::minimumSizeHint() const
{
    const QSize hint = sizeHint();
    return orientation() == Qt::Horizontal ? QSize(2 * m_style->handleSize().width(), hint.height())
                                           : QSize(hint.width(), 2 * m_style->handleSize().height());
}

bool KSSLider::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
        return true;
    default:
        return m_finger.takes(event) || QSlider::event(event);
    }
}

void KSSLider::sendMouse(QEvent::Type type)
{
    QMouseEvent event =
        OneFinger::mouseEvent(type, m_finger.positionIn(this).toPoint(), m_finger.position().toPoint());
    if (type == QEvent::MouseButtonPress)
        mousePressEvent(&event);
    else if (type == QEvent::MouseMove)
        mouseMoveEvent(&event);
    else
        mouseReleaseEvent(&event);
}

void KSSLider::mousePressEvent(QMouseEvent* event)
{
    if (!m_response || event->button() != Qt::LeftButton) {
        event->ignore();
        return;
    }
    m_pressed = true;
    Q_EMIT signalMousePressed();
    QRect handle = handleRect();
    m_clickOffset = event->position().toPoint() - handle.center();
    changeHandleRect(handle);
    if (!handle.contains(event->position().toPoint())) {
        QSlider::mousePressEvent(event);
        return;
    }
    event->accept();
    m_dragging = true;
    setRepeatAction(SliderNoAction);
    setSliderDown(true);
    update();
    ShowTip();
}

void KSSLider::mouseMoveEvent(QMouseEvent* event)
{
    if (!m_dragging) {
        QSlider::mouseMoveEvent(event);
        return;
    }
    event->accept();
    const int position = valueAt(event->position().toPoint() - m_clickOffset);
    if (position != sliderPosition()) {
        setSliderPosition(position);
        ShowTip();
    }
}

void KSSLider::mouseReleaseEvent(QMouseEvent* event)
{
    if (m_pressed && event->button() != Qt::LeftButton) {
        event->ignore(); // another button was released while the left one is held
        return;
    }
    if (m_dragging)
        event->accept();
    else
        QSlider::mouseReleaseEvent(event);
    letGo();
}

// Ends the current press and leaves the handle where it is.
void KSSLider::letGo()
{
    if (m_dragging) {
        m_dragging = false;
        setSliderDown(false);
        KSToolTip::hideText();
    }
    setRepeatAction(SliderNoAction);
    update();
    if (m_pressed) {
        m_pressed = false;
        Q_EMIT signalMouseRelease();
    }
}

// position is that of the handle's centre.
int KSSLider::valueAt(const QPoint& position) const
{
    QStyleOptionSlider option;
    initStyleOption(&option);
    const QSize handle = m_style->handleSize();
    const QRect groove = m_style->subControlRect(QStyle::CC_Slider, &option, QStyle::SC_SliderGroove, this);
    const bool flat = orientation() == Qt::Horizontal;
    const QPoint half = QRect(QPoint(0, 0), handle).center();
    const int along = flat ? position.x() - half.x() - groove.x() : position.y() - half.y() - groove.y();
    const int span = flat ? groove.width() - handle.width() : groove.height() - handle.height();
    return QStyle::sliderValueFromPosition(minimum(), maximum(), along, qMax(span, 0), option.upsideDown);
}

void KSSLider::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::EnabledChange && !isEnabled())
        letGo();
    QSlider::changeEvent(event);
}

void KSSLider::hideEvent(QHideEvent* event)
{
    letGo();
    QSlider::hideEvent(event);
}

void KSSLider::initStyleOption(QStyleOptionSlider* option) const
{
    QSlider::initStyleOption(option);
    if (m_dragging) {
        option->state |= QStyle::State_Sunken;
        option->activeSubControls = QStyle::SC_SliderHandle;
    }
}

void KSSLider::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    QStyleOptionSlider option;
    initStyleOption(&option);
    m_style->drawComplexControl(QStyle::CC_Slider, &option, &painter, this);
}
