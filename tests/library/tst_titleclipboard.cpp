// The copied title: it can be pasted again and again, also when its source is gone.
#include "LibraryFixture.h"

#include "library/TitleClipboard.h"

#include <QTest>

class tst_titleclipboard : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void emptyPastesNothing();
    void copySurvivesItsSource();
    void laterCopyTakesTheFirstOnesPlace();

private:
    LibraryFixture m_fixture;
    ArchiveController m_controller;
    TitleFileOperations m_files{m_controller};
};

void tst_titleclipboard::emptyPastesNothing()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("empty"));
    TitleClipboard clipboard;
    QVERIFY(clipboard.isEmpty());
    QVERIFY(!clipboard.paste(m_files, folder));
    const auto source = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("Text"));
    clipboard.copy(*source);
    QVERIFY(!clipboard.isEmpty());
    QVERIFY(!clipboard.paste(m_files, QString()));
    clipboard.clear();
    QVERIFY(clipboard.isEmpty());
    QVERIFY(!clipboard.paste(m_files, folder));
    QVERIFY(QDir(folder).entryList(QDir::Files).isEmpty());
}

void tst_titleclipboard::copySurvivesItsSource()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("copy"));
    const auto source = LibraryFixture::makeRecord(folder, QStringLiteral("s"), QStringLiteral("Copy me"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("other")});
    QVERIFY(m_controller.saveNewArchive(folder, source.get()));
    TitleClipboard clipboard;
    clipboard.copy(*source);
    QVERIFY(m_controller.deleteArchive(QString::fromStdString(source->getPath())));

    const auto first = clipboard.paste(m_files, folder);
    const auto second = clipboard.paste(m_files, folder);
    QVERIFY(first && second);
    QVERIFY(first->getPath() != second->getPath());
    for (const Archive* made : {first.get(), second.get()})
        QVERIFY(QFile::exists(QString::fromStdString(made->getPath())));
}

void tst_titleclipboard::laterCopyTakesTheFirstOnesPlace()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("later"));
    const auto first = LibraryFixture::makeRecord(folder, QStringLiteral("a"), QStringLiteral("First"));
    const auto second = LibraryFixture::makeRecord(folder, QStringLiteral("b"), QStringLiteral("Second"));
    TitleClipboard clipboard;
    clipboard.copy(*first);
    clipboard.copy(*second);
    const auto pasted = clipboard.paste(m_files, folder);
    QVERIFY(pasted);
    QFile file(QString::fromStdString(pasted->getPath()));
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray text = file.readAll();
    QVERIFY(text.contains("Second"));
    QVERIFY(!text.contains("First"));
}

QTEST_MAIN(tst_titleclipboard)
#include "tst_titleclipboard.moc"
