// The model of the touch tree: attributes, children made on demand, rows, columns and orders.
#include "TreeFixture.h"

#include "tests/support/RandomSeed.h"
#include "touchui/KSModelTreeDataItem.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeModelDefaultSortHelper.h"

#include <QAbstractItemModelTester>
#include <QColor>
#include <QRandomGenerator>
#include <QSignalSpy>
#include <QTest>

class tst_kstreemodel : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void attributesAreSharedOrPerColumn();
    void attributeColumnsCanBeInsertedAndRemoved();
    void itemLinks();
    void orderMustNameEveryChildOnce();
    void childrenAreMadeWhenAskedFor();
    void importHappensOnce();
    void walksUnderTheTester();
    void defaultsStandIn();
    void checkStateOnlyWhenCheckable();
    void flagsFollowTheAttributes();
    void setDataTellsWhatChanged();
    void headerAttributes();
    void invalidIndicesGiveNothing();
    void insertAndRemoveRows();
    void moveRowsKeepsPersistentIndices_data();
    void moveRowsKeepsPersistentIndices();
    void columns();
    void rowTakesAnotherSource();
    void currentRoot();
    void sortTable_data();
    void sortTable();
    void sortLeavesUnknownColumnsAlone();
    void sortHelperRefuses();
    void filesComeBeforeFolders();
    void sortKeepsPersistentIndices();
    void childrenMadeLaterAreSorted();
    void sortBelowZeroEndsSorting();
    void clearsAttributesOfAll();
    void randomOperations();

private:
    static QStringList names(const KSTreeModel& model, const QModelIndex& parent = QModelIndex());
};

QStringList tst_kstreemodel::names(const KSTreeModel& model, const QModelIndex& parent)
{
    QStringList list;
    for (int row = 0; row < model.rowCount(parent); ++row)
        list.append(model.index(row, 0, parent).data().toString());
    return list;
}

void tst_kstreemodel::attributesAreSharedOrPerColumn()
{
    KSModelTreeDataItem item;
    QVERIFY(!item.getAttribute(Qt::DisplayRole, 0).isValid());
    QCOMPARE(item.getAttributeMaxKey(Qt::DisplayRole), 0);
    item.setAttribute(Qt::DisplayRole, 1, 5);
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 0).toInt(), 1);
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 9).toInt(), 1);
    item.setAttributeMaxKey(Qt::DisplayRole, 2);
    QCOMPARE(item.getAttributeMaxKey(Qt::DisplayRole), 2);
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 0).toInt(), 1);
    QVERIFY(!item.getAttribute(Qt::DisplayRole, 1).isValid());
    item.setAttribute(Qt::DisplayRole, 2, 2);
    item.setAttribute(Qt::DisplayRole, 3, 3);
    item.setAttribute(Qt::DisplayRole, 4, -1);
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 2).toInt(), 2);
    QVERIFY(!item.getAttribute(Qt::DisplayRole, 3).isValid());
    QVERIFY(!item.getAttribute(Qt::DisplayRole, -1).isValid());
    item.setAttributeMaxKey(Qt::DisplayRole, -4);
    QCOMPARE(item.getAttributeMaxKey(Qt::DisplayRole), 0);
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 7).toInt(), 1);
}

void tst_kstreemodel::attributeColumnsCanBeInsertedAndRemoved()
{
    KSModelTreeDataItem item;
    item.setAttributeMaxKey(Qt::DisplayRole, 2);
    for (int column = 0; column < 3; ++column)
        item.setAttribute(Qt::DisplayRole, column, column);
    item.setAttribute(KSVIEW::ItemEnableRole, true, 0);
    item.insertAttributeColumns(1, 2);
    QCOMPARE(item.getAttributeMaxKey(Qt::DisplayRole), 4);
    QVERIFY(!item.getAttribute(Qt::DisplayRole, 1).isValid());
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 3).toInt(), 1);
    item.removeAttributeColumns(0, 3);
    QCOMPARE(item.getAttribute(Qt::DisplayRole, 0).toInt(), 1);
    item.removeAttributeColumns(0, 99);
    QVERIFY(!item.getAttribute(Qt::DisplayRole, 0).isValid());
    QCOMPARE(item.getAttribute(KSVIEW::ItemEnableRole, 4).toBool(), true);
}

