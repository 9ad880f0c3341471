#pragma once

#include "document/TText.h"

#include <QChar>
#include <QString>
#include <memory>
#include <vector>

// The records of one text object and the edits on them: one style for each position of the document. Plain
// data without layout and painting. Positions count UTF-16 units, line breaks included; a position out of
// range changes nothing.
//
// A character of two units keeps its whole text in the first style and an empty string in the second, since
// half of it has no UTF-8 form. So it is not lost when it is styled, saved or loaded.
class StyleDocument
{
public:
    StyleDocument();

    TText& current() { return m_current; }
    const TText& current() const { return m_current; }
    // Returns a record of one style, which the next character takes while the record has no characters.
    TText& lastAlpha() { return m_lastAlpha; }
    const TText& lastAlpha() const { return m_lastAlpha; }
    // Returns the style of the next typed character, which is used while nextInsertSaved() is true.
    TText& nextInsert() { return m_nextInsert; }
    TText& undoBaseline() { return m_undoBaseline; }
    TText& editStart() { return m_editStart; }
    TText& editStartLastAlpha() { return m_editStartLastAlpha; }

    int count() const { return int(m_current.textItems().size()); }
    bool isEmpty() const { return m_current.textItems().empty(); }
    // Returns the style, which the record owns, or null out of range.
    TextStyle* at(int position) const;
    // Returns the character as it was typed; for the second half of a pair a low surrogate.
    QChar characterAt(int position) const;

    void setCurrent(const TText& record);
    void insert(int position, std::vector<std::unique_ptr<TextStyle>> styles);
    // Removes the style. Returns whether it was the last one, which is then kept as last alpha.
    bool remove(int position);

    // Copies the style for a character about to be inserted from its neighbours: with startOfLine from the
    // characters that follow on its line, otherwise from those before it.
    void copyNeighbourStyle(int position, bool startOfLine, QChar added, TextStyle& out) const;
    // Takes over shadow and align of the source and copies its first style.
    void copyTTextToTextStyle(TextStyle& out, const TText& source);
    // Copies place, shadow and align of the object and one style.
    void copyTextStyle(TText& out, const TextStyle& style) const;
    // Copies place, shadow and align of the object and the styles from begin to before end.
    void copySelection(TText& out, int begin, int end) const;

    void setOverallProperty(int id, const TText& source);
    static void setFontProperties(int id, TextStyle& target, const TextStyle& source);
    // Sets one per-character property: one of setFontProperties, outline or kerning.
    static void setCharacterProperty(int id, TextStyle& target, const TextStyle& source);

    // Copies the current state into a snapshot; writes only what differs.
    void refreshUndoBaseline() { synchronise(m_undoBaseline, m_current); }
    void markEditStart();

    // Keeps the state from before the first preview until it is taken back or another record is set.
    void markPreviewStart();
    // Restores every style from before the preview. Returns whether there was a preview.
    bool takeBackPreview();
    // Restores the styles from before the preview in a copy of the current record.
    void removePreviewFrom(TText& copy) const;

    static void synchronise(TText& target, const TText& source);

    void saveForNextInsert(const TText& style, int property, int cursorPosition);
    bool nextInsertSaved() const { return m_styleSaved; }
    void forgetNextInsert() { m_styleSaved = false; }
    int savedProperty() const { return m_savedProperty; }
    int savedCursorPosition() const { return m_savedCursorPosition; }
    void setSavedCursorPosition(int position) { m_savedCursorPosition = position; }

    // Scales the shadow with the smallest size: overwrites direction and blur of the record, but keeps their
    // signs.
    static void setItemShadowInfo(TText& record);
    static int getMinmumSize(const TText& record);
    static int getRadioValueofStandardSize(int size);

    // Returns the text of a style without unpaired surrogates.
    static QString textOf(const TextStyle& style);
    // Returns the text to store in the style at index i of the characters.
    static QString storedText(const QString& characters, qsizetype index);
    // Converts any record to one style per position and at most CHARACTER_LIMIT characters.
    static void normalise(TText& record);

private:
    static bool isNormal(const TText& record);

    TText m_current;
    TText m_lastAlpha;
    TText m_nextInsert;
    TText m_undoBaseline;
    TText m_editStart;
    TText m_editStartLastAlpha;
    TText m_beforePreview;
    bool m_previewing = false;
    bool m_styleSaved = false;
    int m_savedProperty = -1;
    // -2: none; -1: cleared because the cursor was moved.
    int m_savedCursorPosition = -2;
};
