#include "gallery/GalleryPages.h"

QList<GalleryPages::Maker> GalleryPages::all()
{
    return {pushButtons, slidersAndRadioButtons, comboBoxes, menus, balloons, tabs,
            scrollBars,  scrollViewer,           liftedItem, tree,  toolsBar};
}
