#include "library/FolderNameRules.h"

bool FolderNameRules::isTooLong(const QString& name)
{
    qsizetype characters = 0;
    for (const QChar unit : name)
        characters += unit.isLowSurrogate() ? 0 : 1;
    return characters > LONGEST_NAME;
}

bool FolderNameRules::isSameName(const QString& first, const QString& second)
{
    return first.compare(second, Qt::CaseInsensitive) == 0;
}

bool FolderNameRules::isFolderName(const QString& name)
{
    return !name.isEmpty() && name != QLatin1String(".") && name != QLatin1String("..") &&
           !name.contains(QLatin1Char('/')) && !name.contains(QChar(u'\0'));
}
