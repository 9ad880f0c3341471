#include "touchui/KSInputContextPlugin.h"

#include "touchui/KSInputContext.h"

#include <QGuiApplication>
#include <qpa/qplatforminputcontextfactory_p.h>

const char* const KSInputContextPlugin::KEY = "kssoftkeyboard";

namespace
{

QString& innerMethod()
{
    static QString key;
    return key;
}

} // namespace

void KSInputContextPlugin::setInnerMethod(const QString& key)
{
    innerMethod() = key;
}

QPlatformInputContext* KSInputContextPlugin::create(const QString& key, const QStringList&)
{
    if (key.compare(QLatin1String(KEY), Qt::CaseInsensitive) != 0) {
        return nullptr;
    }
    // X11 needs an input method even without a daemon: dead keys and the compose key come from it.
    QString inner = innerMethod();
    if (inner.isEmpty() && QGuiApplication::platformName() == QLatin1String("xcb")) {
        inner = QStringLiteral("compose");
    }
    std::unique_ptr<QPlatformInputContext> context;
    if (!inner.isEmpty()) {
        context.reset(QPlatformInputContextFactory::create(inner));
    }
    return new KSInputContext(std::move(context));
}

// The plug-in's description is compiled here, where it is known that the plug-in is a part of the program.
#include "moc_KSInputContextPlugin.cpp"
