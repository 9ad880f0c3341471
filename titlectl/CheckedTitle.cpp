#include "titlectl/CheckedTitle.h"

#include "document/TitleParser.h"
#include "titlectl/PictureStates.h"
#include "titlectl/TitleInk.h"

#include <QFileInfo>
#include <utility>

CheckedTitle::CheckedTitle(QString path)
    : m_path(std::move(path)), m_changed(QFileInfo(m_path).lastModified())
{
    m_isReadable = TitleParser().readOneTitle(m_path.toStdString(), &m_archive) == 1;
    if (!m_isReadable)
        m_archive = Archive();
}

CheckedTitle::~CheckedTitle() = default;

const TitleInk& CheckedTitle::ink() const
{
    if (!m_ink)
        m_ink = std::make_unique<TitleInk>(m_archive);
    return *m_ink;
}

const PictureStates& CheckedTitle::pictures() const
{
    if (!m_pictures)
        m_pictures = std::make_unique<PictureStates>(m_archive, m_changed);
    return *m_pictures;
}
