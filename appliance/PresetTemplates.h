// The records of the preset templates.
//
// Text stands inside the title-safe area (80 % of the picture). Sizes and colours are ones that the panel
// offers, so that an operator who changes a word finds the style of the rest marked there.
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
