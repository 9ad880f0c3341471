#include "canvas/SceneKeyboard.h"

#include "canvas/GraphicsText.h"
#include "canvas/SoftKeyboardField.h"
#include "touchui/KSInputContext.h"

#include <QWidget>
#include <utility>

QString SceneKeyboard::description(const QString& title)
{
    if (m_item->isDoubleClickedSelection())
        return SoftKeyboardField::doubleClick(title, QString());
    if (!std::exchange(m_isNewText, false))
        return SoftKeyboardField::commonState(title, QString(), *m_item);
    KSInputContext::resetFocusWidget();
    return SoftKeyboardField::newText(title, QString());
}

void SceneKeyboard::request(QWidget* view, const QString& title)
{
    KSInputContext* context = KSInputContext::instance();
    if (!m_item) {
        if (context)
            context->dummyCloseSoftKeyBoardWindow();
        return;
    }
    if (context && view)
        context->setFocusWidget(view);
    m_item->setObjectName(description(title));
    if (!context || !view)
        return;
    context->setFocusWidget(view);
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    context->filterEvent(&request);
}
