// The operator's templates in a random order of what the operator, the title list and the file manager do
// with them: after each step the grid, the choice, the order file and the folders on disk must be those of a
// plain list of names.
//
// TITLER_STEPS changes the length, TITLER_SEED the course.
#include "tests/library/ItemLooks.h"
#include "tests/library/TemplateFixture.h"

#include "library/TemplateItem.h"
#include "library/TemplatePicker.h"
#include "library/TemplateTab.h"
#include "tests/support/RandomSeed.h"
#include "touchui/KSPushbutton.h"

#include <QLabel>
#include <QLoggingCategory>
#include <QRandomGenerator>
#include <QTest>

namespace
{

const int DEFAULT_STEPS = 600;
const int COMFORTABLE_COUNT = 9; // around which the number of templates moves

} // namespace

class tst_templatepicker_steps : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void randomOrder();

private:
    void step();
    void save();
    void importNew();
    void importOverOne();
    void importOfOneThatWent();
    void renameOutside();
    void deleteOutside();
    void deleteByQuestion();
    void choose();
    void noticesOfNothing();
    void readAgain();

    QString verify() const;
    void startPicker();
    QString newName();
    QString randomName() { return mNames.at(random(int(mNames.size()))); }
    int random(int bound) { return int(mRandom.bounded(quint32(bound))); }
    QString folderOf(const QString& name) const { return mFixture.userRoot() + '/' + name; }
    // As it is told by others: the folder, with a slash or not, or a file in it.
    QString pathOf(const QString& name)
    {
        static const char* const ends[] = {"", "/", "/Titler.xml", "/Titler_240.png", "/Titler"};
        return folderOf(name) + QLatin1String(ends[random(5)]);
    }
    // Files get ages of their own: the order at a start is that of their times.
    void makeYoungest(const QString& name);
    void forget(const QString& name);
    TemplateTab* tab() const { return mPicker->userTab(); }

    TemplateFixture mFixture;
    FakeMessageBoxController mMessages;
    FakeTitleChangeReporter mReports;
    std::unique_ptr<TemplatePicker> mPicker;
    QRandomGenerator mRandom;
    QStringList mNames;
    QString mChosen;
    QString mLastChosen; // remembered over a start
    QString mDoing;
    int mMade = 0;
    int mAge = 0;
};

