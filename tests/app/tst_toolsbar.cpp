// The row of buttons above the canvas: taps, looks, enabling and the Canvas menu.
#include "app/APPEventFilter.h"
#include "app/ToolsBar.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSPushbutton.h"

#include <QAction>
#include <QApplication>
#include <QFile>
#include <QImage>
#include <QLabel>
#include <QMenu>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>
#include <QTouchEvent>
#include <QTranslator>
#include <QUndoStack>
#include <QVBoxLayout>

namespace
{

class CountingCommand : public QUndoCommand
{
public:
    explicit CountingCommand(int* value) : m_value(value) {}
    void undo() override { --*m_value; }
    void redo() override { ++*m_value; }

private:
    int* m_value;
};

const char BRIGHT[] = "background-color:transparent; color:rgb(220, 220, 220); font:20px;";
const char GREY[] = "background-color:transparent; color:rgb(102, 102, 102); font:20px;";

} // namespace

class tst_toolsbar : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void layout();
    void tapsGiveTheirSignal_data();
    void tapsGiveTheirSignal();
    void undoLeavesEditingFirst();
    void undoFollowsTheStack();
    void resetShowsDisabledUntilTheNextChange();
    void deleteFollowsTheSelection();
    void newTextIsSwitchedOffAndOn();
    void folderStates();
    void safeAreaStaysSelected();
    void pressedLook();
    void menuOpensUnderTheButton();
    void menuReportsItsActions();
    void tappingCanvasAgainClosesTheMenu();
    void touchBesideTheMenuOnlyCloses();
    void fingerThatOpenedTheMenuIsLifted();
    void mouseBesideTheMenuOnlyCloses();
    void menuMarksTheItemUnderTheFinger();
    void disablingLetsGoOfTheTouch();
    void disablingAnotherButtonLeavesTheTouchAlone();
    void textsAreTranslated();

private:
    KSPushbutton* button(const char* name) const;
    QLabel* label(const char* name) const;
    QMenu* menu() const { return m_bar->findChild<QMenu*>(); }
    void openMenu();

    TouchDevice m_device;
    std::unique_ptr<QUndoStack> m_stack;
    std::unique_ptr<QWidget> m_window;
    ToolsBar* m_bar = nullptr;
    int m_value = 0;
};

void tst_toolsbar::initTestCase()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
    APPEventFilter::instance();
}

void tst_toolsbar::init()
{
    m_value = 0;
    m_stack = std::make_unique<QUndoStack>();
    m_window = std::make_unique<QWidget>();
    m_window->resize(1400, 500);
    m_bar = new ToolsBar(m_stack->createUndoAction(m_stack.get()), m_stack->createRedoAction(m_stack.get()),
                         m_window.get());
    m_bar->setGeometry(0, 8, 1363, 67);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
}

void tst_toolsbar::cleanup()
{
    m_window.reset();
    m_stack.reset();
    APPEventFilter::instance()->unlock();
}

KSPushbutton* tst_toolsbar::button(const char* name) const
{
    return m_bar->findChild<KSPushbutton*>(QLatin1String(name));
}

QLabel* tst_toolsbar::label(const char* name) const
{
    return button(name)->findChild<QLabel*>();
}

void tst_toolsbar::openMenu()
{
    QTest::mouseClick(button("Canvas"), Qt::LeftButton);
    QVERIFY(QTest::qWaitForWindowExposed(menu(), PATIENCE_MS));
}

void tst_toolsbar::layout()
{
    const char* names[] = {"Folder", "Text", "Delete", "Undo", "Redo", "SafeArea", "Canvas", "Close"};
    const char* texts[] = {"Folder", "New Text", "Delete", "Undo", "Redo", "Safe Area", "Canvas", "Close"};
    int x = 48;
    for (int i = 0; i < 8; ++i) {
        QCOMPARE(button(names[i])->geometry(), QRect(x, 0, 120, 67));
        QCOMPARE(label(names[i])->text(), QLatin1String(texts[i]));
        QCOMPARE(label(names[i])->y(), 40);
        QCOMPARE(label(names[i])->width(), 120);
        x += 120 + 46;
    }
    QCOMPARE(label("Canvas")->x(), -8);
    QCOMPARE(label("Close")->x(), 0);
    QVERIFY(x - 46 <= m_bar->width());
}

