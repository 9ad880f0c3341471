#include "canvas/EditTextCommand.h"

#include "canvas/CanvasScene.h"

#include <QCoreApplication>

bool EditTextCommand::mRedoButtonClickedFlag = false;

EditTextCommand::EditTextCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast,
                                 CanvasScene* scene, QUndoCommand* parent)
    : QUndoCommand(parent)
    , m_scene(scene)
    , m_title(*scene)
    , m_oldText(*oldText)
    , m_newText(*newText)
    , m_oldLast(*oldLast)
    , m_newLast(*newLast)
{
    mRedoButtonClickedFlag = false;
}

void EditTextCommand::showState(TText& text, TText& lastAlpha)
{
    GraphicsText* item = m_title.isShown() ? m_scene->findTextItem(text.getTextObjectID()) : nullptr;
    if (!item)
        return;
    item->setLastAlpaTextStyleValue(lastAlpha);
    item->resetDocument(&text, 0);
    item->changeItemToSolidLineState();
}

void EditTextCommand::undo()
{
    m_scene->saveArchiveFlag();
    showState(m_oldText, m_oldLast);
    m_scene->update();
    m_scene->saveArchive();
    setText(QCoreApplication::translate("EditTextCommand", "edit undo"));
}

void EditTextCommand::redo()
{
    m_scene->saveArchiveFlag();
    if (mRedoButtonClickedFlag)
        showState(m_newText, m_newLast);
    m_scene->update();
    m_scene->saveArchive();
    setText(QCoreApplication::translate("EditTextCommand", "edit redo"));
    mRedoButtonClickedFlag = true;
}