void tst_kstreemodel::itemLinks()
{
    KSModelTreeDataItem root;
    root.setRoot(&root);
    QCOMPARE(root.next(), nullptr);
    QVERIFY(root.insertNext(std::make_unique<KSModelTreeDataItem>()) == nullptr);
    QVERIFY(root.removeSeft() == nullptr);
    KSModelItem* b = root.addChild(std::make_unique<KSModelTreeDataItem>());
    KSModelItem* a = b->insertPrev(std::make_unique<KSModelTreeDataItem>());
    KSModelItem* c = b->insertNext(std::make_unique<KSModelTreeDataItem>());
    KSModelItem* below = b->addChild(std::make_unique<KSModelTreeDataItem>());
    QCOMPARE(root.children(false), QList<KSModelItem*>({a, b, c}));
    QCOMPARE(root.children(true), QList<KSModelItem*>({a, b, below, c}));
    QCOMPARE(a->next(), b);
    QCOMPARE(b->prev(), a);
    QCOMPARE(a->prev(), nullptr);
    QCOMPARE(c->next(), nullptr);
    QCOMPARE(below->root(), &root);
    QCOMPARE(below->parent(), b);
    QCOMPARE(root.indexOfChildList(c), 2);
    QCOMPARE(root.indexOfChildList(below), -1);
    QCOMPARE(root.child(-1), nullptr);
    QCOMPARE(root.child(3), nullptr);
    QVERIFY(root.addChild(nullptr) == nullptr);
    const std::unique_ptr<KSModelItem> taken = b->removeSeft();
    QCOMPARE(taken.get(), b);
    QCOMPARE(b->parent(), nullptr);
    QCOMPARE(below->root(), nullptr);
    QCOMPARE(root.children(false), QList<KSModelItem*>({a, c}));
    QVERIFY(root.remove(5) == nullptr);
}

void tst_kstreemodel::orderMustNameEveryChildOnce()
{
    KSModelTreeDataItem root;
    KSModelItem* a = root.addChild(std::make_unique<KSModelTreeDataItem>());
    KSModelItem* b = root.addChild(std::make_unique<KSModelTreeDataItem>());
    QVERIFY(!root.orderChildList({a}));
    QVERIFY(!root.orderChildList({a, a}));
    QVERIFY(!root.orderChildList({a, nullptr}));
    QCOMPARE(root.children(false), QList<KSModelItem*>({a, b}));
    QVERIFY(root.orderChildList({b, a}));
    QCOMPARE(root.children(false), QList<KSModelItem*>({b, a}));
}

void tst_kstreemodel::childrenAreMadeWhenAskedFor()
{
    TreeSource source;
    source.fill(200, 99);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    QCOMPARE(source.installed, 200);
    QVERIFY(model.hasChildren());
    const QModelIndex folder = model.index(7, 0);
    QVERIFY(model.hasChildren(folder));
    QVERIFY(!model.hasChildren(model.index(7, 1)));
    QCOMPARE(source.installed, 200);
    QVERIFY(!model.areChildrenMade(folder));
    QCOMPARE(model.rowCount(folder), 99);
    QCOMPARE(model.rowCount(folder), 99);
    QCOMPARE(source.installed, 299);
    QVERIFY(!model.hasChildren(model.index(3, 0, folder)));
    QCOMPARE(model.parent(model.index(3, 2, folder)), folder);
}

void tst_kstreemodel::importHappensOnce()
{
    TreeSource source;
    source.fill(2, 2);
    KSTreeModel model(&source, 3);
    QCOMPARE(model.rowCount(), 2); // asked for without being told to read
    QCOMPARE(source.imports, 0);
    QSignalSpy reset(&model, &QAbstractItemModel::modelReset);
    model.createDataItems();
    QCOMPARE(source.imports, 1);
    QCOMPARE(reset.count(), 1);
    QCOMPARE(model.rowCount(), 2);
}

void tst_kstreemodel::walksUnderTheTester()
{
    TreeSource source;
    source.fill(5, 4);
    KSTreeModel model(&source, 3);
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    model.createDataItems();
    QCOMPARE(model.rowCount(model.index(4, 0)), 4);
    model.sort(0, Qt::DescendingOrder);
    QVERIFY(model.insertRows(1, 2, model.index(0, 0)));
    QVERIFY(model.removeRows(0, 1));
    QVERIFY(model.moveRow(QModelIndex(), 0, QModelIndex(), 2));
    QVERIFY(model.insertColumns(1, 1));
    QVERIFY(model.removeColumns(0, 1));
    QVERIFY(model.setData(model.index(0, 0), QStringLiteral("new")));
    model.setCurrentRoot(model.index(0, 0));
}

