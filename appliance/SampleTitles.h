#pragma once

#include "appliance/SampleText.h"
#include "document/Archive.h"

#include <QImage>
#include <QSize>
#include <functional>
#include <string>
#include <vector>

// Makes the records of the sample titles.
class SampleTitles
{
public:
    // A title to be written. stem is the base name of all its files; only the text objects of the record are
    // set.
    struct Sample {
        std::string stem;
        // paints the background at a size; empty without a background
        std::function<QImage(const QSize&)> background;
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

    // Returns a title with the lines as text objects, numbered from 1.
    static Sample sample(const char* stem, std::function<QImage(const QSize&)> background,
                         const std::vector<Line>& lines);
};
