// The size box: its list, its ladder from mixed selections, and what becomes of what is typed in it.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "panel/ComboxLineEditRegExpValidator.h"
#include "panel/SizeBoxLineEdit.h"
#include "panel/SizeToolBox.h"
#include "touchui/CustomComboBoxView.h"
#include "touchui/KSCombobox.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QScrollBar>
#include <QWindow>
#include <qpa/qwindowsysteminterface.h>

using Sizes = QList<int>;
Q_DECLARE_METATYPE(Sizes)

class tst_sizetoolbox : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { m_environment = std::make_unique<PanelEnvironment>(); }
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup();
    void validatorRefusesWhatIsNotFinished_data();
    void validatorRefusesWhatIsNotFinished();
    void shows_data();
    void shows();
    void stepsFromMixedSizes();
    void stepsStopAtTheEnds();
    void listSetsAllCharacters();
    void listIsScrolledByAFinger();
    void listRowsAreWideEnough();
    void listOpensOnlyWhileEnabled();
    void tapsEditAndSelect();
    void typedSizes_data();
    void typedSizes();
    void wholeTextOfTheKeyboard_data();
    void wholeTextOfTheKeyboard();
    void pastedText_data();
    void pastedText();
    void mixedDisplayLeftAlone();
    void halfTypedSizeIsDroppedByAnotherBox();
    void halfTypedSizeWhenTheFieldIsLeft();
    void keyboardClosedWhileTyping();
    void keyboardClosedAfterARefusedSize();
    void keyboardWindowTakesTheFocus();
    void newSelectionEndsTyping();
    void describesItselfToTheKeyboard();
    void paintsByState();

private:
    KSCombobox* combo() const { return m_box->findChild<KSCombobox*>(); }
    SizeBoxLineEdit* edit() const { return m_box->findChild<SizeBoxLineEdit*>(); }
    KSPushbutton* next() const { return m_box->findChild<KSPushbutton*>(QStringLiteral("Icon_SizeUp")); }
    KSPushbutton* previous() const
    {
        return m_box->findChild<KSPushbutton*>(QStringLiteral("Icon_SizeDown"));
    }
    QString text() const { return edit()->text(); }
    // Taps the field through the box, as a finger does.
    void tapField() { m_environment->touch(combo(), edit()->geometry().center()); }
    // Sends what the keyboard sends at Enter: the whole text, then the key.
    void enter(const QString& typed)
    {
        edit()->selectAll();
        edit()->insert(typed);
        QTest::keyClick(edit(), Qt::Key_Enter);
    }

    std::unique_ptr<PanelEnvironment> m_environment;
    std::unique_ptr<QWidget> m_window;
    SizeToolBox* m_box = nullptr;
};

void tst_sizetoolbox::init()
{
    m_window = std::make_unique<QWidget>();
    m_window->resize(600, 300);
    m_box = new SizeToolBox(m_window.get());
    m_box->move(20, 100);
    m_box->setWidgetDisabled();
    m_box->setWidgetEnabled();
    m_window->show();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    m_environment->messages.posted.clear();
}

void tst_sizetoolbox::cleanup()
{
    m_window.reset();
}

void tst_sizetoolbox::validatorRefusesWhatIsNotFinished_data()
{
    QTest::addColumn<bool>("accepted");
    for (const char* good : {"20", "21", "64", "99", "100", "999"})
        QTest::newRow(good) << true;
    for (const char* bad :
         {"", "1", "2", "9", "10", "19", "0", "012", "1000", "2a", "abc", "40+", " 64", "-64"})
        QTest::newRow(bad) << false;
}

void tst_sizetoolbox::validatorRefusesWhatIsNotFinished()
{
    QFETCH(bool, accepted);
    ComboxLineEditRegExpValidator validator{QRegularExpression(SizeToolBox::REGEXP_VALUE)};
    QSignalSpy spy(&validator, &ComboxLineEditRegExpValidator::validText);
    QString input = QString::fromLatin1(QTest::currentDataTag());
    int position = 0;
    QCOMPARE(validator.validate(input, position), accepted ? QValidator::Acceptable : QValidator::Invalid);
    QCOMPARE(spy, (QList<QVariantList>{{accepted}}));
}

