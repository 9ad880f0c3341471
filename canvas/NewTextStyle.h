#pragma once

#include "document/TText.h"

#include <QString>

class FontStyle;

// The style of a new text object: the style that the panel has reported; before it has reported one, the
// change that it sent last, and at first the style remembered from the last run. The family may come from the
// input language or the model of the appliance instead.
class NewTextStyle
{
public:
    // sample: the text of the first record, one style per character. font: the style remembered from the last
    // run.
    NewTextStyle(const QString& sample, const FontStyle& font);

    // Call when the panel has changed an object: keeps the first style of the change. Does nothing without
    // characters.
    void rememberChange(const TText& style);
    // Call when a property of an object has changed, one of TextObjectConstants::StyleProperty. The family of
    // the last change of language is not used any more then and, if the property is the family, nor is that
    // of the model.
    void propertyChanged(int id);
    // Call before the panel is asked for its style.
    void askPanel() { m_panelTold = false; }
    // Keeps the style that the panel reports: shadow, align and the style of one character.
    void rememberProperty(const TText& style);

    // Sets the family that the model of the appliance requires; empty for none.
    void setFamilyOfModel(const QString& family) { m_familyOfModel = family; }
    // Sets the row of the tables of InputLanguageFonts.
    void setLanguageRow(int row);
    int languageRow() const { return m_languageRow; }

    // Returns the style of the next character of an emptied object, which is also that of a new one.
    TText& lastTextStyle() { return m_last; }

    // Sets shadow and align of a new object; the rest of the record stays.
    void applyTo(TText& record) const;
    // A record of one character, and the mode in which its family follows the script of what is typed; see
    // GraphicsText::setFontFamilyEnsureMode().
    struct FirstCharacter {
        TText record;
        int ensureMode = 2;
    };
    // Returns the style of the first character. A change of language affects one text only.
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
