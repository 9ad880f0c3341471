#include "library/SmallPictures.h"

#include "document/PictureReader.h"

SmallPictures::SmallPictures(const QStringList& paths, QSize bounds)
    : mBounds(bounds), mPictures(static_cast<std::size_t>(paths.size()))
{
    for (std::size_t i = 0; i < mPictures.size(); ++i)
        mPictures[i].path = paths.at(static_cast<qsizetype>(i));
    mWorker = std::async(std::launch::async, [this] {
        for (Picture& picture : mPictures) {
            if (mStop)
                return;
            decode(picture);
        }
    });
}

SmallPictures::~SmallPictures()
{
    mStop = true;
    mWorker.wait();
}

bool SmallPictures::decode(Picture& picture) const
{
    State waiting = State::Waiting;
    if (!picture.state.compare_exchange_strong(waiting, State::Begun))
        return false;
    picture.image = read(picture.path, mBounds);
    picture.state = State::Decoded;
    picture.state.notify_all();
    return true;
}

QImage SmallPictures::take(qsizetype index)
{
    if (index < 0 || static_cast<std::size_t>(index) >= mPictures.size())
        return {};
    Picture& picture = mPictures[static_cast<std::size_t>(index)];
    if (!decode(picture))
        picture.state.wait(State::Begun);
    return std::exchange(picture.image, {});
}

QImage SmallPictures::read(const QString& path, QSize bounds)
{
    return fitted(PictureReader::read(path), bounds);
}

// Pictures made by other programs may have any size; scaling them down saves memory.
QImage SmallPictures::fitted(const QImage& picture, QSize bounds)
{
    const bool fits = picture.width() <= bounds.width() && picture.height() <= bounds.height();
    return fits ? picture : picture.scaled(bounds, Qt::KeepAspectRatio, Qt::SmoothTransformation);
}
