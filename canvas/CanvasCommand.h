#pragma once

#include <QUndoCommand>
#include <string>

class CanvasScene;
class GraphicsText;

// A step of undo on the canvas; made by the scene, owned by the undo stack. Each undo and redo rewrites the
// title file and marks its pictures as out of date.
//
// A command finds its object by the number of the object, since undo of other commands builds objects anew,
// and only while the title is shown that it was made for: the canvas may show another title when the command
// is done again, and objects of that one have the same numbers. GUI thread only.
class CanvasCommand : public QUndoCommand
{
public:
    void undo() final;
    void redo() final;

protected:
    // The command belongs to the title that is shown now. The scene outlives it.
    explicit CanvasCommand(CanvasScene* scene, QUndoCommand* parent);

    virtual void undoChange() = 0;
    virtual void redoChange() = 0;

    CanvasScene& scene() const { return *m_scene; }
    bool titleIsShown() const;
    // The object with the number, or null.
    GraphicsText* shownItem(int id) const;

private:
    CanvasScene* m_scene;
    std::string m_path; // of the title; empty: no title
};