void tst_toolsbar::tapsGiveTheirSignal_data()
{
    QTest::addColumn<QByteArray>("name");
    QTest::addColumn<int>("which");
    QTest::newRow("folder") << QByteArray("Folder") << 0;
    QTest::newRow("new text") << QByteArray("Text") << 1;
    QTest::newRow("delete") << QByteArray("Delete") << 2;
    QTest::newRow("undo") << QByteArray("Undo") << 3;
    QTest::newRow("redo") << QByteArray("Redo") << 4;
    QTest::newRow("safe area") << QByteArray("SafeArea") << 5;
    QTest::newRow("close") << QByteArray("Close") << 6;
}

void tst_toolsbar::tapsGiveTheirSignal()
{
    QFETCH(QByteArray, name);
    QFETCH(int, which);
    using Signal = void (ToolsBar::*)();
    const Signal list[] = {&ToolsBar::folderButtonClick, &ToolsBar::newTextButtonClick,
                           &ToolsBar::deleteButtonClick, &ToolsBar::undoButtonClicked,
                           &ToolsBar::redoButtonClicked, &ToolsBar::SafeAreaButtonClicked,
                           &ToolsBar::closeButtonClick};
    std::vector<std::unique_ptr<QSignalSpy>> spies;
    for (const Signal signal : list)
        spies.push_back(std::make_unique<QSignalSpy>(m_bar, signal));
    m_stack->push(new CountingCommand(&m_value));
    m_stack->push(new CountingCommand(&m_value));
    m_stack->undo();
    m_bar->changeBtnStatus(true);
    KSPushbutton* tapped = button(name.constData());
    QVERIFY(tapped->isEnabled());
    QTest::touchEvent(tapped, m_device).press(0, QPoint(60, 30));
    QTest::touchEvent(tapped, m_device).release(0, QPoint(60, 30));
    QTest::mouseClick(tapped, Qt::LeftButton);
    for (int i = 0; i < 7; ++i) {
        QVERIFY(i == which ? spies[static_cast<size_t>(i)]->count() >= 1
                           : spies[static_cast<size_t>(i)]->count() == 0);
    }
}

void tst_toolsbar::undoLeavesEditingFirst()
{
    m_stack->push(new CountingCommand(&m_value));
    QCOMPARE(m_value, 1);
    QStringList order;
    connect(m_bar, &ToolsBar::undoButtonClicked, this,
            [&] { order.append(QStringLiteral("leave %1").arg(m_value)); });
    connect(m_bar, &ToolsBar::exeUndoAction, this,
            [&] { order.append(QStringLiteral("undone %1").arg(m_value)); });
    connect(m_bar, &ToolsBar::redoButtonClicked, this,
            [&] { order.append(QStringLiteral("leave %1").arg(m_value)); });
    connect(m_bar, &ToolsBar::exeRedoAction, this,
            [&] { order.append(QStringLiteral("redone %1").arg(m_value)); });
    QTest::mouseClick(button("Undo"), Qt::LeftButton);
    QTest::mouseClick(button("Redo"), Qt::LeftButton);
    QCOMPARE(order, (QStringList{QStringLiteral("leave 1"), QStringLiteral("undone 0"),
                                 QStringLiteral("leave 0"), QStringLiteral("redone 1")}));
}

