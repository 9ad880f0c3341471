#include "library/SmallPictures.h"

#include "document/PictureReader.h"

SmallPictures::SmallPictures(const QStringList& paths, QSize bounds)
    : m_bounds(bounds), m_pictures(static_cast<std::size_t>(paths.size()))
{
    for (std::size_t i = 0; i < m_pictures.size(); ++i)
        m_pictures[i].path = paths.at(static_cast<qsizetype>(i));
    m_worker = std::async(std::launch::async, [this] {
        for (Picture& picture : m_pictures) {
            if (m_stop)
                return;
            decode(picture);
        }
    });
}

SmallPictures::~SmallPictures()
{
    m_stop = true;
    m_worker.wait();
}

bool SmallPictures::decode(Picture& picture) const
{
    State waiting = State::Waiting;
    if (!picture.state.compare_exchange_strong(waiting, State::Begun))
        return false;
    picture.image = read(picture.path, m_bounds);
    picture.state = State::Decoded;
    picture.state.notify_all();
    return true;
}

QImage SmallPictures::take(qsizetype index)
{
    if (index < 0 || static_cast<std::size_t>(index) >= m_pictures.size())
        return {};
    Picture& picture = m_pictures[static_cast<std::size_t>(index)];
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
