#include "touchui/KSMenu.h"

#include "touchui/BalloonWindow.h"
#include "touchui/OutsidePressFilter.h"

#include <QBitmap>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QPointer>
#include <QTimer>
#include <QTouchEvent>
#include <QTransform>

using MenuPlacement::ArrowSide;

namespace
{

constexpr int ROW_HEIGHT = 60;
constexpr int ROW_PADDING = 12; // above and below a text that is higher than usual
constexpr int BORDER = 8;
constexpr int TEXT_MARGIN = 20;
constexpr int LEAST_WIDTH = 200;
constexpr int TEXT_PIXELS = 28;
const QColor TEXT_COLOR(220, 220, 220);
const QColor DISABLED_COLOR(102, 102, 102);

} // namespace

QWidget* KSMenu::s_parent = nullptr;

KSMenu::KSMenu(QWidget* parent, const QFont& font)
    : QMenu(parent)
    , m_outsidePress(new OutsidePressFilter(this, this))
    , m_frame(SliceFrame::family(QStringLiteral(":/Dialog/dialog_base_")))
    , m_arrow(QStringLiteral(":/Menu/context_menu_allow"))
    , m_separator(QStringLiteral(":/Menu/Separator_H"))
    , m_cursor(QStringLiteral(":/Menu/List_Cursor"))
{
    setWindowFlags(Qt::ToolTip | Qt::FramelessWindowHint | Qt::NoDropShadowWindowHint |
                   Qt::WindowDoesNotAcceptFocus);
    setAttribute(Qt::WA_TranslucentBackground);
    setAttribute(Qt::WA_AcceptTouchEvents);
    setAttribute(Qt::WA_ShowWithoutActivating);
    QFont textFont = font;
    if (font == QFont())
        textFont.setPixelSize(TEXT_PIXELS);
    setFont(textFont);
    connect(m_outsidePress, &OutsidePressFilter::pressedOutside, this, &QWidget::close);
    const auto place = [this] { return m_finger.positionIn(this).toPoint(); };
    connect(&m_finger, &OneFinger::began, this, [this, place] { onMouseButtonPress(place()); });
    connect(&m_finger, &OneFinger::moved, this, [this, place] { onMouseMove(place()); });
    connect(&m_finger, &OneFinger::lifted, this,
            [this, place] { onMouseButtonRelease(place(), Qt::LeftButton); });
    connect(&m_finger, &OneFinger::cancelled, this, [this] { setCurrent(-1); });
}

KSMenu::~KSMenu()
{
    m_outsidePress->stop();
}

void KSMenu::setBalloonAlignment(int flags)
{
    m_alignment = flags;
}

bool KSMenu::testBalloonAlignment(int flag) const
{
    return (m_alignment & flag) != 0;
}

int KSMenu::flags() const
{
    int result = 0;
    for (const int flag : {MenuPlacement::Below, MenuPlacement::Above, MenuPlacement::Horizontal})
        if (testBalloonAlignment(flag))
            result |= flag;
    return result;
}

void KSMenu::popup(const QPoint& anchor, QAction* atAction)
{
    m_anchor = anchor;
    m_hasAnchor = true;
    QMenu::popup(anchor, atAction);
}

void KSMenu::showEvent(QShowEvent* event)
{
    if (!m_hasAnchor)
        m_anchor = pos();
    m_hasAnchor = false;
    setCurrent(-1);
    resize(sizeHint());
    AutoMoveMenuVertical(m_anchor);
    AutoMoveMenuHorizontal(m_anchor);
    adjustMask();
    QMenu::showEvent(event);
    m_outsidePress->start();
    startAutoCloseTimer();
}

void KSMenu::hideEvent(QHideEvent* event)
{
    m_outsidePress->stop();
    setCurrent(-1);
    if (m_autoCloseTimer != nullptr)
        m_autoCloseTimer->stop();
    QMenu::hideEvent(event);
}

QRect KSMenu::bounds() const
{
    return BalloonWindow::bounds(s_parent, m_anchor);
}

MenuPlacement::Placement KSMenu::placement() const
{
    return MenuPlacement::placeMenu(flags(), m_anchor, size(), bounds());
}

void KSMenu::AutoMoveMenuVertical(const QPoint& anchor)
{
    move(x(), MenuPlacement::menuTop(flags(), anchor.y(), height(), bounds()));
}

