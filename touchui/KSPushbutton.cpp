#include "touchui/KSPushbutton.h"

#include <QEvent>
#include <QIcon>
#include <QPaintEvent>
#include <QPainter>

namespace
{

constexpr int SLICES_PER_STATE = 3;
constexpr int TEXT_MARGIN = 8; // from the left and right edge, in pixels
const QColor TEXT(220, 220, 220);
const QColor DISABLED_TEXT(102, 102, 102);

} // namespace

KSPushbutton::KSPushbutton(const QString& images, QWidget* parent) : TouchEventButton(parent)
{
    init();
    setImage(images);
}

KSPushbutton::KSPushbutton(const QString& images, const QString& text, QWidget* parent)
    : TouchEventButton(text, parent)
{
    init();
    setImage(images);
}

KSPushbutton::KSPushbutton(QWidget* parent) : TouchEventButton(parent)
{
    init();
}

void KSPushbutton::init()
{
    connect(this, &QAbstractButton::pressed, this, [this] { Q_EMIT pressed(m_buttonId); });
    connect(this, &TouchEventButton::signalReleased, this,
            [this](bool outside) { Q_EMIT signalReleased(outside, m_buttonId); });
}

void KSPushbutton::changeButtonState(_enumButtonState state)
{
    changeButtonState(static_cast<int>(state));
}

void KSPushbutton::changeButtonState(int state)
{
    if (state < ButtonRest || state >= ButtonStateCount)
        return;
    m_state = static_cast<_enumButtonState>(state);
    if (m_autoState)
        m_paintedState = m_state;
    update();
}

void KSPushbutton::setAutoState(bool autoState)
{
    m_autoState = autoState;
    if (m_autoState)
        changeButtonState(m_state);
}

void KSPushbutton::setSelected(bool selected)
{
    if (selected != isSelected())
        changeButtonState(selected ? m_state + ButtonSelectedRest : m_state - ButtonSelectedRest);
}

void KSPushbutton::setImage(const QString& images)
{
    m_imageNames = images.isEmpty() ? QStringList() : images.split(QLatin1Char(':'));
    m_slices = QList<QPixmap>(m_imageNames.size());
    update();
}

void KSPushbutton::setMovableImage(const QPixmap& image, const QPoint& position)
{
    m_movableImage = image;
    m_movablePosition = position;
    update();
}

void KSPushbutton::setBackgroudImage(const QPixmap& image)
{
    m_backgroundImage = image;
    update();
}

void KSPushbutton::cleanImages()
{
    m_imageNames.clear();
    m_slices.clear();
    m_movableImage = QPixmap();
    m_backgroundImage = QPixmap();
    update();
}

void KSPushbutton::setTextAlignment(Qt::Alignment alignment)
{
    m_textAlignment = alignment;
    update();
}

// Disabling and enabling keep the button selected or unselected and select the matching state.
void KSPushbutton::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::EnabledChange) {
        const int row = isSelected() ? ButtonSelectedRest : ButtonRest;
        if (!isEnabled())
            changeButtonState(row + ButtonDisabled);
        else if (m_state == row + ButtonDisabled)
            changeButtonState(row + ButtonRest);
    }
    TouchEventButton::changeEvent(event);
}

void KSPushbutton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    drawImage(painter, m_paintedState);
    if (!m_backgroundImage.isNull())
        painter.drawPixmap(rect(), m_backgroundImage);
    drawIcon(painter);
    if (!m_movableImage.isNull())
        painter.drawPixmap(m_movablePosition, m_movableImage);
    drawText(painter);
}

const QPixmap& KSPushbutton::slice(int index)
{
    static const QPixmap none;
    if (index >= m_imageNames.size() || m_imageNames.at(index).isEmpty())
        return none;
    QPixmap& pixmap = m_slices[index];
    if (pixmap.isNull())
        pixmap.load(QStringLiteral(":/%1/%2").arg(m_imageNames.constFirst(), m_imageNames.at(index)));
    return pixmap;
}

void KSPushbutton::drawImage(QPainter& painter, _enumButtonState state)
{
    const int first = state * SLICES_PER_STATE + 1; // skip the folder
    const QPixmap& left = slice(first);
    const QPixmap& center = slice(first + 1);
    const QPixmap& right = slice(first + 2);
    const int leftWidth = left.isNull() ? 0 : left.width();
    const int rightWidth = right.isNull() ? 0 : right.width();
    if (!left.isNull())
        painter.drawPixmap(QRect(0, 0, leftWidth, height()), left);
    if (!right.isNull())
        painter.drawPixmap(QRect(width() - rightWidth, 0, rightWidth, height()), right);
    const int middle = width() - leftWidth - rightWidth;
    if (!center.isNull() && middle > 0)
        painter.drawPixmap(QRect(leftWidth, 0, middle, height()), center);
}

void KSPushbutton::drawIcon(QPainter& painter)
{
    if (icon().isNull())
        return;
    const QRect area(QPoint((width() - iconSize().width()) / 2, (height() - iconSize().height()) / 2),
                     iconSize());
    // The owner sets a separate picture for the disabled state; Qt must not compute one.
    icon().paint(&painter, area, Qt::AlignCenter, QIcon::Normal, QIcon::Off);
}

void KSPushbutton::drawText(QPainter& painter)
{
    if (text().isEmpty())
        return;
    const bool disabled = m_paintedState == ButtonDisabled || m_paintedState == ButtonSelectedDisabled;
    // Bright text on the dark pictures, unless the owner has set another colour.
    const bool chosen = palette().isBrushSet(QPalette::Active, QPalette::ButtonText);
    const QColor ink = chosen ? palette().color(QPalette::Active, QPalette::ButtonText) : TEXT;
    painter.setPen(disabled ? DISABLED_TEXT : ink);
    painter.setFont(font());
    const QRect area = rect().adjusted(TEXT_MARGIN, 0, -TEXT_MARGIN, 0);
    painter.drawText(area, static_cast<int>(m_textAlignment) | Qt::TextSingleLine, text());
}
