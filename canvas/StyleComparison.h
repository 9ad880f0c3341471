#pragma once

class TText;

// Compares the characters of a record as far as the property panel shows their style.
class StyleComparison
{
public:
    // Returns whether all styles are equal; true for fewer than two characters. An empty text or a number of
    // -1 in the first character matches everything; bold, italic and outline are compared only when the first
    // character has them.
    static bool isTheSame(const TText& style);
};
