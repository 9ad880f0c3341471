#pragma once

#include <QImage>
#include <string>
#include <utility>

// Makes the small variants of a picture. Paths are wide strings. Formats are those of Qt, chosen by
// extension, plus ".jpe" for JPEG. Any thread; made on the stack for a job.
class ImageResizer
{
public:
    // Looks up the folder of the checker pictures.
    ImageResizer();

    // After this call, pictures that cannot be written are kept for this title (PngWriter::saveOrKeep), and
    // saving does not wait for a sync.
    void keepRefusedFor(std::string title) { m_title = std::move(title); }

    // Reduces the picture at source to a quarter of its width and height and saves it twice: over black to
    // blackPath, and over the checker picture to smallPath (for an opaque picture both are equal). width and
    // height are those of the result. Returns whether both files were written; the second one fails if the
    // checker picture is missing.
    bool resizeImageToThumbnail(std::wstring& source, std::wstring& blackPath, std::wstring& smallPath,
                                unsigned width, unsigned height);

    // As above for a picture in memory. The result is the same as if the picture were saved as PNG and loaded
    // first.
    bool resizeImageToThumbnail(const QImage& source, const std::wstring& blackPath,
                                const std::wstring& smallPath, unsigned width, unsigned height);

    // Returns whether the file is a picture that can be loaded.
    bool isAvailableImage(std::wstring path);

    // Return the size in pixels, or 0 if the picture cannot be loaded.
    int getImageWidth(std::wstring& path);
    int getImageHeight(std::wstring& path);

    // Sets each target pixel to the mean of the first two lines of its block of 4 x 4 source pixels, channel
    // by channel. For RGB32 and ARGB32 pictures; skips blocks that are not inside both pictures.
    void scaledToQuaterSizeWithAAF(QImage& source, QImage& target);

    // Returns whether the file name ends in ".jpe", ignoring case.
    bool checkJPE(std::wstring path);

    // Returns the name under which a ".jpe" file is saved before it is renamed; empty if the path has no
    // extension.
    std::wstring changeJPEToJPEG(std::wstring path);

private:
    bool resizeImageToThumbnailImageWithNotAlpha(const std::wstring& path, const QImage& reduced);
    bool resizeImageToThumbnailTitlerWithNotAlpha(const std::wstring& path, const QImage& reduced);
    bool resizeImageToThumbnailImageWithAlpha(const std::wstring& path, const QImage& reduced);
    bool resizeImageToThumbnailTitlerWithAlpha(const std::wstring& path, const QImage& composed);
    bool save(const QImage& image, const std::wstring& path);

    std::string m_title; // if empty, pictures that cannot be written are not kept

    static std::string checkerFname_in_title;
    static std::string checkerFname_in_logo;
};
