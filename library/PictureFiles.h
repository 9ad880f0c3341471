#pragma once

#include <QFlags>
#include <QImage>
#include <QString>
#include <string>

class Archive;

// Writes the four pictures of a title beside its file. Each is replaced when the new one is complete; the
// disk may sync it later. Any thread.
class PictureFiles
{
public:
    enum Picture {
        Big = 1,    // 1920x1080
        Middle = 2, // 960x540
        Reduced = 4 // the two of 240x135, on black and on the checker
    };
    Q_DECLARE_FLAGS(Pictures, Picture)
    static constexpr int ALL = Big | Middle | Reduced;

    PictureFiles() = delete;

    // Writes the pictures under the names in the record; skips those whose names are not valid. Returns
    // whether all of them are in place. Those that the disk refuses are kept by RefusedWrites.
    static bool write(const Archive& archive, const QImage& big, const QImage& middle,
                      Pictures pictures = Pictures(ALL));

    // Returns the path of a picture that the record names; empty for a name that is not valid for a picture.
    static QString path(const Archive& archive, const std::string& name);
};

Q_DECLARE_OPERATORS_FOR_FLAGS(PictureFiles::Pictures)