void tst_toolsbar::undoFollowsTheStack()
{
    QVERIFY(!button("Undo")->isEnabled());
    QCOMPARE(label("Undo")->styleSheet(), QLatin1String(GREY));
    QCOMPARE(button("Undo")->buttonState(), KSPushbutton::ButtonDisabled);
    m_stack->push(new CountingCommand(&m_value));
    QVERIFY(button("Undo")->isEnabled());
    QVERIFY(!button("Redo")->isEnabled());
    QCOMPARE(label("Undo")->styleSheet(), QLatin1String(BRIGHT));
    m_stack->undo();
    QVERIFY(!button("Undo")->isEnabled());
    QVERIFY(button("Redo")->isEnabled());
}

void tst_toolsbar::resetShowsDisabledUntilTheNextChange()
{
    m_stack->push(new CountingCommand(&m_value));
    m_bar->changeBtnStatus(true);
    m_bar->resetToDefaultState();
    QVERIFY(!button("Undo")->isEnabled());
    QVERIFY(!button("Redo")->isEnabled());
    QVERIFY(!button("Delete")->isEnabled());
    m_stack->undo();
    QVERIFY(button("Redo")->isEnabled());
    m_stack->redo();
    QVERIFY(button("Undo")->isEnabled());
    QVERIFY(!button("Redo")->isEnabled());
}

void tst_toolsbar::deleteFollowsTheSelection()
{
    const QImage disabled = button("Delete")->grab().toImage();
    m_bar->changeBtnStatus(true);
    QVERIFY(button("Delete")->isEnabled());
    QVERIFY(button("Delete")->grab().toImage() != disabled);
    m_bar->changeBtnStatus(false);
    QVERIFY(!button("Delete")->isEnabled());
    QCOMPARE(button("Delete")->grab().toImage(), disabled);
}

void tst_toolsbar::newTextIsSwitchedOffAndOn()
{
    m_bar->slotDisableNewTextButton(true);
    QVERIFY(!button("Text")->isEnabled());
    QCOMPARE(button("Text")->buttonState(), KSPushbutton::ButtonDisabled);
    QCOMPARE(label("Text")->styleSheet(), QLatin1String(GREY));
    m_bar->slotDisableNewTextButton(false);
    QVERIFY(button("Text")->isEnabled());
    QCOMPARE(button("Text")->buttonState(), KSPushbutton::ButtonRest);
    QCOMPARE(label("Text")->styleSheet(), QLatin1String(BRIGHT));
    // An enabled button is left as it is.
    button("Text")->changeButtonState(KSPushbutton::ButtonPressed);
    m_bar->slotDisableNewTextButton(false);
    QCOMPARE(button("Text")->buttonState(), KSPushbutton::ButtonPressed);
    QTest::mouseClick(button("Text"), Qt::LeftButton);
    QVERIFY(button("Text")->isChecked());
    m_bar->setInsertUnchecked();
    QVERIFY(!button("Text")->isChecked());
}

void tst_toolsbar::folderStates()
{
    m_bar->setFolderButtonEnabled(false);
    QVERIFY(!button("Folder")->isEnabled());
    QSignalSpy clicked(m_bar, &ToolsBar::folderButtonClick);
    QTest::mouseClick(button("Folder"), Qt::LeftButton);
    QCOMPARE(clicked.count(), 0);
    m_bar->setFolderButtonEnabled(true);
    QVERIFY(button("Folder")->isEnabled());
    button("Folder")->changeButtonState(KSPushbutton::ButtonPressed);
    m_bar->setFolderButtonRest();
    QCOMPARE(button("Folder")->buttonState(), KSPushbutton::ButtonRest);
}

