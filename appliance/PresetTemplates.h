// The records of the preset templates.
//
// Text stands inside the title-safe area (80 % of the picture). Sizes are steps of the panel's ladder, so
// that an operator who adds a word can give it the size of its neighbour by tapping.
#pragma once

#include "appliance/SampleTitles.h"

#include <vector>

class PresetTemplates
{
public:
    // The set of the language, in the order of the list. Both sets have the same designs under the same
    // names. Needs a QGuiApplication.
    static std::vector<SampleTitles::Sample> samples(bool chinese);
};
