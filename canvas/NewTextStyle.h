#pragma once

#include "document/TText.h"

#include <QString>

class FontStyle;

// The style that a new text object starts with: what the panel shows; until the panel has reported that, the
// change that it sent last, at first the style remembered from the last run. The family may come from the
// input language or the model instead.
class NewTextStyle
{
public:
    // sample: the text of the first record, one style per character. font: the remembered style.
    NewTextStyle(const QString& sample, const FontStyle& font);

    // The panel changed an object: its first style counts. Nothing without characters.
    void rememberChange(const TText& style);
    // Call when a property of an object has changed, one of TextObjectConstants::StyleProperty: from then on
    // the family is that of the panel.
    void propertyChanged(int id);
    // Call before the panel is asked what it shows.
    void askPanel() { m_panelTold = false; }
    // The panel reports what it shows: shadow, align and the style of one character.
    void rememberProperty(const TText& style);

    // The family that the model of the appliance asks for; empty: none.
    void setFamilyOfModel(const QString& family) { m_familyOfModel = family; }
    // Row of the tables of InputLanguageFonts.
    void setLanguageRow(int row);
    int languageRow() const { return m_languageRow; }

    // What an emptied object takes for the next character, too.
    TText& lastTextStyle() { return m_last; }

    // Shadow and align of a new object; the rest of the record stays.
    void applyTo(TText& record) const;
    // A record of one character, and how its family follows the script of what is typed; see
    // GraphicsText::setFontFamilyEnsureMode().
    struct FirstCharacter {
        TText record;
        int ensureMode = 2;
    };
    // The style of the first character. A new language counts for one text only.
    FirstCharacter firstCharacter();

private:
    void takeFirstCharacter(const TText& style);
    QString rememberedFamily() const;

    TText m_last;
    TText m_property;
    bool m_panelTold = false;
    QString m_familyOfModel;
    int m_languageRow = 4;
    bool m_languageChanged = false;
};
