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

    // Shows the window in the corner of the screen and makes it the one that limits menus, balloons and
    // lifted items.
    void show();
    // Returns a picture of the page in its pose, with the windows that it has opened. Cancels the fingers
    // afterwards.
    QImage shoot();
    // Closes the window and the windows that it has opened.
    void close();

    // Adds a caption to the page.
    QLabel* caption(const QPoint& position, const QString& text) const;

    QString name; // usable as a file name without suffix
    std::unique_ptr<QWidget> window;
    // Brings the page, when it is shown, into states that need a finger or an open window.
    std::function<void(Fingers&)> pose = [](Fingers&) {};
};