void KSMenu::AutoMoveMenuHorizontal(const QPoint& anchor)
{
    move(MenuPlacement::menuLeft(flags(), anchor.x(), width(), bounds()), y());
}

QPolygon KSMenu::getMenuPointPoints() const
{
    const MenuPlacement::Placement place = placement();
    const int half = MenuPlacement::ARROW_WIDTH / 2;
    const int length = MenuPlacement::ARROW_LENGTH;
    const QPoint tip = place.tip;
    switch (place.side) {
    case ArrowSide::Top:
        return QPolygon({tip, tip + QPoint(-half, length), tip + QPoint(half, length)});
    case ArrowSide::Bottom:
        return QPolygon({tip, tip + QPoint(-half, -length), tip + QPoint(half, -length)});
    case ArrowSide::Left:
        return QPolygon({tip, tip + QPoint(length, -half), tip + QPoint(length, half)});
    case ArrowSide::Right:
        return QPolygon({tip, tip + QPoint(-length, -half), tip + QPoint(-length, half)});
    }
    return QPolygon();
}

QRect KSMenu::getMenuBackgroundRect() const
{
    return MenuPlacement::background(size(), placement().side);
}

int KSMenu::getMenuItemHeight() const
{
    return height() / qMax(1, static_cast<int>(actions().size()));
}

QRect KSMenu::getMenuItemRect(int row) const
{
    return MenuPlacement::rowRect(getMenuBackgroundRect(), BORDER, static_cast<int>(rows().size()), row);
}

int KSMenu::cursorItem(const QPoint& point) const
{
    return MenuPlacement::rowAt(getMenuBackgroundRect(), BORDER, static_cast<int>(rows().size()), point);
}

QList<QAction*> KSMenu::rows() const
{
    QList<QAction*> result;
    for (QAction* action : actions())
        if (action->isVisible() && !action->isSeparator())
            result.append(action);
    return result;
}

QSize KSMenu::sizeHint() const
{
    const QFontMetrics metrics(font());
    int width = 0;
    const QList<QAction*> list = rows();
    for (const QAction* action : list)
        width = qMax(width, metrics.horizontalAdvance(action->text()));
    const int rowHeight = qMax(ROW_HEIGHT, metrics.height() + 2 * ROW_PADDING);
    const QSize body(qMax(LEAST_WIDTH, width + 2 * TEXT_MARGIN + 2 * BORDER),
                     rowHeight * qMax(1, static_cast<int>(list.size())) + 2 * BORDER);
    const bool beside =
        testBalloonAlignment(MenuPlacement::Above) && !testBalloonAlignment(MenuPlacement::Below);
    return body + (beside ? QSize(MenuPlacement::ARROW_LENGTH, 0) : QSize(0, MenuPlacement::ARROW_LENGTH));
}

void KSMenu::setAutoCloseTime(int milliseconds)
{
    m_autoCloseTime = qMax(0, milliseconds);
    if (m_autoCloseTime == 0 && m_autoCloseTimer != nullptr)
        m_autoCloseTimer->stop();
}

void KSMenu::startAutoCloseTimer()
{
    if (m_autoCloseTime <= 0)
        return;
    delete m_autoCloseTimer;
    m_autoCloseTimer = new QTimer(this);
    m_autoCloseTimer->setSingleShot(true);
    connect(m_autoCloseTimer, &QTimer::timeout, this, &QWidget::close);
    m_autoCloseTimer->start(m_autoCloseTime);
}

void KSMenu::restartAutoCloseTimer()
{
    if (isVisible())
        startAutoCloseTimer();
}

bool KSMenu::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        return onKeyEvent(static_cast<QKeyEvent*>(event));
    case QEvent::Enter:
        return QWidget::event(event);
    case QEvent::Leave:
        onMouseLeave();
        return true;
    case QEvent::Close:
        if (isVisible())
            Q_EMIT signalMenuAboutToClose();
        return QMenu::event(event);
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::MouseButtonRelease:
        return onMouseEvent(event);
    default:
        return (OneFinger::isTouch(event) && onTouchEvent(static_cast<QTouchEvent*>(event))) ||
               QMenu::event(event);
    }
}

