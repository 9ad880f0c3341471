#include "library/TitleClipboard.h"

#include "document/Archive.h"

void TitleClipboard::copy(const Archive& archive)
{
    clear();
    m_archive = std::make_unique<Archive>(archive);
    m_pictures = TitleFileOperations::loadPictures(*m_archive);
    decodeBackground();
}

void TitleClipboard::clear()
{
    m_archive.reset();
    m_pictures = TitlePictures();
    m_decoder = {};
    m_background.reset();
}

void TitleClipboard::decodeBackground()
{
    const QString path = m_archive->getFullPathOfBgResource();
    if (path.isEmpty())
        return;
    m_background = BackgroundPicture::find(path);
    if (!m_background)
        m_decoder = std::async(std::launch::async, [path] { return BackgroundPicture::decode(path); });
}

std::unique_ptr<Archive> TitleClipboard::paste(const TitleFileOperations& files, const QString& folder)
{
    if (isEmpty())
        return nullptr;
    std::unique_ptr<Archive> made = files.createFromCopy(folder, *m_archive, m_pictures);
    if (made && m_decoder.valid())
        m_background = BackgroundPicture::load(m_decoder.get());
    return made;
}
