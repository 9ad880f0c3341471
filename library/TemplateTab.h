// One tab of the template picker: a grid of thumbnails, of which one may be chosen. Both tabs are this class,
// fed from different sources. Indices are positions in the list of templates; the grid is filled row by row
// and stays dense. GUI thread.
#pragma once

#include <QList>
#include <QString>
#include <QVector>
#include <QWidget>
#include <memory>
#include <string>
#include <vector>

class Archive;
class ITemplateSource;
class QGridLayout;
class QPushButton;
class TemplateItem;
class TemplateScrollArea;

class TemplateTab : public QWidget
{
    Q_OBJECT

public:
    static const int MAX_COLUMN = 4;
    static const int GRID_SPACING = 10;
    static const QSize SCROLL_AREA_SIZE;

    // The source is not owned and must outlive the tab.
    TemplateTab(ITemplateSource& source, bool isUser, QWidget* parent = nullptr);
    ~TemplateTab() override;

    bool isUser() const { return mIsUser; }

    // Shows these templates instead of the ones before, and chooses the one that the source took last. Takes
    // the records over; those without a name are no templates and are dropped.
    void setTemplates(const QVector<Archive*>& templates);

    // At the end; the record's order becomes the new count. Takes the record over.
    TemplateItem* addNewTemplateToLast(Archive* archive);

    // Deletes the item and the record, and closes the gap. Others are ignored.
    void removeTemplate(int id);

    int count() const { return static_cast<int>(mArchives.size()); }
    TemplateItem* item(int id) const; // null outside the list, like the record
    Archive* archive(int id) const;

    // The first template of this name; -1 for none.
    int findTemplateIdFromName(const QString& name) const;

    // Name of a template: that of its record up to the first "/".
    static QString templateName(const Archive& archive);

    // Chooses the item and remembers it as the one taken last; null chooses nothing and remembers nothing.
    void select(TemplateItem* item);
    TemplateItem* selectedItem() const { return mSelected; }
    Archive* selectedArchive() const; // null without a choice; stays owned here
    // Remembers the chosen template's path again.
    void saveSelection();

    // Scrolls to the last row, now or as soon as the grid has been laid out.
    void scrollToEnd();
    TemplateScrollArea* scrollArea() const { return mScrollArea; }

Q_SIGNALS:
    // A finger or the mouse has chosen an item.
    void itemSelected(int index, TemplateItem* item);
    void itemPressed(QPushButton* button);
    // Another template is chosen now, or none.
    void selectionChanged();

private Q_SLOTS:
    void setBottomOnSliderAtOnce(int minimum, int maximum);

private:
    TemplateItem* createOneItem(const Archive& archive, int index);
    void place(TemplateItem* item);
    void clear();

    ITemplateSource& mSource;
    bool mIsUser;
    TemplateScrollArea* mScrollArea;
    QWidget* mBoard; // holds the items
    QGridLayout* mGrid;
    std::vector<std::unique_ptr<Archive>> mArchives;
    QList<TemplateItem*> mItems; // of the same indices; owned by the board
    TemplateItem* mSelected = nullptr;
};