void tst_sizetoolbox::shows_data()
{
    QTest::addColumn<Sizes>("sizes");
    QTest::addColumn<QString>("shown");
    QTest::addColumn<int>("row");
    QTest::addColumn<bool>("down");
    QTest::addColumn<bool>("up");
    QTest::newRow("in the list") << Sizes{64} << "64" << 7 << true << true;
    QTest::newRow("off the list") << Sizes{50, 50} << "50" << -1 << true << true;
    QTest::newRow("mixed") << Sizes{64, 40} << "40+" << -1 << true << true;
    QTest::newRow("least") << Sizes{20, 20} << "20" << -1 << false << true;
    QTest::newRow("greatest") << Sizes{999} << "999" << -1 << true << false;
    QTest::newRow("least and greatest") << Sizes{999, 20} << "20+" << -1 << true << true;
}

void tst_sizetoolbox::shows()
{
    QFETCH(Sizes, sizes);
    QFETCH(int, row);
    QFETCH(bool, down);
    QFETCH(bool, up);
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize(sizes);
    QTEST(text(), "shown");
    QCOMPARE(combo()->currentIndex(), row);
    QCOMPARE(previous()->isEnabled(), down);
    QCOMPARE(next()->isEnabled(), up);
    QVERIFY(changed.isEmpty());
}

void tst_sizetoolbox::stepsFromMixedSizes()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize({40, 64});
    m_environment->tap(next());
    QCOMPARE(changed.takeFirst(), (QVariantList{QVariant::fromValue(Sizes{44, 66}), 1}));
    QCOMPARE(text(), QStringLiteral("44+"));
    m_environment->tap(previous());
    m_environment->tap(previous());
    QCOMPARE(changed.last(), (QVariantList{QVariant::fromValue(Sizes{36, 60}), 1}));
    QVERIFY(m_environment->messages.posted.isEmpty());
}

void tst_sizetoolbox::stepsStopAtTheEnds()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize({857});
    m_environment->tap(next());
    QCOMPARE(text(), QStringLiteral("999"));
    QVERIFY(!next()->isEnabled());
    m_environment->tap(next());
    QCOMPARE(changed.size(), 1);
    m_box->setFontSize({24, 20});
    m_environment->tap(previous());
    QCOMPARE(changed.last().first().value<Sizes>(), (Sizes{20, 20}));
    QVERIFY(!previous()->isEnabled());
}

void tst_sizetoolbox::listSetsAllCharacters()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    QSignalSpy shown(m_box, &SizeToolBox::signalShowSizeComboxList);
    m_box->setFontSize({40, 64, 999});
    m_environment->touch(combo(), QPoint(combo()->width() - 8, 24));
    QTRY_VERIFY(combo()->view()->isVisible());
    QCOMPARE(combo()->count(), 13);
    CustomComboBoxView* list = combo()->listView();
    const QModelIndex row = list->model()->index(2, 0);
    list->scrollTo(row);
    m_environment->touch(list->viewport(), list->visualRect(row).center());
    QTRY_VERIFY(!combo()->view()->isVisible());
    QCOMPARE(changed.size(), 1);
    QCOMPARE(changed.first(), (QVariantList{QVariant::fromValue(Sizes{40, 40, 40}), 1}));
    QCOMPARE(shown, (QList<QVariantList>{{true}, {false}}));
    QCOMPARE(text(), QStringLiteral("40"));
}

