#pragma once

#include <QString>

class Archive;
class TText;

// The texts of a title's record: reading them as plain text, and changing one while its styles stay.
class TitleTexts
{
public:
    TitleTexts() = delete;

    // Returns the characters of the runs; lines end with "\n".
    static QString plainText(const TText& text);

    // Sets the text of the object to the characters of its runs, as the canvas does before a title is saved.
    static void refreshText(TText& text);

    // Returns the text object with this id, or null. The record keeps owning it.
    static TText* find(const Archive& archive, int id);

    // Replaces the characters. What is equal at the beginning and at the end keeps its styles; the characters
    // between take the style of the first one that they replace, or of the one before. A text that is centred
    // or set right keeps its centre or right edge. A text without runs takes the default style. GUI thread
    // only.
    static void replace(TText& text, const QString& characters);
};
