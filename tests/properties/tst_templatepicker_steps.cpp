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
    QString randomName() { return m_names.at(random(int(m_names.size()))); }
    int random(int bound) { return int(m_random.bounded(quint32(bound))); }
    QString folderOf(const QString& name) const { return m_fixture.userRoot() + '/' + name; }
    // Returns the path as other processes report it: the folder, with or without a slash, or a file in it.
    QString pathOf(const QString& name)
    {
        static const char* const ends[] = {"", "/", "/Titler.xml", "/Titler_240.png", "/Titler"};
        return folderOf(name) + QLatin1String(ends[random(5)]);
    }
    // Gives each file a time of its own, since the order at a start is that of the times.
    void makeYoungest(const QString& name);
    void forget(const QString& name);
    TemplateTab* tab() const { return m_picker->userTab(); }

    TemplateFixture m_fixture;
    FakeMessageBoxController m_messages;
    FakeTitleChangeReporter m_reports;
    std::unique_ptr<TemplatePicker> m_picker;
    QRandomGenerator m_random;
    QStringList m_names;
    QString m_chosen;
    QString m_lastChosen; // remembered over a start
    QString m_doing;
    int m_made = 0;
    int m_age = 0;
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
    m_random.seed(seed);
    m_fixture.resetTemplates();
    startPicker();
    QStringList log;
    for (int i = 1; i <= steps; ++i) {
        step();
        log.append(m_doing);
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
    const int more = qMax(1, COMFORTABLE_COUNT - int(m_names.size()));
    const int fewer = m_names.isEmpty() ? 0 : qMax(1, int(m_names.size()) - COMFORTABLE_COUNT);
    const int some = m_names.isEmpty() ? 0 : 3;
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
    m_picker.reset();
    UserTemplateManager::cleanUp();
    m_picker = std::make_unique<TemplatePicker>();
    m_picker->show(); // its parts are laid out only then
    m_picker->showUserTemplateTab();
}

QString tst_templatepicker_steps::newName()
{
    static const char* const patterns[] = {"UserTemplate_%1", "片头 %1", "テロップ%1", "자막 & <%1>",
                                           "a.b %1"};
    return QString::fromUtf8(patterns[random(5)]).arg(++m_made, 3, 10, QLatin1Char('0'));
}

void tst_templatepicker_steps::makeYoungest(const QString& name)
{
    FileSyncQueue::flush(std::chrono::seconds(30));
    QFile file(m_fixture.userTitle(name));
    if (!file.open(QIODevice::ReadWrite) ||
        !file.setFileTime(QDateTime::fromSecsSinceEpoch(5000 + ++m_age), QFile::FileModificationTime))
        qFatal("no title of %s", qPrintable(name));
}

void tst_templatepicker_steps::forget(const QString& name)
{
    m_names.removeAll(name);
    if (m_chosen == name)
        m_chosen.clear();
    if (m_lastChosen == name)
        m_lastChosen.clear();
}

void tst_templatepicker_steps::save()
{
    const QString name = newName();
    m_doing = "save " + name;
    m_fixture.makeUserTemplate(name);
    makeYoungest(name);
    m_picker->slotSaveAsTemplate(name);
    m_names.append(name);
    m_chosen = name;
    m_lastChosen = name;
}

void tst_templatepicker_steps::importNew()
{
    const QString name = newName();
    m_doing = "import " + name;
    m_fixture.makeUserPictures(name);
    m_picker->slotImportNewUserTemplate(random(2) == 0 ? name : pathOf(name));
    makeYoungest(name);
    m_names.append(name);
}

void tst_templatepicker_steps::importOverOne()
{
    const QString name = randomName();
    m_doing = "import over " + name;
    m_picker->slotImportNewUserTemplate(random(2) == 0 ? name : pathOf(name));
    makeYoungest(name);
    m_names.removeAll(name);
    m_names.append(name);
    if (m_chosen == name)
        m_chosen.clear(); // it is another template now
}

void tst_templatepicker_steps::importOfOneThatWent()
{
    const QString name = randomName();
    m_doing = "import of the missing " + name;
    QVERIFY(QDir(folderOf(name)).removeRecursively());
    m_picker->slotImportNewUserTemplate(random(2) == 0 ? name : pathOf(name));
    forget(name);
}