void tst_sizetoolbox::listIsScrolledByAFinger()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize({32});
    combo()->setMaxVisibleItems(5);
    combo()->showPopup();
    QTRY_VERIFY(combo()->view()->isVisible());
    CustomComboBoxView* list = combo()->listView();
    QScrollBar* bar = list->verticalScrollBar();
    QCOMPARE(bar->value(), 0);
    const QPoint low(20, list->viewport()->height() - 10);
    QWidget* viewport = list->viewport();
    QTest::touchEvent(viewport, m_environment->device).press(0, low, viewport);
    QTest::touchEvent(viewport, m_environment->device).move(0, low - QPoint(0, 60), viewport);
    QTest::touchEvent(viewport, m_environment->device).move(0, low - QPoint(0, 150), viewport);
    QTRY_VERIFY(bar->value() > 40);
    QTest::touchEvent(viewport, m_environment->device).release(0, low - QPoint(0, 150), viewport);
    QVERIFY(changed.isEmpty()); // a drag does not choose a row
    QVERIFY(combo()->view()->isVisible());
    combo()->hidePopup();
}

// The list is wider than the box.
void tst_sizetoolbox::listRowsAreWideEnough()
{
    combo()->showPopup();
    QTRY_VERIFY(combo()->view()->isVisible());
    const int room = combo()->listView()->viewport()->width();
    QVERIFY2(room >= combo()->listView()->sizeHintForColumn(0), qPrintable(QString::number(room)));
    combo()->hidePopup();
}

void tst_sizetoolbox::listOpensOnlyWhileEnabled()
{
    m_box->setWidgetDisabled();
    m_environment->touch(combo(), QPoint(combo()->width() - 8, 24));
    QVERIFY(!combo()->view()->isVisible());
    tapField();
    QVERIFY(!m_box->isEditing());
}

void tst_sizetoolbox::tapsEditAndSelect()
{
    m_box->setFontSize({64});
    QVERIFY(edit()->isReadOnly());
    tapField();
    QVERIFY(m_box->isEditing() && !edit()->isReadOnly());
    QVERIFY(edit()->hasFocus());
    QVERIFY(!edit()->hasSelectedText());
    tapField();
    QCOMPARE(edit()->selectedText(), QStringLiteral("64"));
}

void tst_sizetoolbox::typedSizes_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<int>("size");
    QTest::newRow("least") << "20" << 20;
    QTest::newRow("greatest") << "999" << 999;
    QTest::newRow("in the list") << "72" << 72;
    QTest::newRow("too small") << "19" << 0;
    QTest::newRow("too great") << "1000" << 0;
    QTest::newRow("nothing") << "" << 0;
    QTest::newRow("letters") << "abc" << 0;
    QTest::newRow("wide digits") << QString::fromUtf8("６４") << 0;
    QTest::newRow("sign") << "+64" << 0;
    QTest::newRow("two lines") << "64\n72" << 0;
}

void tst_sizetoolbox::typedSizes()
{
    QFETCH(QString, typed);
    QFETCH(int, size);
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    QSignalSpy done(m_box, &SizeToolBox::signalSizeToolBoxEditDone);
    for (const Sizes& sizes : {Sizes{64, 64}, Sizes{40, 64}}) {
        m_box->setFontSize(sizes);
        const QString before = text();
        m_environment->messages.posted.clear();
        changed.clear();
        done.clear();
        tapField();
        enter(typed);
        QVERIFY(!m_box->isEditing() && edit()->isReadOnly() && !edit()->hasFocus());
        QCOMPARE(done.size(), 1);
        if (size == 0) {
            QVERIFY(changed.isEmpty());
            QCOMPARE(text(), before);
            QCOMPARE(m_environment->messages.ids(), QList<int>{111});
            QCOMPARE(m_box->fontSizes(), sizes);
        } else {
            QCOMPARE(changed.size(), 1);
            QCOMPARE(changed.first(), (QVariantList{QVariant::fromValue(Sizes{size, size}), 1}));
            QCOMPARE(text(), QString::number(size));
            QVERIFY(m_environment->messages.posted.isEmpty());
        }
    }
}

