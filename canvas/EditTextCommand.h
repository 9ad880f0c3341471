#pragma once

#include "canvas/CanvasCommand.h"
#include "document/TText.h"

// A change of text or style of one object.
class EditTextCommand : public CanvasCommand
{
public:
    // Copies all four records; none may be null.
    EditTextCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast, CanvasScene* scene,
                    QUndoCommand* parent = nullptr);

    // Cleared while the change of the newest command is already on screen, so that pushing it draws nothing.
    // Shared by all commands.
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
