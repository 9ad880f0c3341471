#pragma once

#include "messaging/services/SubCommonDefine.h"
#include "tests/fakes/FakeInputMethod.h"
#include "tests/fakes/FakeSoftKeyBoardController.h"
#include "tests/support/Patience.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSInputFocusManager.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QApplication>
#include <QComboBox>
#include <QGraphicsScene>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QLineEdit>
#include <QPushButton>
#include <QRegularExpressionValidator>
#include <QSignalSpy>
#include <QTest>
#include <QVBoxLayout>

// A text item like those of the canvas.
class FakeTextItem : public QGraphicsTextItem
{
public:
    using QGraphicsTextItem::QGraphicsTextItem;
    int type() const override { return 65546; }
    bool event(QEvent* event) override
    {
        if (event->type() == KSSoftKeyboardCursorSettingEvent::myType) {
            const auto* setting = static_cast<KSSoftKeyboardCursorSettingEvent*>(event);
            positions = {setting->getCursorBeginPos(), setting->getCursorEndPos(),
                         setting->getCursorCurrentPos(), setting->getCursorSelectionMode()};
            return true;
        }
        closed += event->type() == KSInputContext::SoftKeyBoardCloseType ? 1 : 0;
        return QGraphicsTextItem::event(event);
    }
    QList<int> positions;
    int closed = 0;
};

// Counts the closings of the soft keyboard.
class ClosingEdit : public QLineEdit
{
public:
    using QLineEdit::QLineEdit;
    bool event(QEvent* event) override
    {
        if (event->type() == KSInputContext::SoftKeyBoardCloseType) {
            ++closed;
            closedWasSeen = KSInputContext::isSoftKeyboardClosed();
        }
        return QLineEdit::event(event);
    }
    int closed = 0;
    bool closedWasSeen = false;
};

// Keeps the texts that it was asked for.
class RecordingValidator : public QRegularExpressionValidator
{
public:
    using QRegularExpressionValidator::QRegularExpressionValidator;
    State validate(QString& text, int& position) const override
    {
        asked.append(text);
        return QRegularExpressionValidator::validate(text, position);
    }
    mutable QStringList asked;
};

inline SubCommonDefine::tagSoftKeyBoardKeyData keyRecord(int type, int key, const std::wstring& text = {})
{
    SubCommonDefine::tagSoftKeyBoardKeyData data;
    data.eventType = type;
    data.key = key;
    data.text = text;
    return data;
}

// A window with one field of each kind and a service that records its calls. Programs that use it call
// KSInputContext::install() before QApplication.
class InputContextFixture : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

protected:
    KSInputContext* m_context = nullptr;
    std::unique_ptr<KSAppEventFilter> m_filter;
    std::unique_ptr<FakeSoftKeyBoardController> m_service;
    std::unique_ptr<QWidget> m_window;
    ClosingEdit* m_edit = nullptr;
    QLineEdit* m_other = nullptr;
    QComboBox* m_box = nullptr;
    QPushButton* m_button = nullptr;
    QGraphicsScene* m_scene = nullptr;
    QGraphicsView* m_view = nullptr;
    FakeTextItem* m_parentItem = nullptr;
    FakeTextItem* m_item = nullptr;
    void open(QWidget* widget);
    void type(const char* letters);
};

inline void InputContextFixture::init()
{
    qApp->setObjectName(QStringLiteral("Titler"));
    m_context = KSInputContext::instance();
    QVERIFY(m_context != nullptr);
    m_filter = std::make_unique<KSAppEventFilter>();
    qApp->installEventFilter(m_filter.get());
    m_service = std::make_unique<FakeSoftKeyBoardController>();
    m_context->setKeyBoardController(m_service.get());
    m_window = std::make_unique<QWidget>();
    auto* layout = new QVBoxLayout(m_window.get());
    m_button = new QPushButton(QStringLiteral("button"));
    m_edit = new ClosingEdit;
    m_other = new QLineEdit;
    m_box = new QComboBox;
    m_box->setEditable(true);
    m_scene = new QGraphicsScene(m_window.get());
    m_parentItem = new FakeTextItem;
    m_scene->addItem(m_parentItem);
    m_item = new FakeTextItem(m_parentItem);
    m_item->setTextInteractionFlags(Qt::TextEditorInteraction);
    m_view = new QGraphicsView(m_scene);
    for (QWidget* widget : QList<QWidget*>{m_button, m_edit, m_other, m_box, m_view})
        layout->addWidget(widget);
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get(), PATIENCE_MS));
    m_button->setFocus();
    m_service->calls.clear();
}

inline void InputContextFixture::cleanup()
{
    m_window.reset();
    m_context->setKeyBoardController(nullptr);
    KSInputContext::m_bClosed = true;
    KSInputContext::resetFocusWidget();
    KSInputContext::m_strLimitCondition.clear();
    m_filter.reset();
}

inline void InputContextFixture::open(QWidget* widget)
{
    widget->setFocus();
    m_context->setFocusWidget(widget);
    KSInputContext::resetFocusWidget();
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(m_context->filterEvent(&request));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

// Types on the physical keyboard.
inline void InputContextFixture::type(const char* letters)
{
    for (; *letters != '\0'; ++letters)
        QTest::keyClick(m_window->windowHandle(), *letters);
}
