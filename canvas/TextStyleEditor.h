#pragma once

#include "canvas/RecordLayout.h"
#include "canvas/TextObjectParts.h"
#include "document/TText.h"

#include <QTimer>

class QTextCursor;

// Keeps the Qt document of a text object and its style record in step: typing goes from the document into the
// record, style changes and loading from the record into the document. Also forms the undo steps of typing.
// GUI thread only.
class TextStyleEditor
{
public:
    explicit TextStyleEditor(const TextObjectParts& parts);

    void initShowText();
    void resetDocument(const TText& record, int cursorPosition);

    // The document reports a change that was not made here.
    void documentChanged(int position, int removed, int added);

    void changeAllStyleWhenSelectionMode(const TText& source, int id, bool overall, int undoFlag);
    void changeAllStyleWhenHasSelection(const TText& source, int id);
    void changePartStyleWhenHasSelection(const TText& source, int id, int undoFlag);
    void saveStyleForNextInsert(const TText& style, int undoFlag, int id);
    // Every character looks as it did before the first preview; does nothing without one.
    void cancelPreview();
    void setFontFamilyEnsureMode(int mode);

    // Reports the style at the cursor or of the selection.
    void showCurrentTextStyle();
    // The same for the whole text, leaving no selection.
    void showStyleOfWholeText();
    void selectWholeText();
    void clearSelection();
    // Reports the object's style with its place, which becomes the state that undo returns to.
    void reportMovedObject();
    // Offset (0,0) switches the shadow off.
    void applyShadow();

    // Typing up to now becomes an undo step.
    void pushLastEditTextIntoStack();
    // Its timeout has to call undoTimeOut().
    const QTimer& undoTimer() const { return m_undoTimer; }
    void undoTimeOut();
    // Whether there is typing that is not part of an undo step yet.
    bool isTyping() const { return m_undoTimer.isActive(); }
    // Forgets typing that has not become a step: the object is about to be hidden.
    void discardBurst() { m_undoTimer.stop(); }

private:
    class Guard;

    // Substitutes a missing family and reports it.
    void ensureFamily(TextStyle& style);
    int cutOffCharsBeyondMaxNum(int position, int added);
    // Leaves out of a reported change the characters that did not change.
    void trimUnchanged(int& position, int& removed, int& added) const;
    void replaceCharacters(int position, int removed, int added);
    void charsAddedChange(int position, int added);
    void charsRemovedChange(int position, int count);
    void styleNewCharacter(int position, bool startOfLine, QChar character, TextStyle& style);
    bool startsFilledLine(int position, int added) const;
    void reconcile();
    // Brings the texts of the styles there up to date: a change may have parted or joined a pair.
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
