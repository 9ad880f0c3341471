// The language of the window with translations of which one is missing.
#include "app/APPEventFilter.h"
#include "app/TitlerWindow.h"
#include "library/ArchiveList.h"
#include "tests/app/Siblings.h"
#include "tests/support/Patience.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTest>

class tst_windowlanguage : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void missingTranslationLeavesTheLanguage();
    void listKeepsItsPlace();

private:
    QTemporaryDir mPrefix;
    Siblings mSiblings;
    std::unique_ptr<TitlerWindow> mWindow;
};

void tst_windowlanguage::initTestCase()
{
    QVERIFY(mSiblings.listenOnFreePorts());
    const QString folder = mPrefix.filePath("share/kestrel/translations/titler");
    QVERIFY(QDir().mkpath(folder));
    QVERIFY(QFile::copy(QStringLiteral(TITLER_TRANSLATION_DIR "/cn.qm"), folder + "/cn.qm"));
    qputenv("K2SYS_AC_PREFIX", mPrefix.path().toUtf8());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    APPEventFilter::instance();
    mWindow = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = mWindow.get();
}

void tst_windowlanguage::cleanupTestCase()
{
    mWindow.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_windowlanguage::missingTranslationLeavesTheLanguage()
{
    const auto shows = [this](const QString& text) {
        const QList<KSPushbutton*> buttons = mWindow->findChildren<KSPushbutton*>();
        return std::any_of(buttons.cbegin(), buttons.cend(),
                           [&text](const KSPushbutton* b) { return b->text() == text; });
    };
    QVERIFY(shows("Move"));
    mWindow->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageChinese);
    QVERIFY(shows("移动"));
    mWindow->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageEnglish);
    QVERIFY(shows("移动"));
    // What is translated later, too.
    mWindow->editAndDoneButtonClicked();
    QVERIFY(shows("完成"));
    mWindow->editAndDoneButtonClicked();
    QVERIFY(shows("移动"));
}

// Its frame is painted at a fixed place of the window.
void tst_windowlanguage::listKeepsItsPlace()
{
    mWindow->show();
    QVERIFY(QTest::qWaitForWindowExposed(mWindow.get(), PATIENCE_MS));
    const auto* list = mWindow->findChild<ArchiveList*>();
    for (const auto language :
         {SystemSetupDef::emSystemLanguageEnglish, SystemSetupDef::emSystemLanguageChinese}) {
        mWindow->slotSystemLanguageChanged(language);
        QCoreApplication::processEvents();
        QCOMPARE(QRect(list->mapTo(mWindow.get(), QPoint(0, 0)), list->size()), QRect(14, 64, 549, 997));
    }
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName("Titler");
    tst_windowlanguage test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_windowlanguage.moc"
