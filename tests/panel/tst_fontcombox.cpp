// The font box: which families it offers, under which names, and what it makes of imported files.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "panel/FamilyToolBox.h"
#include "panel/FontCombox.h"
#include "panel/FontFamilyDelegate.h"
#include "touchui/CustomComboBoxView.h"

#include <QFontDatabase>
#include <QFontInfo>

#include <sys/stat.h>

class tst_fontcombox : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup();
    void displayNames();
    void offersTheAppliancesFamilies();
    void leavesOutWhatCannotBeResolved();
    void importedFamiliesAlone();
    void setFamilyIsSilent();
    void unknownFamilyShowsNone();
    void tapInTheListChooses();
    void refreshKeepsTheFamily();
    void importedFileJoinsTheList();
    void brokenFilesArePassedOver();
    void fontsOutsideAreNotImported();
    void removedFontLeavesTheList();
    void paintsTheDisplayName();
    void isFilledWhenItIsNeeded();

private:
    FontCombox* combo() const { return m_box->comboBox(); }
    QStringList rows() const
    {
        QStringList names;
        for (int i = 0; i < combo()->count(); ++i)
            names << combo()->itemText(i);
        return names;
    }

    std::unique_ptr<PanelEnvironment> m_environment;
    QString m_fonts;
    std::unique_ptr<QWidget> m_window;
    FamilyToolBox* m_box = nullptr;
};

void tst_fontcombox::initTestCase()
{
    m_environment = std::make_unique<PanelEnvironment>();
    // The environment variables that say where the data is, as for the provisioning program.
    m_fonts = QString::fromStdWString(IPathManagerEx::getInstance()->getFontsPath());
}

void tst_fontcombox::init()
{
    m_window = std::make_unique<QWidget>();
    m_window->resize(600, 900);
    m_box = new FamilyToolBox(m_window.get());
    m_box->move(20, 700);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
}

void tst_fontcombox::cleanup()
{
    m_window.reset();
}

void tst_fontcombox::displayNames()
{
    QCOMPARE(FontFamilyDelegate::changeFamilyName(QStringLiteral("KST")), QStringLiteral("KST Medium"));
    QCOMPARE(FontFamilyDelegate::changeFamilyName(QStringLiteral("IPAPMincho")), QStringLiteral("IPA P明朝"));
    QCOMPARE(FontFamilyDelegate::changeFamilyName(QStringLiteral("IPAGothic")),
             QStringLiteral("IPA ゴシック"));
    QCOMPARE(FontFamilyDelegate::changeFamilyName(QStringLiteral("DejaVu Sans")),
             QStringLiteral("DejaVu Sans"));
    QCOMPARE(FontFamilyDelegate::changeFamilyName(QString()), QString());
    QCOMPARE(FontFamilyDelegate::REPLACE_FAMILY_LIST.size(), size_t(9));
}

void tst_fontcombox::offersTheAppliancesFamilies()
{
    const QStringList names = rows();
    for (const char* family : {"KST", "KST Japanese Pro", "DFHeiW5-A", "YDGothic 100 Pro", "DejaVu Serif",
                               "URW Chancery L", "IPAPMincho", "Nimbus Mono L"})
        QVERIFY2(names.contains(QString::fromLatin1(family)), family);
    QVERIFY(!names.contains(QStringLiteral("Noto Color Emoji"))); // installed, but not offered
    QCOMPARE(names.size(), QSet<QString>(names.begin(), names.end()).size());
}

void tst_fontcombox::leavesOutWhatCannotBeResolved()
{
    // It is on the appliance's list, and no font of that name is installed.
    QVERIFY(!rows().contains(QStringLiteral("KST Japanese Pro Regular")));
    QCOMPARE(FontCombox::filterAvailableFamily(
                 {QStringLiteral("KST"), QStringLiteral("Nobody's Font"), QString()}),
             QStringList{QStringLiteral("KST")});
    QCOMPARE(combo()->filterAvailableForSY({QStringLiteral("KST"), QStringLiteral("Noto Color Emoji"),
                                            QStringLiteral("KST Japanese Pro Regular")}),
             (QStringList{QStringLiteral("KST"), QStringLiteral("KST Japanese Pro Regular")}));
}

void tst_fontcombox::importedFamiliesAlone()
{
    QSignalSpy changed(m_box, &FamilyToolBox::familyChange);
    m_box->modifyComboxItem(false);
    QCOMPARE(rows(), QStringList{QStringLiteral("DFHeiW5-A")});
    m_box->modifyComboxItem(true);
    QVERIFY(rows().size() > 10);
    QVERIFY(changed.isEmpty());
}

