#include "touchui/BalloonWindow.h"

#include <QBitmap>
#include <QGuiApplication>
#include <QPainter>
#include <QScreen>

BalloonWindow::BalloonWindow(QWidget* window)
    : QWidget(window, Qt::ToolTip | Qt::FramelessWindowHint | Qt::WindowTransparentForInput |
                          Qt::WindowDoesNotAcceptFocus | Qt::NoDropShadowWindowHint)
{
    setAttribute(Qt::WA_TranslucentBackground);
    setAttribute(Qt::WA_ShowWithoutActivating);
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

void BalloonWindow::showPicture(const QPixmap& picture, const QPoint& globalPosition)
{
    m_picture = picture;
    setGeometry(QRect(globalPosition, picture.size()));
    // Without a compositor, transparent pixels would be black.
    setMask(picture.mask());
    if (!isVisible()) {
        show();
        raise();
    }
    update();
}

QRect BalloonWindow::bounds(const QWidget* window, const QPoint& globalPoint)
{
    if (window != nullptr)
        return QRect(window->mapToGlobal(QPoint(0, 0)), window->size());
    const QScreen* screen = QGuiApplication::screenAt(globalPoint);
    if (screen == nullptr)
        screen = QGuiApplication::primaryScreen();
    return screen != nullptr ? screen->geometry() : QRect();
}

void BalloonWindow::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setCompositionMode(QPainter::CompositionMode_Source);
    painter.drawPixmap(0, 0, m_picture);
}
