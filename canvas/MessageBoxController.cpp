#include "canvas/MessageBoxController.h"

namespace
{
MessageBoxController* (*getController)() = nullptr;
void (*clearController)() = nullptr;
} // namespace

MessageBoxController* MessageBoxController::getInstance()
{
    return getController ? getController() : nullptr;
}

void MessageBoxController::clearInstance()
{
    if (clearController)
        clearController();
}

void MessageBoxController::setProvider(MessageBoxController* (*get)(), void (*clear)())
{
    getController = get;
    clearController = clear;
}
