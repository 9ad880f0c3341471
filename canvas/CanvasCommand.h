#pragma once

#include <QUndoCommand>
#include <string>

class CanvasScene;
class GraphicsText;

// An undo step on the canvas; made by the scene, owned by the undo stack. Each undo and redo rewrites the
// title file and marks its pictures as out of date.
//
// A command finds its object by id, since the undo of other commands creates new objects for old ids. It acts
// only while the title is shown that it was made for: the canvas may show another title when the command is
// redone, and the objects of that title have the same ids. GUI thread only.
class CanvasCommand : public QUndoCommand
{
public:
    void undo() final;
    void redo() final;

protected:
    // Makes a command for the title that is shown now. The scene outlives it.
    explicit CanvasCommand(CanvasScene* scene, QUndoCommand* parent);

    virtual void undoChange() = 0;
    virtual void redoChange() = 0;

    CanvasScene& scene() const { return *m_scene; }
    bool titleIsShown() const;
    // Returns the object of the command, or null.
    GraphicsText* shownItem(int id) const;

private:
    CanvasScene* m_scene;
    std::string m_path; // path of the title; empty without one
};
