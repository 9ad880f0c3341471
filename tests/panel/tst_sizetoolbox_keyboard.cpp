// The size box and the soft keyboard: asked for by a tap into the field, and put away by whatever leaves it.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "panel/SizeBoxLineEdit.h"
#include "panel/SizeToolBox.h"
#include "tests/fakes/FakeSoftKeyBoardController.h"
#include "touchui/KSCombobox.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSPushbutton.h"

#include <QApplication>

class tst_sizetoolbox_keyboard : public QObject
{
    Q_OBJECT

public:
    enum Way {
        Return,
        Enter,
        Refused,
        OtherField,
        NoField,
        OtherBox,
        Stepped,
        Disabled,
        NewSelection,
        Hidden
    };
    Q_ENUM(Way)

private Q_SLOTS:
    void initTestCase() { m_environment = std::make_unique<PanelEnvironment>(); }
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup();
    void isPutAwayOnce_data();
    void isPutAwayOnce();
    void isNotPutAwayTwice();
    void isLeftToTheTextThatHasIt();

private:
    KSCombobox* combo() const { return m_box->findChild<KSCombobox*>(); }
    SizeBoxLineEdit* edit() const { return m_box->findChild<SizeBoxLineEdit*>(); }
    void tapField() { m_environment->touch(combo(), edit()->geometry().center()); }
    void type(const wchar_t* text, int key);
    void leave(Way way);

    std::unique_ptr<PanelEnvironment> m_environment;
    std::unique_ptr<QWidget> m_window;
    FakeSoftKeyBoardController m_service;
    KSInputContext* m_context = nullptr;
    SizeToolBox* m_box = nullptr;
    QLineEdit* m_other = nullptr;
};

void tst_sizetoolbox_keyboard::init()
{
    m_context = KSInputContext::instance();
    QVERIFY(m_context);
    m_context->setKeyBoardController(&m_service);
    m_window = std::make_unique<QWidget>();
    m_window->resize(600, 300);
    m_box = new SizeToolBox(m_window.get());
    m_box->move(20, 100);
    m_box->setWidgetDisabled();
    m_box->setWidgetEnabled();
    m_box->setFontSize({64, 64});
    m_other = new QLineEdit(m_window.get());
    m_window->show();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    m_service.calls.clear();
    m_service.shown.clear();
}

void tst_sizetoolbox_keyboard::cleanup()
{
    m_window.reset();
    m_context->setKeyBoardController(nullptr);
}

// Sends what the service sends at the end: the whole text, then the key.
void tst_sizetoolbox_keyboard::type(const wchar_t* text, int key)
{
    m_context->sendInputStringOnEnterPressing(text);
    SubCommonDefine::tagSoftKeyBoardKeyData data;
    data.key = key;
    data.text = L"\r";
    for (const int eventType : {int(QEvent::KeyPress), int(QEvent::KeyRelease)}) {
        data.eventType = eventType;
        m_context->sendKey(data);
    }
}

void tst_sizetoolbox_keyboard::leave(Way way)
{
    switch (way) {
    case Return:
        type(L"150", Qt::Key_Return);
        break;
    case Enter:
        type(L"150", Qt::Key_Enter);
        break;
    case Refused:
        type(L"19", Qt::Key_Return);
        break;
    case OtherField:
        m_other->setFocus(Qt::MouseFocusReason);
        break;
    case NoField:
        combo()->clearFocus();
        break;
    case OtherBox:
        m_box->clearFocusOfSizeBoxLineEdit(true);
        break;
    case Stepped:
        m_environment->tap(m_box->findChild<KSPushbutton*>(QStringLiteral("Icon_SizeUp")));
        break;
    case Disabled:
        m_box->setWidgetDisabled();
        break;
    case NewSelection:
        m_box->setFontSize({36});
        break;
    case Hidden:
        m_box->hide();
        break;
    }
}

void tst_sizetoolbox_keyboard::isPutAwayOnce_data()
{
    QTest::addColumn<Way>("way");
    const QMetaEnum ways = QMetaEnum::fromType<Way>();
    for (int i = 0; i < ways.keyCount(); ++i)
        QTest::newRow(ways.key(i)) << Way(ways.value(i));
}

void tst_sizetoolbox_keyboard::isPutAwayOnce()
{
    QFETCH(Way, way);
    tapField();
    QVERIFY(m_box->isEditing());
    QCOMPARE(m_service.calls.count(QStringLiteral("show")), 1);
    QCOMPARE(m_service.shown.constLast().title, std::wstring(L"Font Size"));
    QVERIFY(!m_service.calls.contains(QStringLiteral("close")));
    leave(way);
    QCOMPARE(m_service.calls.count(QStringLiteral("close")), 1);
    QCOMPARE(m_service.calls.count(QStringLiteral("show")), 1);
    QVERIFY(!m_box->isEditing() && edit()->isReadOnly() && !edit()->hasFocus());
    // The service reports that it has closed. Its later calls change nothing.
    m_context->sendSoftKeyboardState(false);
    const QString text = edit()->text();
    m_context->sendInputStringOnEnterPressing(L"300");
    QCOMPARE(edit()->text(), text);
    // The field can be entered again.
    if (way == Disabled || way == Hidden)
        return;
    tapField();
    QVERIFY(m_box->isEditing());
    QCOMPARE(m_service.calls.count(QStringLiteral("show")), 2);
}

// The keyboard was closed by its own key before.
void tst_sizetoolbox_keyboard::isNotPutAwayTwice()
{
    tapField();
    SubCommonDefine::tagSoftKeyBoardKeyData data;
    data.eventType = KSInputContext::SoftKeyBoardCloseType;
    m_context->sendKey(data);
    QVERIFY(!m_box->isEditing() && edit()->isReadOnly() && !edit()->hasFocus());
    QVERIFY(!m_service.calls.contains(QStringLiteral("close")));
}

// Another field has taken over the keyboard while the size was being typed.
void tst_sizetoolbox_keyboard::isLeftToTheTextThatHasIt()
{
    tapField();
    KSInputContext::resetFocusWidget();
    m_context->setFocusWidget(m_other);
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(m_context->filterEvent(&request));
    m_box->setFontSize({36});
    QVERIFY(!m_box->isEditing());
    QVERIFY(!m_service.calls.contains(QStringLiteral("close")));
    m_context->sendInputStringOnEnterPressing(L"name");
    QCOMPARE(m_other->text(), QStringLiteral("name"));
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    application.setObjectName(QStringLiteral("Titler"));
    tst_sizetoolbox_keyboard test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_sizetoolbox_keyboard.moc"
