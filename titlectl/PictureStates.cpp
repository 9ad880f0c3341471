#include "titlectl/PictureStates.h"

#include "document/Archive.h"
#include "document/PictureReader.h"
#include "library/PictureFiles.h"
#include "library/PictureThread.h"
#include "library/RasterScene.h"

#include <QFileInfo>
#include <QImage>
#include <string>

namespace
{

QString reasonOf(PictureStates::State state, const QString& path, QSize size)
{
    using State = PictureStates::State;
    const QString name = QFileInfo(path).fileName();
    switch (state) {
    case State::Missing:
        return path.isEmpty() ? QStringLiteral("the title names no picture that can be used")
                              : QStringLiteral("%1 is missing").arg(name);
    case State::Torn:
        return QStringLiteral("%1 is torn or not a picture").arg(name);
    case State::WrongSize:
        return QStringLiteral("%1 is not of %2x%3").arg(name).arg(size.width()).arg(size.height());
    case State::Old:
        return QStringLiteral("%1 is older than the title").arg(name);
    case State::Good:
        break;
    }
    return {};
}

} // namespace

PictureStates::PictureStates(const Archive& archive, const QDateTime& titleChanged)
{
    const auto beside = [&archive](const std::string& name) { return PictureFiles::path(archive, name); };
    const QString small = archive.getThumbnailSmall().starts_with('/') ? archive.getFullPathOfThumbnailSmall()
                                                                       : beside(archive.getThumbnailSmall());
    judge(QStringLiteral("picture 1920"), beside(archive.getThumbnailBig()), RasterScene::SIZE, titleChanged);
    judge(QStringLiteral("picture 960"), beside(archive.getThumbnailMiddle()),
          PictureThread::THUMBNAIL_MIDDLE_SIZE, titleChanged);
    judge(QStringLiteral("picture 240"), small, PictureThread::THUMBNAIL_SMALL_SIZE, titleChanged);
    judge(QStringLiteral("picture 240 on black"), beside(archive.getThumbnailBlack()),
          PictureThread::THUMBNAIL_SMALL_SIZE, titleChanged);
    // Backgrounds may have any size and age.
    if (!archive.getBgResource().empty())
        judge(QStringLiteral("background 1280"), archive.getFullPathOfBgResource(), QSize(), QDateTime());
    if (!archive.getBgResourceBig().empty())
        judge(QStringLiteral("background 1920"), archive.getFullPathOfBgResourceBig(), QSize(), QDateTime());
}

void PictureStates::judge(const QString& picture, const QString& path, QSize size, const QDateTime& notBefore)
{
    if (const State state = stateOf(path, size, notBefore); state != State::Good)
        m_faults.append({picture, state, reasonOf(state, path, size)});
}

PictureStates::State PictureStates::stateOf(const QString& path, QSize size, const QDateTime& notBefore)
{
    const QFileInfo file(path);
    if (path.isEmpty() || !file.exists())
        return State::Missing;
    const QImage picture = PictureReader::read(path);
    if (picture.isNull())
        return State::Torn;
    if (size.isValid() && picture.size() != size)
        return State::WrongSize;
    return notBefore.isValid() && file.lastModified() < notBefore ? State::Old : State::Good;
}
