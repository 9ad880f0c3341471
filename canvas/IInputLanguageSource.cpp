#include "canvas/IInputLanguageSource.h"

#include <QPointer>

namespace
{
QPointer<IInputLanguageSource>& currentSource()
{
    static QPointer<IInputLanguageSource> source;
    return source;
}
} // namespace

IInputLanguageSource* IInputLanguageSource::instance()
{
    return currentSource();
}

void IInputLanguageSource::setInstance(IInputLanguageSource* source)
{
    currentSource() = source;
}
