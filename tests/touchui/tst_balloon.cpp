// The balloons: the tool tip of sliders and rows, and those of buttons and prompts.
#include "tests/support/Patience.h"
#include "tests/touchui/ShownTip.h"
#include "touchui/Balloon.h"
#include "touchui/BalloonWindow.h"
#include "touchui/KSToolTip.h"

#include <QApplication>
#include <QTest>

class tst_balloon : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void tipStandsOverItsAnchor();
    void tipTurnsWhereThereIsNoRoom();
    void tipShortensLongText();
    void tipOfARowShowsOnlyWhatIsCut();
    void emptyTextHides();
    void tipTakesNoTouchAndNoFocus();
    void tipFollowsANewWindow();
    void buttonBalloonStandsUnder();
    void promptStandsOverAndGoes();
    void promptBreaksLines();
    void balloonGoesWithItsWidget();
    void balloonWithoutWidget();

private:
    QRect global(const QRect& rect) const
    {
        return QRect(m_window->mapToGlobal(rect.topLeft()), rect.size());
    }

    std::unique_ptr<QWidget> m_window;
    QWidget* m_anchor = nullptr;
};

void tst_balloon::init()
{
    Q_INIT_RESOURCE(UILibrary);
    m_window = std::make_unique<QWidget>();
    m_window->setGeometry(0, 0, 800, 600);
    m_anchor = new QWidget(m_window.get());
    m_anchor->setGeometry(300, 300, 100, 50);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
    KSToolTip::s_mainWindow = m_window.get();
    Balloon::s_ParentWindow = m_window.get();
}

void tst_balloon::cleanup()
{
    KSToolTip::clearInstance();
    KSToolTip::s_mainWindow = nullptr;
    Balloon::s_ParentWindow = nullptr;
    m_window.reset();
}

void tst_balloon::tipStandsOverItsAnchor()
{
    const QRect handle = global(QRect(300, 300, 40, 40));
    KSToolTip::showTextForSlider(handle, QStringLiteral("7"));
    QVERIFY(shownTip() != nullptr);
    QCOMPARE(shownTip()->geometry().bottom() + 1, handle.top());
    QVERIFY(qAbs(shownTip()->geometry().center().x() - handle.center().x()) <= 1);
    const QImage look = shownTip()->grab().toImage();
    QVERIFY(look.pixelColor(look.width() / 2, look.height() - 4).alpha() > 0); // the arrow
    QCOMPARE(look.pixelColor(2, look.height() - 4).alpha(), 0);                // and nothing beside it
    KSToolTip::hideText();
    QVERIFY(shownTip() == nullptr);
    QVERIFY(KSToolTip::text().isEmpty());
}

void tst_balloon::tipTurnsWhereThereIsNoRoom()
{
    const QRect handle = global(QRect(300, 5, 40, 40));
    KSToolTip::showText(handle, QStringLiteral("7"));
    QCOMPARE(shownTip()->geometry().top(), handle.bottom() + 1);
    const QImage look = shownTip()->grab().toImage();
    QVERIFY(look.pixelColor(look.width() / 2, 4).alpha() > 0);
    QCOMPARE(look.pixelColor(2, 4).alpha(), 0);
    KSToolTip::showText(global(QRect(0, 300, 10, 10)), QStringLiteral("at the edge"));
    QVERIFY(global(m_window->rect()).contains(shownTip()->geometry()));
}

void tst_balloon::tipShortensLongText()
{
    const QString text = QStringLiteral("A very long name ").repeated(40);
    KSToolTip::showText(global(QRect(300, 300, 40, 40)), text);
    QCOMPARE(KSToolTip::text(), text);
    QVERIFY(shownTip()->width() <= m_window->width());
    QVERIFY(shownTip()->width() > m_window->width() * 3 / 4);
    KSToolTip::showText(global(QRect(300, 300, 40, 40)), QStringLiteral("one\ntwo"));
    QVERIFY(shownTip()->height() < 80);
}

void tst_balloon::tipOfARowShowsOnlyWhatIsCut()
{
    const QRect row = global(QRect(100, 300, 200, 40));
    const QString text = QStringLiteral("A folder's name");
    KSToolTip::showTextForTreeView(row, text, 1000);
    QVERIFY(shownTip() == nullptr);
    KSToolTip::showTextForTreeView(row, text, 20);
    QVERIFY(shownTip() != nullptr);
    QCOMPARE(shownTip()->geometry().top(), row.bottom() + 1);
}