void tst_kstreemodel::defaultsStandIn()
{
    KSTreeModel model(nullptr, 2);
    QVERIFY(!model.hasChildren());
    QVERIFY(model.insertRow(0));
    const QModelIndex index = model.index(0, 0);
    QVERIFY(model.getItemEnable(index));
    QVERIFY(!model.isForder(index));
    QVERIFY(!model.getCheckable(index));
    QVERIFY(!model.isRecording(index));
    QCOMPARE(model.getItemHeight(index), 0);
    QCOMPARE(model.getOnOrPartialChildrenNumber(index), 0);
    model.setDefaultAttribute(KSVIEW::ItemHeightRole, 60);
    QCOMPARE(model.getItemHeight(index), 60);
    model.setData(index, -5, KSVIEW::ItemHeightRole);
    QCOMPARE(model.getItemHeight(index), 0);
    model.setDefaultAttribute(Qt::DisplayRole, QStringLiteral("all"));
    model.setDefaultAttribute(Qt::DisplayRole, QStringLiteral("second"), 1);
    QCOMPARE(index.data().toString(), QStringLiteral("all"));
    QCOMPARE(index.siblingAtColumn(1).data().toString(), QStringLiteral("second"));
    QCOMPARE(index.data(Qt::EditRole).toString(), QStringLiteral("all"));
}

void tst_kstreemodel::checkStateOnlyWhenCheckable()
{
    KSTreeModel model(nullptr, 1);
    model.insertRow(0);
    const QModelIndex index = model.index(0, 0);
    model.setData(index, static_cast<int>(Qt::Checked), Qt::CheckStateRole);
    QVERIFY(!index.data(Qt::CheckStateRole).isValid());
    model.setData(index, true, KSVIEW::ItemCheckableRole);
    QCOMPARE(index.data(Qt::CheckStateRole).toInt(), static_cast<int>(Qt::Checked));
}

void tst_kstreemodel::flagsFollowTheAttributes()
{
    KSTreeModel model(nullptr, 1);
    model.insertRow(0);
    const QModelIndex index = model.index(0, 0);
    QCOMPARE(model.flags(index), Qt::ItemIsEnabled | Qt::ItemIsSelectable);
    model.setData(index, true, KSVIEW::ItemEditableRole);
    model.setData(index, true, KSVIEW::ItemCheckableRole);
    model.setData(index, false, KSVIEW::ItemEnableRole);
    model.setData(index, false, KSVIEW::ItemSelectableRole);
    QCOMPARE(model.flags(index), Qt::ItemIsEditable | Qt::ItemIsUserCheckable);
    QCOMPARE(model.flags(QModelIndex()), Qt::ItemFlags(Qt::NoItemFlags));
}

void tst_kstreemodel::setDataTellsWhatChanged()
{
    TreeSource source;
    source.fill(1, 0);
    KSTreeModel model(&source, 3);
    QSignalSpy changed(&model, &QAbstractItemModel::dataChanged);
    const QModelIndex name = model.index(0, 0);
    QVERIFY(model.setData(name, QStringLiteral("other")));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.at(0).at(0).toModelIndex(), name);
    QCOMPARE(changed.at(0).at(1).toModelIndex(), name);
    QCOMPARE(changed.at(0).at(2).value<QList<int>>(), QList<int>({Qt::EditRole, Qt::DisplayRole}));
    QCOMPARE(name.data().toString(), QStringLiteral("other"));
    QCOMPARE(name.siblingAtColumn(1).data().toString(), QStringLiteral("2024-01-01"));
    QVERIFY(model.setData(name, true, KSVIEW::ItemRecordingRole)); // shared by the columns
    QCOMPARE(changed.at(1).at(1).toModelIndex(), name.siblingAtColumn(2));
    QVERIFY(model.isRecording(name.siblingAtColumn(1)));
}

