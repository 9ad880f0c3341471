#include "document/Archive.h"

#include "document/DocumentConstants.h"
#include "document/TText.h"
#include "support/ConfinedPath.h"

#include <QFile>
#include <QFileInfo>

namespace
{

QString toQString(const std::string& text)
{
    return QString::fromLocal8Bit(text.data(), static_cast<qsizetype>(text.size()));
}

} // namespace

Archive::Archive()
    : m_order(1, '\xff')
    , m_clip(DEFAULT_CLIP)
    , m_gain(DEFAULT_GAIN)
    , m_density(DEFAULT_DENSITY)
    , m_bgPointX(0.0f)
    , m_bgPointY(0.0f)
    , m_bgPointZ(-1.0f)
{
}

Archive::Archive(const Archive& other) : Archive()
{
    *this = other;
}

Archive& Archive::operator=(const Archive& other)
{
    if (this == &other)
        return *this;
    m_name = other.m_name;
    m_path = other.m_path;
    m_order = other.m_order;
    m_version = other.m_version;
    m_category = other.m_category;
    m_thumbnailSmall = other.m_thumbnailSmall;
    m_thumbnailBlack = other.m_thumbnailBlack;
    m_thumbnailBig = other.m_thumbnailBig;
    m_thumbnailMiddle = other.m_thumbnailMiddle;
    m_bgResource = other.m_bgResource;
    m_bgResourceBig = other.m_bgResourceBig;
    m_bgPointX = other.m_bgPointX;
    m_bgPointY = other.m_bgPointY;
    m_bgPointZ = other.m_bgPointZ;
    m_clip = other.m_clip;
    m_gain = other.m_gain;
    m_density = other.m_density;
    releaseVectorText();
    cloneText(other.m_text);
    return *this;
}

Archive::~Archive()
{
    releaseVectorText();
}

void Archive::cloneText(const std::vector<TText*>& text)
{
    m_text.reserve(text.size());
    for (const TText* object : text)
        if (object)
            m_text.push_back(new TText(*object));
}

void Archive::releaseVectorText()
{
    for (TText*& object : m_text) {
        delete object;
        object = nullptr;
    }
    m_text.clear();
}

bool Archive::isPreset() const
{
    return !m_bgResource.empty() && m_bgResource.front() == '/';
}

QString Archive::besideTitle(const std::string& name) const
{
    return confined(folder() + '/' + name);
}

std::string Archive::folder() const
{
    return QFile::encodeName(QFileInfo(toQString(m_path)).path()).toStdString();
}

QString Archive::confined(const std::string& path) const
{
    const std::string allowed = ConfinedPath::namedByTitle(folder(), path);
    return allowed.empty() ? QString() : toQString(allowed);
}

QString Archive::getFullPathOfThumbnailSmall() const
{
    if (m_thumbnailSmall.empty())
        return QString();
    return m_thumbnailSmall.front() == '/' ? confined(m_thumbnailSmall) : besideTitle(m_thumbnailSmall);
}

QString Archive::getFullPathOfBgResource() const
{
    if (m_bgResource.empty())
        return QString();
    return isPreset() ? confined(m_bgResource) : besideTitle(m_bgResource);
}

QString Archive::getFullPathOfBgResourceBig() const
{
    if (m_bgResourceBig.empty())
        return QString();
    return isPreset() ? confined(m_bgResourceBig) : besideTitle(m_bgResourceBig);
}
