#pragma once

#include <QString>
#include <QStringList>
#include <functional>
#include <optional>

class TText;

// Puts texts from a list into the text objects of a title. Works on records alone: one style for each UTF-16
// unit, as the canvas keeps them, and the plain text of the object. Line breaks are "\n". Any thread.
class TextFields
{
public:
    // Returns the text for a name, or nothing to leave the part as it is.
    using Values = std::function<std::optional<QString>(const QString& name)>;

    // Returns the names of the parts "{name}" in reading order, each once, without the spaces around them.
    // Braces within braces, empty ones, and those with a line break between them are ordinary text.
    static QStringList partNames(const TText& text);

    // Replaces the whole text. It takes the style of the first character.
    static void replaceAll(TText& text, const QString& value);

    // Replaces each part "{name}". What replaces it takes the style of its brace and is not searched again.
    static void replaceParts(TText& text, const Values& values);

    // Returns how many characters count against the limit of an object: UTF-16 units without line breaks.
    static int characterCount(const TText& text);
    // Returns whether the text consists of white space only. Such texts are not kept in a title.
    static bool isBlank(const TText& text);
};
