// What a list would make of a template.
#include "ListTexts.h"
#include "titlectl/ListPlan.h"
#include "titlectl/ListTable.h"
#include "titlectl/TextFit.h"

#include "document/Archive.h"
#include "document/ArchiveOrder.h"
#include "document/FolderOrder.h"
#include "document/TitleParser.h"
#include "support/FileSyncQueue.h"

#include <QDir>
#include <QFile>
#include <QImage>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <chrono>
#include <memory>

namespace
{

// Returns the rows as "2: Made", "3: Wrong, reason".
QStringList outcomesOf(const ListPlan& plan)
{
    static const char* const NAMES[] = {"Made", "Updated", "Wrong"};
    QStringList rows;
    for (const ListPlan::Row& row : plan.rows())
        rows.append(QStringLiteral("%1: %2").arg(row.line).arg(NAMES[int(row.outcome)]) +
                    (row.reason.isEmpty() ? QString() : QStringLiteral(", ") + row.reason));
    return rows;
}

QString textsOf(const Archive& title)
{
    QStringList texts;
    for (const TText* text : title.text())
        texts.append(QStringLiteral("%1=").arg(text->getTextObjectID()) +
                     QString::fromStdString(text->getText()));
    return texts.join(QLatin1Char(' '));
}

} // namespace

