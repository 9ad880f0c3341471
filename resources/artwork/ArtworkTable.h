#pragma once

#include "resources/artwork/Picture.h"

// Every picture of the program.
QList<Picture> artworkTable();
