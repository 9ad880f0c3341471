// Decodes the small pictures of a folder's titles on another core while the list builds its items.
#pragma once

#include <QImage>
#include <QSize>
#include <QString>
#include <QStringList>
#include <atomic>
#include <future>
#include <memory>
#include <vector>

class SmallPictures
{
public:
    // Begins with the first path. A picture that is larger than the bounds is scaled into them.
    SmallPictures(const QStringList& paths, QSize bounds);
    // Leaves what is not decoded yet.
    ~SmallPictures();
    SmallPictures(const SmallPictures&) = delete;
    SmallPictures& operator=(const SmallPictures&) = delete;

    qsizetype count() const { return static_cast<qsizetype>(mPictures.size()); }
    // The picture at the index, null when it cannot be read; each can be taken once. Decodes it when its turn
    // has not come.
    QImage take(qsizetype index);

    // Null for what is no picture file. Any thread.
    static QImage read(const QString& path, QSize bounds);

    // Null and pictures within the bounds stay as they are.
    static QImage fitted(const QImage& picture, QSize bounds);

private:
    enum class State { Waiting, Begun, Decoded };
    struct Picture {
        QString path;
        QImage image;
        std::atomic<State> state = State::Waiting;
    };

    // False when another thread has begun it.
    bool decode(Picture& picture) const;

    QSize mBounds;
    std::vector<Picture> mPictures;
    std::atomic<bool> mStop = false;
    std::future<void> mWorker;
};
