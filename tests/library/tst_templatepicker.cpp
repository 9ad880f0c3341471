// The template picker under a finger, on folders.
#include "ItemLooks.h"
#include "TemplateFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"
#include "tests/touchui/TouchFixture.h"

#include "library/ArchiveItem.h"
#include "library/TemplateItem.h"
#include "library/TemplatePicker.h"
#include "library/TemplateScrollArea.h"
#include "library/TemplateTab.h"
#include "library/TitlerTabWidget.h"
#include "library/UserTemplateMenu.h"
#include "touchui/KSPushbutton.h"

#include <QLabel>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTabBar>
#include <QTest>
#include <sys/fsuid.h>
#include <sys/stat.h>

class tst_templatepicker : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { Q_INIT_RESOURCE(TitlerToolResource); }

    void init()
    {
        m_fixture.resetTemplates();
        m_reports.take();
        m_messages.take();
    }

    void cleanup() { m_picker.reset(); }

    void reloadRules_data()
    {
        using namespace SystemSetupDef;
        QTest::addColumn<int>("language");
        QTest::addColumn<bool>("pin");
        QTest::addColumn<bool>("lastPin");
        QTest::addColumn<bool>("reloads");
        QTest::newRow("same, not pinned") << 1 << false << false << false;
        QTest::newRow("same, no longer pinned") << 1 << false << true << false;
        QTest::newRow("same, newly pinned") << 1 << true << false << true;
        QTest::newRow("same, still pinned") << 1 << true << true << false;
        QTest::newRow("other, not pinned") << 2 << false << false << true;
        QTest::newRow("other, no longer pinned") << 2 << false << true << true;
        QTest::newRow("other, newly pinned") << 2 << true << false << true;
        QTest::newRow("other, still pinned") << 2 << true << true << false;
    }

    void reloadRules()
    {
        QFETCH(int, language);
        QFETCH(bool, pin);
        QFETCH(bool, lastPin);
        QFETCH(bool, reloads);
        TemplateReloadRule rule(SystemSetupDef::emSystemLanguageEnglish, lastPin);
        const auto wanted = static_cast<SystemSetupDef::emSystemLanguageType>(language);
        QCOMPARE(rule.needsReload(wanted, pin), reloads);
        rule.reloaded(wanted, pin);
        QCOMPARE(rule.language(), wanted);
        QVERIFY(!rule.needsReload(wanted, pin));
    }

    void setsOfTheController()
    {
        m_fixture.makePresets("templates_en", {"lower"});
        m_fixture.makePresets("templates_chs", {"xia", "zhong"});
        TemplatePickerController controller;
        const auto count = [&](int language, bool pin) {
            const QVector<Archive*> templates =
                controller.getTemplates(static_cast<SystemSetupDef::emSystemLanguageType>(language), pin);
            qDeleteAll(templates);
            return templates.size();
        };
        QCOMPARE(count(0, false), 1);
        QCOMPARE(count(1, false), 1);
        QCOMPARE(count(2, false), 2);
        QCOMPARE(count(3, false), 1);
        QCOMPARE(count(1, true), 2);
    }

    void presetsFollowTheLanguage()
    {
        m_fixture.makePresets("templates_en", {"lower", "strap"});
        m_fixture.makePresets("templates_chs", {"xia"});
        open();
        QCOMPARE(names(presets()), QStringList({"lower", "strap"}));
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageEnglish);
        QCOMPARE(names(presets()), QStringList({"lower", "strap"}));
        tapItem(presets(), 1);
        // Setting the same language again does not read the templates again, so the selection is kept.
        TemplateItem* chosen = presets()->selectedItem();
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageEnglish);
        QCOMPARE(presets()->selectedItem(), chosen);
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageChinese);
        QCOMPARE(names(presets()), QStringList({"xia"}));
        QVERIFY(!presets()->selectedItem());
        QVERIFY(!button("selectPresetButton")->isEnabled());
        // Each set remembers its last selection.
        tapItem(presets(), 0);
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageEnglish);
        QCOMPARE(presets()->selectedItem(), presets()->item(1));
        QVERIFY(hasSelectedStyle(presets()->item(1)));
        QVERIFY(button("selectPresetButton")->isEnabled());
    }

    void presetsAreReadWhenTheyAreShown()
    {
        makePicker();
        m_fixture.makePresets("templates_en", {"lower"});
        m_fixture.makePresets("templates_chs", {"xia"});
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageChinese);
        m_fixture.makePresets("templates_chs", {"xin"});
        show();
        QCOMPARE(m_picker->findChildren<TemplateItem*>().size(), names(presets()).size());
        QVERIFY(names(presets()).contains("xin"));
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageEnglish); // at once while it is shown
        QCOMPARE(m_picker->findChildren<TemplateItem*>().size(), 1);
        m_picker->hide();
        m_fixture.makePresets("templates_en", {"strap"});
        show();
        QCOMPARE(names(presets()), QStringList{"lower"}); // read once for a language
    }

    void theModelOfTheApplianceChangesNoSet()
    {
        m_fixture.makePresets("templates_en", {"lower"});
        m_fixture.makePresets("templates_chs", {"xia"});
        open();
        m_picker->setModuleInfo(SystemSetupDef::emInformationModelChina);
        m_picker->reloadTemplates(SystemSetupDef::emSystemLanguageEnglish);
        QCOMPARE(names(presets()), QStringList{"lower"});
    }

    void noTemplates()
    {
        open();
        QCOMPARE(presets()->count(), 0);
        QCOMPARE(users()->count(), 0);
        QVERIFY(!button("selectPresetButton")->isEnabled());
        QVERIFY(!button("selectUserButton")->isEnabled());
        QVERIFY(!button("deleteTemplateButton")->isEnabled());
        QSignalSpy selected(m_picker.get(), &TemplatePicker::selectedTemplate);
        m_picker->selectClicked();
        m_picker->selectClicked2();
        m_picker->deleteClicked2();
        QVERIFY(selected.isEmpty());
        QVERIFY(m_messages.take().isEmpty());
        QVERIFY(m_picker->isVisible());
    }

    void placesInTheGrid()
    {
        m_fixture.makePresets("templates_en", {"a", "b", "c", "d", "e"});
        open();
        QCOMPARE(presets()->item(3)->pos(), QPoint(3 * 258, 0));
        QCOMPARE(presets()->item(4)->pos(), QPoint(0, 153));
        QCOMPARE(presets()->item(4)->size(), QSize(248, 143));
        QCOMPARE(presets()->scrollArea()->size(), QSize(1049, 595));
        // The fourth column is not under the scroll bar.
        m_fixture.makeUserTemplates(13);
        UserTemplateManager::cleanUp();
        m_picker->reloadTemplates2();
        m_picker->showUserTemplateTab();
        QTRY_VERIFY(users()->scrollArea()->verticalScrollBar()->isVisible());
        QVERIFY(users()->scrollArea()->viewport()->width() >= 4 * 248 + 3 * 10);
    }

    void textsStandInTheirBox()
    {
        m_fixture.makeUserTemplate("UserTemplate_001", {"Evening News"});
        openUserTab();
        QCOMPARE(preview()->size().width(), fileName()->width());
        QCOMPARE(preview()->x(), fileName()->x());
        const QWidget* tabs = users()->parentWidget()->parentWidget();
        const int right = preview()->mapTo(tabs, QPoint(preview()->width(), 0)).x();
        QVERIFY2(right <= TemplatePicker::TAB_AREA_WIDTH - 2 - 4, qPrintable(QString::number(right)));
        const QRect text = textArea(preview())->textRect(0);
        QVERIFY(text.left() >= 8);
        QVERIFY(text.right() <= preview()->width() - 8);
    }

    void cornersAreNotPartOfTheDialog()
    {
        open();
        QVERIFY(!m_picker->mask().isEmpty());
        QVERIFY(!m_picker->mask().contains(QPoint(0, 0)));
        QVERIFY(!m_picker->mask().contains(QPoint(m_picker->width() - 1, m_picker->height() - 1)));
        QVERIFY(m_picker->mask().contains(m_picker->rect().center()));
    }

    void aTapChoosesAndSelectTakes()
    {
        m_fixture.makePresets("templates_en", {"a", "b", "c"}, true);
        open();
        QVERIFY(!button("selectPresetButton")->isEnabled());
        QVERIFY(!button("selectUserButton")->isVisible());
        tapItem(presets(), 0);
        tapItem(presets(), 2);
        QVERIFY(!hasSelectedStyle(presets()->item(0)));
        QVERIFY(hasSelectedStyle(presets()->item(2)));
        QVERIFY(button("selectPresetButton")->isEnabled());

        m_picker->setSelectedItem(false);
        QStringList taken;
        connect(m_picker.get(), &TemplatePicker::selectedTemplate, this, [&](Archive* archive) {
            QVERIFY(m_picker->isSelectedItem());
            taken.append(QString::fromStdString(archive->getName()));
            QVERIFY(archive->isPreset());
        });
        tap(button("selectPresetButton"));
        QCOMPARE(taken, QStringList{"c"});
        QTRY_VERIFY(!m_picker->isVisible());
        QCOMPARE(m_picker->result(), int(QDialog::Accepted));

        // The selection is kept in this process and in the next one.
        QCOMPARE(presets()->selectedItem(), presets()->item(2));
        TemplateManager::cleanUp();
        open();
        QCOMPARE(presets()->selectedItem(), presets()->item(2));
        QVERIFY(button("selectPresetButton")->isEnabled());
    }

    void theMouseServesAsWell()
    {
        m_fixture.makePresets("templates_en", {"a", "b"});
        open();
        QTest::mouseClick(presets()->item(1), Qt::LeftButton);
        QCOMPARE(presets()->selectedItem(), presets()->item(1));
        QSignalSpy selected(m_picker.get(), &TemplatePicker::selectedTemplate);
        QTest::mouseClick(button("selectPresetButton"), Qt::LeftButton);
        QCOMPARE(selected.size(), 1);
        QVERIFY(!m_picker->isVisible());
    }

    void cancelTakesNothing()
    {
        m_fixture.makePresets("templates_en", {"a"});
        open();
        tapItem(presets(), 0);
        QSignalSpy selected(m_picker.get(), &TemplatePicker::selectedTemplate);
        tap(button("cancelTemplateButton"));
        QTRY_VERIFY(!m_picker->isVisible());
        QVERIFY(selected.isEmpty());
        QVERIFY(!m_picker->isSelectedItem());
        QCOMPARE(presets()->selectedItem(), presets()->item(0));
    }

    void aLastChoiceThatIsGone()
    {
        m_fixture.makePresets("templates_en", {"a", "b"});
        open();
        tapItem(presets(), 1);
        m_picker.reset();
        QVERIFY(QFile::remove(m_fixture.presetRoot() + "/templates_en/b.xml"));
        TemplateManager::cleanUp();
        open();
        QCOMPARE(names(presets()), QStringList{"a"});
        QVERIFY(!presets()->selectedItem());
        QVERIFY(!button("selectPresetButton")->isEnabled());
        TemplatePickerController controller;
        QVERIFY(controller.getLastSelectedTemplate().empty());
    }

    void userTabShowsNameAndTexts()
    {
        m_fixture.makeUserTemplate("first", {"one text"});
        m_fixture.makeUserTemplate("a name that is much too long for the place where it has to stand",
                                   {"Breaking", "快讯", "third"});
        open();
        tapTab(1);
        QVERIFY(button("selectUserButton")->isVisible());
        QVERIFY(!button("selectPresetButton")->isVisible());
        QCOMPARE(fileName()->text(), QString());
        tapItem(users(), 0);
        QCOMPARE(fileName()->text(), QString("first"));
        QCOMPARE(textLines(preview()).first(), QString("one text"));
        QVERIFY(button("deleteTemplateButton")->isEnabled());
        tapItem(users(), 1);
        QVERIFY(fileName()->text().startsWith("a name that"));
        QVERIFY(fileName()->text().endsWith(QChar(0x2026)));
        QVERIFY(QFontMetrics(fileName()->font()).horizontalAdvance(fileName()->text()) <=
                fileName()->width());
        QCOMPARE(textLines(preview()).mid(0, 3), QStringList({"Breaking", "快讯", "third"}));

        QSignalSpy selected(m_picker.get(), &TemplatePicker::selectedTemplate);
        tap(button("selectUserButton"));
        QCOMPARE(selected.size(), 1);
        QCOMPARE(selected[0][0].value<Archive*>(), users()->archive(1));
    }

    void theLastChoiceIsTold()
    {
        m_fixture.makeUserTemplate("UserTemplate_001", {"one", "two"});
        UserTemplatePickerController().saveSelectedTemplate(
            m_fixture.userTitle("UserTemplate_001").toStdString());
        openUserTab();
        QCOMPARE(users()->selectedItem(), users()->item(0));
        QCOMPARE(fileName()->text(), QString("UserTemplate_001"));
        QCOMPARE(textLines(preview()).mid(0, 2), QStringList({"one", "two"}));
        QVERIFY(button("deleteTemplateButton")->isEnabled());
    }

    void deleteAsksAndDeletes()
    {
        m_fixture.makeUserTemplates(5);
        openUserTab();
        tapItem(users(), 2);
        QSignalSpy closeKeyboard(m_picker.get(), &TemplatePicker::signalCloseSoftwareKeyBoardForFileManager);
        tap(button("deleteTemplateButton"));
        QCOMPARE(closeKeyboard.size(), 1);
        QCOMPARE(m_messages.take(), (Reports{{43, "UserTemplate_003"}}));
        answer(MessageDefine::CLOSE_CANCEL);
        QCOMPARE(users()->count(), 5);
        answer(MessageDefine::CLOSE_OK); // without a question
        QCOMPARE(users()->count(), 5);

        tap(button("deleteTemplateButton"));
        tap(button("deleteTemplateButton"));
        QCOMPARE(m_messages.take().size(), 2);
        answer(MessageDefine::CLOSE_OK, 117); // the answer to another message
        QCOMPARE(users()->count(), 5);
        answer(MessageDefine::CLOSE_OK);
        QCOMPARE(names(users()), QStringList({"UserTemplate_001", "UserTemplate_002", "UserTemplate_004",
                                              "UserTemplate_005"}));
        verifyDense();
        QVERIFY(!QFile::exists(m_fixture.userRoot() + "/UserTemplate_003"));
        QCOMPARE(m_fixture.userOrder(), names(users()));
        QCOMPARE(m_reports.take(), (Reports{{5, "Titler"}}));
        QVERIFY(!users()->selectedItem());
        QVERIFY(!button("selectUserButton")->isEnabled());
        QVERIFY(!button("deleteTemplateButton")->isEnabled());
        QCOMPARE(fileName()->text(), QString());
        QCOMPARE(textLines(preview()).first(), QString());
        answer(MessageDefine::CLOSE_OK);
        QCOMPARE(users()->count(), 4);
    }

    void anAnswerAfterAnotherChoice()
    {
        m_fixture.makeUserTemplates(3);
        openUserTab();
        tapItem(users(), 0);
        tap(button("deleteTemplateButton"));
        tapItem(users(), 1);
        answer(MessageDefine::CLOSE_OK);
        QCOMPARE(users()->count(), 3);
        // The template is deleted while the question is shown.
        tap(button("deleteTemplateButton"));
        m_picker->slotDeleteUserTemplate(m_fixture.userRoot() + "/UserTemplate_002/");
        answer(MessageDefine::CLOSE_OK);
        QCOMPARE(names(users()), QStringList({"UserTemplate_001", "UserTemplate_003"}));
    }

    void aTemplateThatCannotBeDeletedStays()
    {
        m_fixture.makeUserTemplates(2);
        openUserTab();
        tapItem(users(), 1);
        tap(button("deleteTemplateButton"));
        const QString folder = m_fixture.userRoot() + "/UserTemplate_002";
        const QString root = QDir::cleanPath(m_fixture.titleRoot() + "/../..");
        QCOMPARE(::chmod(qPrintable(root), 0755), 0);
        QCOMPARE(::chmod(qPrintable(folder), 0555), 0);
        const int user = ::setfsuid(65534);
        answer(MessageDefine::CLOSE_OK);
        ::setfsuid(static_cast<uid_t>(user));
        QCOMPARE(::chmod(qPrintable(folder), 0755), 0);
        QCOMPARE(users()->count(), 2);
        QVERIFY(users()->selectedItem());
        QVERIFY(QFile::exists(m_fixture.userTitle("UserTemplate_002")));
        QVERIFY(m_reports.take().isEmpty());
    }

    void savedAsTemplate()
    {
        m_fixture.makeUserTemplates(3);
        openUserTab();
        m_fixture.makeUserTemplate("UserTemplate_004", {"saved"});
        m_picker->slotSaveAsTemplate("UserTemplate_004");
        QCOMPARE(names(users()).last(), QString("UserTemplate_004"));
        QCOMPARE(users()->archive(3)->getOrder(), std::string("4"));
        QCOMPARE(m_fixture.userOrder().last(), QString("UserTemplate_004"));
        QCOMPARE(users()->item(3)->getIndex(), 3);
        // The new template is selected, whichever was selected before, and remembered.
        QCOMPARE(users()->selectedItem(), users()->item(3));
        QVERIFY(hasSelectedStyle(users()->item(3)));
        QVERIFY(button("selectUserButton")->isEnabled() && button("deleteTemplateButton")->isEnabled());
        QCOMPARE(textLines(preview()).first(), QString("saved"));
        QCOMPARE(fileName()->text(), QString("UserTemplate_004"));
        tapItem(users(), 1);
        m_fixture.makeUserTemplate("UserTemplate_005");
        m_picker->slotSaveAsTemplate("UserTemplate_005");
        QVERIFY(!hasSelectedStyle(users()->item(1)));
        QCOMPARE(users()->selectedItem(), users()->item(4));
        m_picker->reloadTemplates2();
        QCOMPARE(TemplateTab::templateName(*users()->selectedArchive()), QString("UserTemplate_005"));
    }

    void imports()
    {
        m_fixture.makeUserTemplates(4);
        openUserTab();
        m_fixture.makeUserPictures("新 import");
        m_picker->slotImportNewUserTemplate("新 import");
        QCOMPARE(names(users()).last(), QString("新 import"));
        QVERIFY(users()->archive(4)->text().empty());
        QVERIFY(QFile::exists(m_fixture.userTitle("新 import")));
        QCOMPARE(users()->item(4)->geometry().topLeft() - users()->item(0)->pos(), QPoint(0, 153));
        // An import under a name in use replaces the old template; the new one is the last.
        tapItem(users(), 1);
        m_fixture.makeUserPictures("UserTemplate_002");
        m_picker->slotImportNewUserTemplate(m_fixture.userRoot() + "/UserTemplate_002");
        QCOMPARE(names(users()), QStringList({"UserTemplate_001", "UserTemplate_003", "UserTemplate_004",
                                              "新 import", "UserTemplate_002"}));
        QCOMPARE(m_fixture.userOrder(), names(users()));
        QVERIFY(users()->archive(4)->text().empty());
        QVERIFY(!users()->selectedItem());
        QVERIFY(!button("deleteTemplateButton")->isEnabled());
        verifyDense();
        // These names cannot be imported.
        for (const char* name : {"gone", "", "..", "/"})
            m_picker->slotImportNewUserTemplate(name);
        QCOMPARE(users()->count(), 5);
        QCOMPARE(m_fixture.userOrder().size(), 5);
    }

    void renames()
    {
        m_fixture.makeUserTemplates(3);
        openUserTab();
        tapItem(users(), 1);
        QVERIFY(QDir(m_fixture.userRoot()).rename("UserTemplate_002", "片头"));
        m_picker->slotRenameUserTemplate("UserTemplate_002", "片头", m_fixture.userRoot() + "/片头/");
        QCOMPARE(names(users()), QStringList({"UserTemplate_001", "片头", "UserTemplate_003"}));
        QCOMPARE(fileName()->text(), QString("片头"));
        QCOMPARE(users()->archive(1)->getPath(), m_fixture.userTitle("片头").toStdString());
        QCOMPARE(users()->archive(1)->getName(), std::string("片头/Titler"));
        QCOMPARE(m_fixture.userOrder(), names(users()));
        UserTemplatePickerController controller;
        QCOMPARE(controller.getLastSelectedTemplate(), m_fixture.userTitle("片头").toStdString());
        // A template that is not selected is renamed; the notice has the path of its title file.
        QVERIFY(QDir(m_fixture.userRoot()).rename("UserTemplate_001", "x"));
        m_picker->slotRenameUserTemplate("UserTemplate_001", "x", m_fixture.userTitle("x"));
        QCOMPARE(users()->archive(0)->getPath(), m_fixture.userTitle("x").toStdString());
        QCOMPARE(fileName()->text(), QString("片头"));
        const QStringList before = m_fixture.userOrder();
        m_picker->slotRenameUserTemplate("unknown", "y", m_fixture.userRoot() + "/y/");
        QCOMPARE(names(users()), before);
        QCOMPARE(m_fixture.userOrder(), before);
    }

    void deletedOutside()
    {
        m_fixture.makeUserTemplates(5);
        openUserTab();
        tapItem(users(), 2);
        QVERIFY(QDir(m_fixture.userRoot() + "/UserTemplate_003").removeRecursively());
        m_picker->slotDeleteUserTemplate(m_fixture.userTitle("UserTemplate_003"));
        QCOMPARE(names(users()), QStringList({"UserTemplate_001", "UserTemplate_002", "UserTemplate_004",
                                              "UserTemplate_005"}));
        verifyDense();
        QVERIFY(!users()->selectedItem());
        QVERIFY(!button("selectUserButton")->isEnabled());
        QCOMPARE(fileName()->text(), QString());
        QCOMPARE(m_fixture.userOrder(), names(users()));
        m_picker->slotDeleteUserTemplate(m_fixture.userRoot() + "/unknown/");
        m_picker->slotDeleteUserTemplate("");
        QCOMPARE(users()->count(), 4);
        QVERIFY(m_reports.take().isEmpty());
        // Taps the template that took the place of the deleted one.
        tapItem(users(), 2);
        QCOMPARE(fileName()->text(), QString("UserTemplate_004"));
    }

    void deletedOutsideUnderTheFinger()
    {
        m_fixture.makeUserTemplates(3);
        openUserTab();
        const QPoint point = centre(users()->item(0));
        touch().press(0, point);
        m_picker->slotDeleteUserTemplate(m_fixture.userRoot() + "/UserTemplate_001/");
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        touch().release(0, point);
        QVERIFY(!users()->selectedItem());
        tapItem(users(), 1);
        QCOMPARE(fileName()->text(), QString("UserTemplate_003"));
    }

    void theLastTemplateIsShown_data()
    {
        QTest::addColumn<int>("count");
        QTest::newRow("one row") << 2;
        QTest::newRow("a full row more than fits") << 20;
        QTest::newRow("a new row") << 21;
        QTest::newRow("the second of a row") << 22;
    }

    void theLastTemplateIsShown()
    {
        QFETCH(int, count);
        m_fixture.makeUserTemplates(count - 1);
        makePicker();
        QScrollBar* bar = users()->scrollArea()->verticalScrollBar();
        // The first round runs while the picker is hidden, as when the list saves a template, the second one
        // while it is open.
        for (int round = 0; round < 2; ++round) {
            const QString name = QStringLiteral("saved %1").arg(round);
            m_fixture.makeUserTemplate(name);
            m_picker->slotSaveAsTemplate(name);
            m_picker->showUserTemplateTab();
            show();
            QVERIFY(users()->isVisible());
            TemplateItem* last = users()->item(users()->count() - 1);
            QTRY_VERIFY(!last->visibleRegion().isEmpty() &&
                        last->visibleRegion().boundingRect() == last->rect());
            QCOMPARE(bar->value(), bar->maximum());
        }
        // The picker scrolls once: later rows do not move the view.
        bar->setValue(0);
        m_fixture.makeUserTemplate("later 1");
        for (int i = 0; i < 4; ++i) {
            m_fixture.makeUserPictures(QStringLiteral("later %1").arg(i));
            m_picker->slotImportNewUserTemplate(QStringLiteral("later %1").arg(i));
        }
        QCoreApplication::processEvents();
        QCOMPARE(bar->value(), 0);
    }

    void aDragScrollsAndTapsNothing()
    {
        m_fixture.makeUserTemplates(40);
        openUserTab();
        QScrollBar* bar = users()->scrollArea()->verticalScrollBar();
        bar->setValue(0);
        const QPoint start = centre(users()->item(5));
        touch().press(0, start);
        touch().move(0, start - QPoint(0, 10));
        touch().move(0, start - QPoint(0, 130));
        QTRY_VERIFY(bar->value() >= 110);
        QTRY_VERIFY(users()->scrollArea()->isFlickEnd());
        touch().release(0, start - QPoint(0, 130));
        QVERIFY(!users()->selectedItem());
        tapItem(users(), 8);
        QCOMPARE(users()->selectedItem(), users()->item(8));
    }

    void damagedPictures_data()
    {
        QTest::addColumn<QString>("kind");
        for (const char* kind : {"none", "missing", "truncated", "no picture", "pipe", "too large", "wide"})
            QTest::newRow(kind) << kind;
    }

    void damagedPictures()
    {
        QFETCH(QString, kind);
        m_fixture.makePresets("templates_en", {"whole", "bad"});
        const QString path = m_fixture.presetRoot() + "/templates_en/bad_240.png";
        const QByteArray bytes = contents(path);
        QVERIFY(QFile::remove(path));
        if (kind == "none") {
            write(path, bytes);
            Archive archive;
            archive.setPath((m_fixture.presetRoot() + "/templates_en/bad.xml").toStdString());
            QCOMPARE(ArchiveManager().saveArchive(&archive), 1);
        } else if (kind == "truncated") {
            write(path, bytes.left(bytes.size() / 3));
        } else if (kind == "no picture") {
            write(path, "text");
        } else if (kind == "pipe") {
            QCOMPARE(::mkfifo(qPrintable(path), 0644), 0);
        } else if (kind == "too large") {
            QImage(20000, 1000, QImage::Format_Mono).save(path);
        } else if (kind == "wide") {
            QImage image(4000, 100, QImage::Format_RGB32);
            image.fill(Qt::red);
            QVERIFY(image.save(path));
        }
        open();
        QCOMPARE(presets()->count(), 2);
        const QColor whole = middle(presets()->item(0));
        QCOMPARE(whole, QColor(Qt::blue));
        const QColor bad = middle(presets()->item(1));
        if (kind == "wide")
            QCOMPARE(bad, QColor(Qt::red));
        else
            QVERIFY2(bad.saturation() < 10, qPrintable(bad.name()));
        tapItem(presets(), 1);
        QCOMPARE(presets()->selectedItem(), presets()->item(1));
    }

    void framesOfTheItems()
    {
        m_fixture.makePresets("templates_en", {"a", "b"});
        open();
        tapItem(presets(), 1);
        const QImage normal = presets()->item(0)->grab().toImage();
        const QImage chosen = presets()->item(1)->grab().toImage();
        const QColor frame(0, 129, 255);
        QCOMPARE(chosen.pixelColor(1, 70), frame);
        QCOMPARE(chosen.pixelColor(246, 70), frame);
        QVERIFY(normal.pixelColor(1, 70) != frame);
        QCOMPARE(chosen.pixelColor(124, 71), QColor(Qt::blue));
        QCOMPARE(normal.pixelColor(5, 70), QColor(Qt::blue));
    }

    void masks()
    {
        open();
        m_picker->showDialogMaskWidget(true);
        QWidget* mask = m_picker->childAt(100, 100);
        QVERIFY(mask);
        QCOMPARE(mask->geometry(), QRect(10, 6, 1371 - 19, 833 - 18));
        QVERIFY(!m_picker->testAttribute(Qt::WA_AcceptTouchEvents));
        m_picker->showMessageMaskWidget(true);
        m_picker->showMessageMaskWidget(false);
        QVERIFY(!m_picker->testAttribute(Qt::WA_AcceptTouchEvents));
        m_picker->showDialogMaskWidget(false);
        QVERIFY(m_picker->testAttribute(Qt::WA_AcceptTouchEvents));
        m_picker->showMessageMaskWidget(true);
        QVERIFY(!m_picker->testAttribute(Qt::WA_AcceptTouchEvents));
        m_picker->showMessageMaskWidget(false);
        QVERIFY(m_picker->testAttribute(Qt::WA_AcceptTouchEvents));
    }

    void menuOfAUserTemplate()
    {
        m_fixture.makeUserTemplates(1);
        m_fixture.makePresets("templates_en", {"a"});
        open();
        UserTemplateMenu menu;
        QStringList texts;
        QList<int> types;
        for (QAction* action : menu.actions()) {
            texts.append(action->text());
            types.append(qobject_cast<ArchiveAction*>(action)->getActionType());
        }
        QCOMPARE(texts, QStringList({"Create New", "Copy", "Paste", "Delete", "Add Template"}));
        QCOMPARE(types, QList<int>({0, 1, 2, 3, 5}));
        presets()->item(0)->showMenu();
        QVERIFY(!presets()->item(0)->findChild<UserTemplateMenu*>());
        users()->item(0)->showMenu();
        auto* shown = users()->item(0)->findChild<UserTemplateMenu*>();
        QVERIFY(shown && shown->isVisible());
        shown->close();
    }

    void aTemplateGoneFromUnderTheFinger_data()
    {
        QTest::addColumn<bool>("isReload");
        QTest::newRow("deleted elsewhere") << false;
        QTest::newRow("all are read again") << true;
    }

    void aTemplateGoneFromUnderTheFinger()
    {
        QFETCH(bool, isReload);
        const TouchFixture fingers;
        m_fixture.makeUserTemplates(3);
        openUserTab();
        const QPoint place = centre(users()->item(1));
        fingers.press(m_picker.get(), place);
        QVERIFY(fingers.isLocked());
        if (isReload)
            m_picker->reloadTemplates2();
        else
            m_picker->slotDeleteUserTemplate(m_fixture.userRoot() + "/UserTemplate_002/");
        QVERIFY(!fingers.isLocked());
        fingers.lift(m_picker.get(), place);
        QVERIFY(!users()->selectedItem());
        QCoreApplication::processEvents();
        fingers.tap(m_picker.get(), place);
        QCOMPARE(users()->selectedItem(), users()->item(1));
    }

    void manyTemplates()
    {
        m_fixture.makeUserTemplates(998);
        openUserTab();
        QCOMPARE(users()->count(), 998);
        m_picker->showUserTemplateTab();
        tapItem(users(), 997);
        QCOMPARE(fileName()->text(), QString("UserTemplate_998"));
        m_picker->slotDeleteUserTemplate(m_fixture.userRoot() + "/UserTemplate_001/");
        QCOMPARE(users()->item(0)->getIndex(), 0);
        QCOMPARE(users()->count(), 997);
        QCOMPARE(fileName()->text(), QString("UserTemplate_998"));
    }

