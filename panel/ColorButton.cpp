#include "panel/ColorButton.h"

#include <QStyleOptionButton>
#include <QStylePainter>

namespace
{

const QColor PRESSED_SHADE(0, 0, 0, 90);
const QColor DISABLED_SHADE(50, 50, 50, 190);

} // namespace

ColorButton::ColorButton(QWidget* parent) : KSPushbutton(parent)
{
    setFocusPolicy(Qt::NoFocus);
}

QString ColorButton::getRgbaValue(const QString& color)
{
    const QColor value(color);
    return QStringLiteral("rgba(%1, %2, %3, %4)")
        .arg(value.red())
        .arg(value.green())
        .arg(value.blue())
        .arg(value.alpha());
}

// Skips a style sheet that is set already, since parsing it is slow.
void ColorButton::setFace(const QString& color, const QString& declarations)
{
    const QString sheet = QStringLiteral("background-color:%1; %2").arg(color, declarations);
    if (sheet != styleSheet())
        setStyleSheet(sheet);
}

void ColorButton::paintEvent(QPaintEvent*)
{
    QStylePainter painter(this);
    QStyleOptionButton option;
    initStyleOption(&option);
    painter.drawControl(QStyle::CE_PushButton, option);
    switch (paintedState()) {
    case ButtonPressed:
    case ButtonSelectedPressed:
        painter.fillRect(rect(), PRESSED_SHADE);
        break;
    case ButtonDisabled:
    case ButtonSelectedDisabled:
        painter.fillRect(rect(), DISABLED_SHADE);
        break;
    default:
        break;
    }
}
