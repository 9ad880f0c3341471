#pragma once

#include "canvas/RecordLayout.h"
#include "canvas/TextObjectParts.h"
#include "document/TText.h"

#include <QTimer>

class QTextCursor;

// Keeps the Qt document of a text object and its style record synchronised: typing is copied from the
// document into the record, style changes and loaded records from the record into the document. Also forms
// the undo steps of typing. GUI thread only.
class TextStyleEditor
{
public:
    explicit TextStyleEditor(const TextObjectParts& parts);

    void initShowText();
    void resetDocument(const TText& record, int cursorPosition);

    // Call when the document reports a change; changes made by this class are ignored. Returns whether the
    // surface was informed of what has to be drawn anew.
    bool documentChanged(int position, int removed, int added);

    void changeAllStyleWhenSelectionMode(const TText& source, int id, bool overall, int undoFlag);
    void changeAllStyleWhenHasSelection(const TText& source, int id);
    void changePartStyleWhenHasSelection(const TText& source, int id, int undoFlag);
    void saveStyleForNextInsert(const TText& style, int undoFlag, int id);
    // Restores every character's style from before the first preview; does nothing without one.
    void cancelPreview();
    void setFontFamilyEnsureMode(int mode);

    // Reports the style at the cursor or of the selection to the listener.
    void showCurrentTextStyle();
    // Reports the style of the whole text and clears the selection.
    void showStyleOfWholeText();
    void selectWholeText();
    void clearSelection();
    // Reports the object's style and place and makes them the state that undo returns to.
    void reportMovedObject();
    // Applies the shadow of the record; an offset of (0,0) switches it off.
    void applyShadow();

    // Turns the typing since the last step into an undo step.
    void pushLastEditTextIntoStack();
    // Returns the timer that ends a burst of typing. Connect its timeout to undoTimeOut().
    const QTimer& undoTimer() const { return m_undoTimer; }
    void undoTimeOut();
    // Returns whether there is typing that is not part of an undo step yet.
    bool isTyping() const { return m_undoTimer.isActive(); }
    // Drops the typing that is not part of an undo step yet, since the object is about to be hidden.
    void discardBurst() { m_undoTimer.stop(); }

private:
    class Guard;

    // Replace missing families and report them, for one style or those from begin to before end.
    void ensureFamily(TextStyle& style);
    void ensureFamilies(int begin, int end);
    int cutOffCharsBeyondMaxNum(int position, int added);
    // Narrows a reported change down to the characters that did change.
    void trimUnchanged(int& position, int& removed, int& added) const;
    void replaceCharacters(int position, int removed, int added);
    void charsAddedChange(int position, int added);
    void charsRemovedChange(int position, int count);
    void styleNewCharacter(int position, bool startOfLine, QChar character, TextStyle& style);
    bool startsFilledLine(int position, int added) const;
    void reconcile();
    // Updates the texts of the styles in the range: a change may have split or joined a surrogate pair.
    void repairTexts(int begin, int end);
    void startBurst();
    void changeSelectionProperty(int id, const TText& source, int from, int to);
    void changeSelectionPropertyWhenObjectIsEmpty(int id, const TText& source);
    void changeTextItemPosition(float x, float y);
    void reportStyle(const TextStyle& style);
    void showTextStyleOfCursorPosition(const QTextCursor& cursor);
    void emitEdited(TText& before, TText& beforeLast);

    QTextDocument& m_document;
    StyleDocument& m_styles;
    TextPlacement& m_placement;
    ITextSurface& m_surface;
    ITextObjectListener& m_listener;
    RecordLayout m_layout;
    QTimer m_undoTimer;
    int m_guard = 0;
    int m_undoFlag = 1;
    int m_ensureMode = 2;
    bool m_ensurePending = false;
};
