#include "library/DecodedBackground.h"

#include <utility>

DecodedBackground::DecodedBackground(const QString& path, std::function<void()> decoded)
    : m_path(path), m_picture(BackgroundPicture::find(path)), m_isDone(m_picture != nullptr)
{
    if (m_picture)
        return;
    m_decoder = std::async(std::launch::async, [this, path, decoded = std::move(decoded)] {
        BackgroundPicture::Decoded result = BackgroundPicture::decode(path);
        m_isDone = true;
        decoded();
        return result;
    });
}

bool DecodedBackground::isThatOf(const QString& path)
{
    if (!m_isDone)
        return path == m_path;
    takeResult();
    return !m_picture->pixmap().isNull() && BackgroundPicture::find(path) == m_picture;
}

std::shared_ptr<const BackgroundPicture> DecodedBackground::picture()
{
    takeResult();
    if (m_picture->pixmap().isNull())
        return m_picture;
    const std::shared_ptr<const BackgroundPicture> now = BackgroundPicture::load(m_path);
    if (!now->pixmap().isNull()) // it is when the folder has been renamed
        m_picture = now;
    return m_picture;
}

void DecodedBackground::takeResult()
{
    if (m_decoder.valid())
        m_picture = BackgroundPicture::load(m_decoder.get());
}
