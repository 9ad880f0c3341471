// The input context on an X server: keys that really come from one. Run under Xvfb.
#include "tests/fakes/FakeSoftKeyBoardController.h"
#include "tests/support/Patience.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSInputFocusManager.h"

#include <QApplication>
#include <QDeadlineTimer>
#include <QDialog>
#include <QFile>
#include <QLineEdit>
#include <QProcess>
#include <QPushButton>
#include <QTemporaryDir>
#include <QTest>
#include <QThread>
#include <QVBoxLayout>

#define XK_MISCELLANY
#define XK_XKB_KEYS
#include <X11/Xlib.h>
#include <X11/keysymdef.h>
#include <algorithm>
// Xlib's names that clash with Qt's.
#undef KeyPress
#undef KeyRelease
#undef FocusIn
#undef FocusOut
#undef None
#undef Bool
#undef Status
#undef CursorShape

using namespace SubCommonDefine;

namespace
{

// Gives letters that the keyboard lacks a key of their own. A tool that maps each of them for the moment of
// its key press may have taken it away again before the program has read the map.
bool addKeys(const QList<KeySym>& wanted)
{
    Display* display = XOpenDisplay(nullptr);
    if (display == nullptr)
        return false;
    int lowest = 0;
    int highest = 0;
    XDisplayKeycodes(display, &lowest, &highest);
    int perKey = 0;
    KeySym* map = XGetKeyboardMapping(display, static_cast<KeyCode>(lowest), highest - lowest + 1, &perKey);
    qsizetype next = 0;
    for (int code = highest; code >= lowest && next < wanted.size(); --code) {
        const KeySym* symbols = map + static_cast<qsizetype>(code - lowest) * perKey;
        if (std::all_of(symbols, symbols + perKey, [](KeySym symbol) { return symbol == 0; })) {
            KeySym symbol = wanted.at(next);
            XChangeKeyboardMapping(display, code, 1, &symbol, 1);
            ++next;
        }
    }
    XFree(map);
    XCloseDisplay(display);
    return next == wanted.size();
}

} // namespace

class tst_ksinputcontext_x11 : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void keysWorkWhileClosed();
    void eachKeyIsForwardedOnce();
    void keysWorkAgainWithoutTheService();
    void requestWithoutAFieldGivesBackTheFocus();
    void windowBehindADialogLeavesTheFocus();
    void deadWindowDoesNoHarm();

private:
    void press(const QStringList& arguments);

    KSAppEventFilter m_filter;
    FakeSoftKeyBoardController m_service;
    std::unique_ptr<QWidget> m_window;
    std::unique_ptr<QWidget> m_second;
    QLineEdit* m_edit = nullptr;
};

void tst_ksinputcontext_x11::initTestCase()
{
    QCOMPARE(QGuiApplication::platformName(), QStringLiteral("xcb"));
    constexpr KeySym UNICODE = 0x1000000;
    QList<KeySym> symbols{XK_dead_acute};
    for (const QChar letter : QStringLiteral("速報속보"))
        symbols.append(UNICODE + letter.unicode());
    QVERIFY(addKeys(symbols));
    qApp->setObjectName(QStringLiteral("Titler"));
    qApp->installEventFilter(&m_filter);
    QVERIFY(KSInputContext::instance() != nullptr);
    // The service sends a key back, which is how it reaches the field.
    m_service.onKey = [](const tagSoftKeyBoardKeyData& key) { KSInputContext::instance()->sendKey(key); };
    KSInputContext::instance()->setKeyBoardController(&m_service);
    m_window = std::make_unique<QWidget>();
    auto* layout = new QVBoxLayout(m_window.get());
    auto* button = new QPushButton(QStringLiteral("&a"));
    m_edit = new QLineEdit;
    layout->addWidget(button);
    layout->addWidget(m_edit);
    m_window->resize(300, 200);
    m_window->show(); // the window manager gives a new window the focus
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), 60000));
    m_edit->setFocus();
}

void tst_ksinputcontext_x11::cleanupTestCase()
{
    m_second.reset();
    m_window.reset();
    KSInputContext::instance()->setKeyBoardController(nullptr);
}

void tst_ksinputcontext_x11::press(const QStringList& arguments)
{
    // Letters that the keyboard lacks are mapped while they are typed, which only a running event loop
    // follows.
    QProcess tool;
    tool.start(QStringLiteral("xdotool"), arguments);
    QTRY_COMPARE(tool.state(), QProcess::NotRunning);
    QCOMPARE(tool.exitCode(), 0);
}

void tst_ksinputcontext_x11::keysWorkWhileClosed()
{
    press({QStringLiteral("key"), QStringLiteral("a"), QStringLiteral("b")});
    QTRY_COMPARE(m_edit->text(), QStringLiteral("ab"));
    // A dead key and a letter: the composition is not lost.
    press({QStringLiteral("key"), QStringLiteral("dead_acute"), QStringLiteral("e")});
    QTRY_COMPARE(m_edit->text(), QStringLiteral("abé"));
    QVERIFY(m_service.keys.isEmpty());
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
}

