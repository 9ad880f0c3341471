#pragma once

#include "canvas/CanvasCommand.h"
#include "document/TText.h"

// A change of text or style of one object;
class EditTextCommand : public CanvasCommand
{
public:
    // Copies all four records; none may be null.
    EditTextCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast, CanvasScene* scene,
                    QUndoCommand* parent = nullptr);

    // Clear while the change of the newest command is already on screen; shared by all commands.
    static bool mRedoButtonClickedFlag;

private:
    void undoChange() override;
    void redoChange() override;
    void showState(TText& text, TText& lastAlpha);

    TText m_oldText;
    TText m_newText;
    TText m_oldLast;
    TText m_newLast;
};
