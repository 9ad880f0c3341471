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
    QTemporaryDir m_prefix;
    Siblings m_siblings;
    std::unique_ptr<TitlerWindow> m_window;
};

void tst_windowlanguage::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    const QString folder = m_prefix.filePath("share/kestrel/translations/titler");
    QVERIFY(QDir().mkpath(folder));
    QVERIFY(QFile::copy(QStringLiteral(TITLER_TRANSLATION_DIR "/cn.qm"), folder + "/cn.qm"));
    qputenv("K2SYS_AC_PREFIX", m_prefix.path().toUtf8());
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    APPEventFilter::instance();
    m_window = std::make_unique<TitlerWindow>(true, nullptr);
    pMainWindow = m_window.get();
}

void tst_windowlanguage::cleanupTestCase()
{
    m_window.reset();
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_windowlanguage::missingTranslationLeavesTheLanguage()
{
    const auto shows = [this](const QString& text) {
        const QList<KSPushbutton*> buttons = m_window->findChildren<KSPushbutton*>();
        return std::any_of(buttons.cbegin(), buttons.cend(),
                           [&text](const KSPushbutton* b) { return b->text() == text; });
    };
    QVERIFY(shows("Move"));
    m_window->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageChinese);
    QVERIFY(shows("移动"));
    m_window->slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageEnglish);
    QVERIFY(shows("移动"));
    // What is translated later, too.
    m_window->editAndDoneButtonClicked();
    QVERIFY(shows("完成"));
    m_window->editAndDoneButtonClicked();
    QVERIFY(shows("移动"));
}

// Its frame is painted at a fixed place of the window.
void tst_windowlanguage::listKeepsItsPlace()
{
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
    const auto* list = m_window->findChild<ArchiveList*>();
    for (const auto language :
         {SystemSetupDef::emSystemLanguageEnglish, SystemSetupDef::emSystemLanguageChinese}) {
        m_window->slotSystemLanguageChanged(language);
        QCoreApplication::processEvents();
        QCOMPARE(QRect(list->mapTo(m_window.get(), QPoint(0, 0)), list->size()), QRect(14, 64, 549, 997));
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
