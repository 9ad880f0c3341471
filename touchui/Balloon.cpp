#include "touchui/Balloon.h"

#include "touchui/BalloonPainter.h"
#include "touchui/BalloonWindow.h"

#include <QApplication>
#include <QEvent>
#include <QFontMetrics>
#include <QPainter>
#include <QTimer>

namespace
{

constexpr int MARGIN_X = 20;
constexpr int MARGIN_Y = 10;
constexpr int LEAST_WIDTH = 64;
constexpr int WIDEST_PROMPT = 560;
const QColor TEXT_COLOR(220, 220, 220);

} // namespace

QWidget* Balloon::s_ParentWindow = nullptr;

Balloon::Balloon(QObject* parent)
    : QObject(parent)
    , m_timer(new QTimer(this))
    , m_frame(BalloonPainter::frame())
    , m_arrowUp(BalloonPainter::arrowUp())
    , m_arrowDown(BalloonPainter::arrowDown())
{
    m_timer->setSingleShot(true);
    connect(m_timer, &QTimer::timeout, this, &Balloon::hide);
}

Balloon::~Balloon()
{
    delete m_window;
}

QFont Balloon::textFont()
{
    QFont font = QApplication::font();
    font.setPixelSize(FONT_SIZE);
    return font;
}

void Balloon::showButtonText(QWidget* button, const QString& text)
{
    m_timer->stop();
    show(button, text, Qt::AlignCenter | Qt::TextSingleLine, true);
}

void Balloon::showPromptText(QWidget* widget, const QString& text, int milliseconds)
{
    m_timer->stop();
    show(widget, text, Qt::AlignLeft | Qt::AlignVCenter | Qt::TextWordWrap, false);
    if (isVisible() && milliseconds > 0)
        m_timer->start(milliseconds);
}

void Balloon::show(QWidget* widget, const QString& text, int flags, bool below)
{
    if (m_anchor != nullptr && m_anchor != widget) {
        m_anchor->removeEventFilter(this);
        disconnect(m_anchor, &QObject::destroyed, this, &Balloon::hide);
    }
    m_anchor = widget;
    if (widget == nullptr || text.isEmpty()) {
        hide();
        return;
    }
    widget->installEventFilter(this);
    connect(widget, &QObject::destroyed, this, &Balloon::hide, Qt::UniqueConnection);
    m_text = text;
    m_textFlags = flags;
    m_below = below;
    const QRect bounds = BalloonWindow::bounds(s_ParentWindow, widget->mapToGlobal(QPoint(0, 0)));
    int room = bounds.width() - 2 * MARGIN_X;
    if (flags & Qt::TextWordWrap)
        room = qMin(room, WIDEST_PROMPT);
    else
        m_text = QFontMetrics(textFont()).elidedText(text, Qt::ElideRight, room);
    setTextRect(calculateTextRect(m_text, room, flags));
    designballon(widget);
}

QRect Balloon::calculateTextRect(const QString& text, int width, int flags) const
{
    return QFontMetrics(textFont()).boundingRect(QRect(0, 0, width, QWIDGETSIZE_MAX), flags, text);
}

void Balloon::setTextRect(const QRect& rect)
{
    m_textRect = QRect(MARGIN_X, MARGIN_Y, qMax(rect.width(), LEAST_WIDTH - 2 * MARGIN_X), rect.height());
}

void Balloon::designballon(QWidget* widget)
{
    const QRect anchor(widget->mapToGlobal(QPoint(0, 0)), widget->size());
    const QRect bounds = BalloonWindow::bounds(s_ParentWindow, anchor.center());
    const QSize size(m_textRect.width() + 2 * MARGIN_X,
                     m_textRect.height() + 2 * MARGIN_Y + MenuPlacement::ARROW_LENGTH);
    m_placement = MenuPlacement::placeBalloon(anchor, size, bounds, m_below);
    m_body = MenuPlacement::background(size, m_placement.side);
    QPixmap picture(size);
    picture.fill(Qt::transparent);
    {
        QPainter painter(&picture);
        if (m_placement.side == MenuPlacement::ArrowSide::Top)
            paintTopArrowBalloon(painter);
        else
            paintBottomBalloon(painter);
        painter.setFont(textFont());
        painter.setPen(TEXT_COLOR);
        painter.drawText(m_textRect.translated(m_body.topLeft()), m_textFlags, m_text);
    }
    if (m_window == nullptr || m_window->parentWidget() != s_ParentWindow) {
        delete m_window;
        m_window = new BalloonWindow(s_ParentWindow);
        m_window->setObjectName(QStringLiteral("Balloon"));
    }
    m_window->showPicture(picture, m_placement.rect.topLeft());
}

void Balloon::paintTopArrowBalloon(QPainter& painter) const
{
    drawTopArrowTopImage(painter);
    drawTopArrowMidImage(painter);
    drawTopArrowBottomImage(painter);
}

void Balloon::paintBottomBalloon(QPainter& painter) const
{
    drawBottomArrowTopImage(painter);
    drawBottomArrowMidImage(painter);
    drawBottomArrowBottomImage(painter);
}

void Balloon::drawTopArrowTopImage(QPainter& painter) const
{
    BalloonPainter::paintBand(painter, m_frame, m_body, 0, m_arrowUp, m_placement.tip.x());
}

void Balloon::drawTopArrowMidImage(QPainter& painter) const
{
    BalloonPainter::paintBand(painter, m_frame, m_body, 1);
}

void Balloon::drawTopArrowBottomImage(QPainter& painter) const
{
    BalloonPainter::paintBand(painter, m_frame, m_body, 2);
}

void Balloon::drawBottomArrowTopImage(QPainter& painter) const
{
    BalloonPainter::paintBand(painter, m_frame, m_body, 0);
}

void Balloon::drawBottomArrowMidImage(QPainter& painter) const
{
    BalloonPainter::paintBand(painter, m_frame, m_body, 1);
}

void Balloon::drawBottomArrowBottomImage(QPainter& painter) const
{
    BalloonPainter::paintBand(painter, m_frame, m_body, 2, m_arrowDown, m_placement.tip.x());
}

void Balloon::hide()
{
    m_timer->stop();
    if (m_window != nullptr)
        m_window->hide();
}

bool Balloon::isVisible() const
{
    return m_window != nullptr && m_window->isVisible();
}

QRect Balloon::geometry() const
{
    return isVisible() ? m_window->geometry() : QRect();
}

bool Balloon::eventFilter(QObject* obj, QEvent* event)
{
    if (obj == m_anchor && event->type() == QEvent::Hide)
        hide();
    else if (obj == m_anchor && (event->type() == QEvent::Move || event->type() == QEvent::Resize) &&
             isVisible())
        designballon(m_anchor);
    return QObject::eventFilter(obj, event);
}
