#pragma once

#include <QImage>
#include <QPixmap>
#include <QString>
#include <memory>
#include <sys/stat.h>

// The picture in a background file. Objects that show the same file at the same time, or one with the same
// bytes, as a pasted title does, share the decoded pixels; nothing is kept for later.
class BackgroundPicture
{
public:
    // Never null; a file that cannot be read gives an empty pixmap. GUI thread only.
    static std::shared_ptr<const BackgroundPicture> load(const QString& path);
    // The same in two steps, of which any thread may do the first one, which takes long.
    struct Decoded {
        QString path;
        struct stat status = {};
        QImage image;
    };
    static Decoded decode(const QString& path);
    static std::shared_ptr<const BackgroundPicture> load(const Decoded& decoded);
    // Null if no picture of the file, or of one with the same bytes, is in use. GUI thread only.
    static std::shared_ptr<const BackgroundPicture> find(const QString& path);
    // Decodes into the format that needs no conversion for a pixmap; null when that cannot be done. Any
    // thread.
    static QImage read(const QString& path);

    const QPixmap& pixmap() const { return m_pixmap; }

private:
    explicit BackgroundPicture(const Decoded& decoded);
    // Whether the picture is what the file with this status holds.
    bool isThatOf(const QString& path, const struct stat& status) const;

    QString m_path;
    struct stat m_status;
    QPixmap m_pixmap;
};