void tst_toolsbar::safeAreaStaysSelected()
{
    QSignalSpy draw(m_bar, &ToolsBar::SafeAreaButtonClickedForDrawRect);
    KSPushbutton* safeArea = button("SafeArea");
    QTest::mousePress(safeArea, Qt::LeftButton);
    QCOMPARE(safeArea->buttonState(), KSPushbutton::ButtonPressed);
    QTest::mouseRelease(safeArea, Qt::LeftButton);
    QCOMPARE(safeArea->buttonState(), KSPushbutton::ButtonSelectedRest);
    QCOMPARE(draw.constLast().at(0).toBool(), true);
    QTest::mousePress(safeArea, Qt::LeftButton);
    QCOMPARE(safeArea->buttonState(), KSPushbutton::ButtonSelectedPressed);
    QTest::mouseRelease(safeArea, Qt::LeftButton);
    QCOMPARE(safeArea->buttonState(), KSPushbutton::ButtonRest);
    QCOMPARE(draw.constLast().at(0).toBool(), false);
    QTest::mouseClick(safeArea, Qt::LeftButton);
    m_bar->resetToDefaultState();
    QCOMPARE(safeArea->buttonState(), KSPushbutton::ButtonRest);
    QCOMPARE(draw.count(), 4);
    QCOMPARE(draw.constLast().at(0).toBool(), false);
    m_bar->resetToDefaultState();
    QCOMPARE(draw.count(), 4);
}

void tst_toolsbar::pressedLook()
{
    m_bar->changeBtnStatus(true);
    m_stack->push(new CountingCommand(&m_value));
    m_stack->push(new CountingCommand(&m_value));
    m_stack->undo();
    for (const char* name : {"Folder", "Text", "Delete", "Undo", "Redo", "SafeArea", "Close"}) {
        const QImage rest = button(name)->grab().toImage();
        QTest::touchEvent(button(name), m_device).press(0, QPoint(60, 30));
        QCOMPARE(button(name)->buttonState(), KSPushbutton::ButtonPressed);
        QVERIFY(button(name)->grab().toImage() != rest);
        QTest::touchEvent(button(name), m_device).move(0, QPoint(60, -90));
        QTest::touchEvent(button(name), m_device).release(0, QPoint(60, -90));
        QCOMPARE(button(name)->buttonState(), KSPushbutton::ButtonRest);
    }
}

void tst_toolsbar::menuOpensUnderTheButton()
{
    QSignalSpy shown(m_bar, &ToolsBar::signalShowCanvasMenu);
    openMenu();
    QCOMPARE(menu()->size(), QSize(200, 210));
    QVERIFY(!menu()->mask().contains(QPoint(0, 0))); // black without a compositor
    QVERIFY(!menu()->mask().contains(QPoint(199, 209)));
    QVERIFY(menu()->mask().contains(QPoint(100, 100)));
    QCOMPARE(menu()->pos(), button("Canvas")->mapToGlobal(QPoint(-7, 67 - 9)));
    QCOMPARE(button("Canvas")->buttonState(), KSPushbutton::ButtonSelectedRest);
    QCOMPARE(shown.constLast().at(0).toBool(), true);
    m_bar->hideCanvasMenu();
    QVERIFY(!menu()->isVisible());
    QCOMPARE(button("Canvas")->buttonState(), KSPushbutton::ButtonRest);
    QCOMPARE(shown.constLast().at(0).toBool(), false);
    QCOMPARE(shown.count(), 2);
}

void tst_toolsbar::menuReportsItsActions()
{
    QSignalSpy clicked(m_bar, &ToolsBar::canvasButtonClicked);
    for (int i = 0; i < 3; ++i) {
        openMenu();
        QTest::mouseClick(menu(), Qt::LeftButton, Qt::NoModifier, QPoint(100, 11 + 64 * i + 30));
        QVERIFY(!menu()->isVisible());
        QCOMPARE(clicked.count(), i + 1);
        QCOMPARE(clicked.at(i).at(0).value<QAction*>()->data().toInt(), i);
    }
    // A click between the items chooses none, and the menu stays open.
    openMenu();
    QTest::mouseClick(menu(), Qt::LeftButton, Qt::NoModifier, QPoint(100, 11 + 62));
    QVERIFY(menu()->isVisible());
    QCOMPARE(clicked.count(), 3);
    m_bar->hideCanvasMenu();
}