void tst_kstreemodel::headerAttributes()
{
    KSTreeModel model(nullptr, 2);
    QSignalSpy changed(&model, &QAbstractItemModel::headerDataChanged);
    QVERIFY(!model.getHeaderTextColor(0).isValid());
    model.setHeaderAttribute(Qt::ForegroundRole, QColor(Qt::red));
    QVERIFY(model.setHeaderData(1, Qt::Horizontal, QColor(Qt::green), Qt::ForegroundRole));
    QVERIFY(model.setHeaderData(0, Qt::Horizontal, QStringLiteral("Name")));
    QCOMPARE(changed.count(), 3);
    QCOMPARE(model.getHeaderTextColor(0), QColor(Qt::red));
    QCOMPARE(model.getHeaderTextColor(1), QColor(Qt::green));
    QCOMPARE(model.headerData(0, Qt::Horizontal).toString(), QStringLiteral("Name"));
    QCOMPARE(model.getHeaderAttribute(Qt::ForegroundRole).value<QColor>(), QColor(Qt::red));
    QVERIFY(!model.setHeaderData(2, Qt::Horizontal, 1));
    QVERIFY(!model.setHeaderData(0, Qt::Vertical, 1));
    QVERIFY(!model.headerData(-1, Qt::Horizontal).isValid());
    QVERIFY(!model.headerData(0, Qt::Vertical).isValid());
}

void tst_kstreemodel::invalidIndicesGiveNothing()
{
    TreeSource source;
    source.fill(2, 1);
    KSTreeModel model(&source, 3);
    KSTreeModel other(&source, 3);
    const QModelIndex strange = other.index(0, 0);
    for (const QModelIndex& index : {QModelIndex(), strange}) {
        QVERIFY(!model.data(index).isValid());
        QVERIFY(!model.setData(index, 1));
        QVERIFY(!model.getItemEnable(index));
        QVERIFY(model.itemOf(index) == nullptr);
        QVERIFY(!model.parent(index).isValid());
        QCOMPARE(model.flags(index), Qt::ItemFlags(Qt::NoItemFlags));
    }
    QCOMPARE(model.rowCount(strange), 0);
    QVERIFY(!model.hasChildren(strange));
    QVERIFY(!model.index(0, 0, strange).isValid());
    QVERIFY(!model.index(2, 0).isValid());
    QVERIFY(!model.index(-1, 0).isValid());
    QVERIFY(!model.index(0, 3).isValid());
    QVERIFY(!model.indexOf(nullptr).isValid());
    QCOMPARE(model.createTreeItemChildren(nullptr), 0);
    model.sort(0);
    QCOMPARE(model.rowCount(), 2);
}

void tst_kstreemodel::insertAndRemoveRows()
{
    TreeSource source;
    source.fill(3, 2);
    KSTreeModel model(&source, 3);
    QVERIFY(!model.insertRows(4, 1));
    QVERIFY(!model.insertRows(-1, 1));
    QVERIFY(!model.insertRows(0, 0));
    QVERIFY(!model.removeRows(2, 2));
    QVERIFY(!model.removeRows(-1, 1));
    QVERIFY(!model.removeRows(0, 0));
    QCOMPARE(model.rowCount(), 3);
    QPersistentModelIndex last = model.index(2, 0);
    QPersistentModelIndex child = model.index(1, 0, last);
    QVERIFY(model.insertRows(3, 1));
    QVERIFY(model.insertRows(0, 2));
    QCOMPARE(last.row(), 4);
    QCOMPARE(child.parent(), QModelIndex(last));
    QVERIFY(!model.index(0, 0).data().isValid());
    QVERIFY(model.removeRows(0, 2));
    QCOMPARE(names(model), QStringList({"Folder 000", "Folder 001", "Folder 002", ""}));
    QVERIFY(model.removeRow(2));
    QVERIFY(!last.isValid());
    QVERIFY(!child.isValid());
}

void tst_kstreemodel::moveRowsKeepsPersistentIndices_data()
{
    QTest::addColumn<int>("from");
    QTest::addColumn<int>("to");
    QTest::addColumn<bool>("moved");
    QTest::addColumn<QString>("result");
    QTest::newRow("down") << 0 << 3 << true << "BCAD";
    QTest::newRow("up") << 3 << 1 << true << "ADBC";
    QTest::newRow("to the end") << 1 << 4 << true << "ACDB";
    QTest::newRow("nowhere") << 1 << 1 << false << "ABCD";
    QTest::newRow("behind itself") << 1 << 2 << false << "ABCD";
    QTest::newRow("beyond") << 1 << 5 << false << "ABCD";
    QTest::newRow("no row") << 4 << 0 << false << "ABCD";
}

