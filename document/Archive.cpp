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
    : mOrder(1, '\xff')
    , mClip(DEFAULT_CLIP)
    , mGain(DEFAULT_GAIN)
    , mDensity(DEFAULT_DENSITY)
    , mBgPointX(0.0f)
    , mBgPointY(0.0f)
    , mBgPointZ(-1.0f)
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
    mName = other.mName;
    mPath = other.mPath;
    mOrder = other.mOrder;
    mVersion = other.mVersion;
    mCategory = other.mCategory;
    mThumbnailSmall = other.mThumbnailSmall;
    mThumbnailBlack = other.mThumbnailBlack;
    mThumbnailBig = other.mThumbnailBig;
    mThumbnailMiddle = other.mThumbnailMiddle;
    mBgResource = other.mBgResource;
    mBgResourceBig = other.mBgResourceBig;
    mBgPointX = other.mBgPointX;
    mBgPointY = other.mBgPointY;
    mBgPointZ = other.mBgPointZ;
    mClip = other.mClip;
    mGain = other.mGain;
    mDensity = other.mDensity;
    releaseVectorText();
    cloneText(other.mText);
    return *this;
}

Archive::~Archive()
{
    releaseVectorText();
}

void Archive::cloneText(const std::vector<TText*>& text)
{
    mText.reserve(text.size());
    for (const TText* object : text)
        if (object)
            mText.push_back(new TText(*object));
}

void Archive::releaseVectorText()
{
    for (TText*& object : mText) {
        delete object;
        object = nullptr;
    }
    mText.clear();
}

bool Archive::isPreset() const
{
    return !mBgResource.empty() && mBgResource.front() == '/';
}

QString Archive::besideTitle(const std::string& name) const
{
    return confined(folder() + '/' + name);
}

std::string Archive::folder() const
{
    return QFile::encodeName(QFileInfo(toQString(mPath)).path()).toStdString();
}

QString Archive::confined(const std::string& path) const
{
    const std::string allowed = ConfinedPath::namedByTitle(folder(), path);
    return allowed.empty() ? QString() : toQString(allowed);
}

QString Archive::getFullPathOfThumbnailSmall() const
{
    if (mThumbnailSmall.empty())
        return QString();
    return mThumbnailSmall.front() == '/' ? confined(mThumbnailSmall) : besideTitle(mThumbnailSmall);
}

QString Archive::getFullPathOfBgResource() const
{
    if (mBgResource.empty())
        return QString();
    return isPreset() ? confined(mBgResource) : besideTitle(mBgResource);
}

QString Archive::getFullPathOfBgResourceBig() const
{
    if (mBgResourceBig.empty())
        return QString();
    return isPreset() ? confined(mBgResourceBig) : besideTitle(mBgResourceBig);
}
