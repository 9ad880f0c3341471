// Data paths that cannot be worked with.
#include "support/DataPathCheck.h"

#include <unistd.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

class tst_datapathcheck : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void goodPaths();
    void longPaths_data();
    void longPaths();
    void relativePaths_data();
    void relativePaths();
    void aFileInTheWay();
    void noFolderCanBeMade();
    void noFileCanBeMade();
    void oneLineWhateverThePathHolds();

private:
    QString problemOf(const QByteArray& path)
    {
        qputenv("K2SYS_AC_DATA", path);
        return QString::fromStdString(DataPathCheck::problem());
    }

    QTemporaryDir m_folder{"/tmp/dpcXXXXXX"};
};

void tst_datapathcheck::init()
{
    qunsetenv("K2SYS_AC_ROOT");
    QVERIFY(m_folder.isValid());
}

void tst_datapathcheck::goodPaths()
{
    const QByteArray path = m_folder.path().toUtf8();
    QCOMPARE(problemOf(path), QString());
    QVERIFY(QDir(path + "/defaultuser").exists());
    QCOMPARE(QDir(path + "/defaultuser").entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList());
    QCOMPARE(problemOf(path + "/not/yet/there"), QString());
    const QByteArray longest = path + '/' + QByteArray(98 - path.size(), 'x');
    QCOMPARE(longest.size(), qsizetype(DataPathCheck::MAX_LENGTH));
    QCOMPARE(problemOf(longest), QString());
    // Under the root "/" the path is taken from where the process was started.
    qputenv("K2SYS_AC_ROOT", "/");
    QCOMPARE(problemOf(path), QString());
}

void tst_datapathcheck::longPaths_data()
{
    QTest::addColumn<int>("length");
    for (const int length : {100, 127, 128, 4095, 4096, 100000})
        QTest::addRow("%d", length) << length;
}

void tst_datapathcheck::longPaths()
{
    QFETCH(int, length);
    const QByteArray path = m_folder.path().toUtf8() + '/';
    QVERIFY(problemOf(path + QByteArray(length - path.size(), 'x')).contains("too long"));
    QVERIFY(QDir(path).entryList(QDir::AllEntries | QDir::NoDotAndDotDot).filter("xx").size() <= 1);
}

void tst_datapathcheck::relativePaths_data()
{
    QTest::addColumn<QByteArray>("path");
    for (const char* path : {"data", "./data", "../data", "~/data", "."})
        QTest::addRow("%s", path) << QByteArray(path);
}

void tst_datapathcheck::relativePaths()
{
    QFETCH(QByteArray, path);
    const QString problem = problemOf(path);
    QVERIFY2(problem.contains("not absolute"), qPrintable(problem));
    QVERIFY(problem.contains('"' + path + '"'));
}

void tst_datapathcheck::aFileInTheWay()
{
    QFile file(m_folder.filePath("file"));
    QVERIFY(file.open(QIODevice::WriteOnly));
    const QString problem = problemOf(file.fileName().toUtf8() + "/data");
    QVERIFY2(problem.contains("cannot be written: Not a directory"), qPrintable(problem));
    QVERIFY(problemOf(file.fileName().toUtf8()).contains("cannot be written"));
}

void tst_datapathcheck::noFolderCanBeMade()
{
    const QString problem = problemOf("/proc/titler");
    QVERIFY2(problem.contains("cannot be written"), qPrintable(problem));
}

void tst_datapathcheck::noFileCanBeMade()
{
    if (geteuid() == 0)
        QSKIP("root may write everywhere");
    const QString user = m_folder.filePath("closed/defaultuser");
    QVERIFY(QDir().mkpath(user));
    QVERIFY(QFile::setPermissions(user, QFile::ReadOwner | QFile::ExeOwner));
    const QString problem = problemOf(m_folder.filePath("closed").toUtf8());
    QVERIFY2(problem.contains("Permission denied"), qPrintable(problem));
}

void tst_datapathcheck::oneLineWhateverThePathHolds()
{
    const QString problem = problemOf("one\ntwo\x1b[31m");
    QVERIFY2(problem.contains("\"one?two?[31m\""), qPrintable(problem));
    QVERIFY(!problem.contains('\n'));
}

QTEST_GUILESS_MAIN(tst_datapathcheck)
#include "tst_datapathcheck.moc"
