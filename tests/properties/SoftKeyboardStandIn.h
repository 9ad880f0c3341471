#pragma once

#include "tests/fakes/FakeSoftKeyBoardController.h"
#include "touchui/KSInputContext.h"

#include <QEvent>
#include <QString>

// A soft keyboard service for the random tests: keeps whether the keyboard is shown, and answers as the real
// service does.
class SoftKeyboardStandIn : public FakeSoftKeyBoardController
{
public:
    bool isUp() const { return m_up; }
    // Returns whether the field is a single line for a folder's name or a number, and not a text on the
    // canvas.
    bool isForLine() const { return m_field.fieldKind == 1; }

    // Sends the notice that the keyboard has closed, which the service sends with a delay.
    void settle()
    {
        if (!m_tellClosed)
            return;
        m_tellClosed = false;
        context()->sendSoftKeyboardState(false);
    }

    // Types the text and presses Enter.
    void typeLine(const QString& text)
    {
        for (qsizetype length = 1; length <= text.size(); length += 5)
            context()->sendInputStringOnTextChanged(text.left(length).toStdWString());
        context()->sendInputStringOnEnterPressing(text.toStdWString());
        press(Qt::Key_Return, QStringLiteral("\r"));
    }
    void type(const QString& text) { context()->sendInputString(text.toStdWString()); }
    void press(int key, const QString& text = QString())
    {
        for (const int type : {int(QEvent::KeyPress), int(QEvent::KeyRelease)}) {
            SubCommonDefine::tagSoftKeyBoardKeyData data;
            data.eventType = type;
            data.key = key;
            data.text = text.toStdWString();
            context()->sendKey(data);
        }
    }
    void select(int begin, int end, int mode)
    {
        context()->sendInputStringSelectionPos({begin, end, end, mode});
    }
    // Closes the keyboard with its own key.
    void putAway()
    {
        SubCommonDefine::tagSoftKeyBoardKeyData data;
        data.eventType = KSInputContext::SoftKeyBoardCloseType;
        m_up = false;
        context()->sendKey(data);
    }

    void show(SubCommonDefine::tagSoftKeyBoardInitData data) override
    {
        m_field = data;
        m_up = true;
        m_tellClosed = false;
    }
    void close() override
    {
        m_up = false;
        m_tellClosed = true;
    }
    void dummyClose() override { m_up = false; }
    void simpleClose() override { m_up = false; }
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData) override {}
    void sendLimitInfo(SubCommonDefine::taLimitInfo) override {}
    // A long run calls it often.
    void closeLimitBalloon() override {}

private:
    static KSInputContext* context() { return KSInputContext::instance(); }

    SubCommonDefine::tagSoftKeyBoardInitData m_field;
    bool m_up = false;
    bool m_tellClosed = false;
};
