#include "touchui/ITitlerAPPEventFilterController.h"

namespace
{

ITitlerAPPEventFilterController* gInstance = nullptr;

}

ITitlerAPPEventFilterController::ITitlerAPPEventFilterController(QObject* parent) : QObject(parent)
{
}

ITitlerAPPEventFilterController::~ITitlerAPPEventFilterController()
{
    if (gInstance == this)
        gInstance = nullptr;
}

ITitlerAPPEventFilterController* ITitlerAPPEventFilterController::getInstance()
{
    return gInstance;
}

void ITitlerAPPEventFilterController::setInstance(ITitlerAPPEventFilterController* instance)
{
    gInstance = instance;
}
