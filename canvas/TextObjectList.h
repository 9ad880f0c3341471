#pragma once

#include <QList>

class GraphicsText;
class QGraphicsItem;
class QGraphicsScene;

// The text objects of a scene and what is done to all of them. Objects that were deleted stay in the scene
// hidden and disabled until it is cleared; only the enabled ones count. The scene owns the items.
class TextObjectList
{
public:
    explicit TextObjectList(const QGraphicsScene& scene);

    // The children that the scene lists, oldest first.
    QList<GraphicsText*>& listed() { return m_listed; }
    const QList<GraphicsText*>& listed() const { return m_listed; }

    QList<QGraphicsItem*> enableItems() const;
    // Enabled children.
    QList<GraphicsText*> enabledTexts() const;
    // The enabled child with the id, or null.
    GraphicsText* find(int id) const;
    // The first listed child that is selected or edited, or null.
    GraphicsText* findTheActiveItem() const;

    // The lowest id that no object holds, -1 when all are taken.
    int freeId(int highest) const;
    double maxZValue() const;

    bool isSelectionMode() const;
    bool isEditorInteraction() const;
    // Ends editing and selection of all but the object with the id, and puts all back to their z.
    void releaseAllBut(int id);
    // Ends selection only.
    void clearSelectionMode();

    // Hides and disables the pair and takes it off the list.
    void hide(GraphicsText* item);

private:
    static void release(GraphicsText* item);
    static void restoreZ(GraphicsText* item);

    const QGraphicsScene& m_scene;
    QList<GraphicsText*> m_listed;
};