void tst_fontcombox::setFamilyIsSilent()
{
    QSignalSpy changed(m_box, &FamilyToolBox::familyChange);
    m_box->setFontFamily(QStringLiteral("DejaVu Serif"));
    QCOMPARE(m_box->getFontFamily(), QStringLiteral("DejaVu Serif"));
    QCOMPARE(combo()->previousFamily(), QStringLiteral("DejaVu Serif"));
    m_box->setFontFamily(QString());
    QVERIFY(changed.isEmpty());
}

void tst_fontcombox::unknownFamilyShowsNone()
{
    m_box->setFontFamily(QStringLiteral("KST"));
    for (const char* family : {"Nobody's Font", "", "kst"}) { // names are case sensitive
        m_box->setFontFamily(QString::fromLatin1(family));
        QCOMPARE(combo()->currentIndex(), -1);
        QCOMPARE(m_box->getFontFamily(), QString());
    }
}

void tst_fontcombox::tapInTheListChooses()
{
    QSignalSpy changed(m_box, &FamilyToolBox::familyChange);
    QSignalSpy shown(m_box, &FamilyToolBox::signalShowComboxList);
    QSignalSpy clear(m_box, &ToolBox::signalClearSizeBoxLineEditFocus);
    m_box->setFontFamily(QStringLiteral("KST"));
    m_environment->tap(combo());
    QTRY_VERIFY(combo()->view()->isVisible());
    QCOMPARE(clear, (QList<QVariantList>{{true}}));
    CustomComboBoxView* list = combo()->listView();
    const QModelIndex row = list->model()->index(combo()->findText(QStringLiteral("DejaVu Sans")), 0);
    list->scrollTo(row);
    m_environment->touch(list->viewport(), list->visualRect(row).center());
    QTRY_VERIFY(!combo()->view()->isVisible());
    QCOMPARE(changed, (QList<QVariantList>{{"DejaVu Sans", 0}}));
    QCOMPARE(shown, (QList<QVariantList>{{true}, {false}}));
}

void tst_fontcombox::refreshKeepsTheFamily()
{
    QSignalSpy changed(m_box, &FamilyToolBox::familyChange);
    m_box->setFontFamily(QStringLiteral("URW Gothic L"));
    m_box->modifyComboxItem(false);
    QCOMPARE(m_box->getFontFamily(), QString()); // not offered any more
    m_box->modifyComboxItem(true);
    QCOMPARE(m_box->getFontFamily(), QStringLiteral("URW Gothic L"));
    QVERIFY(changed.isEmpty());
}

void tst_fontcombox::importedFileJoinsTheList()
{
    QSignalSpy changed(m_box, &FamilyToolBox::familyChange);
    if (m_fonts.isEmpty())
        QFAIL("the test has no folder of imported fonts");
    const QString source = QStringLiteral(TITLER_IMPORTED_FONT);
    QVERIFY2(QFile::exists(source), "a font file that the font set does not show is needed");
    QVERIFY(QFile::copy(source, m_fonts + QStringLiteral("/imported.ttf")));
    QVERIFY(!rows().contains(QStringLiteral(TITLER_IMPORTED_FAMILY)));
    m_box->importFontFamilyNotify(QStringLiteral("imported.ttf"));
    QVERIFY(rows().contains(QStringLiteral(TITLER_IMPORTED_FAMILY)));
    m_box->importFontFamilyNotify(QStringLiteral("imported.ttf")); // imported again: listed once
    QCOMPARE(rows().count(QStringLiteral(TITLER_IMPORTED_FAMILY)), 1);
    m_box->modifyComboxItem(false);
    QCOMPARE(rows(), (QStringList{QStringLiteral("DFHeiW5-A"), QStringLiteral(TITLER_IMPORTED_FAMILY)}));
    QVERIFY(changed.isEmpty());
    // Another start finds it in the folder.
    FamilyToolBox later(nullptr);
    later.comboBox()->fill();
    QVERIFY(later.comboBox()->findText(QStringLiteral(TITLER_IMPORTED_FAMILY)) >= 0);
}

void tst_fontcombox::brokenFilesArePassedOver()
{
    const QStringList before = rows();
    QFile broken(m_fonts + QStringLiteral("/broken.ttf"));
    QVERIFY(broken.open(QIODevice::WriteOnly));
    broken.write(QByteArray(5000, '\xAB'));
    broken.close();
    QFile empty(m_fonts + QStringLiteral("/empty.otf"));
    QVERIFY(empty.open(QIODevice::WriteOnly));
    empty.close();
    QVERIFY(QDir(m_fonts).mkpath(QStringLiteral("folder.ttf")));
    const QString pipe = m_fonts + QStringLiteral("/pipe.ttf");
    QCOMPARE(::mkfifo(pipe.toLocal8Bit().constData(), 0600), 0);
    for (const char* file : {"broken.ttf", "empty.otf", "folder.ttf", "pipe.ttf", "missing.ttf", ""})
        m_box->importFontFamilyNotify(QString::fromLatin1(file));
    QCOMPARE(rows(), before);
    // A folder with such files does not prevent the start, either.
    FamilyToolBox later(nullptr);
    later.comboBox()->fill();
    QVERIFY(later.comboBox()->findText(QStringLiteral("KST")) >= 0);
    QVERIFY(QFile::remove(pipe) && broken.remove() && empty.remove());
}

