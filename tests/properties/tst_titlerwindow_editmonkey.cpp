// Many touches anywhere on the canvas and the panel of the real window. TITLER_SEED repeats a run,
// TITLER_TOUCHES changes its length: a hundred thousand take some minutes.
#include "CanvasFingers.h"
#include "MonkeyGround.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/TitleParser.h"
#include "document/TitleParserUtility.h"
#include "tests/app/Siblings.h"
#include "tests/canvas/StyleProperties.h"
#include "tests/library/LibraryFixture.h"
#include "tests/support/Patience.h"
#include "tests/support/RandomSeed.h"
#include "tests/touchui/TouchDevice.h"

#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QProcess>
#include <QTemporaryDir>

using MonkeyGround::heldLocks;

namespace
{

#ifdef __SANITIZE_ADDRESS__
constexpr int DEFAULT_TOUCHES = 1000;
#else
constexpr int DEFAULT_TOUCHES = 10000;
#endif
constexpr int REPLAYED_TOUCHES = 2000;
constexpr int DEFAULT_SEED = 20231;
constexpr int TOUCHES_PER_LOOK = 1000;
constexpr int TOUCHES_PER_FRAME = 50;
constexpr int REPLAY_TIMEOUT = 60000;
// Set in a process that only runs the monkey and writes there what the title became.
constexpr char DIGEST_VARIABLE[] = "TITLER_MONKEY_DIGEST";

QString describe(const std::vector<TText*>& texts)
{
    QString description;
    for (const TText* text : texts)
        description += StyleProperties::describe(*text);
    return description;
}

// Returns the first lines that differ; empty if there are none.
QString difference(const QString& now, const QString& then)
{
    const QStringList a = now.split(QLatin1Char('\n'));
    const QStringList b = then.split(QLatin1Char('\n'));
    for (qsizetype i = 0; i < qMax(a.size(), b.size()); ++i) {
        if (a.value(i) != b.value(i))
            return QString("line %1 of %2, should be %3: '%4', should be '%5'")
                .arg(i)
                .arg(a.size())
                .arg(b.size())
                .arg(a.value(i), b.value(i));
    }
    return {};
}

// Places are written with six digits.
float asSaved(float place)
{
    return QString::fromStdString(TitleParserUtility::fromDouble(place)).toFloat();
}

QByteArray bytesOf(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

} // namespace

class tst_titlerwindow_editmonkey : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void manyTouches();
    void seedReplays();

private:
    QString writeFolder();
    CanvasScene* scene() const { return m_window->findChild<CanvasScene*>(); }
    void look(int touches) const;
    QString misplaced() const;
    QByteArray replay(const QString& name);

    LibraryFixture m_files; // titles are edited below their root only
    QTemporaryDir m_data;
    Siblings m_siblings;
    TitlerWindow* m_window = nullptr;
    TouchDevice m_device;
    int m_touches = 0;
};

void tst_titlerwindow_editmonkey::initTestCase()
{
    m_touches = runLength("TITLER_TOUCHES", DEFAULT_TOUCHES);
    qInfo("seed %u, %d touches", quint32(RandomSeed(DEFAULT_SEED)), m_touches);
    MonkeyGround::showErrorsOnly();
    QVERIFY(m_siblings.listenOnFreePorts());
    m_window = makeWaitingWindow();
}

