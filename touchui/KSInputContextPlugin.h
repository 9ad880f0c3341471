#pragma once

#include <qpa/qplatforminputcontextplugin_p.h>

// Offers KSInputContext to Qt as a platform input context; part of the program itself.
class KSInputContextPlugin : public QPlatformInputContextPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QPlatformInputContextFactoryInterface_iid FILE "KSInputContextPlugin.json")
public:
    // The key under which the context is chosen.
    static const char* const KEY;
    // Keeps the input method that serves the physical keyboard beside this one; empty for the platform's
    // default.
    static void setInnerMethod(const QString& key);

    QPlatformInputContext* create(const QString& key, const QStringList& parameters) override;
};
