#include "touchui/KSRadiobutton.h"

#include <QMouseEvent>
#include <QPainter>

namespace
{

constexpr QSize PLAIN_PICTURE(36, 36);
constexpr int GAP = 8;
constexpr int TEXT_PIXELS = 24;
const QColor TEXT_COLOR(220, 220, 220);
const QColor DISABLED_COLOR(102, 102, 102);
const QPoint OUTSIDE(-1, -1);

} // namespace

KSRadiobutton::KSRadiobutton(QWidget* parent) : QRadioButton(parent)
{
    init();
}

KSRadiobutton::KSRadiobutton(const QString& text, QWidget* parent) : QRadioButton(text, parent)
{
    init();
}

void KSRadiobutton::init()
{
    setAttribute(Qt::WA_AcceptTouchEvents);
    setFocusPolicy(Qt::NoFocus);
    connect(&m_finger, &OneFinger::acted, this,
            [this](QEvent::Type type) { sendMouse(type, m_finger.positionIn(this)); });
    connect(&m_finger, &OneFinger::cancelled, this, &KSRadiobutton::comeUp);
    QFont textFont = font();
    textFont.setPixelSize(TEXT_PIXELS);
    setFont(textFont);
    setImagesPath(QStringLiteral(":/KSRadioButton"));
}

void KSRadiobutton::setImagesPath(const QString& folder)
{
    const char* const rows[] = {"Off", "On"};
    const char* const columns[] = {"Rest", "Pressed", "Disabled"};
    for (std::size_t row = 0; row < m_pictures.size(); ++row) {
        for (std::size_t column = 0; column < m_pictures[row].size(); ++column) {
            m_pictures[row][column] =
                QPixmap(QStringLiteral("%1/Radiobutton_%2_%3")
                            .arg(folder, QLatin1String(rows[row]), QLatin1String(columns[column])));
        }
    }
    updateGeometry();
    update();
}

QSize KSRadiobutton::pictureSize() const
{
    return m_pictures[0][0].isNull() ? PLAIN_PICTURE : m_pictures[0][0].size();
}

QSize KSRadiobutton::sizeHint() const
{
    const QSize picture = pictureSize();
    if (text().isEmpty())
        return picture;
    return QSize(picture.width() + GAP + fontMetrics().horizontalAdvance(text()),
                 qMax(picture.height(), fontMetrics().height()));
}

bool KSRadiobutton::hitButton(const QPoint& position) const
{
    return rect().contains(position);
}

bool KSRadiobutton::event(QEvent* event)
{
    return m_finger.takes(event) || QRadioButton::event(event);
}

void KSRadiobutton::sendMouse(QEvent::Type type, const QPointF& position)
{
    const QPoint place = position.toPoint();
    QMouseEvent event = OneFinger::mouseEvent(type, place, mapToGlobal(place));
    if (type == QEvent::MouseButtonPress)
        mousePressEvent(&event);
    else if (type == QEvent::MouseMove)
        mouseMoveEvent(&event);
    else
        mouseReleaseEvent(&event);
}

// Releases the button without choosing it.
void KSRadiobutton::comeUp()
{
    sendMouse(QEvent::MouseMove, OUTSIDE);
    sendMouse(QEvent::MouseButtonRelease, OUTSIDE);
}

void KSRadiobutton::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    const std::size_t column = !isEnabled() ? 2 : isDown() ? 1 : 0;
    const QPixmap& picture = m_pictures[isChecked() ? 1 : 0][column];
    const QSize size = pictureSize();
    const QRect place(QPoint(0, (height() - size.height()) / 2), size);
    if (picture.isNull()) {
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(isEnabled() ? TEXT_COLOR : DISABLED_COLOR);
        painter.setBrush(isChecked() ? painter.pen().brush() : Qt::NoBrush);
        painter.drawEllipse(place.adjusted(6, 6, -6, -6));
    } else {
        painter.drawPixmap(place, picture);
    }
    if (text().isEmpty())
        return;
    painter.setFont(font());
    painter.setPen(isEnabled() ? TEXT_COLOR : DISABLED_COLOR);
    painter.drawText(rect().adjusted(size.width() + GAP, 0, 0, 0),
                     Qt::AlignLeft | Qt::AlignVCenter | Qt::TextSingleLine, text());
}
