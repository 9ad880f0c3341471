#pragma once

#include "messaging/services/SystemSetupDef.h"

#include <QObject>

// Reports the input language of the keyboard to the text objects. The application's system controller derives
// from it and installs itself; text objects made without a source keep their initial language. GUI thread
// only.
class IInputLanguageSource : public QObject
{
    Q_OBJECT
public:
    using QObject::QObject;

    static IInputLanguageSource* instance();
    // Sets the source, which the caller keeps owning. It is reset when the source is destroyed.
    static void setInstance(IInputLanguageSource* source);

Q_SIGNALS:
    void signalsInputLanguageInfo(SystemSetupDef::emInputLanguageType language);
};
