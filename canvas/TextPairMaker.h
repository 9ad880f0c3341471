#pragma once

#include <QPointF>

class CanvasScene;
class GraphicsText;
class NewTextStyle;
class TText;

// Makes the two items of a text object: a parent, which is placed in the scene, and its child, which shows a
// copy of the record and is connected to the scene. The scene owns both. GUI thread only.
class TextPairMaker
{
public:
    // The scene outlives this object.
    explicit TextPairMaker(CanvasScene& scene);

    // Shows the record at its place. Returns the child.
    GraphicsText* make(TText& record) const;
    // The same for an object that takes this style while it has no characters. ensureMode: see
    // GraphicsText::setFontFamilyEnsureMode().
    GraphicsText* make(TText& record, TText& lastAlpha, int ensureMode) const;
    // A new object without characters, its middle at the place (scene coordinates).
    GraphicsText* makeNew(int id, QPointF place, int z, NewTextStyle& style) const;
    // Where the middle of a new object comes: the centre of the scene, or as many steps up and right of it as
    // find no other object.
    QPointF getInitItemScenePosition() const;
    void connectToScene(GraphicsText* item) const;

private:
    // Not laid out yet.
    GraphicsText* makeItems(TText& record) const;

    CanvasScene& m_scene;
};
