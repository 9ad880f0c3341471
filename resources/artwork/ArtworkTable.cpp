#include "resources/artwork/ArtworkTable.h"

#include "resources/artwork/Families.h"

QList<Picture> artworkTable()
{
    QList<Picture> table;
    Families::addToolIcons(table);
    Families::addButtons(table);
    Families::addWindow(table);
    Families::addTextPanel(table);
    Families::addMarks(table);
    Families::addFrames(table);
    Families::addTracks(table);
    Families::addViews(table);
    return table;
}
