#pragma once

class TText;

// Whether all characters of a record look alike, as far as the property panel is concerned.
class StyleComparison
{
public:
    // True for fewer than two characters. An empty text or a number of -1 in the first character agrees with
    // everything, and bold, italic and outline disagree only where the first character has them.
    static bool isTheSame(const TText& style);
};
