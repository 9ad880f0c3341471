// The records of the sample titles and of the preset templates.
#pragma once

#include "document/Archive.h"

#include <QImage>
#include <string>
#include <vector>

class SampleTitles
{
public:
    // A title to be written. stem is the name of all its files; the record has its text objects and nothing
    // else.
    struct Sample {
        std::string stem;
        QImage (*background)(); // null for a title without a background
        Archive archive;
    };

    // A folder of titles; the name is UTF-8.
    struct Folder {
        std::string name;
        std::vector<Sample> samples;
    };

    static std::vector<Folder> folders();

    // English or Chinese preset templates.
    static std::vector<Sample> templates(bool chinese);
};
