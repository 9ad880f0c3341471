#include "library/TemplateTab.h"

#include "document/Archive.h"
#include "library/ITemplateSource.h"
#include "library/TemplateItem.h"
#include "library/TemplateScrollArea.h"

#include <QGridLayout>
#include <QScrollBar>

const QSize TemplateTab::SCROLL_AREA_SIZE(1049, 595);

TemplateTab::TemplateTab(ITemplateSource& source, bool isUser, QWidget* parent)
    : QWidget(parent)
    , mSource(source)
    , mIsUser(isUser)
    , mScrollArea(new TemplateScrollArea(this))
    , mBoard(new QWidget)
    , mGrid(new QGridLayout(mBoard))
{
    setObjectName(QStringLiteral("TemplateMainWidget"));
    setAttribute(Qt::WA_StyledBackground);
    setStyleSheet(QStringLiteral(" QWidget#TemplateMainWidget { background:rgb(51, 51, 51); }"));
    mBoard->setObjectName(QStringLiteral("TemplateBoard"));
    mBoard->setStyleSheet(QStringLiteral("QWidget#TemplateBoard { background:rgb(51, 51, 51); }"));
    mGrid->setContentsMargins(0, 0, 0, 0);
    mGrid->setSpacing(GRID_SPACING);
    mGrid->setSizeConstraint(QLayout::SetFixedSize);
    mScrollArea->setStyleSheet(QStringLiteral("QScrollArea { background:rgb(51, 51, 51); border:0; }"));
    mScrollArea->setWidget(mBoard);
    mScrollArea->setFixedSize(SCROLL_AREA_SIZE);
    mScrollArea->verticalScrollBar()->setSingleStep((TemplateItem::WIDGET_HEIGHT + GRID_SPACING) / 3);
    mScrollArea->initTouch();
    connect(mScrollArea, &TemplateScrollArea::itemPressed, this, &TemplateTab::itemPressed);
}

TemplateTab::~TemplateTab() = default;

void TemplateTab::setTemplates(const QVector<Archive*>& templates)
{
    clear();
    const std::string last = mSource.getLastSelectedTemplate();
    for (Archive* record : templates) {
        std::unique_ptr<Archive> archive(record);
        if (archive->getName().empty())
            continue;
        TemplateItem* item = createOneItem(*archive, count());
        if (!mSelected && !last.empty() && archive->getPath() == last) {
            mSelected = item;
            item->setSelectedStyle();
        }
        mArchives.push_back(std::move(archive));
    }
    Q_EMIT selectionChanged();
}

void TemplateTab::clear()
{
    mSelected = nullptr;
    for (TemplateItem* item : mItems)
        mScrollArea->letGoOf(item);
    qDeleteAll(mItems);
    mItems.clear();
    mArchives.clear();
}

TemplateItem* TemplateTab::createOneItem(const Archive& archive, int index)
{
    auto* item = new TemplateItem(index, mIsUser, mBoard);
    item->setImage(archive.getFullPathOfThumbnailSmall());
    item->installEventFilter(mScrollArea);
    connect(item, &TemplateItem::itemSelected, this, &TemplateTab::itemSelected);
    mItems.append(item);
    place(item);
    item->show();
    return item;
}

void TemplateTab::place(TemplateItem* item)
{
    mGrid->addWidget(item, item->getIndex() / MAX_COLUMN, item->getIndex() % MAX_COLUMN);
}

TemplateItem* TemplateTab::addNewTemplateToLast(Archive* archive)
{
    mArchives.emplace_back(archive);
    archive->setOrder(std::to_string(mArchives.size()));
    return createOneItem(*archive, count() - 1);
}

void TemplateTab::removeTemplate(int id)
{
    TemplateItem* removed = item(id);
    if (!removed)
        return;
    const bool wasSelected = removed == mSelected;
    if (wasSelected)
        mSelected = nullptr;
    mScrollArea->letGoOf(removed);
    mGrid->removeWidget(removed);
    mItems.removeAt(id);
    // Hidden now and deleted later, since this may be called from the item's own event.
    removed->hide();
    removed->setEnabled(false);
    removed->deleteLater();
    for (int i = id; i < mItems.size(); ++i) {
        mGrid->removeWidget(mItems[i]);
        mItems[i]->setIndex(i);
        place(mItems[i]);
    }
    mArchives.erase(mArchives.begin() + id);
    if (wasSelected)
        Q_EMIT selectionChanged();
}

TemplateItem* TemplateTab::item(int id) const
{
    return mItems.value(id, nullptr);
}

Archive* TemplateTab::archive(int id) const
{
    return id >= 0 && id < count() ? mArchives[static_cast<std::size_t>(id)].get() : nullptr;
}

Archive* TemplateTab::selectedArchive() const
{
    return mSelected ? archive(mSelected->getIndex()) : nullptr;
}

QString TemplateTab::templateName(const Archive& archive)
{
    return QString::fromStdString(archive.getName()).section(QLatin1Char('/'), 0, 0);
}

int TemplateTab::findTemplateIdFromName(const QString& name) const
{
    for (int id = 0; id < count(); ++id)
        if (templateName(*archive(id)) == name)
            return id;
    return -1;
}

void TemplateTab::select(TemplateItem* item)
{
    if (mSelected && mSelected != item)
        mSelected->setNormalStyle();
    mSelected = item;
    if (item) {
        item->setSelectedStyle();
        saveSelection();
    }
    Q_EMIT selectionChanged();
}

void TemplateTab::saveSelection()
{
    if (const Archive* archive = selectedArchive())
        mSource.saveSelectedTemplate(archive->getPath());
}

// The range of the scroll bar includes new rows only after the next layout.
void TemplateTab::scrollToEnd()
{
    QScrollBar* bar = mScrollArea->verticalScrollBar();
    mScrollArea->stopFlick();
    const int rows = (count() + MAX_COLUMN - 1) / MAX_COLUMN;
    const int height = rows * (TemplateItem::WIDGET_HEIGHT + GRID_SPACING) - GRID_SPACING;
    if (bar->maximum() != qMax(0, height - mScrollArea->height()))
        connect(bar, &QScrollBar::rangeChanged, this, &TemplateTab::setBottomOnSliderAtOnce,
                Qt::UniqueConnection);
    bar->setValue(bar->maximum());
}

void TemplateTab::setBottomOnSliderAtOnce(int, int maximum)
{
    QScrollBar* bar = mScrollArea->verticalScrollBar();
    disconnect(bar, &QScrollBar::rangeChanged, this, &TemplateTab::setBottomOnSliderAtOnce);
    bar->setValue(maximum);
}
