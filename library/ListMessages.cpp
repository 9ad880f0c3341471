#include "library/ListMessages.h"

#include "canvas/MessageBoxController.h"

void ListMessages::post(MessageDef::Message_ID id, const QString& text)
{
    MessageBoxController* controller = MessageBoxController::getInstance();
    if (!controller)
        return;
    if (text.isEmpty())
        controller->postMessage(id);
    else
        controller->postMessage(id, text);
}

QString ListMessages::limitText()
{
    return QString::number(TITLE_LIMIT);
}
