#pragma once

#include "document/FontStyle.h"

#include <QStringList>

// Gives the panel access to the stored settings and to the font system. GUI thread only.
class TextToolsPanelController
{
public:
    // Returns all families of the font system, whatever scripts they support.
    QStringList getFontLib() const;
    // Returns the style stored by the last run; the defaults when there is none.
    FontStyle getLastTextStyle() const;
    void setLastTextStyle(FontStyle style) const;
};
