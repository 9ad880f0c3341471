// The picture of a template as the picker shows it.
#pragma once

#include <QImage>
#include <QSize>
#include <QString>

namespace TemplateThumbnail
{

constexpr QSize SIZE(240, 135);

// Pixels of the largest file that is read: many times what a thumbnail has, and soon decoded.
constexpr qint64 PIXEL_LIMIT = 8 * 1024 * 1024;

// At most SIZE, with its proportions. Null for what is no plain file, no picture, or too large. Any thread.
QImage read(const QString& path);

// The picture in the middle of a checker of SIZE; the bare checker for a null picture. GUI thread.
QImage onChecker(const QImage& picture);

} // namespace TemplateThumbnail
