#pragma once

#include "document/FontStyle.h"

#include <QStringList>

// The panel's link to the stored settings and to the font system. GUI thread.
class TextToolsPanelController
{
public:
    // Every family, whatever it can write.
    QStringList getFontLib() const;
    // What the last run left; the defaults when there is nothing to read.
    FontStyle getLastTextStyle() const;
    void setLastTextStyle(FontStyle style) const;
};
