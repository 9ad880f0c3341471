#include "tests/resources/PictureNames.h"

#include <QRegularExpression>

#include <algorithm>

namespace
{

constexpr int SLICES = 3; // a list of slices names the folder and at least one state

bool isBeginning(const QString& path)
{
    return path.endsWith(QLatin1Char('_')) || path.endsWith(QLatin1Char('/'));
}

bool isSliceList(const QString& literal)
{
    static const QRegularExpression list(QStringLiteral("^[A-Za-z][\\w-]*(:[\\w-]*)+$"));
    return literal.count(QLatin1Char(':')) >= SLICES && literal.contains(QLatin1Char('_')) &&
           list.match(literal).hasMatch();
}

} // namespace

QStringList PictureNames::literals(const QString& source)
{
    // A comment, a character, or a string up to its closing quote.
    static const QRegularExpression token(
        QStringLiteral("//[^\\n]*|/\\*.*?\\*/|'(?:[^'\\\\\\n]|\\\\.)+'|\"((?:[^\"\\\\\\n]|\\\\.)*)\""),
        QRegularExpression::DotMatchesEverythingOption);
    QStringList result;
    qsizetype end = -1;
    auto matches = token.globalMatch(source);
    while (matches.hasNext()) {
        const auto match = matches.next();
        if (!match.capturedView().startsWith(QLatin1Char('"')))
            continue;
        const bool isContinued = end >= 0 && source.mid(end, match.capturedStart() - end).trimmed().isEmpty();
        if (isContinued)
            result.last() += match.captured(1);
        else
            result.append(match.captured(1));
        end = match.capturedEnd();
    }
    return result;
}

QStringList PictureNames::paths(const QString& literal)
{
    static const QRegularExpression url(QStringLiteral("url\\((:/[^)]+)\\)"));
    static const QRegularExpression path(QStringLiteral("^:/[\\w./%-]+$"));
    static const QRegularExpression fixedPart(QStringLiteral("[A-Za-z]"));
    QStringList result;
    auto urls = url.globalMatch(literal);
    while (urls.hasNext())
        result.append(urls.next().captured(1));
    if (path.match(literal).hasMatch() && fixedPart.match(literal).hasMatch())
        result.append(literal);
    if (isSliceList(literal)) {
        const QStringList names = literal.split(QLatin1Char(':'));
        for (const QString& name : names.mid(1))
            if (!name.isEmpty())
                result.append(QStringLiteral(":/") + names.first() + QLatin1Char('/') + name);
    }
    return result;
}

bool PictureNames::exists(const QString& path, const QStringList& existing)
{
    if (path.contains(QLatin1Char('%'))) {
        static const QRegularExpression placeholder(QStringLiteral("%\\d+"));
        QStringList parts = path.split(placeholder);
        for (QString& part : parts)
            part = QRegularExpression::escape(part);
        return existing.indexOf(QRegularExpression(
                   QRegularExpression::anchoredPattern(parts.join(QStringLiteral("[\\w-]+"))))) >= 0;
    }
    if (isBeginning(path)) {
        return std::any_of(existing.begin(), existing.end(),
                           [&path](const QString& name) { return name.startsWith(path); });
    }
    return existing.contains(path);
}
