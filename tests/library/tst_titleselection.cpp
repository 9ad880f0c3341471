// Which items of the title list are marked, and what they look like.
#include "document/Archive.h"
#include "library/ArchiveItem.h"
#include "library/TitleSelection.h"

#include <QTest>
#include <memory>

class tst_titleselection : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void looksFollowTheMarks();
    void nullChangesNothing();
    void destroyedItemsAreForgotten();
};

void tst_titleselection::looksFollowTheMarks()
{
    Archive record;
    ArchiveItem first(&record, ArchiveItem::LIST_ITEM, nullptr);
    ArchiveItem second(&record, ArchiveItem::LIST_ITEM, nullptr);
    TitleSelection selection;
    selection.select(&first);
    TitleSelection::showSelected(&first);
    QCOMPARE(selection.selected(), &first);
    QCOMPARE(first.look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);

    selection.mark(&first);
    QCOMPARE(first.look(), ArchiveItem::OPERATE_AND_SELECT_STATE);
    selection.removeBorder(&first);
    QCOMPARE(first.look(), ArchiveItem::UN_OPERATE_AND_SELECT_STATE);

    selection.mark(&second);
    QCOMPARE(selection.operation(), &second);
    QCOMPARE(second.look(), ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
    selection.removeBorder(&second);
    QCOMPARE(second.look(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    TitleSelection::showDefault(&first);
    QCOMPARE(first.look(), ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
}

void tst_titleselection::nullChangesNothing()
{
    Archive record;
    ArchiveItem item(&record, ArchiveItem::LIST_ITEM, nullptr);
    TitleSelection selection;
    selection.select(&item);
    selection.mark(&item);
    selection.select(nullptr);
    selection.mark(nullptr);
    selection.removeBorder(nullptr);
    TitleSelection::showSelected(nullptr);
    TitleSelection::showDefault(nullptr);
    QCOMPARE(selection.selected(), &item);
    QCOMPARE(selection.operation(), &item);
    QCOMPARE(item.look(), ArchiveItem::OPERATE_AND_SELECT_STATE);
}

void tst_titleselection::destroyedItemsAreForgotten()
{
    Archive record;
    auto item = std::make_unique<ArchiveItem>(&record, ArchiveItem::LIST_ITEM, nullptr);
    TitleSelection selection;
    selection.select(item.get());
    selection.mark(item.get());
    item.reset();
    QVERIFY(!selection.selected());
    QVERIFY(!selection.operation());
}

QTEST_MAIN(tst_titleselection)
#include "tst_titleselection.moc"