void tst_fontcombox::fontsOutsideAreNotImported()
{
    combo()->addImportFontsToApplication(true, true, QString());
    const QString inside = m_fonts + QStringLiteral("/imported.ttf");
    const QString outside = QFileInfo(m_fonts).path() + QStringLiteral("/outside.ttf");
    const QString link = m_fonts + QStringLiteral("/link.ttf");
    QVERIFY(QFile::rename(inside, outside));
    combo()->addImportFontsToApplication(true, true, QString());
    QVERIFY(QFile::link(outside, link));
    for (const char* file : {"../outside.ttf", "link.ttf"})
        m_box->importFontFamilyNotify(QString::fromLatin1(file));
    QVERIFY(!rows().contains(QStringLiteral(TITLER_IMPORTED_FAMILY)));
    combo()->addImportFontsToApplication(true, true, QString()); // as at a start
    combo()->refreshFontListView(true);
    QVERIFY(!rows().contains(QStringLiteral(TITLER_IMPORTED_FAMILY)));
    QVERIFY(QFile::remove(link) && QFile::rename(outside, inside));
}

void tst_fontcombox::removedFontLeavesTheList()
{
    combo()->addImportFontsToApplication(true, true, QString());
    m_box->setFontFamily(QStringLiteral(TITLER_IMPORTED_FAMILY));
    QCOMPARE(m_box->getFontFamily(), QStringLiteral(TITLER_IMPORTED_FAMILY));
    QSignalSpy changed(m_box, &FamilyToolBox::familyChange);
    QVERIFY(QFile::remove(m_fonts + QStringLiteral("/imported.ttf")));
    combo()->blockSignals(true);
    combo()->addImportFontsToApplication(true, true, QString());
    combo()->blockSignals(false);
    QVERIFY(!rows().contains(QStringLiteral(TITLER_IMPORTED_FAMILY)));
    QCOMPARE(m_box->getFontFamily(), QString());
    QVERIFY(changed.isEmpty());
}

void tst_fontcombox::paintsTheDisplayName()
{
    m_box->setFontFamily(QStringLiteral("KST"));
    const QImage shortName = combo()->grab().toImage();
    m_box->setFontFamily(QStringLiteral("KST Japanese Pro"));
    const QImage longName = combo()->grab().toImage();
    const auto inkEnd = [](const QImage& image) {
        int end = 0;
        for (int x = 10; x < 184; ++x)
            for (int y = 12; y < 40; ++y)
                if (qGray(image.pixel(x, y)) > 150)
                    end = x;
        return end;
    };
    // The length of "KST Medium" is between that of "KST" and that of the display name of the other family.
    QVERIFY(inkEnd(shortName) > 80);
    QVERIFY(inkEnd(longName) > inkEnd(shortName));
}

void tst_fontcombox::isFilledWhenItIsNeeded()
{
    QWidget window;
    FamilyToolBox hidden(&window);
    const FontCombox* box = hidden.comboBox();
    QSignalSpy changed(&hidden, &FamilyToolBox::familyChange);
    QCOMPARE(box->count(), 0);
    hidden.setFontFamily(QStringLiteral("DejaVu Serif")); // asked for a family: filled while hidden
    QCOMPARE(hidden.getFontFamily(), QStringLiteral("DejaVu Serif"));
    QCOMPARE(box->count(), combo()->count());

    hidden.resetInitializeStyle(); // no family, and disabled
    hidden.modifyComboxItem(false);
    window.show();
    QVERIFY(box->count() > 1); // still what it was
    hidden.setWidgetEnabled();
    QCOMPARE(box->count(), 1);
    QCOMPARE(box->currentIndex(), -1);
    hidden.modifyComboxItem(true); // at once while it is shown and enabled
    QCOMPARE(box->count(), combo()->count());
    QCOMPARE(box->currentIndex(), -1);
    window.hide();
    hidden.modifyComboxItem(false);
    QVERIFY(box->count() > 1);
    window.show();
    QCOMPARE(box->count(), 1);
    QVERIFY(changed.isEmpty());
}

QTEST_MAIN(tst_fontcombox)
#include "tst_fontcombox.moc"
