// The context of a request: what is remembered, what is answered, and in which order.
#include "app/EditContextController.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "tests/fakes/FakeTitlerCallBack.h"

#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>

class tst_editcontextcontroller : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        EditContextController::clearInstance();
        context = EditContextController::getInstance();
    }

    void cleanupTestCase() { EditContextController::clearInstance(); }

    void createAsksForTheFolderPicker()
    {
        QSignalSpy spy(context, &EditContextController::signalShowTitlerParameter);
        context->insertFilePath(L"/left/over.xml");
        context->showTitlerCreate(7);
        QCOMPARE(spy.size(), 1);
        const auto request = spy.first().first().value<titler_paramter>();
        QCOMPARE(request.mode, 0);
        QVERIFY(request.path.empty());
        QVERIFY(!context->isNewCreateFile(L"/left/over.xml"));
    }

    void editWithoutPathEmitsNothing()
    {
        Answers callBack;
        context->resultCallBack(new FakeTitlerCallBack(callBack));
        context->showTitlerCreate(1);
        QSignalSpy spy(context, &EditContextController::signalShowTitlerParameter);
        context->showTitlerEdit({2, L""});
        QCOMPARE(spy.size(), 0);
        QVERIFY(!context->isCreateNew());
    }

    void editCarriesItsPath()
    {
        QSignalSpy spy(context, &EditContextController::signalShowTitlerParameter);
        context->showTitlerEdit({2, L"/titles/速報"});
        QCOMPARE(spy.size(), 1);
        QCOMPARE(spy.first().first().value<titler_paramter>().path, std::wstring(L"/titles/速報"));
    }

    void isCreateNewNeedsACallback()
    {
        context->showTitlerCreate(1);
        QVERIFY(!context->isCreateNew());
        Answers callBack;
        context->resultCallBack(new FakeTitlerCallBack(callBack));
        QVERIFY(context->isCreateNew());
        context->setITitlerNoCallBack();
        QVERIFY(!context->isCreateNew());
    }

    void mainNeedsAMessageOnlyForFilesOfAnEditSession()
    {
        Answers callBack;
        context->insertFilePath(L"/a.xml");
        QVERIFY(!context->isMainNeedMsg());
        context->resultCallBack(new FakeTitlerCallBack(callBack));
        QVERIFY(context->isMainNeedMsg());
        context->deleteFilePath(L"/a.xml");
        QVERIFY(!context->isMainNeedMsg());
        context->showTitlerCreate(1);
        context->insertFilePath(L"/a.xml");
        QVERIFY(!context->isMainNeedMsg());
    }

    void aFileIsListedOnce()
    {
        Answers callBack;
        context->resultCallBack(new FakeTitlerCallBack(callBack));
        context->showTitlerCreate(1);
        context->insertFilePath(L"/f/a.xml");
        context->insertFilePath(L"/f/a.xml");
        context->sentITitlerCallBack(L"/f");
        QCOMPARE(callBack.last.count, 1);
    }

    void nothingMadeIsAnsweredWithNothing()
    {
        Answers callBack;
        context->resultCallBack(new FakeTitlerCallBack(callBack));
        context->showTitlerCreate(9);
        context->sentITitlerCallBack(L"/f");
        QCOMPARE(callBack.calls, 1);
        QCOMPARE(callBack.last.type, 9);
        QCOMPARE(callBack.last.count, 0);
        QCOMPARE(callBack.last.size, 0);
        context->sentITitlerCallBack(L"/f");
        QCOMPARE(callBack.calls, 1);
    }

    void answerFollowsTheFolderOrder()
    {
        QTemporaryDir folder;
        writeOrder(folder.path(), {"c.xml", "a.xml", "b.xml"});
        const QStringList made = sendMade(folder.path(), {"a.xml", "b.xml", "c.xml"});
        QCOMPARE(made, QStringList({"c.xml", "a.xml", "b.xml"}));
    }

    void aFileUnknownToTheOrderKeepsTheOldOrderForAll()
    {
        QTemporaryDir folder;
        writeOrder(folder.path(), {"c.xml", "a.xml"});
        const QStringList made = sendMade(folder.path(), {"a.xml", "b.xml", "c.xml"});
        QCOMPARE(made, QStringList({"a.xml", "b.xml", "c.xml"}));
    }

private:
    static void writeOrder(const QString& folder, const QStringList& names)
    {
        QList<ArchiveOrder*> rows;
        for (const QString& name : names) {
            auto* row = new ArchiveOrder;
            row->setArchiveIndex(static_cast<int>(rows.size()));
            row->setArchivePath(name.toStdString());
            rows << row;
        }
        QVERIFY(ArchiveController().saveArchiveListOrder(folder, rows));
        qDeleteAll(rows);
    }

    QStringList sendMade(const QString& folder, const QStringList& names)
    {
        Answers callBack;
        context->resultCallBack(new FakeTitlerCallBack(callBack));
        context->showTitlerCreate(3);
        for (const QString& name : names)
            context->insertFilePath(name.toStdWString());
        context->sentITitlerCallBack(folder.toStdWString());
        context->resultCallBack(nullptr);
        if (callBack.last.path != folder.toStdWString() || callBack.bytesRead != callBack.last.size)
            return {};
        return callBack.paths;
    }

    EditContextController* context = nullptr;
};

QTEST_GUILESS_MAIN(tst_editcontextcontroller)
#include "tst_editcontextcontroller.moc"
