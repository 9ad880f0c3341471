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

// One tab of the template picker: a grid of thumbnails, one of which may be selected. Both tabs are of this
// class, with different sources. Indices are positions in the list of templates; the grid is filled row by
// row without gaps. GUI thread.
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

    bool isUser() const { return m_isUser; }

    // Replaces all templates and selects the one that the source reports as the last one selected. Takes
    // ownership of the records; those without a name are not templates and are deleted.
    void setTemplates(const QVector<Archive*>& templates);

    // Appends a template and sets the record's order to the new count. Takes ownership of the record.
    TemplateItem* addNewTemplateToLast(Archive* archive);

    // Deletes the item and the record, and closes the gap. Ignores an index out of range.
    void removeTemplate(int id);

    int count() const { return static_cast<int>(m_archives.size()); }
    TemplateItem* item(int id) const; // null for an index out of range; also holds for the record
    Archive* archive(int id) const;

    // Returns the index of the first template of this name; -1 for none.
    int findTemplateIdFromName(const QString& name) const;

    // Returns the name of a template: its record's name up to the first "/".
    static QString templateName(const Archive& archive);

    // Selects the item and stores it as the last one; null clears the selection and stores nothing.
    void select(TemplateItem* item);
    TemplateItem* selectedItem() const { return m_selected; }
    Archive* selectedArchive() const; // null without a selection; owned by the tab
    // Stores the path of the selected template again.
    void saveSelection();

    // Scrolls to the last row, now or after the grid has been laid out.
    void scrollToEnd();
    TemplateScrollArea* scrollArea() const { return m_scrollArea; }

Q_SIGNALS:
    // Emitted when an item was selected by touch or mouse.
    void itemSelected(int index, TemplateItem* item);
    void itemPressed(QPushButton* button);
    // Emitted when the selection has changed or was cleared.
    void selectionChanged();

private Q_SLOTS:
    void setBottomOnSliderAtOnce(int minimum, int maximum);

private:
    TemplateItem* createOneItem(const Archive& archive, int index);
    void place(TemplateItem* item);
    void clear();

    ITemplateSource& m_source;
    bool m_isUser;
    TemplateScrollArea* m_scrollArea;
    QWidget* m_board; // parent of the items
    QGridLayout* m_grid;
    std::vector<std::unique_ptr<Archive>> m_archives;
    QList<TemplateItem*> m_items; // same indices as the templates; owned by the board
    TemplateItem* m_selected = nullptr;
};