// While the operator types on the keyboard only the validator is asked.
void tst_sizetoolbox::wholeTextOfTheKeyboard_data()
{
    QTest::addColumn<QStringList>("typed");
    QTest::addColumn<bool>("accepted");
    QTest::newRow("good") << QStringList{"7", "72"} << true;
    QTest::newRow("corrected") << QStringList{"7", "72", "720", "7201", "720"} << true;
    QTest::newRow("bad") << QStringList{"1", "10", "100", "1000"} << false;
}

void tst_sizetoolbox::wholeTextOfTheKeyboard()
{
    QFETCH(QStringList, typed);
    QFETCH(bool, accepted);
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize({64});
    tapField();
    for (const QString& soFar : std::as_const(typed)) {
        QLineEdit scratch;
        scratch.setValidator(edit()->validator());
        scratch.insert(soFar);
        QCOMPARE(text(), QStringLiteral("64"));
    }
    enter(typed.constLast());
    QCOMPARE(changed.size(), accepted ? 1 : 0);
    QCOMPARE(text(), accepted ? typed.constLast() : QStringLiteral("64"));
    QCOMPARE(m_environment->messages.posted.size(), accepted ? 0 : 1);
}

void tst_sizetoolbox::pastedText_data()
{
    QTest::addColumn<QString>("pasted");
    QTest::addColumn<QString>("shown");
    QTest::newRow("good") << "300"
                          << "300";
    QTest::newRow("with a line break") << "64\n"
                                       << "64";
    QTest::newRow("words") << "size sixty-four"
                           << "64";
    QTest::newRow("long") << QString(10000, QLatin1Char('9')) << "64";
}

void tst_sizetoolbox::pastedText()
{
    QFETCH(QString, pasted);
    m_box->setFontSize({64});
    tapField();
    tapField();
    QGuiApplication::clipboard()->setText(pasted);
    edit()->paste();
    QTEST(text(), "shown");
    QTest::keyClick(edit(), Qt::Key_Return);
    QTEST(text(), "shown");
    QVERIFY(!m_box->isEditing());
}

void tst_sizetoolbox::mixedDisplayLeftAlone()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize({40, 64});
    tapField();
    QTest::keyClick(edit(), Qt::Key_Enter);
    QVERIFY(m_environment->messages.posted.isEmpty());
    QVERIFY(changed.isEmpty());
    QCOMPARE(text(), QStringLiteral("40+"));
    QVERIFY(edit()->isReadOnly());
}

void tst_sizetoolbox::halfTypedSizeIsDroppedByAnotherBox()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    m_box->setFontSize({40, 64});
    tapField();
    edit()->selectAll();
    edit()->insert(QStringLiteral("7"));
    m_box->clearFocusOfSizeBoxLineEdit(false); // not yet
    QVERIFY(m_box->isEditing());
    m_box->clearFocusOfSizeBoxLineEdit(true);
    QVERIFY(!m_box->isEditing());
    QCOMPARE(text(), QStringLiteral("40+"));
    QVERIFY(m_environment->messages.posted.isEmpty());
    QVERIFY(changed.isEmpty());
    // The buttons of the box step from the former value.
    tapField();
    edit()->selectAll();
    edit()->insert(QStringLiteral("300"));
    m_environment->tap(next());
    QCOMPARE(changed.takeFirst().first().value<Sizes>(), (Sizes{44, 66}));
    QVERIFY(changed.isEmpty());
}

void tst_sizetoolbox::halfTypedSizeWhenTheFieldIsLeft()
{
    QSignalSpy changed(m_box, &SizeToolBox::sizeChange);
    QLineEdit other(m_window.get());
    other.show();
    m_box->setFontSize({40, 64});
    tapField();
    edit()->selectAll();
    edit()->insert(QStringLiteral("7"));
    other.setFocus();
    QCOMPARE(text(), QStringLiteral("40+"));
    QCOMPARE(m_environment->messages.ids(), QList<int>{111});
    QVERIFY(!m_box->isEditing() && edit()->isReadOnly());
    QVERIFY(other.hasFocus());
    m_environment->messages.posted.clear();
    // A complete size that was not confirmed is dropped without a message.
    m_box->setFontSize({64});
    tapField();
    edit()->selectAll();
    edit()->insert(QStringLiteral("72"));
    other.setFocus();
    QCOMPARE(text(), QStringLiteral("64"));
    QVERIFY(m_environment->messages.posted.isEmpty());
    QVERIFY(changed.isEmpty());
}

