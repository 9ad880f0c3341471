#pragma once

#include "canvas/BackgroundPicture.h"
#include "library/TitleFileOperations.h"

#include <QString>
#include <future>
#include <memory>

class Archive;

// The title that the operator has copied: its record and its pictures, so that it can be pasted after its
// source was deleted. GUI thread.
class TitleClipboard
{
public:
    TitleClipboard() = default;
    TitleClipboard(const TitleClipboard&) = delete;
    TitleClipboard& operator=(const TitleClipboard&) = delete;

    bool isEmpty() const { return !m_archive; }
    // Replaces the copy. Starts decoding its background in another thread, so that the canvas finds it
    // decoded when the title is pasted.
    void copy(const Archive& archive);
    void clear();

    // Writes the copy as a new title of the folder. Returns null without a copy, and when
    // TitleFileOperations::createFromCopy() does.
    std::unique_ptr<Archive> paste(const TitleFileOperations& files, const QString& folder);

private:
    void decodeBackground();

    std::unique_ptr<Archive> m_archive;
    TitlePictures m_pictures;
    std::future<BackgroundPicture::Decoded> m_decoder;
    std::shared_ptr<const BackgroundPicture> m_background; // kept, so that the canvas can share it
};
