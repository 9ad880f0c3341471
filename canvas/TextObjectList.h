#pragma once

#include <QList>

class GraphicsText;
class QGraphicsItem;
class QGraphicsScene;

// The text objects of a scene and the operations on all of them. Deleted objects stay in the scene, hidden
// and disabled, until it is cleared; only the enabled ones count. The scene owns the items.
class TextObjectList
{
public:
    explicit TextObjectList(const QGraphicsScene& scene);

    // Returns the children in the list, oldest first.
    QList<GraphicsText*>& listed() { return m_listed; }
    const QList<GraphicsText*>& listed() const { return m_listed; }

    QList<QGraphicsItem*> enableItems() const;
    // Returns the enabled children.
    QList<GraphicsText*> enabledTexts() const;
    // Returns the enabled child with the id, or null.
    GraphicsText* find(int id) const;
    // Returns the first child in the list that is selected or edited, or null.
    GraphicsText* findTheActiveItem() const;

    // Returns the lowest unused id, -1 when all are used.
    int freeId(int highest) const;
    double maxZValue() const;

    bool isSelectionMode() const;
    bool isEditorInteraction() const;
    // Ends editing and selection of all objects except that with the id, and restores the z value of all.
    void releaseAllBut(int id);
    // Ends selection, but not editing.
    void clearSelectionMode();

    // Hides and disables the pair and removes it from the list.
    void hide(GraphicsText* item);

private:
    static void release(GraphicsText* item);
    static void restoreZ(GraphicsText* item);

    const QGraphicsScene& m_scene;
    QList<GraphicsText*> m_listed;
};
