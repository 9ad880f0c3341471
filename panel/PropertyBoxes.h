#pragma once

#include "document/TShadow.h"

#include <QList>
#include <QString>

class AlignToolBox;
class BoldToolBox;
class EdgeToolBox;
class FamilyToolBox;
class FontStyle;
class ItalicToolBox;
class KerningToolBox;
class QLayout;
class QWidget;
class RangeOfMoveText;
class ShadowToolBox;
class SizeToolBox;
class TText;
class TextColorToolBox;
class ToolBox;

// The ten tool boxes of the property panel: lays them out, shows a style in them without causing a change,
// enables them and reads their values. The panel owns the boxes. GUI thread only.
class PropertyBoxes
{
public:
    explicit PropertyBoxes(QWidget* panel);

    FamilyToolBox* const family;
    SizeToolBox* const size;
    BoldToolBox* const bold;
    ItalicToolBox* const italic;
    EdgeToolBox* const edge;
    ShadowToolBox* const shadow;
    AlignToolBox* const align;
    KerningToolBox* const kerning;
    TextColorToolBox* const textColor;
    RangeOfMoveText* const move;

    QList<ToolBox*> all() const;
    // Creates the layout, which the caller takes ownership of.
    QLayout* createLayout() const;

    // Shows a style of at least one character; of mixed characters what they have in common. edgePreview: the
    // edge comes from a slider that is still being dragged.
    void show(const TText& style, bool edgePreview);
    void show(const FontStyle& style);
    // Returns the values of the boxes as the style of one character without text.
    TText shownStyle(const QString& defaultFamily) const;
    // Sets the offsets of the shadow shown.
    void setShadowOffsets(const TShadow& offsets) { m_shadowOffsets = offsets; }

    // Returns all boxes to their initial values, disabled.
    void reset();
    // Enables the boxes that are available for every selection, and the others as set by the last call of
    // allow().
    void enable();
    void disable();
    // Sets whether shadow and align are available (whole text selected), and whether moving is (object
    // selected).
    void allow(bool shadowAndAlign, bool moving);

private:
    QLayout* createLeftBlock() const;
    QLayout* createMiddleBlock() const;
    void applyAllowed();

    TShadow m_shadowOffsets;
    bool m_shadowAndAlignAllowed = false;
    bool m_movingAllowed = false;
};