bool KSMenu::onMouseEvent(QEvent* event)
{
    const auto* mouse = static_cast<QMouseEvent*>(event);
    const QPoint position = mouse->position().toPoint();
    if (m_finger.isDown())
        return true; // a finger is using the menu
    if (event->type() == QEvent::MouseMove)
        onMouseMove(position);
    else if (event->type() == QEvent::MouseButtonRelease)
        onMouseButtonRelease(position, mouse->button());
    else
        onMouseButtonPress(position);
    return true;
}

bool KSMenu::onTouchEvent(QTouchEvent* event)
{
    m_finger.follow(event);
    return true;
}

bool KSMenu::onKeyEvent(QKeyEvent* event)
{
    const int count = static_cast<int>(rows().size());
    switch (event->key()) {
    case Qt::Key_Escape:
        close();
        break;
    case Qt::Key_Up:
        setCurrent(m_current > 0 ? m_current - 1 : count - 1);
        break;
    case Qt::Key_Down:
        setCurrent(m_current + 1 < count ? m_current + 1 : (count > 0 ? 0 : -1));
        break;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (m_current >= 0)
            onMouseButtonRelease(getMenuItemRect(m_current).center(), Qt::LeftButton);
        break;
    default:
        return false;
    }
    restartAutoCloseTimer();
    return true;
}

void KSMenu::onMouseLeave()
{
    if (!m_finger.isDown())
        setCurrent(-1);
}

void KSMenu::onMouseButtonPress(const QPoint& position)
{
    setCurrent(cursorItem(position));
    restartAutoCloseTimer();
}

void KSMenu::onMouseMove(const QPoint& position)
{
    setCurrent(cursorItem(position));
}

void KSMenu::onMouseButtonRelease(const QPoint& position, Qt::MouseButton button)
{
    setCurrent(cursorItem(position));
    if (m_current < 0 || (button != Qt::LeftButton && button != Qt::NoButton))
        return;
    const QPointer<QAction> action = rows().value(m_current);
    setCurrent(-1);
    if (action == nullptr || !action->isEnabled()) {
        restartAutoCloseTimer();
        return;
    }
    close();
    if (action != nullptr)
        action->trigger(); // also emits triggered(QAction*)
}

void KSMenu::setCurrent(int row)
{
    if (m_current != row) {
        m_current = row;
        update();
    }
}

// Without a compositor, transparent pixels would be black.
void KSMenu::adjustMask()
{
    QPixmap shape(size());
    shape.fill(Qt::transparent);
    QPainter painter(&shape);
    drawBalloon(painter);
    painter.end();
    QRegion region(shape.mask());
    if (region.isEmpty())
        region = QRegion(getMenuBackgroundRect()) + QRegion(getMenuPointPoints());
    setMask(region);
}

void KSMenu::drawBalloon(QPainter& painter) const
{
    const MenuPlacement::Placement place = placement();
    m_frame.paint(painter, MenuPlacement::background(size(), place.side));
    if (m_arrow.isNull())
        return;
    // The arrow's picture points up. Its lower part overlaps the frame.
    painter.save();
    switch (place.side) {
    case ArrowSide::Top:
        painter.translate(place.tip.x(), 0);
        break;
    case ArrowSide::Right:
        painter.translate(width(), place.tip.y());
        painter.rotate(90);
        break;
    case ArrowSide::Bottom:
        painter.translate(place.tip.x(), height());
        painter.rotate(180);
        break;
    case ArrowSide::Left:
        painter.translate(0, place.tip.y());
        painter.rotate(270);
        break;
    }
    painter.drawPixmap(-m_arrow.width() / 2, 0, m_arrow);
    painter.restore();
}

void KSMenu::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    drawBalloon(painter);
    const QList<QAction*> list = rows();
    for (int row = 0; row < list.size(); ++row)
        drawMenuItem(painter, row, list.at(row));
}

void KSMenu::drawMenuItem(QPainter& painter, int row, const QAction* action)
{
    const QRect rect = getMenuItemRect(row);
    if (row == m_current && action->isEnabled())
        painter.drawPixmap(rect, m_cursor);
    if (row > 0 && !m_separator.isNull()) {
        painter.drawPixmap(
            QRect(rect.x(), rect.y() - m_separator.height() / 2, rect.width(), m_separator.height()),
            m_separator);
    }
    painter.setFont(font());
    painter.setPen(action->isEnabled() ? TEXT_COLOR : DISABLED_COLOR);
    painter.drawText(rect.adjusted(TEXT_MARGIN, 0, -TEXT_MARGIN, 0),
                     Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine, action->text());
}