void tst_toolsbar::tappingCanvasAgainClosesTheMenu()
{
    openMenu();
    // With the menu up, the window system hands it every press, also one on the button.
    KSPushbutton* canvas = button("Canvas");
    const QPoint onButton = canvas->mapTo(m_window.get(), QPoint(60, 20));
    QTest::mousePress(m_window->windowHandle(), Qt::LeftButton, Qt::NoModifier, onButton);
    QTest::mouseRelease(m_window->windowHandle(), Qt::LeftButton, Qt::NoModifier, onButton);
    QVERIFY(!menu()->isVisible());
    // A tap that reaches the button itself closes it too.
    openMenu();
    QTest::mouseClick(canvas, Qt::LeftButton);
    QVERIFY(!menu()->isVisible());
}

void tst_toolsbar::touchBesideTheMenuOnlyCloses()
{
    QSignalSpy closed(m_bar, &ToolsBar::closeButtonClick);
    KSPushbutton* close = button("Close");
    openMenu();
    const QPointF global = close->mapToGlobal(QPointF(60, 20));
    const auto send = [&](QEvent::Type type, QEventPoint::State state) {
        QTouchEvent event(type, m_device, Qt::NoModifier, {QEventPoint(0, state, global, global)});
        QCoreApplication::sendEvent(close, &event);
    };
    send(QEvent::TouchBegin, QEventPoint::Pressed);
    QVERIFY(!menu()->isVisible());
    QVERIFY(!close->isDown());
    send(QEvent::TouchUpdate, QEventPoint::Updated);
    send(QEvent::TouchEnd, QEventPoint::Released);
    QCOMPARE(closed.count(), 0);
    QTest::touchEvent(close, m_device).press(0, QPoint(60, 20));
    QTest::touchEvent(close, m_device).release(0, QPoint(60, 20));
    QCOMPARE(closed.count(), 1);
}

// The finger slides off the button, which opens the menu while the finger is still down.
void tst_toolsbar::fingerThatOpenedTheMenuIsLifted()
{
    KSPushbutton* canvas = button("Canvas");
    QTest::touchEvent(canvas, m_device).press(0, QPoint(60, 20));
    QVERIFY(!menu()->isVisible());
    QTest::touchEvent(canvas, m_device).move(0, QPoint(60, -200));
    QVERIFY(QTest::qWaitForWindowExposed(menu(), PATIENCE_MS));
    QVERIFY(APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH));
    QTest::touchEvent(canvas, m_device).release(0, QPoint(60, -200));
    QVERIFY(!APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH));
    QVERIFY(menu()->isVisible());
    QTest::touchEvent(canvas, m_device).press(0, QPoint(60, 20));
    QVERIFY(!menu()->isVisible());
    QTest::touchEvent(canvas, m_device).release(0, QPoint(60, 20));
    QVERIFY(!menu()->isVisible());
    QVERIFY(!APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH));
}

void tst_toolsbar::mouseBesideTheMenuOnlyCloses()
{
    QSignalSpy closed(m_bar, &ToolsBar::closeButtonClick);
    openMenu();
    QTest::mouseClick(button("Close"), Qt::LeftButton);
    QVERIFY(!menu()->isVisible());
    QCOMPARE(closed.count(), 0);
    QVERIFY(!button("Close")->isDown());
    QTest::mouseClick(button("Close"), Qt::LeftButton);
    QCOMPARE(closed.count(), 1);
}

