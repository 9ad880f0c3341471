#include "library/TitlePreview.h"

#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "library/FolderPicker.h"
#include "library/TemplateThumbnail.h"
#include "library/TitleFileOperations.h"
#include "library/TitlerUtility.h"
#include "support/ConfinedPath.h"

#include <QFileInfo>
#include <QLabel>
#include <string>

namespace
{

const int SPACE = 9;
const int LABEL_HEIGHT = 34;

} // namespace

QLabel* TitlePreview::createLabel(QWidget* parent, const QRect& area, const char* name)
{
    auto* label = new QLabel(parent);
    label->setObjectName(QLatin1String(name));
    label->setTextFormat(Qt::PlainText);
    label->setStyleSheet(FolderPicker::COLOR_TRANSPARENT + QStringLiteral("color:rgb(220, 220, 220);"));
    label->setGeometry(area);
    return label;
}

TitlePreview::TitlePreview(QWidget* parent, const QPoint& place)
    : m_thumbnail(createLabel(parent,
                              QRect(place, QSize(FolderPicker::LEFT_WIDTH, FolderPicker::WIDGET_HEIGHT)),
                              "folderThumbnail"))
    , m_sizeLabel(createLabel(parent,
                              QRect(place + QPoint(0, FolderPicker::WIDGET_HEIGHT + SPACE),
                                    QSize(FolderPicker::LEFT_WIDTH, LABEL_HEIGHT)),
                              "folderFileSize"))
{
    m_sizeLabel->setAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
    clearThumbnailArea();
}

void TitlePreview::setFont(const QFont& font)
{
    m_sizeLabel->setFont(font);
}

void TitlePreview::initThumbnailArea(const QString& picture)
{
    const QImage image = TemplateThumbnail::read(picture);
    m_thumbnail->setPixmap(QPixmap::fromImage(TemplateThumbnail::onChecker(image)));
    m_thumbnail->show();
    m_sizeLabel->setText(FolderPicker::DISPLAY_FILE_SIZE);
}

void TitlePreview::updateThumbnailArea(const QString& title)
{
    // The small picture of a title with a background of its own has the file type of the background.
    Archive archive;
    if (ArchiveController().getOneArchive(title, &archive) && !archive.getThumbnailSmall().empty()) {
        initThumbnailArea(archive.getFullPathOfThumbnailSmall());
        return;
    }
    const std::string path = title.toStdString();
    const std::string name = TitlerUtility::getThumbnailNameFromTitlePath(
        path, TitleFileOperations::THUMBNAIL_SMALL.toStdString());
    initThumbnailArea(QString::fromStdString(ConfinedPath::namedByTitle(
        QFileInfo(title).path().toStdString(), TitlerUtility::getThumbnailPathFromTitlePath(path, name))));
}

void TitlePreview::clearThumbnailArea()
{
    m_thumbnail->hide();
    m_thumbnail->setPixmap(QPixmap());
    m_sizeLabel->clear();
}
