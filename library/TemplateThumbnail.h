#pragma once

#include <QImage>
#include <QSize>
#include <QString>

// Makes the picture of a template for the picker.
namespace TemplateThumbnail
{

constexpr QSize SIZE(240, 135);

// Larger pictures are not read. The limit is far above the size of a thumbnail, but still decodes quickly.
constexpr qint64 PIXEL_LIMIT = 8 * 1024 * 1024;

// Returns the picture, scaled down to fit into SIZE in its proportions. Null for a path that is not a regular
// file, not a picture, or too large. Any thread.
QImage read(const QString& path);

// Returns the picture centred on a checker pattern of SIZE; for a null picture the pattern alone. GUI thread.
QImage onChecker(const QImage& picture);

} // namespace TemplateThumbnail
