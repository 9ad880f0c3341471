#pragma once

#include "document/Archive.h"
#include "document/TText.h"

#include <QImage>
#include <memory>
#include <string>
#include <vector>

// Makes the titles for the benchmarks: four texts with one style per character, whose look changes along the
// text; the first text has an outline and the second a shadow.
class BenchTitles
{
public:
    struct Look {
        int characters = 300;
        int size = 24;     // pixels of the 1920 raster
        int edgeWidth = 0; // 0 for no outline
        bool shadow = false;
        bool mixed = true; // whether sizes, weights and colours change from word to word
        int firstLetter = 0;
    };

    static constexpr int TEXTS = 4;
    static constexpr int MOST_CHARACTERS = 300; // that the program allows in a text
    // Returns how many texts of at most MOST_CHARACTERS have this many characters together.
    static constexpr int textsFor(long characters)
    {
        return static_cast<int>((characters + MOST_CHARACTERS - 1) / MOST_CHARACTERS);
    }

    static std::unique_ptr<TText> text(int id, float x, float y, const Look& look);
    // Returns a title without a background. path is that of the title file; the names of the pictures are
    // set.
    static Archive title(const std::string& path, int characters, int size, int texts = TEXTS);
    // Writes titles with few characters, each with a text of its own, and their order file. Returns the paths
    // in this order.
    static std::vector<std::string> writeFolder(const std::string& folder, int count, int texts = TEXTS);

    // Writes the same titles with a small picture for each.
    static std::vector<std::string> writeIllustratedFolder(const std::string& folder, int count,
                                                           int texts = TEXTS);

    // Gives a title a background of 1920x1080 pixels and writes it beside the title, with the smaller
    // pictures that a title has.
    static void illustrate(Archive& title, const QImage& background);

    // Writes the pattern behind small pictures to the data path.
    static void writeChecker();

    // Returns a picture that compresses as badly as a photograph.
    static QImage photograph(QSize size);
};
