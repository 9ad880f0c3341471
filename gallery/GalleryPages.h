#pragma once

#include "gallery/GalleryPage.h"

#include <QList>

#include <functional>

// Functions that make the pages of the gallery. The resources must be initialised first.
namespace GalleryPages
{

using Maker = std::function<GalleryPage()>;

QList<Maker> all();

// One function per page.
GalleryPage pushButtons();
GalleryPage slidersAndRadioButtons();
GalleryPage comboBoxes();
GalleryPage menus();
GalleryPage balloons();
GalleryPage tabs();
GalleryPage scrollBars();
GalleryPage scrollViewer();
GalleryPage liftedItem();
GalleryPage tree();
GalleryPage toolsBar();

} // namespace GalleryPages
