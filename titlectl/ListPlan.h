#pragma once

#include "titlectl/TemplateFields.h"

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>
#include <memory>
#include <vector>

class Archive;
class ListTable;
class TText;

// Which titles a list makes of a template: for each row whether its title is new, replaces one that the same
// row made before, or cannot be made. Nothing is written. GUI thread only, since texts are measured.
//
// A title is recognised by its file name, which is made of the key of its row; without a key column of the
// name of the list and the number of the row, rows that cannot be used included. So the same list can be used
// again, also after a run that was broken off, and nothing else has to be kept.
class ListPlan
{
public:
    enum class Outcome { Made, Updated, Wrong };

    // What the plan is made of. table and sample have to outlive the plan.
    struct Source {
        const ListTable& table;
        const Archive& sample; // the template
        TemplateFields fields;
        QString listPath; // gives the name of the list; paths of pictures are relative to its folder
        QString folder;   // where the titles will be
        QString key;      // name of the key column; empty for none
    };
    struct Row {
        int line = 0;
        Outcome outcome = Outcome::Wrong;
        QString stem;   // name of the title file without ".xml"; empty if the row is wrong
        QString reason; // why the row is wrong
    };

    explicit ListPlan(const Source& source);
    ~ListPlan();

    // Returns why no title can be made at all; empty if titles can be made. There are no rows then.
    const QString& error() const { return m_error; }
    // Returns what is no error, but may be a mistake: columns that nothing uses.
    const QStringList& notes() const { return m_notes; }

    const std::vector<Row>& rows() const { return m_rows; }
    int count(Outcome outcome) const;

    // Returns the title of a row that is not wrong, with its name, its path, and the names of its pictures in
    // the folder. The background is that of the template, with the template's names. Texts that are blank are
    // left out.
    std::unique_ptr<Archive> title(int row) const;
    // Returns the path of the picture that replaces the background; empty if the row has none.
    QString picture(int row) const;

private:
    // How a text of the template is filled.
    struct Filling {
        std::size_t index = 0; // of the text in the template
        int id = 0;
        int column = -1;           // for the whole text; -1 when its parts are filled
        QHash<QString, int> parts; // columns by the names of the parts
    };

    void planFillings();
    bool planParts(Filling& filling, const QStringList& names);
    void noteUnusedColumns(const QSet<int>& used);
    void planRows();
    Row planRow(int row, QHash<QString, int>& lines) const;
    QString stemOf(int row) const;
    // Returns why the row cannot be used; empty if it can.
    QString fill(int row, Archive& title) const;
    QString fillText(int row, const Filling& filling, TText& text) const;
    QString checkPicture(int row) const;
    QSet<QString> existingTitles() const;

    Source m_source;
    QString m_error;
    QStringList m_notes;
    std::vector<Filling> m_fillings;
    int m_keyColumn = -1;
    int m_pictureColumn = -1;
    std::vector<Row> m_rows;
};
