// The records of the sample titles.
#pragma once

#include "appliance/SampleText.h"
#include "document/Archive.h"

#include <QImage>
#include <QSize>
#include <functional>
#include <string>
#include <vector>

class SampleTitles
{
public:
    // A title to be written. stem is the name of all its files; the record has its text objects and nothing
    // else.
    struct Sample {
        std::string stem;
        std::function<QImage(const QSize&)> background; // paints it at a size; none without a background
        Archive archive;
    };

    // A folder of titles; the name is UTF-8.
    struct Folder {
        std::string name;
        std::vector<Sample> samples;
    };

    // A text object of a title.
    struct Line {
        const char* text; // UTF-8
        SampleText::Look look;
    };

    static std::vector<Folder> folders();

    // A title with the lines as text objects, numbered from 1.
    static Sample sample(const char* stem, std::function<QImage(const QSize&)> background,
                         const std::vector<Line>& lines);
};