private:
    void makePicker() { m_picker = std::make_unique<TemplatePicker>(); }

    void show()
    {
        m_picker->show();
        QVERIFY(QTest::qWaitForWindowExposed(m_picker.get(), PATIENCE_MS));
    }

    void open()
    {
        makePicker();
        show();
    }

    void openUserTab()
    {
        open();
        m_picker->showUserTemplateTab();
        QCoreApplication::processEvents();
    }

    TemplateTab* presets() const { return m_picker->presetTab(); }
    TemplateTab* users() const { return m_picker->userTab(); }
    KSPushbutton* button(const char* name) const { return m_picker->findChild<KSPushbutton*>(name); }
    QLabel* fileName() const { return m_picker->findChild<QLabel*>("fileName"); }
    ArchiveItem* preview() const { return m_picker->findChild<ArchiveItem*>(); }

    static QStringList names(TemplateTab* tab)
    {
        QStringList result;
        for (int i = 0; i < tab->count(); ++i)
            result.append(TemplateTab::templateName(*tab->archive(i)));
        return result;
    }

    QTest::QTouchEventWidgetSequence touch() { return QTest::touchEvent(m_picker.get(), m_device); }
    QPoint centre(QWidget* widget) const { return widget->mapTo(m_picker.get(), widget->rect().center()); }

    void tap(QWidget* widget)
    {
        QVERIFY(widget->isVisible());
        m_device.tap(m_picker.get(), centre(widget));
    }

    void tapItem(TemplateTab* tab, int index)
    {
        QCoreApplication::processEvents();
        tap(tab->item(index));
        QCOMPARE(tab->selectedItem(), tab->item(index));
    }

    void tapTab(int index)
    {
        auto* tabs = m_picker->findChild<TitlerTabWidget*>();
        QTest::mouseClick(tabs->tabBar(), Qt::LeftButton, Qt::NoModifier,
                          tabs->tabBar()->tabRect(index).center());
        QCOMPARE(tabs->currentIndex(), index);
    }

    void answer(MessageDefine::_emCloseType type, int id = 43)
    {
        Q_EMIT m_messages.signalCloseMessage({1, type, id});
    }

    void verifyDense()
    {
        QCoreApplication::processEvents();
        for (int i = 0; i < users()->count(); ++i) {
            QCOMPARE(users()->item(i)->getIndex(), i);
            QCOMPARE(users()->item(i)->pos(), QPoint(i % 4 * 258, i / 4 * 153));
        }
    }

    static QColor middle(TemplateItem* item)
    {
        return item->grab().toImage().pixelColor(item->rect().center());
    }

    static QByteArray contents(const QString& path)
    {
        QFile file(path);
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
    }

    static void write(const QString& path, const QByteArray& bytes)
    {
        QFile file(path);
        if (file.open(QIODevice::WriteOnly))
            file.write(bytes);
    }

    TemplateFixture m_fixture;
    FakeTitleChangeReporter m_reports;
    FakeMessageBoxController m_messages;
    TouchDevice m_device;
    std::unique_ptr<TemplatePicker> m_picker;
};

QTEST_MAIN(tst_templatepicker)
#include "tst_templatepicker.moc"
