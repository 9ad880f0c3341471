#pragma once

#include "canvas/BackgroundPicture.h"

#include <QString>
#include <atomic>
#include <functional>
#include <future>
#include <memory>

// The picture of a background file, decoded in a thread of its own unless an object uses the same picture
// already. GUI thread only.
class DecodedBackground
{
public:
    // Begins to decode. decoded is called in the other thread when that is done, or never if the picture is
    // known.
    DecodedBackground(const QString& path, std::function<void()> decoded);
    // Waits for the thread.
    ~DecodedBackground() = default;
    DecodedBackground(const DecodedBackground&) = delete;
    DecodedBackground& operator=(const DecodedBackground&) = delete;

    bool isDone() const { return m_isDone; }
    // Lets objects find the picture as soon as it is decoded. Waits for the thread.
    void takeResult();
    // Returns whether the file at path has this picture, or is the file that is being decoded.
    bool isThatOf(const QString& path);
    // Returns the picture of the file as it is now, or as it was if it cannot be read any more; never null.
    // The pixmap is empty if it could not be read at all. Waits for the thread, and decodes again if the file
    // has been changed since.
    std::shared_ptr<const BackgroundPicture> picture();

private:
    QString m_path;
    std::shared_ptr<const BackgroundPicture> m_picture; // null before the thread's result is taken
    std::atomic<bool> m_isDone = false;
    std::future<BackgroundPicture::Decoded> m_decoder; // last, so that it is waited for first
};