void tst_kstreemodel::moveRowsKeepsPersistentIndices()
{
    QFETCH(int, from);
    QFETCH(int, to);
    QFETCH(bool, moved);
    QFETCH(QString, result);
    TreeSource source;
    for (const char* name : {"A", "B", "C", "D"})
        source.add(QLatin1String(name), nullptr, true);
    KSTreeModel model(&source, 3);
    const QPersistentModelIndex watched = model.index(from, 0);
    const QString name = watched.data().toString();
    QCOMPARE(model.moveRow(QModelIndex(), from, QModelIndex(), to), moved);
    QCOMPARE(names(model).join(QString()), result);
    QCOMPARE(watched.data().toString(), name);
}

void tst_kstreemodel::columns()
{
    TreeSource source;
    source.fill(1, 1);
    KSTreeModel model(&source, 3);
    model.setHeaderData(1, Qt::Horizontal, QStringLiteral("Date"));
    const QModelIndex folder = model.index(0, 0);
    const QPersistentModelIndex date = model.index(0, 1, folder);
    const QPersistentModelIndex name = model.index(0, 0, folder);
    QVERIFY(!model.insertColumns(4, 1));
    QVERIFY(!model.removeColumns(2, 2));
    QVERIFY(model.insertColumns(1, 1));
    QCOMPARE(model.columnCount(), 4);
    QCOMPARE(date.column(), 2);
    QCOMPARE(date.data().toString(), QStringLiteral("2024-01-01"));
    QVERIFY(!model.index(0, 1).data().isValid());
    QCOMPARE(model.headerData(2, Qt::Horizontal).toString(), QStringLiteral("Date"));
    QVERIFY(model.removeColumns(1, 1));
    QCOMPARE(date.column(), 1);
    QCOMPARE(date.data().toString(), QStringLiteral("2024-01-01"));
    QVERIFY(name.isValid());
    QSignalSpy reset(&model, &QAbstractItemModel::modelReset);
    QVERIFY(model.removeColumns(0, 1));
    QCOMPARE(reset.count(), 1);
    QCOMPARE(model.columnCount(), 2);
    QVERIFY(!name.isValid());
    QCOMPARE(model.index(0, 0, model.index(0, 0)).data().toString(), QStringLiteral("2024-01-01"));
    QCOMPARE(model.headerData(0, Qt::Horizontal).toString(), QStringLiteral("Date"));
}

void tst_kstreemodel::rowTakesAnotherSource()
{
    TreeSource source;
    source.fill(2, 3);
    SourceNode* other = source.add(QStringLiteral("Other"), nullptr, true);
    source.add(QStringLiteral("Only"), other, false);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    const QModelIndex folder = model.index(0, 0);
    const QPersistentModelIndex title = model.index(2, 0, folder);
    model.setSourceData(folder, other);
    QVERIFY(!title.isValid());
    QCOMPARE(names(model, folder), QStringList({"Only"}));
    QCOMPARE(folder.data().toString(), QStringLiteral("Folder 000"));
    model.setSourceData(folder, nullptr);
    QCOMPARE(model.rowCount(folder), 0);
    QVERIFY(!model.hasChildren(folder));
    QVERIFY(model.insertRow(3));
    model.setSourceData(model.index(3, 0), other);
    QCOMPARE(names(model, model.index(3, 0)), QStringList({"Only"}));
    model.setSourceData(QModelIndex(), other);
    QCOMPARE(model.rowCount(), 4);
}

void tst_kstreemodel::currentRoot()
{
    TreeSource source;
    source.fill(3, 2);
    KSTreeModel model(&source, 3);
    QSignalSpy reset(&model, &QAbstractItemModel::modelReset);
    model.setCurrentRoot(model.index(1, 0));
    QCOMPARE(reset.count(), 1);
    QCOMPARE(names(model), QStringList({"Title 0", "Title 1"}));
    QVERIFY(!model.parent(model.index(0, 0)).isValid());
    model.setCurrentRoot(QModelIndex());
    QCOMPARE(model.rowCount(), 3);
}

