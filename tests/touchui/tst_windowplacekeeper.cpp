// A window whose place the window system tells wrong.
#include "tests/support/Patience.h"
#include "touchui/WindowPlaceKeeper.h"

#include <QDialog>
#include <QTest>
#include <QWindow>
#include <memory>

class tst_windowplacekeeper : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void takesTheWindowBack();
    void followsTheProgram();
    void doesNotQuarrel();

private:
    // What a window manager does, or seems to do.
    void carryTo(const QPoint& place) { m_dialog->windowHandle()->setPosition(place); }

    std::unique_ptr<QDialog> m_dialog;
};

void tst_windowplacekeeper::init()
{
    m_dialog = std::make_unique<QDialog>(nullptr, Qt::Dialog | Qt::FramelessWindowHint);
    m_dialog->setFixedSize(200, 100);
    new WindowPlaceKeeper(m_dialog.get());
    m_dialog->move(60, 40);
    m_dialog->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_dialog.get(), PATIENCE_MS));
    QCOMPARE(m_dialog->windowHandle()->position(), QPoint(60, 40));
}

void tst_windowplacekeeper::cleanup()
{
    m_dialog.reset();
}

void tst_windowplacekeeper::takesTheWindowBack()
{
    carryTo({0, 0});
    QTRY_COMPARE(m_dialog->windowHandle()->position(), QPoint(60, 40));
    QTRY_COMPARE(m_dialog->pos(), QPoint(60, 40));
    m_dialog->hide();
    carryTo({5, 5});
    m_dialog->move(60, 40);
    m_dialog->show();
    QTRY_COMPARE(m_dialog->windowHandle()->position(), QPoint(60, 40));
}

void tst_windowplacekeeper::followsTheProgram()
{
    m_dialog->move(100, 80);
    QTRY_COMPARE(m_dialog->windowHandle()->position(), QPoint(100, 80));
    carryTo({1, 1});
    QTRY_COMPARE(m_dialog->pos(), QPoint(100, 80));
}

void tst_windowplacekeeper::doesNotQuarrel()
{
    // A window manager that insists gets its way until the window is shown again.
    int times = 0;
    do {
        carryTo({0, 0});
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents();
    } while (m_dialog->windowHandle()->position() != QPoint(0, 0) && ++times < 100);
    QVERIFY2(times >= 1 && times <= 3, qPrintable(QString::number(times)));
    m_dialog->hide();
    m_dialog->move(60, 40);
    m_dialog->show();
    carryTo({0, 0});
    QTRY_COMPARE(m_dialog->windowHandle()->position(), QPoint(60, 40));
}

QTEST_MAIN(tst_windowplacekeeper)
#include "tst_windowplacekeeper.moc"
