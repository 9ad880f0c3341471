#include "canvas/EditTextCommand.h"

#include "canvas/CanvasScene.h"

#include <QCoreApplication>

bool EditTextCommand::mRedoButtonClickedFlag = false;

EditTextCommand::EditTextCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast,
                                 CanvasScene* scene, QUndoCommand* parent)
    : CanvasCommand(scene, parent)
    , m_oldText(*oldText)
    , m_newText(*newText)
    , m_oldLast(*oldLast)
    , m_newLast(*newLast)
{
    mRedoButtonClickedFlag = false;
}

void EditTextCommand::showState(TText& text, TText& lastAlpha)
{
    GraphicsText* item = shownItem(text.getTextObjectID());
    if (!item)
        return;
    item->setLastAlpaTextStyleValue(lastAlpha);
    item->resetDocument(&text, 0);
    item->changeItemToSolidLineState();
}

void EditTextCommand::undoChange()
{
    showState(m_oldText, m_oldLast);
    setText(QCoreApplication::translate("EditTextCommand", "edit undo"));
}

void EditTextCommand::redoChange()
{
    if (mRedoButtonClickedFlag)
        showState(m_newText, m_newLast);
    mRedoButtonClickedFlag = true;
    setText(QCoreApplication::translate("EditTextCommand", "edit redo"));
}
