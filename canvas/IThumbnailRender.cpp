#include "canvas/IThumbnailRender.h"
