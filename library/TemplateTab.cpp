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
    , m_source(source)
    , m_isUser(isUser)
    , m_scrollArea(new TemplateScrollArea(this))
    , m_board(new QWidget)
    , m_grid(new QGridLayout(m_board))
{
    setObjectName(QStringLiteral("TemplateMainWidget"));
    setAttribute(Qt::WA_StyledBackground);
    setStyleSheet(QStringLiteral(" QWidget#TemplateMainWidget { background:rgb(51, 51, 51); }"));
    m_board->setObjectName(QStringLiteral("TemplateBoard"));
    m_board->setStyleSheet(QStringLiteral("QWidget#TemplateBoard { background:rgb(51, 51, 51); }"));
    m_grid->setContentsMargins(0, 0, 0, 0);
    m_grid->setSpacing(GRID_SPACING);
    m_grid->setSizeConstraint(QLayout::SetFixedSize);
    m_scrollArea->setStyleSheet(QStringLiteral("QScrollArea { background:rgb(51, 51, 51); border:0; }"));
    m_scrollArea->setWidget(m_board);
    m_scrollArea->setFixedSize(SCROLL_AREA_SIZE);
    m_scrollArea->verticalScrollBar()->setSingleStep((TemplateItem::WIDGET_HEIGHT + GRID_SPACING) / 3);
    m_scrollArea->initTouch();
    connect(m_scrollArea, &TemplateScrollArea::itemPressed, this, &TemplateTab::itemPressed);
}

TemplateTab::~TemplateTab() = default;

void TemplateTab::setTemplates(const QVector<Archive*>& templates)
{
    clear();
    const std::string last = m_source.getLastSelectedTemplate();
    for (Archive* record : templates) {
        std::unique_ptr<Archive> archive(record);
        if (archive->getName().empty())
            continue;
        TemplateItem* item = createOneItem(*archive, count());
        if (!m_selected && !last.empty() && archive->getPath() == last) {
            m_selected = item;
            item->setSelectedStyle();
        }
        m_archives.push_back(std::move(archive));
    }
    Q_EMIT selectionChanged();
}

void TemplateTab::clear()
{
    m_selected = nullptr;
    for (TemplateItem* item : m_items)
        m_scrollArea->letGoOf(item);
    qDeleteAll(m_items);
    m_items.clear();
    m_archives.clear();
}

TemplateItem* TemplateTab::createOneItem(const Archive& archive, int index)
{
    auto* item = new TemplateItem(index, m_isUser, m_board);
    item->setImage(archive.getFullPathOfThumbnailSmall());
    item->installEventFilter(m_scrollArea);
    connect(item, &TemplateItem::itemSelected, this, &TemplateTab::itemSelected);
    m_items.append(item);
    place(item);
    item->show();
    return item;
}

void TemplateTab::place(TemplateItem* item)
{
    m_grid->addWidget(item, item->getIndex() / MAX_COLUMN, item->getIndex() % MAX_COLUMN);
}

TemplateItem* TemplateTab::addNewTemplateToLast(Archive* archive)
{
    m_archives.emplace_back(archive);
    archive->setOrder(std::to_string(m_archives.size()));
    return createOneItem(*archive, count() - 1);
}

void TemplateTab::removeTemplate(int id)
{
    TemplateItem* removed = item(id);
    if (!removed)
        return;
    const bool wasSelected = removed == m_selected;
    if (wasSelected)
        m_selected = nullptr;
    m_scrollArea->letGoOf(removed);
    m_grid->removeWidget(removed);
    m_items.removeAt(id);
    // Hidden now and deleted later, since this may be called from the item's own event.
    removed->hide();
    removed->setEnabled(false);
    removed->deleteLater();
    for (int i = id; i < m_items.size(); ++i) {
        m_grid->removeWidget(m_items[i]);
        m_items[i]->setIndex(i);
        place(m_items[i]);
    }
    m_archives.erase(m_archives.begin() + id);
    if (wasSelected)
        Q_EMIT selectionChanged();
}

TemplateItem* TemplateTab::item(int id) const
{
    return m_items.value(id, nullptr);
}

Archive* TemplateTab::archive(int id) const
{
    return id >= 0 && id < count() ? m_archives[static_cast<std::size_t>(id)].get() : nullptr;
}

Archive* TemplateTab::selectedArchive() const
{
    return m_selected ? archive(m_selected->getIndex()) : nullptr;
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
    if (m_selected && m_selected != item)
        m_selected->setNormalStyle();
    m_selected = item;
    if (item) {
        item->setSelectedStyle();
        saveSelection();
    }
    Q_EMIT selectionChanged();
}

void TemplateTab::saveSelection()
{
    if (const Archive* archive = selectedArchive())
        m_source.saveSelectedTemplate(archive->getPath());
}

// The range of the scroll bar includes new rows only after the next layout.
void TemplateTab::scrollToEnd()
{
    QScrollBar* bar = m_scrollArea->verticalScrollBar();
    m_scrollArea->stopFlick();
    const int rows = (count() + MAX_COLUMN - 1) / MAX_COLUMN;
    const int height = rows * (TemplateItem::WIDGET_HEIGHT + GRID_SPACING) - GRID_SPACING;
    if (bar->maximum() != qMax(0, height - m_scrollArea->height()))
        connect(bar, &QScrollBar::rangeChanged, this, &TemplateTab::setBottomOnSliderAtOnce,
                Qt::UniqueConnection);
    bar->setValue(bar->maximum());
}

void TemplateTab::setBottomOnSliderAtOnce(int, int maximum)
{
    QScrollBar* bar = m_scrollArea->verticalScrollBar();
    disconnect(bar, &QScrollBar::rangeChanged, this, &TemplateTab::setBottomOnSliderAtOnce);
    bar->setValue(maximum);
}