class tst_listplan : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_folder = std::make_unique<QTemporaryDir>();
        m_fields = TemplateFields();
        m_key.clear();
        m_table = ListTable();
        m_sample = std::make_unique<Archive>();
        m_sample->setPath("/templates/strap.xml");
        setTexts({textOf({"Name"}, 1), textOf({"Role"}, 2)});
    }

    void cleanup() { QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30))); }

    void fieldsByIdAndName()
    {
        fill({"1", "2"}, {{"Anna", "Editor"}, {"Bo", "Sound"}});
        ListPlan plan = make();
        QCOMPARE(plan.error(), QString());
        QCOMPARE(plan.notes(), QStringList());
        QCOMPARE(outcomesOf(plan), QStringList({"2: Made", "3: Made"}));
        QCOMPARE(textsOf(*plan.title(1)), QStringLiteral("1=Bo 2=Sound"));

        m_fields.setField(1, {"Name", std::nullopt});
        fill({"NAME", "Else"}, {{"Anna", "x"}});
        ListPlan named = make();
        QCOMPARE(named.notes(), QStringList{"The column \"Else\" is not used"});
        QCOMPARE(textsOf(*named.title(0)), QStringLiteral("1=Anna 2=Role"));
    }

    void parts()
    {
        setTexts({textOf({"by ", "{Name}", ", {Role}"}, 1), textOf({"{Name}"}, 3)});
        fill({"Role", "Name"}, {{"Editor", "Anna"}});
        const ListPlan plan = make();
        QCOMPARE(textsOf(*plan.title(0)), QStringLiteral("1=by Anna, Editor 3=Anna"));
        QCOMPARE(sizesOf(*plan.title(0)->text().front()), QStringLiteral("by :40 Anna:50 , Editor:60"));
    }

    void blankTextsAreLeftOut()
    {
        fill({"1", "2"}, {{"Anna", " "}, {" ", "Sound"}, {" ", " "}});
        const ListPlan plan = make();
        QCOMPARE(outcomesOf(plan), QStringList({"2: Made", "3: Made", "4: Wrong, it has no text"}));
        QCOMPARE(textsOf(*plan.title(0)), QStringLiteral("1=Anna"));
        QCOMPARE(textsOf(*plan.title(1)), QStringLiteral("2=Sound"));
    }

    void errors()
    {
        fill({"Name"}, {{"Anna"}});
        QCOMPARE(make().error(),
                 QStringLiteral("No column of the list has the name of a field of the template"));
        QVERIFY(make().rows().empty());
        setTexts({textOf({"{Name} {Role}"}, 1)});
        QCOMPARE(make().error(), QStringLiteral("The list has no column \"Role\" for \"{Role}\" in text 1"));
        m_key = "Number";
        QCOMPARE(make().error(), QStringLiteral("The list has no column \"Number\""));
        m_table.fail("torn");
        QCOMPARE(make().error(), QStringLiteral("torn"));
    }

    void wrongRows()
    {
        m_fields.setField(2, {"2", TemplateFields::Fit{300, 30}});
        fill({"1", "2"}, {{"Anna", "Editor"}, {"Bo", QString(60, 'W')}, {QString(301, 'x'), "x"}});
        m_table.addBadRow(9, "bad quote");
        const ListPlan plan = make();
        const QStringList rows = outcomesOf(plan);
        QCOMPARE(rows.size(), 4);
        QCOMPARE(rows[0], QStringLiteral("2: Made"));
        QVERIFY2(rows[1].startsWith("3: Wrong, field \"2\" is ") &&
                     rows[1].endsWith("smallest size, 300 is the limit"),
                 qPrintable(rows[1]));
        QCOMPARE(rows[2], QStringLiteral("4: Wrong, field \"1\" has 301 characters, 300 is the limit"));
        QCOMPARE(rows[3], QStringLiteral("9: Wrong, bad quote"));
        QCOMPARE(plan.count(ListPlan::Outcome::Made), 1);
        QCOMPARE(plan.count(ListPlan::Outcome::Wrong), 3);
    }

    void textsThatFit()
    {
        m_fields.setField(1, {"1", TemplateFields::Fit{200, 10}});
        fill({"1"}, {{"An"}, {QString(20, 'W')}});
        const ListPlan plan = make();
        QCOMPARE(sizesOf(*plan.title(0)->text().front()), QStringLiteral("An:40"));
        const TText fitted = *plan.title(1)->text().front();
        QVERIFY(fitted.textItems().front()->getFontSize() < 40);
        QVERIFY(TextFit::inkWidth(fitted) <= 200.0);
    }

    void centredTextsStayCentred()
    {
        TText centred = textOf({"A long name"}, 1);
        centred.setTextAlign(0);
        setTexts({centred});
        fill({"1"}, {{"An"}});
        QVERIFY(make().title(0)->text().front()->getXValue() > centred.getXValue() + 10.0F);
    }

    void names()
    {
        fill({"1", "2"}, {{"Anna", ""}, {"Bo", ""}});
        const ListPlan plan = make();
        const auto title = plan.title(0);
        const std::string stem = plan.rows()[0].stem.toStdString();
        QVERIFY(stem.starts_with("my-list_") && stem.ends_with("_000001"));
        QCOMPARE(title->getName(), stem);
        QCOMPARE(title->getPath(), m_folder->path().toStdString() + "/" + stem + ".xml");
        QCOMPARE(title->getThumbnailBig(), stem + "_1920.png");
        QCOMPARE(title->getThumbnailMiddle(), stem + "_960.png");
        QCOMPARE(title->getThumbnailSmall(), stem + "_240.png");
        QCOMPARE(title->getThumbnailBlack(), stem + "_240S.png");
        QVERIFY(plan.rows()[1].stem != plan.rows()[0].stem);
    }

    void secondRunUpdates()
    {
        fill({"1", "2"}, {{"Anna", ""}, {"Bo", ""}, {"Cy", ""}});
        QStringList stems;
        const ListPlan first = make();
        for (const ListPlan::Row& row : first.rows())
            stems.append(row.stem);
        // The first is whole; the second is not in the order; the third has no file.
        write({stems[0], stems[2]}, {stems[0], stems[1]});
        QCOMPARE(outcomesOf(make()), QStringList({"2: Updated", "3: Made", "4: Made"}));
        QCOMPARE(make().rows()[0].stem, stems[0]);
        // Without an order all files are shown.
        QVERIFY(QFile::remove(m_folder->filePath(".order.xml")));
        QCOMPARE(outcomesOf(make()), QStringList({"2: Updated", "3: Updated", "4: Made"}));
    }

    void keys()
    {
        m_key = "id";
        fill({"ID", "1"}, {{"Å 7/../x", "Anna"},
                           {"b", "Bo"},
                           {"", "Cy"},
                           {"b ", "Di"},
                           {"B", "Ed"},
                           {QString(500, 'k'), "Fy"}});
        const ListPlan plan = make();
        QCOMPARE(outcomesOf(plan), QStringList({"2: Made", "3: Made", "4: Wrong, it has no key",
                                                "5: Wrong, it has the key of line 3", "6: Made", "7: Made"}));
        QVERIFY(plan.rows()[0].stem.startsWith(QString::fromUtf8("å-7-x_")));
        QVERIFY(plan.rows()[5].stem.size() < 60);
        QCOMPARE(plan.notes(), QStringList());
        // Another order and other texts of the same keys are the same titles.
        const QString before = plan.rows()[1].stem;
        fill({"ID", "1"}, {{"b", "New"}});
        QCOMPARE(make().rows()[0].stem, before);
    }

    void pictures()
    {
        QImage image(16, 9, QImage::Format_RGB32);
        image.fill(Qt::red);
        QVERIFY(QDir(m_folder->path()).mkdir("lists"));
        const QString good = m_folder->filePath("lists/a.png");
        QVERIFY(image.save(good));
        QFile torn(m_folder->filePath("lists/b.png"));
        QVERIFY(torn.open(QIODevice::WriteOnly));
        torn.write("x");
        torn.close();
        fill({"1", "Picture"},
             {{"Anna", "a.png"}, {"Bo", good}, {"Cy", ""}, {"Di", "b.png"}, {"Ed", "c.png"}, {"", "a.png"}});
        const ListPlan plan = make();
        QStringList rows = outcomesOf(plan);
        QCOMPARE(rows.mid(0, 3), QStringList({"2: Made", "3: Made", "4: Made"}));
        QVERIFY2(rows[3].endsWith("lists/b.png cannot be read"), qPrintable(rows[3]));
        QVERIFY2(rows[4].startsWith("6: Wrong, there is no picture "), qPrintable(rows[4]));
        QCOMPARE(rows[5], QStringLiteral("7: Made"));
        QCOMPARE(plan.picture(0), good);
        QCOMPARE(plan.picture(1), good);
        QCOMPARE(plan.picture(2), QString());
    }

