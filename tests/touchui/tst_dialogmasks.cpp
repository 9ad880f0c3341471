// The two masks that darken a dialog and keep fingers off it.
#include "touchui/DialogMasks.h"

#include <QTest>
#include <QWidget>
#include <memory>

class tst_dialogmasks : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { m_owner = std::make_unique<QWidget>(); }
    void touchesReachTheOwnerWithoutMasks_data();
    void touchesReachTheOwnerWithoutMasks();
    void masksAreMadeAtFirstUse();
    void marginsStayFree();
    void pressesEndWhereAskedFor();

private:
    QList<QWidget*> masks() const { return m_owner->findChildren<QWidget*>(); }
    bool takesTouches() const { return m_owner->testAttribute(Qt::WA_AcceptTouchEvents); }

    std::unique_ptr<QWidget> m_owner;
};

void tst_dialogmasks::touchesReachTheOwnerWithoutMasks_data()
{
    QTest::addColumn<QString>("steps"); // D and M show the masks, d and m hide them
    QTest::addColumn<bool>("takesTouches");
    QTest::newRow("dialog") << "D" << false;
    QTest::newRow("dialog gone") << "Dd" << true;
    QTest::newRow("message") << "M" << false;
    QTest::newRow("message gone") << "Mm" << true;
    QTest::newRow("message over dialog") << "DM" << false;
    QTest::newRow("message gone over dialog") << "DMm" << false;
    QTest::newRow("both gone") << "DMmd" << true;
    QTest::newRow("hidden before shown") << "dm" << true;
}

void tst_dialogmasks::touchesReachTheOwnerWithoutMasks()
{
    QFETCH(QString, steps);
    DialogMasks both(m_owner.get());
    for (const QChar step : steps)
        if (step.toUpper() == QLatin1Char('D'))
            both.showDialogMaskWidget(step.isUpper());
        else
            both.showMessageMaskWidget(step.isUpper());
    QTEST(takesTouches(), "takesTouches");
}

void tst_dialogmasks::masksAreMadeAtFirstUse()
{
    DialogMasks both(m_owner.get());
    both.showDialogMaskWidget(false);
    QVERIFY(masks().isEmpty());
    both.showDialogMaskWidget(true);
    both.showDialogMaskWidget(false);
    both.showDialogMaskWidget(true);
    QCOMPARE(masks().size(), 1);
    const QWidget* mask = masks().constFirst();
    QVERIFY(!mask->isHidden());
    QVERIFY(mask->autoFillBackground());
    QCOMPARE(mask->focusPolicy(), Qt::NoFocus);
    QCOMPARE(mask->palette().color(QPalette::Window), QColor(0, 0, 0, 166));
    both.showMessageMaskWidget(true);
    QCOMPARE(masks().size(), 2);
}

void tst_dialogmasks::marginsStayFree()
{
    m_owner->resize(300, 200);
    DialogMasks both(m_owner.get(), QMargins(10, 6, 9, 12));
    both.showMessageMaskWidget(true);
    QCOMPARE(masks().constFirst()->geometry(), QRect(10, 6, 281, 182));
}

void tst_dialogmasks::pressesEndWhereAskedFor()
{
    DialogMasks through(m_owner.get());
    through.showDialogMaskWidget(true);
    QVERIFY(!masks().constLast()->testAttribute(Qt::WA_NoMousePropagation));
    DialogMasks here(m_owner.get(), QMargins(), DialogMasks::Press::EndsHere);
    here.showDialogMaskWidget(true);
    QVERIFY(masks().constLast()->testAttribute(Qt::WA_NoMousePropagation));
}

QTEST_MAIN(tst_dialogmasks)
#include "tst_dialogmasks.moc"
