#pragma once

#include "gallery/GalleryPage.h"

#include <QList>

#include <functional>

// All pages of the gallery, each made when it is needed. The resources must have been initialised.
namespace GalleryPages
{

using Maker = std::function<GalleryPage()>;

QList<Maker> all();

// The makers by theme.
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
