// The canvas is repainted for a cause, and never while nothing happens.
#include "CanvasFixture.h"
#include "tests/support/Patience.h"

#include <QAbstractEventDispatcher>
#include <QPaintEvent>
#include <QRegion>
#include <QScreen>
#include <QTimerEvent>
#include <functional>

namespace
{

// More than an operator's minute of a blinking caret.
constexpr int ROUNDS = 200;

class PaintCounter : public QObject
{
public:
    bool eventFilter(QObject*, QEvent* event) override
    {
        if (event->type() == QEvent::Paint) {
            ++paints;
            region += static_cast<QPaintEvent*>(event)->region();
        }
        return false;
    }
    int paints = 0;
    QRegion region; // of all paints
};

// Time passes: every timer below the object fires. Returns how many did.
int fireTimers(QObject* object)
{
    int fired = 0;
    const auto timers = QAbstractEventDispatcher::instance()->registeredTimers(object);
    for (const auto& timer : timers) {
        QTimerEvent event(timer.timerId);
        QCoreApplication::sendEvent(object, &event);
        ++fired;
    }
    const QObjectList children = object->children();
    for (QObject* child : children)
        fired += fireTimers(child);
    return fired;
}

} // namespace

class tst_canvasscene_repaint : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void idle_data();
    void idle();
    void causes_data();
    void causes();
    void movedShadow_data();
    void movedShadow();
    void keptPictureFollowsTheText();
    void keysPaintWhatChanges_data();
    void keysPaintWhatChanges();
    void aKeyPaintsItsParagraph();

private:
    // Returns what is on the screen, without painting anything.
    QImage onScreen() const { return m_canvas->view.screen()->grabWindow(m_canvas->view.winId()).toImage(); }
    void openLines(const QStringList& lines, int align, bool outlined);
    void bring(const QString& state);
    // Paints everything that is due.
    void settle();
    int paintsOf(const std::function<void()>& action);

    std::unique_ptr<Canvas> m_canvas;
    PaintCounter m_counter;
};

void tst_canvasscene_repaint::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_canvasscene_repaint::init()
{
    messages = new FakeMessageBoxController;
    m_canvas = std::make_unique<Canvas>();
    m_canvas->show();
    TText record = makeRecord(QStringLiteral("Some words"), 1, "KST", 60);
    record.setShadowStyle(1);
    record.getTextShadow()->setShadowDirectionX(1);
    record.getTextShadow()->setShadowDirectionY(1);
    m_canvas->open({record});
    m_canvas->view.viewport()->installEventFilter(&m_counter);
}

void tst_canvasscene_repaint::cleanup()
{
    m_canvas.reset();
    delete messages;
    messages = nullptr;
}

void tst_canvasscene_repaint::settle()
{
    // An update may wait for the next round of the event loop, and its paint for the one after.
    for (int i = 0; i < 5; ++i) {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
    }
    m_counter.paints = 0;
}

int tst_canvasscene_repaint::paintsOf(const std::function<void()>& action)
{
    settle();
    action();
    for (int i = 0; i < 5; ++i) {
        QCoreApplication::sendPostedEvents();
        QCoreApplication::processEvents();
    }
    return m_counter.paints;
}

void tst_canvasscene_repaint::bring(const QString& state)
{
    GraphicsText* text = m_canvas->text(1);
    if (state == QLatin1String("selected")) {
        text->changeItemToSolidLineState();
    } else if (state != QLatin1String("none")) {
        text->initNewTextSelectAll();
        QTRY_VERIFY(text->hasFocus());
    }
    if (state == QLatin1String("whole text"))
        text->getSelectionInfo(0, 0, 0, 2);
    else if (state == QLatin1String("handles"))
        text->getSelectionInfo(2, 5, 5, 1);
}

void tst_canvasscene_repaint::idle_data()
{
    QTest::addColumn<QString>("state");
    QTest::addColumn<bool>("timers");
    QTest::newRow("not selected") << "none" << false;
    QTest::newRow("selected") << "selected" << false;
    QTest::newRow("edited") << "caret" << true;
    QTest::newRow("whole text selected") << "whole text" << true;
    QTest::newRow("handles shown") << "handles" << true;
}

void tst_canvasscene_repaint::idle()
{
    QFETCH(QString, state);
    QFETCH(bool, timers);
    bring(state);
    int fired = 0;
    const int paints = paintsOf([&] {
        for (int i = 0; i < ROUNDS; ++i) {
            fired += fireTimers(m_canvas->text(1));
            QCoreApplication::sendPostedEvents();
        }
    });
    QCOMPARE(paints, 0);
    // The document's own caret blinks all the while.
    QCOMPARE(fired > 0, timers);
}

