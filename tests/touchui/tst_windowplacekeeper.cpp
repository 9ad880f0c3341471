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
    void carryTo(const QPoint& place) { mDialog->windowHandle()->setPosition(place); }

    std::unique_ptr<QDialog> mDialog;
};

void tst_windowplacekeeper::init()
{
    mDialog = std::make_unique<QDialog>(nullptr, Qt::Dialog | Qt::FramelessWindowHint);
    mDialog->setFixedSize(200, 100);
    new WindowPlaceKeeper(mDialog.get());
    mDialog->move(60, 40);
    mDialog->show();
    QVERIFY(QTest::qWaitForWindowExposed(mDialog.get(), PATIENCE_MS));
    QCOMPARE(mDialog->windowHandle()->position(), QPoint(60, 40));
}

void tst_windowplacekeeper::cleanup()
{
    mDialog.reset();
}

void tst_windowplacekeeper::takesTheWindowBack()
{
    carryTo({0, 0});
    QTRY_COMPARE(mDialog->windowHandle()->position(), QPoint(60, 40));
    QTRY_COMPARE(mDialog->pos(), QPoint(60, 40));
    mDialog->hide();
    carryTo({5, 5});
    mDialog->move(60, 40);
    mDialog->show();
    QTRY_COMPARE(mDialog->windowHandle()->position(), QPoint(60, 40));
}

void tst_windowplacekeeper::followsTheProgram()
{
    mDialog->move(100, 80);
    QTRY_COMPARE(mDialog->windowHandle()->position(), QPoint(100, 80));
    carryTo({1, 1});
    QTRY_COMPARE(mDialog->pos(), QPoint(100, 80));
}

void tst_windowplacekeeper::doesNotQuarrel()
{
    // A window manager that insists gets its way until the window is shown again.
    int times = 0;
    do {
        carryTo({0, 0});
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents();
    } while (mDialog->windowHandle()->position() != QPoint(0, 0) && ++times < 100);
    QVERIFY2(times >= 1 && times <= 3, qPrintable(QString::number(times)));
    mDialog->hide();
    mDialog->move(60, 40);
    mDialog->show();
    carryTo({0, 0});
    QTRY_COMPARE(mDialog->windowHandle()->position(), QPoint(60, 40));
}

QTEST_MAIN(tst_windowplacekeeper)
#include "tst_windowplacekeeper.moc"
