#include "gallery/GalleryPage.h"

#include "app/APPEventFilter.h"
#include "gallery/PagePicture.h"
#include "touchui/Balloon.h"
#include "touchui/KSMenu.h"
#include "touchui/KSScrollViewerWidget.h"
#include "touchui/KSToolTip.h"

#include <QCoreApplication>
#include <QLabel>

GalleryPage::GalleryPage(const QString& pageName, const QSize& size)
    : name(pageName), window(std::make_unique<QWidget>())
{
    window->setObjectName(QStringLiteral("page"));
    window->setWindowTitle(pageName);
    window->setFixedSize(size);
    window->setAttribute(Qt::WA_AcceptTouchEvents);
    window->setStyleSheet(QStringLiteral("QWidget#page { background-color: rgb(50, 50, 50); }"));
}

void GalleryPage::show()
{
    KSMenu::setMainWindow(window.get());
    KSScrollViewerWidget::s_mainWnd = window.get();
    KSToolTip::s_mainWindow = window.get();
    Balloon::s_ParentWindow = window.get();
    window->move(0, 0);
    window->show();
}

QImage GalleryPage::shoot()
{
    // A pose has several fingers, on several widgets, which the filter would refuse.
    APPEventFilter::release();
    Fingers fingers;
    show();
    QCoreApplication::processEvents();
    pose(fingers);
    QCoreApplication::processEvents();
    const QImage picture = PagePicture::shoot(window.get());
    fingers.cancel();
    return picture;
}

void GalleryPage::close()
{
    window.reset();
    KSToolTip::clearInstance();
    KSMenu::setMainWindow(nullptr);
    KSToolTip::s_mainWindow = nullptr;
    Balloon::s_ParentWindow = nullptr;
}

QLabel* GalleryPage::caption(const QPoint& position, const QString& text) const
{
    auto* label = new QLabel(text, window.get());
    label->setAttribute(Qt::WA_TransparentForMouseEvents);
    label->setStyleSheet(QStringLiteral("color: rgb(178, 178, 178); font-size: 16px;"));
    label->adjustSize();
    label->move(position);
    return label;
}