void tst_canvasscene_repaint::causes_data()
{
    QTest::addColumn<QString>("state");
    QTest::addColumn<std::function<void(Canvas&)>>("action");
    using Action = std::function<void(Canvas&)>;
    QTest::newRow("a key") << "caret" << Action([](Canvas& c) { QTest::keyClick(&c.view, Qt::Key_A); });
    QTest::newRow("a cursor key") << "caret"
                                  << Action([](Canvas& c) { QTest::keyClick(&c.view, Qt::Key_Right); });
    QTest::newRow("the keyboard's cursor")
        << "caret" << Action([](Canvas& c) { c.text(1)->getSelectionInfo(0, 0, 3, 0); });
    QTest::newRow("the keyboard's selection")
        << "caret" << Action([](Canvas& c) { c.text(1)->getSelectionInfo(1, 4, 4, 1); });
    QTest::newRow("a style") << "handles" << Action([](Canvas& c) {
        TextStyle style = makeStyle("");
        style.setFontColor("#00AA00");
        TText source = makeSource(style, 3);
        c.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertyColor, 1);
    });
    QTest::newRow("a shadow") << "selected" << Action([](Canvas& c) {
        TText source = makeSource(makeStyle(""), 10);
        source.setShadowStyle(2);
        source.getTextShadow()->setShadowDirectionX(-1);
        c.scene->slotChangeObjectTextStyle(&source, TextObjectConstants::PropertyShadow, 1);
    });
    QTest::newRow("a tap") << "none" << Action([](Canvas& c) { c.tap(c.pointOn(1)); });
    QTest::newRow("leaving") << "caret" << Action([](Canvas& c) { c.tap(EmptyPlace); });
}

// Each is painted, in one go, and then there is quiet again.
void tst_canvasscene_repaint::causes()
{
    QFETCH(QString, state);
    QFETCH(std::function<void(Canvas&)>, action);
    bring(state);
    const int paints = paintsOf([&] { action(*m_canvas); });
    QVERIFY2(paints >= 1 && paints <= 2, qPrintable(QString::number(paints)));
    QCOMPARE(paintsOf([&] { fireTimers(m_canvas->text(1)); }), 0);
}

void tst_canvasscene_repaint::movedShadow_data()
{
    QTest::addColumn<QPointF>("place");
    QTest::addColumn<QPointF>("step");
    QTest::newRow("whole pixels") << QPointF(300.0, 200.0) << QPointF(37.0, -12.0);
    QTest::newRow("between pixels") << QPointF(300.4, 200.7) << QPointF(-6.0, 6.0);
    QTest::newRow("to another fraction") << QPointF(300.0, 200.0) << QPointF(3.5, 0.25);
    QTest::newRow("over the edge") << QPointF(10.0, 200.0) << QPointF(-120.0, 0.0);
    QTest::newRow("from over the edge") << QPointF(-100.0, -30.0) << QPointF(150.0, 60.0);
}

// An object that was moved looks as one that was always there.
void tst_canvasscene_repaint::movedShadow()
{
    QFETCH(QPointF, place);
    QFETCH(QPointF, step);
    GraphicsText* text = m_canvas->text(1);
    text->parentTextItem()->setPos(place);
    const QImage before = m_canvas->view.grab().toImage();
    text->parentTextItem()->setPos(place + step);
    const QImage moved = m_canvas->view.grab().toImage();
    text->setRadio(text->canvasRatio(), false); // forgets what is kept of the picture
    QCOMPARE(moved, m_canvas->view.grab().toImage());
    QVERIFY(moved != before);
}

