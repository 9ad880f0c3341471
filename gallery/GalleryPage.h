#pragma once

#include "gallery/Fingers.h"

#include <QImage>
#include <QSize>
#include <QString>
#include <QWidget>

#include <functional>
#include <memory>

class QLabel;

// One window of the gallery.
struct GalleryPage {
    GalleryPage() = default;
    GalleryPage(const QString& pageName, const QSize& size);

    // Shows the window at the screen's corner and makes it the one that bounds menus, balloons and lifted
    // items.
    void show();
    // The page in its pose, with what it has opened; the fingers are taken away again.
    QImage shoot();
    // Brings the window down and closes what it opened.
    void close();

    // A caption in the page.
    QLabel* caption(const QPoint& position, const QString& text) const;

    QString name; // a file name without a suffix
    std::unique_ptr<QWidget> window;
    // Brings the shown page into the states that need a finger or an open window.
    std::function<void(Fingers&)> pose = [](Fingers&) {};
};
