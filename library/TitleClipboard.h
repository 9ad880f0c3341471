#pragma once

#include "canvas/BackgroundPicture.h"
#include "library/TitleFileOperations.h"

#include <QString>
#include <future>
#include <memory>

class Archive;

// The title that the operator has copied: its record and its pictures, so that it can be pasted after its
// source is gone. GUI thread.
class TitleClipboard
{
public:
    TitleClipboard() = default;
    TitleClipboard(const TitleClipboard&) = delete;
    TitleClipboard& operator=(const TitleClipboard&) = delete;

    bool isEmpty() const { return !m_archive; }
    // Takes a copy in place of the one before. Begins to decode its background on another core, so that the
    // canvas need not do that when it is pasted.
    void copy(const Archive& archive);
    void clear();

    // Writes the copy as a new title of the folder. Null when there is no copy, or as
    // TitleFileOperations::createFromCopy.
    std::unique_ptr<Archive> paste(const TitleFileOperations& files, const QString& folder);

private:
    void decodeBackground();

    std::unique_ptr<Archive> m_archive;
    TitlePictures m_pictures;
    std::future<BackgroundPicture::Decoded> m_decoder;
    std::shared_ptr<const BackgroundPicture> m_background; // kept, so that it is found decoded
};
