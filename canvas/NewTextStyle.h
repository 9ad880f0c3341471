#pragma once

#include "document/TText.h"

#include <QString>

class FontStyle;

// The style that a new text object starts with: what the panel shows; before it has told that, the change
// that it sent last, at first the style remembered from the last run.
class NewTextStyle
{
public:
    // sample: the text of the first record, one style per character. font: the remembered style.
    NewTextStyle(const QString& sample, const FontStyle& font);

    // The panel changed an object: its first style counts. Nothing without characters.
    void rememberChange(const TText& style);
    // The panel tells what it shows: shadow, align and the style of one character.
    void rememberProperty(const TText& style);
    QString family() const;

    // What an emptied object takes for the next character, too.
    TText& lastTextStyle() { return m_last; }

    // Shadow and align of a new object; the rest of the record stays.
    void applyTo(TText& record) const;
    // The style of the first character; an empty family keeps the remembered one.
    TText firstCharacter(const QString& family) const;

private:
    void takeFirstCharacter(const TText& style);

    TText m_last;
    TText m_property;
};