void tst_kstreemodel::sortTable_data()
{
    QTest::addColumn<int>("column");
    QTest::addColumn<bool>("ascending");
    QTest::addColumn<QString>("result");
    QTest::newRow("name ascending") << 0 << true << "abcd";
    QTest::newRow("name descending") << 0 << false << "dcba";
    QTest::newRow("date ascending") << 1 << true << "badc";
    QTest::newRow("date descending, equals keep their order") << 1 << false << "cadb";
    QTest::newRow("size ascending") << 2 << true << "dbca";
    QTest::newRow("size descending") << 2 << false << "acbd";
}

void tst_kstreemodel::sortTable()
{
    QFETCH(int, column);
    QFETCH(bool, ascending);
    QFETCH(QString, result);
    TreeSource source;
    source.add(QStringLiteral("b"), nullptr, true, 1, 20);
    source.add(QStringLiteral("a"), nullptr, true, 3, 40);
    source.add(QStringLiteral("d"), nullptr, true, 3, 10);
    source.add(QStringLiteral("c"), nullptr, true, 7, 30);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    model.sort(column, ascending ? Qt::AscendingOrder : Qt::DescendingOrder);
    QCOMPARE(names(model).join(QString()), result);
}

void tst_kstreemodel::sortLeavesUnknownColumnsAlone()
{
    TreeSource source;
    source.setColumnDataType(0, KSModelDataFactory::NoDataType);
    source.add(QStringLiteral("b"), nullptr, true);
    source.add(QStringLiteral("a"), nullptr, true);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    model.sort(0);
    QCOMPARE(names(model), QStringList({"b", "a"}));
    KSTreeModelDefaultSortHelper helper;
    QList<KSModelItem*> list = model.currentRoot()->children(false);
    const QList<KSModelItem*> before = list;
    helper.sortChildList(KSModelDataFactory::NameDataType, KSTreeModelSortHelper::SortByDate, list,
                         Qt::AscendingOrder);
    helper.sortChildList(17, 4, list, Qt::AscendingOrder);
    QCOMPARE(list, before);
    helper.sortChildList(KSModelDataFactory::NameDataType, KSTreeModelSortHelper::SortByName, list,
                         Qt::AscendingOrder);
    QVERIFY(list != before);
}

void tst_kstreemodel::sortHelperRefuses()
{
    KSTreeModelDefaultSortHelper helper;
    QList<KSModelItem*> none;
    helper.sortChildList(1, 0, none, Qt::AscendingOrder);
    QVERIFY(none.isEmpty());
    KSModelTreeDataItem parent;
    for (const char* name : {"b", "a"}) {
        KSModelItem* child = parent.addChild(std::make_unique<KSModelTreeDataItem>());
        child->attributes()->setAttribute(Qt::DisplayRole, QLatin1String(name), 0);
    }
    QList<KSModelItem*> list = parent.children(false);
    helper.sortChildList(1, 0, list, Qt::AscendingOrder); // the parent is no folder
    QCOMPARE(list, parent.children(false));
    parent.setAttribute(KSVIEW::ItemIsForderRole, true, 0);
    helper.sortChildList(1, 0, list, Qt::AscendingOrder);
    QCOMPARE(list.constFirst(), parent.child(1));
}

void tst_kstreemodel::filesComeBeforeFolders()
{
    TreeSource source;
    for (const char* name : {"F2", "f2", "F1", "f1", "F3"})
        source.add(QLatin1String(name), nullptr, *name == 'F');
    KSTreeModel model(&source, 3);
    model.createDataItems();
    model.sort(0, Qt::DescendingOrder);
    QCOMPARE(names(model), QStringList({"f2", "f1", "F3", "F2", "F1"}));
    QList<KSModelItem*> list = model.currentRoot()->children(false);
    KSTreeModel::rankFileAndForder(list, false);
    QCOMPARE(list.constFirst()->attributes()->getAttribute(Qt::DisplayRole, 0).toString(),
             QStringLiteral("F3"));
}

