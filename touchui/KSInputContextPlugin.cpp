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
    if (key.compare(QLatin1String(KEY), Qt::CaseInsensitive) != 0)
        return nullptr;
    // On X11 an input method is needed even without a daemon: it handles dead keys and the compose key.
    QString inner = innerMethod();
    if (inner.isEmpty() && QGuiApplication::platformName() == QLatin1String("xcb"))
        inner = QStringLiteral("compose");
    std::unique_ptr<QPlatformInputContext> context;
    if (!inner.isEmpty())
        context.reset(QPlatformInputContextFactory::create(inner));
    return new KSInputContext(std::move(context));
}

// Included here, so that the plug-in is compiled as a static part of the program.
#include "moc_KSInputContextPlugin.cpp"
