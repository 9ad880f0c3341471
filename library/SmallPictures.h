#pragma once

#include <QImage>
#include <QSize>
#include <QString>
#include <QStringList>
#include <atomic>
#include <future>
#include <memory>
#include <vector>

// Decodes the small pictures of a folder's titles in another thread while the list builds its items.
class SmallPictures
{
public:
    // Starts decoding at the first path. A picture that is larger than the bounds is scaled down to them.
    SmallPictures(const QStringList& paths, QSize bounds);
    // Skips the pictures that are not decoded yet.
    ~SmallPictures();
    SmallPictures(const SmallPictures&) = delete;
    SmallPictures& operator=(const SmallPictures&) = delete;

    qsizetype count() const { return static_cast<qsizetype>(m_pictures.size()); }
    // Returns the picture at the index, null when it cannot be read; each can be taken once. Decodes it here
    // if its decoding has not started.
    QImage take(qsizetype index);

    // Returns the picture scaled down to the bounds; null for a file that is not a picture. Any thread.
    static QImage read(const QString& path, QSize bounds);

    // Returns the picture scaled down to the bounds; null pictures and those within the bounds stay as they
    // are.
    static QImage fitted(const QImage& picture, QSize bounds);

private:
    enum class State { Waiting, Begun, Decoded };
    struct Picture {
        QString path;
        QImage image;
        std::atomic<State> state = State::Waiting;
    };

    // Decodes the picture. Returns false if another thread has already started that.
    bool decode(Picture& picture) const;

    QSize m_bounds;
    std::vector<Picture> m_pictures;
    std::atomic<bool> m_stop = false;
    std::future<void> m_worker;
};
