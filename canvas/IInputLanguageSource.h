#pragma once

#include "messaging/services/SystemSetupDef.h"

#include <QObject>

// Tells the text objects which input language the keyboard has. The application's system controller derives
// from it and installs itself; text objects made without a source keep the language that they start with. GUI
// thread only.
class IInputLanguageSource : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;

    static IInputLanguageSource* instance();
    // The caller keeps ownership; the pointer is cleared by itself when the source dies.
    static void setInstance(IInputLanguageSource* source);

Q_SIGNALS:
    void signalsInputLanguageInfo(SystemSetupDef::emInputLanguageType language);
};