void tst_templatepicker_steps::renameOutside()
{
    const QString before = randomName();
    const QString after = newName();
    m_doing = "rename " + before + " to " + after;
    QVERIFY(QDir(m_fixture.userRoot()).rename(before, after));
    m_picker->slotRenameUserTemplate(before, after, pathOf(after));
    m_names[m_names.indexOf(before)] = after;
    if (m_lastChosen == before)
        m_lastChosen = m_chosen == before ? after : QString();
    if (m_chosen == before)
        m_chosen = after;
}

void tst_templatepicker_steps::deleteOutside()
{
    const QString name = randomName();
    m_doing = "delete outside " + name;
    QVERIFY(QDir(folderOf(name)).removeRecursively());
    m_picker->slotDeleteUserTemplate(pathOf(name));
    forget(name);
}

void tst_templatepicker_steps::deleteByQuestion()
{
    m_doing = "ask about " + m_chosen;
    m_picker->deleteClicked2();
    const Reports asked = m_messages.take();
    QCOMPARE(asked, m_chosen.isEmpty() ? Reports() : (Reports{{43, m_chosen}}));
    const int kind = random(4);
    if (kind == 0) {
        m_doing += " and answer another question first";
        Q_EMIT m_messages.signalCloseMessage({1, MessageDefine::CLOSE_OK, 109});
    }
    if (kind == 1) {
        m_doing += " and keep it";
        Q_EMIT m_messages.signalCloseMessage({1, MessageDefine::CLOSE_CANCEL, 43});
        return;
    }
    Q_EMIT m_messages.signalCloseMessage({1, MessageDefine::CLOSE_OK, 43});
    if (!m_chosen.isEmpty()) {
        QVERIFY(!QFileInfo::exists(folderOf(m_chosen)));
        forget(QString(m_chosen));
    }
}

void tst_templatepicker_steps::choose()
{
    const int id = random(int(m_names.size()));
    m_doing = "choose " + m_names.at(id);
    tab()->item(id)->clickTriggered();
    m_chosen = m_names.at(id);
    m_lastChosen = m_chosen;
}

void tst_templatepicker_steps::noticesOfNothing()
{
    m_doing = "notices of what is not there";
    m_picker->slotDeleteUserTemplate(folderOf("nobody") + '/');
    m_picker->slotRenameUserTemplate("nobody", "somebody", folderOf("somebody") + '/');
    m_picker->slotImportNewUserTemplate("nobody");
    m_picker->slotDeleteUserTemplate(QString());
}

void tst_templatepicker_steps::readAgain()
{
    const bool isStart = random(2) == 0;
    m_doing = isStart ? "start" : "read again";
    if (isStart)
        startPicker();
    else
        m_picker->reloadTemplates2();
    m_chosen = m_lastChosen;
}

QString tst_templatepicker_steps::verify() const
{
    QStringList shown;
    for (int id = 0; id < tab()->count(); ++id) {
        shown.append(TemplateTab::templateName(*tab()->archive(id)));
        const TemplateItem* item = tab()->item(id);
        if (item->getIndex() != id || !item->isUser())
            return QStringLiteral("item %1 is another").arg(id);
        if (hasSelectedStyle(item) != (shown.constLast() == m_chosen))
            return QStringLiteral("the frame of %1").arg(shown.constLast());
        if (QString::fromStdString(tab()->archive(id)->getPath()) != m_fixture.userTitle(shown.constLast()))
            return QStringLiteral("the path of %1").arg(shown.constLast());
    }
    if (shown != m_names)
        return "shown are " + shown.join(", ") + " and not " + m_names.join(", ");
    if (m_fixture.userOrder() != m_names)
        return "the order file has " + m_fixture.userOrder().join(", ");
    QStringList folders = QDir(m_fixture.userRoot()).entryList(QDir::Dirs | QDir::NoDotAndDotDot);
    QStringList names = m_names;
    folders.sort();
    names.sort();
    if (folders != names)
        return "on disk are " + folders.join(", ");
    const Archive* chosen = tab()->selectedArchive();
    if ((chosen ? TemplateTab::templateName(*chosen) : QString()) != m_chosen)
        return "chosen is another than " + m_chosen;
    for (const char* button : {"selectUserButton", "deleteTemplateButton"})
        if (m_picker->findChild<KSPushbutton*>(button)->isEnabled() == m_chosen.isEmpty())
            return QLatin1String(button) + QStringLiteral(" with the choice ") + m_chosen;
    if (m_picker->findChild<QLabel*>("fileName")->text().isEmpty() != m_chosen.isEmpty())
        return "the name beside the grid";
    return {};
}

QTEST_MAIN(tst_templatepicker_steps)
#include "tst_templatepicker_steps.moc"