void tst_canvasscene_repaint::keptPictureFollowsTheText()
{
    GraphicsText* text = m_canvas->text(1);
    const auto grab = [this] { return m_canvas->view.grab().toImage(); };
    const auto change = [this, text](int id, const TText& source) {
        TText copy = source;
        text->changeItemToSolidLineState();
        m_canvas->scene->slotChangeObjectTextStyle(&copy, id, 1);
        m_canvas->scene->clearItemsSelectionMode();
    };
    QImage last = grab();
    TText source = makeSource(makeStyle("", "KST", 60), 10);
    for (TextStyle* style : source.textItems())
        style->setFontColor("#00AA00");
    change(TextObjectConstants::PropertyColor, source);
    QVERIFY(grab() != last);
    last = grab();
    source.setShadowStyle(2);
    source.getTextShadow()->setShadowDirectionX(-1);
    source.getTextShadow()->setShadowDirectionY(-1);
    change(TextObjectConstants::PropertyShadow, source);
    QVERIFY(grab() != last);
    last = grab();
    m_canvas->stack.undo();
    m_canvas->scene->clearItemsSelectionMode();
    QVERIFY(grab() != last);
    m_canvas->stack.redo();
    m_canvas->scene->clearItemsSelectionMode();
    QCOMPARE(grab(), last);
    // The caret is drawn with the text, and has a shadow too.
    text->initNewTextSelectAll();
    const QImage edited = grab();
    text->getSelectionInfo(0, 0, 4, 0);
    QVERIFY(grab() != edited);
    m_canvas->scene->clearItemsSelectionAndFocus();
    QCOMPARE(grab(), last);
}

void tst_canvasscene_repaint::openLines(const QStringList& lines, int align, bool outlined)
{
    TText record = makeRecord(lines.join(QLatin1Char('\n')), 1, "KST", 60);
    record.setTextAlign(align);
    TEdge edge;
    edge.setEdgeWidth(12);
    edge.setEdgeColor("#00AAFF");
    for (TextStyle* style : record.textItems()) {
        style->setIsTextEdge(outlined ? 1 : 0);
        style->setTextEdge(edge);
    }
    m_canvas->open({record});
}

void tst_canvasscene_repaint::keysPaintWhatChanges_data()
{
    QTest::addColumn<int>("align");
    QTest::addColumn<bool>("outlined");
    for (const int align : {0, 1, 2}) {
        QTest::addRow("align %d", align) << align << false;
        QTest::addRow("align %d, outlined", align) << align << true;
    }
}

// After each key the screen shows what it shows when everything is painted anew.
void tst_canvasscene_repaint::keysPaintWhatChanges()
{
    QFETCH(int, align);
    QFETCH(bool, outlined);
    openLines({QStringLiteral("top"), QStringLiteral("the longest line"), QStringLiteral("a j")}, align,
              outlined);
    GraphicsText* text = m_canvas->text(1);
    text->initNewTextSelectAll();
    QTRY_VERIFY(text->hasFocus());
    const auto keys = {Qt::Key_End,    Qt::Key_A,    Qt::Key_Q,  Qt::Key_Left,      Qt::Key_W,
                       Qt::Key_Up,     Qt::Key_X,    Qt::Key_Up, Qt::Key_Backspace, Qt::Key_Return,
                       Qt::Key_Y,      Qt::Key_Down, Qt::Key_J,  Qt::Key_Home,      Qt::Key_Backspace,
                       Qt::Key_Delete, Qt::Key_End,  Qt::Key_G,  Qt::Key_Space,     Qt::Key_F};
    int number = 0;
    for (const Qt::Key key : keys) {
        QTest::keyClick(m_canvas->view.viewport(), key);
        settle();
        const QImage shown = onScreen();
        m_canvas->view.viewport()->update();
        settle();
        QVERIFY2(shown == onScreen(), qPrintable(QString("key %1: %2").arg(number).arg(key)));
        ++number;
    }
}

void tst_canvasscene_repaint::aKeyPaintsItsParagraph()
{
    openLines({QStringLiteral("the longest line"), QStringLiteral("a"), QStringLiteral("b"),
               QStringLiteral("c"), QStringLiteral("d"), QStringLiteral("e"), QStringLiteral("f")},
              2, false);
    GraphicsText* text = m_canvas->text(1);
    text->initNewTextSelectAll();
    QTRY_VERIFY(text->hasFocus());
    QTest::keyClick(m_canvas->view.viewport(), Qt::Key_End);
    QTest::keyClick(m_canvas->view.viewport(), Qt::Key_E); // the first one also sets the font of the caret
    settle();
    m_counter.region = QRegion();
    QCOMPARE(paintsOf([&] { QTest::keyClick(m_canvas->view.viewport(), Qt::Key_E); }), 1);
    const int painted = m_counter.region.boundingRect().height();
    const double whole = text->layoutRect().height();
    QVERIFY2(painted > 0 && painted < whole / 2, qPrintable(QString("%1 of %2").arg(painted).arg(whole)));
}

QTEST_MAIN(tst_canvasscene_repaint)
#include "tst_canvasscene_repaint.moc"
