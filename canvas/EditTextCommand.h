#pragma once

#include "canvas/CommandTitle.h"
#include "document/TText.h"

#include <QUndoCommand>

class CanvasScene;

// A change of text or style of one object; made by the scene, owned by the undo stack. Finds the object by
// its id, since undo of other commands builds objects anew.
class EditTextCommand : public QUndoCommand
{
public:
    // Copies all four records; none may be null.
    EditTextCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast, CanvasScene* scene,
                    QUndoCommand* parent = nullptr);

    void undo() override;
    void redo() override;

    // Clear while the change of the newest command is already on screen; shared by all commands.
    static bool mRedoButtonClickedFlag;

private:
    void showState(TText& text, TText& lastAlpha);

    CanvasScene* m_scene;
    CommandTitle m_title;
    TText m_oldText;
    TText m_newText;
    TText m_oldLast;
    TText m_newLast;
};
