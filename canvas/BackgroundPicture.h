#pragma once

#include <QImage>
#include <QPixmap>
#include <QString>
#include <memory>
#include <sys/stat.h>

// The picture in a background file. Objects that show the same file at the same time, or a file with the same
// bytes (as a pasted title does), share the decoded pixels. Nothing is cached once no object shows it.
class BackgroundPicture
{
public:
    // Loads the picture. Never returns null; a file that cannot be read gives an empty pixmap. GUI thread
    // only.
    static std::shared_ptr<const BackgroundPicture> load(const QString& path);
    // Loads a picture in two steps. The first one, read(), takes long and may run in any thread.
    struct Decoded {
        QString path;
        struct stat status = {};
        QImage image;
    };
    static Decoded decode(const QString& path);
    static std::shared_ptr<const BackgroundPicture> load(const Decoded& decoded);
    // Returns the picture of the file, or of one with the same bytes, if an object shows it; null otherwise.
    // GUI thread only.
    static std::shared_ptr<const BackgroundPicture> find(const QString& path);
    // Decodes into the format that needs no conversion for a pixmap. Returns a null image when the file
    // cannot be decoded. Any thread.
    static QImage read(const QString& path);

    const QPixmap& pixmap() const { return m_pixmap; }

private:
    explicit BackgroundPicture(const Decoded& decoded);
    // Returns whether the file at path, which has this status, contains this picture.
    bool isThatOf(const QString& path, const struct stat& status) const;

    QString m_path;
    struct stat m_status;
    QPixmap m_pixmap;
};