private:
    void setTexts(const std::vector<TText>& texts)
    {
        m_sample->releaseVectorText();
        std::vector<TText*> records;
        for (const TText& text : texts)
            records.push_back(new TText(text));
        m_sample->setText(records);
    }

    void fill(const QStringList& header, const QList<QStringList>& rows)
    {
        m_table = ListTable();
        m_table.setHeader(header);
        int line = 2;
        for (const QStringList& row : rows)
            m_table.addRow(line++, row);
    }

    ListPlan make() const
    {
        return ListPlan(
            {m_table, *m_sample, m_fields, m_folder->filePath("lists/My list.csv"), m_folder->path(), m_key});
    }

    void write(const QStringList& ordered, const QStringList& files) const
    {
        std::vector<ArchiveOrder> rows;
        for (const QString& stem : ordered) {
            ArchiveOrder row;
            row.setArchiveIndex(int(rows.size()));
            row.setArchivePath(stem.toStdString() + ".xml");
            rows.push_back(row);
        }
        QVERIFY(FolderOrder::write(m_folder->path().toStdString(), rows));
        for (const QString& stem : files) {
            Archive title(*m_sample);
            title.setPath((m_folder->path() + '/' + stem + ".xml").toStdString());
            QCOMPARE(TitleParser().writeOneTitle(&title), 1);
        }
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    std::unique_ptr<Archive> m_sample;
    TemplateFields m_fields;
    ListTable m_table;
    QString m_key;
};

QTEST_MAIN(tst_listplan)
#include "tst_listplan.moc"
