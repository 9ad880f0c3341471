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
    // Keeps a reference to the scene, which must outlive this object.
    explicit TextPairMaker(CanvasScene& scene);

    // Makes a pair that shows the record at its place. Returns the child.
    GraphicsText* make(TText& record) const;
    // Makes a pair that has the style lastAlpha while it has no characters. ensureMode: see
    // GraphicsText::setFontFamilyEnsureMode().
    GraphicsText* make(TText& record, TText& lastAlpha, int ensureMode) const;
    // Makes a new object without characters, centred at the place (scene coordinates).
    GraphicsText* makeNew(int id, QPointF place, int z, NewTextStyle& style) const;
    // Returns the centre of a new object: that of the scene, moved up and right in steps until no other
    // object is there.
    QPointF getInitItemScenePosition() const;
    void connectToScene(GraphicsText* item) const;

private:
    // Makes both items without laying them out.
    GraphicsText* makeItems(TText& record) const;

    CanvasScene& m_scene;
};