void tst_templatepicker_steps::initTestCase()
{
    QLoggingCategory::setFilterRules("*.debug=false");
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_templatepicker_steps::randomOrder()
{
    const int steps = runLength("TITLER_STEPS", DEFAULT_STEPS);
    const RandomSeed seed(20267);
    qInfo("seed %u", quint32(seed));
    mRandom.seed(seed);
    mFixture.resetTemplates();
    startPicker();
    QStringList log;
    for (int i = 1; i <= steps; ++i) {
        step();
        log.append(mDoing);
        const QString failure = verify();
        QVERIFY2(failure.isEmpty(),
                 qPrintable(QStringLiteral("seed %1, step %2: %3\n%4")
                                .arg(quint32(seed))
                                .arg(i)
                                .arg(failure, log.mid(qMax(0, int(log.size()) - 12)).join('\n'))));
    }
}

void tst_templatepicker_steps::step()
{
    using Action = void (tst_templatepicker_steps::*)();
    const int more = qMax(1, COMFORTABLE_COUNT - int(mNames.size()));
    const int fewer = mNames.isEmpty() ? 0 : qMax(1, int(mNames.size()) - COMFORTABLE_COUNT);
    const int some = mNames.isEmpty() ? 0 : 3;
    const QList<QPair<int, Action>> actions{{more, &tst_templatepicker_steps::save},
                                            {more, &tst_templatepicker_steps::importNew},
                                            {some, &tst_templatepicker_steps::importOverOne},
                                            {some, &tst_templatepicker_steps::renameOutside},
                                            {fewer, &tst_templatepicker_steps::importOfOneThatWent},
                                            {fewer, &tst_templatepicker_steps::deleteOutside},
                                            {2 * fewer, &tst_templatepicker_steps::deleteByQuestion},
                                            {3 * some, &tst_templatepicker_steps::choose},
                                            {1, &tst_templatepicker_steps::noticesOfNothing},
                                            {1, &tst_templatepicker_steps::readAgain}};
    int sum = 0;
    for (const auto& [weight, action] : actions)
        sum += weight;
    int drawn = random(sum);
    for (const auto& [weight, action] : actions) {
        drawn -= weight;
        if (drawn < 0) {
            (this->*action)();
            return;
        }
    }
}

void tst_templatepicker_steps::startPicker()
{
    mPicker.reset();
    UserTemplateManager::cleanUp();
    mPicker = std::make_unique<TemplatePicker>();
    mPicker->show(); // only then its parts have their places
    mPicker->showUserTemplateTab();
}

QString tst_templatepicker_steps::newName()
{
    static const char* const patterns[] = {"UserTemplate_%1", "片头 %1", "テロップ%1", "자막 & <%1>",
                                           "a.b %1"};
    return QString::fromUtf8(patterns[random(5)]).arg(++mMade, 3, 10, QLatin1Char('0'));
}

void tst_templatepicker_steps::makeYoungest(const QString& name)
{
    FileSyncQueue::flush(std::chrono::seconds(30));
    QFile file(mFixture.userTitle(name));
    if (!file.open(QIODevice::ReadWrite) ||
        !file.setFileTime(QDateTime::fromSecsSinceEpoch(5000 + ++mAge), QFile::FileModificationTime))
        qFatal("no title of %s", qPrintable(name));
}

void tst_templatepicker_steps::forget(const QString& name)
{
    mNames.removeAll(name);
    if (mChosen == name)
        mChosen.clear();
    if (mLastChosen == name)
        mLastChosen.clear();
}

void tst_templatepicker_steps::save()
{
    const QString name = newName();
    mDoing = "save " + name;
    mFixture.makeUserTemplate(name);
    makeYoungest(name);
    mPicker->slotSaveAsTemplate(name);
    mNames.append(name);
    mChosen = name;
    mLastChosen = name;
}

void tst_templatepicker_steps::importNew()
{
    const QString name = newName();
    mDoing = "import " + name;
    mFixture.makeUserPictures(name);
    mPicker->slotImportNewUserTemplate(random(2) == 0 ? name : pathOf(name));
    makeYoungest(name);
    mNames.append(name);
}

void tst_templatepicker_steps::importOverOne()
{
    const QString name = randomName();
    mDoing = "import over " + name;
    mPicker->slotImportNewUserTemplate(random(2) == 0 ? name : pathOf(name));
    makeYoungest(name);
    mNames.removeAll(name);
    mNames.append(name);
    if (mChosen == name)
        mChosen.clear(); // it is another template now
}

void tst_templatepicker_steps::importOfOneThatWent()
{
    const QString name = randomName();
    mDoing = "import of the missing " + name;
    QVERIFY(QDir(folderOf(name)).removeRecursively());
    mPicker->slotImportNewUserTemplate(random(2) == 0 ? name : pathOf(name));
    forget(name);
}

void tst_templatepicker_steps::renameOutside()
{
    const QString before = randomName();
    const QString after = newName();
    mDoing = "rename " + before + " to " + after;
    QVERIFY(QDir(mFixture.userRoot()).rename(before, after));
    mPicker->slotRenameUserTemplate(before, after, pathOf(after));
    mNames[mNames.indexOf(before)] = after;
    if (mLastChosen == before)
        mLastChosen = mChosen == before ? after : QString();
    if (mChosen == before)
        mChosen = after;
}

void tst_templatepicker_steps::deleteOutside()
{
    const QString name = randomName();
    mDoing = "delete outside " + name;
    QVERIFY(QDir(folderOf(name)).removeRecursively());
    mPicker->slotDeleteUserTemplate(pathOf(name));
    forget(name);
}

void tst_templatepicker_steps::deleteByQuestion()
{
    mDoing = "ask about " + mChosen;
    mPicker->deleteClicked2();
    const Reports asked = mMessages.take();
    QCOMPARE(asked, mChosen.isEmpty() ? Reports() : (Reports{{43, mChosen}}));
    const int kind = random(4);
    if (kind == 0) {
        mDoing += " and answer another question first";
        Q_EMIT mMessages.signalCloseMessage({1, MessageDefine::CLOSE_OK, 109});
    }
    if (kind == 1) {
        mDoing += " and keep it";
        Q_EMIT mMessages.signalCloseMessage({1, MessageDefine::CLOSE_CANCEL, 43});
        return;
    }
    Q_EMIT mMessages.signalCloseMessage({1, MessageDefine::CLOSE_OK, 43});
    if (!mChosen.isEmpty()) {
        QVERIFY(!QFileInfo::exists(folderOf(mChosen)));
        forget(QString(mChosen));
    }
}

void tst_templatepicker_steps::choose()
{
    const int id = random(int(mNames.size()));
    mDoing = "choose " + mNames.at(id);
    tab()->item(id)->clickTriggered();
    mChosen = mNames.at(id);
    mLastChosen = mChosen;
}

void tst_templatepicker_steps::noticesOfNothing()
{
    mDoing = "notices of what is not there";
    mPicker->slotDeleteUserTemplate(folderOf("nobody") + '/');
    mPicker->slotRenameUserTemplate("nobody", "somebody", folderOf("somebody") + '/');
    mPicker->slotImportNewUserTemplate("nobody");
    mPicker->slotDeleteUserTemplate(QString());
}

void tst_templatepicker_steps::readAgain()
{
    const bool isStart = random(2) == 0;
    mDoing = isStart ? "start" : "read again";
    if (isStart)
        startPicker();
    else
        mPicker->reloadTemplates2();
    mChosen = mLastChosen;
}

QString tst_templatepicker_steps::verify() const
{
    QStringList shown;
    for (int id = 0; id < tab()->count(); ++id) {
        shown.append(TemplateTab::templateName(*tab()->archive(id)));
        const TemplateItem* item = tab()->item(id);
        if (item->getIndex() != id || !item->isUser())
            return QStringLiteral("item %1 is another").arg(id);
        if (hasSelectedStyle(item) != (shown.constLast() == mChosen))
            return QStringLiteral("the frame of %1").arg(shown.constLast());
        if (QString::fromStdString(tab()->archive(id)->getPath()) != mFixture.userTitle(shown.constLast()))
            return QStringLiteral("the path of %1").arg(shown.constLast());
    }
    if (shown != mNames)
        return "shown are " + shown.join(", ") + " and not " + mNames.join(", ");
    if (mFixture.userOrder() != mNames)
        return "the order file has " + mFixture.userOrder().join(", ");
    QStringList folders = QDir(mFixture.userRoot()).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
    QStringList names = mNames;
    folders.sort();
    names.sort();
    if (folders != names)
        return "on disk are " + folders.join(", ");
    const Archive* chosen = tab()->selectedArchive();
    if ((chosen ? TemplateTab::templateName(*chosen) : QString()) != mChosen)
        return "chosen is another than " + mChosen;
    for (const char* button : {"selectUserButton", "deleteTemplateButton"})
        if (mPicker->findChild<KSPushbutton*>(button)->isEnabled() == mChosen.isEmpty())
            return QLatin1String(button) + QStringLiteral(" with the choice ") + mChosen;
    if (mPicker->findChild<QLabel*>("fileName")->text().isEmpty() != mChosen.isEmpty())
        return "the name beside the grid";
    return {};
}

QTEST_MAIN(tst_templatepicker_steps)
#include "tst_templatepicker_steps.moc"
