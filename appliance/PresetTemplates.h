#pragma once

#include "appliance/SampleTitles.h"

#include <vector>

// Makes the records of the preset templates.
//
// Text is placed inside the title-safe area (80 % of the picture). Sizes are those that the panel's buttons
// step through, so that an operator can give an added word the size of its neighbour.
class PresetTemplates
{
public:
    // Returns the set of the language, in the order of the list. Both sets have the same designs under the
    // same names. Needs a QGuiApplication.
    static std::vector<SampleTitles::Sample> samples(bool chinese);
};