void tst_toolsbar::menuMarksTheItemUnderTheFinger()
{
    openMenu();
    const QImage plain = menu()->grab().toImage();
    QTest::mousePress(menu(), Qt::LeftButton, Qt::NoModifier, QPoint(100, 30));
    const QImage first = menu()->grab().toImage();
    QVERIFY(first != plain);
    QTest::mouseMove(menu(), QPoint(100, 11 + 64 + 20));
    const QImage second = menu()->grab().toImage();
    QVERIFY(second != first);
    QVERIFY(second != plain);
    QEvent leave(QEvent::Leave);
    QCoreApplication::sendEvent(menu(), &leave);
    QCOMPARE(menu()->grab().toImage(), plain);
    m_bar->hideCanvasMenu();
}

// A step that a timer pushes clears the redo steps, also while a button is touched.
void tst_toolsbar::disablingAnotherButtonLeavesTheTouchAlone()
{
    QSignalSpy clicked(m_bar, &ToolsBar::folderButtonClick);
    m_bar->changeBtnStatus(true);
    QTest::touchEvent(button("Folder"), m_device).press(0, QPoint(60, 20));
    for (int i = 0; i < 2; ++i) { // also when it is disabled already
        m_bar->changeBtnStatus(false);
        QVERIFY(!button("Delete")->isEnabled());
        QVERIFY(APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH));
    }
    QTest::touchEvent(button("Folder"), m_device).release(0, QPoint(60, 20));
    QVERIFY(!APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH));
    QCOMPARE(clicked.count(), 1);
}

void tst_toolsbar::disablingLetsGoOfTheTouch()
{
    m_bar->changeBtnStatus(true);
    connect(button("Delete"), &QAbstractButton::pressed, m_bar, [this] { m_bar->changeBtnStatus(false); });
    QTest::touchEvent(button("Delete"), m_device).press(0, QPoint(60, 20));
    QVERIFY(!APPEventFilter::instance()->isLock(nullptr, LOCKMETHOD_TOUCH));
    QTest::touchEvent(button("Delete"), m_device).release(0, QPoint(60, 20));
    QSignalSpy clicked(m_bar, &ToolsBar::folderButtonClick);
    QTest::touchEvent(button("Folder"), m_device).press(0, QPoint(60, 20));
    QTest::touchEvent(button("Folder"), m_device).release(0, QPoint(60, 20));
    QCOMPARE(clicked.count(), 1);
}

void tst_toolsbar::textsAreTranslated()
{
    QTranslator translator;
    QVERIFY(translator.load(QStringLiteral(TITLER_TRANSLATION_DIR "/cn.qm")));
    QCoreApplication::installTranslator(&translator);
    m_bar->translateText();
    QCOMPARE(label("Text")->text(), QStringLiteral("新建文本"));
    QCOMPARE(menu()->actions().at(2)->text(), QStringLiteral("棋盘格"));
    for (const char* name : {"Folder", "Text", "Delete", "Undo", "Redo", "SafeArea", "Canvas", "Close"})
        QVERIFY(label(name)->text().at(0).unicode() > 0x2e80);
    QCOMPARE(QCoreApplication::translate("CanvasScene", "Title goes here"), QStringLiteral("在此输入标题"));
    QCOMPARE(QCoreApplication::translate("TitlerWindow", "Done"), QStringLiteral("完成"));
    QCoreApplication::removeTranslator(&translator);
    QVERIFY(translator.load(QStringLiteral(TITLER_TRANSLATION_DIR "/en.qm")));
    m_bar->translateText();
    QCOMPARE(label("Text")->text(), QStringLiteral("New Text"));
}

// The bar is made for a wide screen; the window system without a display has a small one unless told
// otherwise.
int main(int argc, char** argv)
{
    QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("screen.json"));
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) ||
        file.write(R"({"screens":[{"name":"desk","x":0,"y":0,"width":1920,"height":1080,)"
                   R"("logicalDpi":96,"logicalBaseDpi":96,"dpr":1}]})") < 0)
        return 1;
    file.close();
    qputenv("QT_QPA_PLATFORM", "offscreen:configfile=" + path.toLocal8Bit());
    QApplication app(argc, argv);
    tst_toolsbar test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_toolsbar.moc"