void tst_ksinputcontext_x11::eachKeyIsForwardedOnce()
{
    m_edit->clear();
    QTest::mouseClick(m_edit, Qt::LeftButton);
    QCOMPARE(m_service.shown.size(), 1);
    press({QStringLiteral("type"), QStringLiteral("速報 속보")});
    QTRY_COMPARE(m_edit->text(), QStringLiteral("速報 속보"));
    QString forwarded;
    for (const tagSoftKeyBoardKeyData& key : std::as_const(m_service.keys))
        forwarded += QString::fromStdWString(key.text);
    QCOMPARE(forwarded, QStringLiteral("速報 속보"));
    press({QStringLiteral("key"), QStringLiteral("BackSpace")});
    QTRY_COMPARE(m_edit->text(), QStringLiteral("速報 속"));
    QCOMPARE(m_service.shown.size(), 1);
}

void tst_ksinputcontext_x11::keysWorkAgainWithoutTheService()
{
    m_edit->clear();
    m_service.keys.clear();
    KSInputContext::instance()->setKeyBoardController(nullptr);
    press({QStringLiteral("key"), QStringLiteral("x"), QStringLiteral("y")});
    QTRY_COMPARE(m_edit->text(), QStringLiteral("xy"));
    QVERIFY(m_service.keys.isEmpty());
    KSInputContext::instance()->setKeyBoardController(&m_service);
}

void tst_ksinputcontext_x11::requestWithoutAFieldGivesBackTheFocus()
{
    m_second = std::make_unique<QWidget>();
    m_second->resize(100, 100);
    // Shown, not activated as well: the window manager would give it the focus twice, the second time perhaps
    // after the request below has given it back.
    m_second->show();
    QVERIFY(QTest::qWaitForWindowActive(m_second.get(), 60000));
    KSInputContext* context = KSInputContext::instance();
    context->setWindowID(m_window->winId());
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(!context->filterEvent(&request));
    QTRY_COMPARE(KSInputFocusManager::getInputFocusWindow(), static_cast<unsigned long>(m_window->winId()));
    // A field in the other window takes it there.
    QTRY_VERIFY(m_window->isActiveWindow());
    context->setFocusWidget(m_second.get());
    QTRY_COMPARE(KSInputFocusManager::getInputFocusWindow(), static_cast<unsigned long>(m_second->winId()));
}

// A window that hears late of its activation would take the keyboard from the dialog, the dialog from the
// window, and so on.
void tst_ksinputcontext_x11::windowBehindADialogLeavesTheFocus()
{
    QDialog dialog(m_window.get());
    dialog.setWindowModality(Qt::WindowModal);
    dialog.resize(100, 100);
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog, 60000));
    KSInputContext* context = KSInputContext::instance();
    const auto focus = [] { return KSInputFocusManager::getInputFocusWindow(); };
    QTRY_COMPARE(focus(), static_cast<unsigned long>(dialog.winId()));
    context->setFocusWidget(m_edit);
    QCOMPARE(focus(), static_cast<unsigned long>(dialog.winId()));
    dialog.hide();
    QTRY_VERIFY(focus() != static_cast<unsigned long>(dialog.winId()));
    context->setFocusWidget(m_edit);
    QTRY_COMPARE(focus(), static_cast<unsigned long>(m_window->winId()));
}

void tst_ksinputcontext_x11::deadWindowDoesNoHarm()
{
    const unsigned long before = KSInputFocusManager::getInputFocusWindow();
    KSInputFocusManager::setInputFocusWindow(0x7ffffff);
    QCOMPARE(KSInputFocusManager::getInputFocusWindow(), before);
}

int main(int argc, char** argv)
{
    // Qt asks what the window manager can do once, when it connects, and a window that is mapped while the
    // manager starts may never be taken over: the manager says that it has started by making a file.
    const QTemporaryDir folder;
    const QString started = folder.filePath(QStringLiteral("started"));
    QProcess windowManager;
    windowManager.start(QStringLiteral("openbox"),
                        {QStringLiteral("--sm-disable"), QStringLiteral("--startup"),
                         QStringLiteral("touch \"%1\"").arg(started)});
    for (const QDeadlineTimer limit(20000); !QFile::exists(started) && !limit.hasExpired();)
        QThread::msleep(10);
    KSInputContext::install();
    QApplication app(argc, argv);
    tst_ksinputcontext_x11 test;
    QTEST_SET_MAIN_SOURCE_PATH
    const int result = QTest::qExec(&test, argc, argv);
    windowManager.terminate();
    return windowManager.waitForFinished() ? result : EXIT_FAILURE;
}

#include "tst_ksinputcontext_x11.moc"