void tst_kstreemodel::sortKeepsPersistentIndices()
{
    TreeSource source;
    source.fill(20, 5);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    const QPersistentModelIndex folder = model.index(3, 1);
    const QPersistentModelIndex title = model.index(1, 2, model.index(3, 0));
    QSignalSpy about(&model, &QAbstractItemModel::layoutAboutToBeChanged);
    QSignalSpy done(&model, &QAbstractItemModel::layoutChanged);
    model.sort(0, Qt::DescendingOrder);
    QCOMPARE(about.count(), 1);
    QCOMPARE(done.count(), 1);
    QCOMPARE(folder.row(), 16);
    QCOMPARE(folder.column(), 1);
    QCOMPARE(folder.sibling(folder.row(), 0).data().toString(), QStringLiteral("Folder 003"));
    QCOMPARE(title.sibling(title.row(), 0).data().toString(), QStringLiteral("Title 1"));
    QCOMPARE(title.row(), 3);
    QCOMPARE(title.parent(), folder.sibling(folder.row(), 0));
}

void tst_kstreemodel::childrenMadeLaterAreSorted()
{
    TreeSource source;
    source.fill(2, 3);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    model.sort(0, Qt::DescendingOrder);
    QCOMPARE(source.installed, 2);
    QCOMPARE(names(model, model.index(0, 0)), QStringList({"Title 2", "Title 1", "Title 0"}));
}

void tst_kstreemodel::sortBelowZeroEndsSorting()
{
    TreeSource source;
    source.fill(2, 3);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    model.sort(0, Qt::DescendingOrder);
    QSignalSpy done(&model, &QAbstractItemModel::layoutChanged);
    model.sort(-1);
    QCOMPARE(done.count(), 0);
    QCOMPARE(names(model), QStringList({"Folder 001", "Folder 000"}));
    QCOMPARE(names(model, model.index(0, 0)), QStringList({"Title 0", "Title 1", "Title 2"}));
    model.sort(99);
    QCOMPARE(names(model), QStringList({"Folder 001", "Folder 000"}));
}

void tst_kstreemodel::clearsAttributesOfAll()
{
    TreeSource source;
    source.fill(2, 2);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    const QModelIndex title = model.index(1, 0, model.index(0, 0));
    model.setData(title, 3, KSVIEW::ItemLoadingRole);
    QCOMPARE(model.madeIndexesWith(KSVIEW::ItemLoadingRole), QModelIndexList({title}));
    model.setAttributeOfAll(KSVIEW::ItemLoadingRole, 0);
    QVERIFY(model.madeIndexesWith(KSVIEW::ItemLoadingRole).isEmpty());
    QVERIFY(!model.index(0, 0).data(KSVIEW::ItemLoadingRole).isValid());
    QVERIFY(!model.areChildrenMade(model.index(1, 0)));
}

void tst_kstreemodel::randomOperations()
{
    const RandomSeed seed(20240711);
    QRandomGenerator random(seed);
    TreeSource source;
    source.fill(8, 6);
    KSTreeModel model(&source, 3);
    model.createDataItems();
    QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::QtTest);
    const auto below = [&](int bound) { return bound > 0 ? random.bounded(bound) : 0; };
    for (int step = 0; step < 1500; ++step) {
        const QModelIndex parent = below(2) == 0 ? QModelIndex() : model.index(below(model.rowCount()), 0);
        const int rows = model.rowCount(parent);
        const QPersistentModelIndex watched = model.index(below(rows), below(model.columnCount()), parent);
        const QString name = watched.sibling(watched.row(), 0).data().toString();
        bool kept = true;
        switch (below(5)) {
        case 0:
            QCOMPARE(model.insertRows(below(rows + 1), 1, parent), true);
            break;
        case 1:
            if (rows > 3) {
                const int row = below(rows);
                kept = row != watched.row();
                QVERIFY(model.removeRows(row, 1, parent));
            }
            break;
        case 2:
            model.sort(below(3), below(2) == 0 ? Qt::AscendingOrder : Qt::DescendingOrder);
            break;
        case 3:
            model.moveRow(parent, below(rows), parent, below(rows + 1));
            break;
        default:
            model.setData(model.index(below(rows), 1, parent), step, KSVIEW::ItemSizeRole);
        }
        QCOMPARE(watched.isValid(), kept && rows > 0);
        if (watched.isValid())
            QCOMPARE(watched.sibling(watched.row(), 0).data().toString(), name);
    }
}

QTEST_MAIN(tst_kstreemodel)
#include "tst_kstreemodel.moc"
