#pragma once

class GraphicsText;
class NewTextStyle;
class TText;

// Passes a style change of the panel to a text object, in the way that suits its selection. GUI thread only.
class StyleDispatch
{
public:
    // Returns the edit mode id for a status of GraphicsText::getStatusId(). overall: the property belongs to
    // the whole object; same: all characters have one style.
    static int getItemTextEditId(int status, bool overall, bool same);

    // Applies the change. id: one of TextObjectConstants::StyleProperty. Returns whether what the object
    // shows may have changed.
    static bool apply(GraphicsText& item, TText& style, int id, int undoFlag, NewTextStyle& newText);
};