void tst_balloon::emptyTextHides()
{
    KSToolTip::showText(global(QRect(300, 300, 40, 40)), QStringLiteral("7"));
    KSToolTip::showText(global(QRect(300, 300, 40, 40)), QString());
    QVERIFY(shownTip() == nullptr);
    Balloon balloon;
    balloon.showButtonText(m_anchor, QStringLiteral("Delete"));
    balloon.showButtonText(m_anchor, QString());
    QVERIFY(!balloon.isVisible());
}

void tst_balloon::tipTakesNoTouchAndNoFocus()
{
    KSToolTip::showText(global(QRect(300, 300, 40, 40)), QStringLiteral("7"));
    QVERIFY(shownTip()->windowFlags() & Qt::WindowTransparentForInput);
    QVERIFY(shownTip()->windowFlags() & Qt::WindowDoesNotAcceptFocus);
    QVERIFY(QApplication::activePopupWidget() == nullptr);
}

void tst_balloon::tipFollowsANewWindow()
{
    KSToolTip::showText(global(QRect(300, 300, 40, 40)), QStringLiteral("7"));
    QWidget other;
    other.setGeometry(100, 100, 300, 200);
    other.show();
    KSToolTip::s_mainWindow = &other;
    KSToolTip::showText(QRect(other.mapToGlobal(QPoint(200, 100)), QSize(10, 10)), QStringLiteral("8"));
    QCOMPARE(shownTip()->parentWidget(), &other);
    QVERIFY(QRect(other.mapToGlobal(QPoint(0, 0)), other.size()).contains(shownTip()->geometry()));
    KSToolTip::s_mainWindow = m_window.get();
}

void tst_balloon::buttonBalloonStandsUnder()
{
    Balloon balloon;
    balloon.showButtonText(m_anchor, QStringLiteral("Delete"));
    QVERIFY(balloon.isVisible());
    QCOMPARE(balloon.geometry().top(), m_anchor->mapToGlobal(QPoint(0, 50)).y());
    m_anchor->move(300, 540); // no room under it there
    QCOMPARE(balloon.geometry().bottom() + 1, m_anchor->mapToGlobal(QPoint(0, 0)).y());
    QCOMPARE(Balloon::FONT_SIZE, 29);
}

void tst_balloon::promptStandsOverAndGoes()
{
    Balloon balloon;
    balloon.showPromptText(m_anchor, QStringLiteral("Enter a name."), 30);
    QVERIFY(balloon.isVisible());
    QCOMPARE(balloon.geometry().bottom() + 1, m_anchor->mapToGlobal(QPoint(0, 0)).y());
    QTRY_VERIFY(!balloon.isVisible());
    QVERIFY(balloon.geometry().isNull());
}

void tst_balloon::promptBreaksLines()
{
    Balloon balloon;
    balloon.showPromptText(m_anchor, QStringLiteral("Short"));
    const QSize one = balloon.geometry().size();
    balloon.showPromptText(m_anchor,
                           QStringLiteral("This name has been taken. Enter another one. ").repeated(2));
    const QSize more = balloon.geometry().size();
    QVERIFY(more.height() > one.height() + 20);
    QVERIFY(more.width() <= 600);
    balloon.hide();
    QVERIFY(!balloon.isVisible());
}

void tst_balloon::balloonGoesWithItsWidget()
{
    Balloon balloon;
    balloon.showButtonText(m_anchor, QStringLiteral("Delete"));
    m_anchor->hide();
    QVERIFY(!balloon.isVisible());
    m_anchor->show();
    balloon.showButtonText(m_anchor, QStringLiteral("Delete"));
    delete m_anchor;
    QVERIFY(!balloon.isVisible());
    m_window.reset(); // owns the balloon's window
    QVERIFY(!balloon.isVisible());
    balloon.hide();
}

void tst_balloon::balloonWithoutWidget()
{
    Balloon balloon;
    balloon.showPromptText(nullptr, QStringLiteral("text"));
    QVERIFY(!balloon.isVisible());
}

QTEST_MAIN(tst_balloon)
#include "tst_balloon.moc"
