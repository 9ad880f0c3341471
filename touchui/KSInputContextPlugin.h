#pragma once

#include <qpa/qplatforminputcontextplugin_p.h>

// Registers KSInputContext with Qt as a platform input context; part of the program itself.
class KSInputContextPlugin : public QPlatformInputContextPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QPlatformInputContextFactoryInterface_iid FILE "KSInputContextPlugin.json")
public:
    // The key that selects the context.
    static const char* const KEY;
    // Sets the input method for the physical keyboard; empty for the platform's default.
    static void setInnerMethod(const QString& key);

    QPlatformInputContext* create(const QString& key, const QStringList& parameters) override;
};
