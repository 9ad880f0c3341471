#include "touchui/KSTabBar.h"

#include "touchui/KSTabStyle.h"

#include <QMouseEvent>
#include <QPalette>

namespace
{

constexpr int TEXT_MARGIN = 24;
constexpr int LEAST_WIDTH = 120;
constexpr int ICON_ROOM = 40;
const QColor TEXT_COLOR(160, 160, 160);
const QColor SELECTED_TEXT(220, 220, 220);
const QColor BACKGROUND(50, 50, 50);

} // namespace

KSTabBar::KSTabBar(QWidget* parent) : QTabBar(parent), m_style(new KSTabStyle)
{
    m_style->setParent(this);
    setStyle(m_style);
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFocusPolicy(Qt::NoFocus);
    connect(&m_finger, &OneFinger::began, this, [this] { pressAt(fingerPosition()); });
    connect(&m_finger, &OneFinger::moved, this, [this] { moveTo(fingerPosition()); });
    connect(&m_finger, &OneFinger::lifted, this, [this] { releaseAt(fingerPosition()); });
    connect(&m_finger, &OneFinger::cancelled, this, &KSTabBar::dropPress);
    setDrawBase(false);
    setExpanding(false);
    QFont textFont = font();
    textFont.setPixelSize(TEXT_PIXELS);
    setFont(textFont);
    QPalette colors = palette();
    for (const QPalette::ColorGroup group : {QPalette::Active, QPalette::Inactive, QPalette::Disabled}) {
        colors.setColor(group, QPalette::WindowText, TEXT_COLOR);
        colors.setColor(group, QPalette::BrightText, SELECTED_TEXT);
        colors.setColor(group, QPalette::Window, BACKGROUND);
    }
    setPalette(colors);
}

bool KSTabBar::isUpright() const
{
    switch (shape()) {
    case RoundedWest:
    case RoundedEast:
    case TriangularWest:
    case TriangularEast:
        return true;
    default:
        return false;
    }
}

void KSTabBar::setTabSizeHint(int index, const QSize& size)
{
    if (index < 0 || index >= m_sizes.size())
        return;
    m_sizes[index] = size;
    // The base class updates its layout only when a tab changes.
    setTabText(index, tabText(index) + QLatin1Char(' '));
    setTabText(index, tabText(index).chopped(1));
    updateGeometry();
}

QSize KSTabBar::textSize(int index) const
{
    const int icon = tabIcon(index).isNull() ? 0 : ICON_ROOM;
    const int width = fontMetrics().horizontalAdvance(tabText(index)) + 2 * TEXT_MARGIN + icon;
    const QSize size(qMax(LEAST_WIDTH, width), TAB_HEIGHT);
    return isUpright() ? size.transposed() : size;
}

QSize KSTabBar::tabSizeHint(int index) const
{
    const QSize size = m_sizes.value(index);
    return size.isValid() ? size : textSize(index);
}

QSize KSTabBar::sizeHint() const
{
    QSize size(0, 0);
    for (int i = 0; i < count(); ++i) {
        if (!isTabVisible(i))
            continue;
        const QSize tab = tabSizeHint(i);
        size = isUpright() ? QSize(qMax(size.width(), tab.width()), size.height() + tab.height())
                           : QSize(size.width() + tab.width(), qMax(size.height(), tab.height()));
    }
    return size;
}

void KSTabBar::tabInserted(int index)
{
    m_sizes.insert(qBound(qsizetype(0), qsizetype(index), m_sizes.size()), QSize());
    dropPress();
    QTabBar::tabInserted(index);
}

void KSTabBar::tabRemoved(int index)
{
    if (index >= 0 && index < m_sizes.size())
        m_sizes.removeAt(index);
    dropPress();
    QTabBar::tabRemoved(index);
}

bool KSTabBar::event(QEvent* event)
{
    return m_finger.takes(event) || QTabBar::event(event);
}

QPoint KSTabBar::fingerPosition() const
{
    return m_finger.positionIn(this).toPoint();
}

void KSTabBar::mousePressEvent(QMouseEvent* event)
{
    if (event->button() == Qt::LeftButton && !m_finger.isDown())
        pressAt(event->position().toPoint());
}

void KSTabBar::mouseMoveEvent(QMouseEvent* event)
{
    if (!m_finger.isDown())
        moveTo(event->position().toPoint());
}

void KSTabBar::mouseReleaseEvent(QMouseEvent* event)
{
    if (event->button() == Qt::LeftButton && !m_finger.isDown())
        releaseAt(event->position().toPoint());
}

void KSTabBar::hideEvent(QHideEvent* event)
{
    dropPress();
    QTabBar::hideEvent(event);
}

void KSTabBar::dropPress()
{
    m_pressStart = -1;
    setPressedTab(-1);
}

void KSTabBar::pressAt(const QPoint& position)
{
    const int index = tabAt(position);
    m_pressStart = index >= 0 && isTabEnabled(index) ? index : -1;
    setPressedTab(m_pressStart);
}

void KSTabBar::moveTo(const QPoint& position)
{
    setPressedTab(m_pressStart >= 0 && tabAt(position) == m_pressStart ? m_pressStart : -1);
}

void KSTabBar::releaseAt(const QPoint& position)
{
    moveTo(position);
    const int index = m_pressedTab;
    m_pressStart = -1;
    setPressedTab(-1);
    if (index < 0)
        return;
    setCurrentIndex(index);
    Q_EMIT tabBarClicked(index);
}

void KSTabBar::setPressedTab(int index)
{
    if (m_pressedTab != index) {
        m_pressedTab = index;
        m_style->setPressedTab(index);
        update();
    }
}