void tst_titlerwindow_editmonkey::cleanupTestCase()
{
    MonkeyGround::Application::instance()->frozen = false;
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

QString tst_titlerwindow_editmonkey::writeFolder()
{
    const QString folder = m_files.makeFolder(QStringLiteral("monkey"));
    Archive archive;
    archive.setPath((folder + "/title.xml").toStdString());
    archive.setThumbnailBig("title_1920.png");
    archive.setThumbnailMiddle("title_960.png");
    archive.setThumbnailSmall("title_240.png");
    archive.setThumbnailBlack("title_240S.png");
    auto* first = new TText(makeRecord(QString::fromUtf8("First 快讯\nline 😀"), 1, "KST", 60));
    auto* second = new TText(makeRecord(QStringLiteral("Second"), 2, "KST", 96));
    second->setXValue(500.0F);
    second->setYValue(400.0F);
    second->setZValue(2.0F);
    archive.setText({first, second});
    TitleParser().writeOneTitle(&archive);

    QList<ArchiveOrder*> rows{new ArchiveOrder};
    rows.last()->setArchiveIndex(0);
    rows.last()->setArchivePath("title.xml");
    ArchiveController().saveArchiveListOrder(folder, rows);
    qDeleteAll(rows);
    return folder;
}

// Returns the texts that are not at the place in their record; empty if there are none.
QString tst_titlerwindow_editmonkey::misplaced() const
{
    QStringList wrong;
    for (const GraphicsText* text : scene()->getTextItemList()) {
        const TText& record = *text->getItemTText();
        const QPointF off = text->scenePos() - QPointF(record.getXValue(), record.getYValue());
        if (off.manhattanLength() > 0.01)
            wrong +=
                QString("text %1 is off by %2,%3").arg(record.getTextObjectID()).arg(off.x()).arg(off.y());
    }
    return wrong.join('\n');
}

// Checks what must be true at any moment.
void tst_titlerwindow_editmonkey::look(int touches) const
{
    const QList<GraphicsText*> texts = scene()->getTextItemList();
    QVERIFY2(texts.size() <= CanvasScene::MAX_TEXT_OBJECTS, qPrintable(QString::number(touches)));
    for (const GraphicsText* text : texts)
        QVERIFY2(inStep(*text), qPrintable(QString("out of step after %1 touches").arg(touches)));
    QVERIFY(m_window->isVisible());
}

void tst_titlerwindow_editmonkey::manyTouches()
{
    const QString folder = writeFolder();
    const QString path = folder + "/title.xml";
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, path.toStdWString()});
    QVERIFY(QTest::qWaitForWindowExposed(m_window, PATIENCE_MS));
    QCOMPARE(scene()->getTextItemList().size(), 2);
    MonkeyGround::Application::instance()->frozen = true;
    QElapsedTimer clock;
    clock.start();

    const RandomSeed seed(DEFAULT_SEED);
    CanvasFingers fingers(*m_window, m_device, seed);
    for (int steps = 1; fingers.touches() < m_touches; ++steps) {
        fingers.act();
        if (!fingers.isTouching()) {
            QVERIFY2(misplaced().isEmpty(),
                     qPrintable(misplaced() + "\n" + fingers.lastTouches().join('\n')));
            QVERIFY2(heldLocks().isEmpty(),
                     qPrintable(heldLocks() + "\n" + fingers.lastTouches().join('\n')));
        }
        if (steps % TOUCHES_PER_FRAME == 0)
            QCoreApplication::processEvents();
        if (steps % TOUCHES_PER_LOOK != 0)
            continue;
        look(fingers.touches());
        if (QTest::currentTestFailed())
            return;
        m_siblings.forget();
    }
    fingers.liftAll();
    MonkeyGround::Application::instance()->frozen = false;
    QCOMPARE(heldLocks(), QString());
    const qint64 touched = clock.elapsed();

    m_window->hideSoftWareWithDeleteEmptyItems();
    m_window->saveCurrentTitle();
    QTRY_VERIFY(m_window->dataSaveIsFinished());
    std::vector<TText*> shown;
    const QList<GraphicsText*> texts = scene()->getTextItemList();
    for (const GraphicsText* text : texts) {
        TText* record = text->getItemTText();
        record->setXValue(asSaved(record->getXValue()));
        record->setYValue(asSaved(record->getYValue()));
        shown.push_back(record);
    }
    Archive saved;
    QCOMPARE(TitleParser().readOneTitle(path.toStdString(), &saved), 1);
    QCOMPARE(difference(describe(saved.text()), describe(shown)), QString());
    if (const QString digest = qEnvironmentVariable(DIGEST_VARIABLE); !digest.isEmpty()) {
        QFile file(digest);
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(describe(shown).toUtf8());
    }
    // Writing the same title again gives the same file.
    const QByteArray written = bytesOf(path);
    QVERIFY(TitleParser().writeOneTitle(&saved));
    QCOMPARE(bytesOf(path), written);
    fprintf(stderr, "seed %u: %d touches in %lld ms, %d texts left\n", quint32(seed), fingers.touches(),
            touched, int(shown.size()));

    m_window->closeTitlerWindow();
    QVERIFY(!m_window->isVisible());
    m_window->showTitlerWindow({_titler_paramter::CREATE_OR_EDIT, path.toStdWString()});
    QCOMPARE(scene()->getTextItemList().size(), qsizetype(saved.text().size()));
    for (const GraphicsText* text : scene()->getTextItemList())
        QVERIFY(inStep(*text));
    m_window->closeTitlerWindow();
}

// A process of its own, since the panel remembers the last styles.
QByteArray tst_titlerwindow_editmonkey::replay(const QString& name)
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    QDir(m_data.path()).mkpath(name);
    environment.insert(QStringLiteral("XDG_DATA_HOME"), m_data.filePath(name));
    environment.insert(QStringLiteral("TITLER_SEED"), QString::number(quint32(RandomSeed(DEFAULT_SEED))));
    environment.insert(QStringLiteral("TITLER_TOUCHES"), QString::number(REPLAYED_TOUCHES));
    environment.insert(QString::fromLatin1(DIGEST_VARIABLE), m_data.filePath(name + ".txt"));
    process.setProcessEnvironment(environment);
    process.start(QCoreApplication::applicationFilePath(), {QStringLiteral("manyTouches")});
    if (!process.waitForFinished(REPLAY_TIMEOUT) || process.exitCode() != 0)
        return process.readAllStandardOutput();
    return bytesOf(m_data.filePath(name + ".txt"));
}

void tst_titlerwindow_editmonkey::seedReplays()
{
    const QByteArray first = replay(QStringLiteral("first"));
    QVERIFY2(first.startsWith("id"), first.constData());
    QCOMPARE(replay(QStringLiteral("second")), first);
}

int main(int argc, char** argv)
{
    return MonkeyGround::run<tst_titlerwindow_editmonkey>(argc, argv);
}

#include "tst_titlerwindow_editmonkey.moc"
