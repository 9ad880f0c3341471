#include "canvas/StyleDispatch.h"

#include "canvas/CanvasScene.h"
#include "canvas/GraphicsText.h"
#include "canvas/NewTextStyle.h"
#include "canvas/StyleComparison.h"
#include "canvas/TextObjectConstants.h"

using namespace TextObjectConstants;

int StyleDispatch::getItemTextEditId(int status, bool overall, bool same)
{
    switch (status) {
    case 0:
        return CanvasScene::ALL_STYLE_CHANGED_WHEN_SELECTION_MODE;
    case 1:
        return overall ? CanvasScene::ALL_STYLE_CHANGED_WHEN__HAS_SELECTION_MODE
                       : CanvasScene::PART_STYLE_CHANGED_WHEN_HAS_SELECTION_MODE;
    case 2:
        if (!same)
            return CanvasScene::NO_EDIT_MODE;
        return overall ? CanvasScene::ALL_STYLE_CHANGED_WHEN_EDIT_MODE
                       : CanvasScene::STYLE_SAVED_FOR_NEXT_INSER_MODE;
    default:
        return CanvasScene::NO_EDIT_MODE;
    }
}

bool StyleDispatch::apply(GraphicsText& item, TText& style, int id, int undoFlag, NewTextStyle& newText)
{
    const bool overall = id == PropertyShadow || id == PropertyAlign || id == PropertyPosition;
    switch (getItemTextEditId(item.getStatusId(), overall, StyleComparison::isTheSame(style))) {
    case CanvasScene::ALL_STYLE_CHANGED_WHEN_SELECTION_MODE:
        item.changeAllStyleWhenSelectionMode(&style, id, overall, undoFlag);
        break;
    case CanvasScene::ALL_STYLE_CHANGED_WHEN_EDIT_MODE:
        item.changeAllStyleWhenEditMode(&style, id, overall, undoFlag);
        break;
    case CanvasScene::ALL_STYLE_CHANGED_WHEN__HAS_SELECTION_MODE:
        item.changeAllStyleWhenHasSelection(&style, id);
        break;
    case CanvasScene::PART_STYLE_CHANGED_WHEN_HAS_SELECTION_MODE:
        item.changePartStyleWhenHasSelection(&style, id, undoFlag);
        break;
    case CanvasScene::STYLE_SAVED_FOR_NEXT_INSER_MODE:
        item.saveStyleForNextInsert(&newText.lastTextStyle(), undoFlag, id);
        item.setTextInteractionFlags(Qt::TextEditorInteraction);
        item.setFocus();
        return false;
    default:
        break;
    }
    return true;
}