void tst_sizetoolbox::keyboardClosedWhileTyping()
{
    m_box->setFontSize({64});
    tapField();
    QEvent closed(static_cast<QEvent::Type>(KSInputContext::SoftKeyBoardCloseType));
    QCoreApplication::sendEvent(combo(), &closed);
    QVERIFY(!m_box->isEditing());
    QCOMPARE(text(), QStringLiteral("64"));
    QVERIFY(m_environment->messages.posted.isEmpty());
}

// Typed text reaches the field with Enter only; until then the keyboard is told whether the text is valid.
void tst_sizetoolbox::keyboardClosedAfterARefusedSize()
{
    m_box->setFontSize({64});
    tapField();
    m_box->setValid(false);
    QEvent closed(static_cast<QEvent::Type>(KSInputContext::SoftKeyBoardCloseType));
    QCoreApplication::sendEvent(combo(), &closed);
    QVERIFY(!m_box->isEditing());
    QCOMPARE(text(), QStringLiteral("64"));
    QCOMPARE(m_environment->messages.ids(), QList<int>{111});
}

// The keyboard is a window of another process, which takes the activation when it is touched.
void tst_sizetoolbox::keyboardWindowTakesTheFocus()
{
    m_box->setFontSize({64});
    tapField();
    QVERIFY(m_box->isEditing());
    QWindow* const window = m_window->windowHandle();
    QWindowSystemInterface::handleWindowActivated<QWindowSystemInterface::SynchronousDelivery>(nullptr);
    QCOMPARE(QGuiApplication::focusWindow(), nullptr);
    QVERIFY(m_box->isEditing());
    QWindowSystemInterface::handleWindowActivated<QWindowSystemInterface::SynchronousDelivery>(window);
    QVERIFY(m_box->isEditing());
    enter(QStringLiteral("72"));
    QCOMPARE(text(), QStringLiteral("72"));
    QVERIFY(m_environment->messages.posted.isEmpty());
}

void tst_sizetoolbox::newSelectionEndsTyping()
{
    m_box->setFontSize({64});
    tapField();
    edit()->selectAll();
    m_box->setFontSize({36});
    QVERIFY(!m_box->isEditing());
    QCOMPARE(text(), QStringLiteral("36"));
    QTest::keyClick(edit(), Qt::Key_Enter);
    QVERIFY(m_environment->messages.posted.isEmpty());
}

void tst_sizetoolbox::describesItselfToTheKeyboard()
{
    const QStringList parts = edit()->objectName().split(QLatin1Char('#'));
    QCOMPARE(parts.size(), 3);
    QCOMPARE(parts.at(1), QStringLiteral("Font Size"));
    const auto* validator = qobject_cast<const QRegularExpressionValidator*>(edit()->validator());
    QVERIFY(validator);
    QCOMPARE(validator->regularExpression().pattern(),
             QStringLiteral("(^[2-9][0-9]{1}$)|(^[1-9][0-9][0-9]$)"));
}

void tst_sizetoolbox::paintsByState()
{
    m_box->setFontSize({888});
    const auto brightest = [this] {
        const QImage image = combo()->grab().toImage();
        int value = 0;
        for (int x = edit()->geometry().left(); x < edit()->geometry().right(); ++x)
            for (int y = 14; y < 34; ++y)
                value = std::max(value, qGray(image.pixel(x, y)));
        return value;
    };
    QVERIFY(brightest() > 200);
    m_box->setWidgetDisabled();
    QVERIFY(brightest() < 120);
    QCOMPARE(edit()->state(), 0);
}

QTEST_MAIN(tst_sizetoolbox)
#include "tst_sizetoolbox.moc"
