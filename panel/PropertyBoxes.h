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

// The ten tool boxes of the property panel as one: lays them out, shows a style in them without a change,
// enables them and reads what they show. The panel owns the boxes. GUI thread only.
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
    // The caller takes the layout over.
    QLayout* createLayout() const;

    // Shows a style with at least one character, of mixed ones what they have in common. edgePreview: the
    // edge is that of a slider that is still dragged.
    void show(const TText& style, bool edgePreview);
    void show(const FontStyle& style);
    // What the boxes show, as the style of one character without a text.
    TText shownStyle(const QString& defaultFamily) const;
    // The offsets that belong to the shadow shown.
    void setShadowOffsets(const TShadow& offsets) { m_shadowOffsets = offsets; }

    // Back to new boxes, disabled.
    void reset();
    // Enables the boxes that apply to every selection, and the others as allowed last.
    void enable();
    void disable();
    // Shadow and align apply to a whole text, moving to an object that is selected as one.
    void allow(bool shadowAndAlign, bool moving);

private:
    QLayout* createLeftBlock() const;
    QLayout* createMiddleBlock() const;
    void applyAllowed();

    TShadow m_shadowOffsets;
    bool m_shadowAndAlignAllowed = false;
    bool m_movingAllowed = false;
};
