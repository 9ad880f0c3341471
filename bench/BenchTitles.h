// The titles that the benchmarks work on: four texts of one run a character, with runs of different looks,
// the first text outlined and the second with a shadow.
#pragma once

#include "document/Archive.h"
#include "document/TText.h"

#include <QImage>
#include <memory>
#include <string>
#include <vector>

class BenchTitles
{
public:
    struct Look {
        int characters = 300;
        int size = 24;     // pixels of the 1920 raster
        int edgeWidth = 0; // 0 is no outline
        bool shadow = false;
        bool mixed = true; // sizes, weights and colours change from word to word
        int firstLetter = 0;
    };

    static constexpr int TEXTS = 4;

    static std::unique_ptr<TText> text(int id, float x, float y, const Look& look);
    // path is that of the title file; the names of the pictures are set, there is no background.
    static Archive title(const std::string& path, int characters, int size, int texts = TEXTS);
    // Titles of few characters, each with a text of its own, and their order file; returns the paths in that
    // order.
    static std::vector<std::string> writeFolder(const std::string& folder, int count, int texts = TEXTS);

    // The same with a small picture for each title.
    static std::vector<std::string> writeIllustratedFolder(const std::string& folder, int count,
                                                           int texts = TEXTS);

    // A picture that compresses as badly as a photograph does.
    static QImage photograph(QSize size);
};
