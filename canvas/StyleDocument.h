#pragma once

#include "document/TText.h"

#include <QChar>
#include <QString>
#include <memory>
#include <vector>

// The records of one text object and the edits on them: one style for each position of the document. Plain
// data: it neither lays out nor paints. Positions count UTF-16 units, line breaks included; a position out of
// range changes nothing.
//
// A character of two units keeps its whole text in the first style and an empty string in the second, since
// half of it has no UTF-8 form; so it survives styling, saving and loading.
class StyleDocument
{
public:
    StyleDocument();

    TText& current() { return m_current; }
    const TText& current() const { return m_current; }
    // One style, which the next character takes while the record has no characters.
    TText& lastAlpha() { return m_lastAlpha; }
    const TText& lastAlpha() const { return m_lastAlpha; }
    // Takes effect for the next typed character while nextInsertSaved() holds.
    TText& nextInsert() { return m_nextInsert; }
    TText& undoBaseline() { return m_undoBaseline; }
    TText& editStart() { return m_editStart; }
    TText& editStartLastAlpha() { return m_editStartLastAlpha; }

    int count() const { return int(m_current.textItems().size()); }
    bool isEmpty() const { return m_current.textItems().empty(); }
    // Null out of range; owned by the record.
    TextStyle* at(int position) const;
    bool isLineBreak(int position) const;
    // The character as it was typed; the second half of a pair gives a low surrogate.
    QChar characterAt(int position) const;

    void setCurrent(const TText& record);
    void insert(int position, std::vector<std::unique_ptr<TextStyle>> styles);
    // Returns whether it was the only character, whose style is then kept as last alpha.
    bool remove(int position);

    // Style of a character about to be inserted, from its neighbours. startOfLine: the characters behind it
    // on its line lend their style, else those before it.
    void copyNeighbourStyle(int position, bool startOfLine, QChar added, TextStyle& out) const;
    // Takes shadow and align of the source over and copies its first style.
    void copyTTextToTextStyle(TextStyle& out, const TText& source);
    // Gives out place, shadow and align of the object and one copy of the style.
    void copyTextStyle(TText& out, const TextStyle& style) const;
    // The same with copies of the styles from begin to before end.
    void copySelection(TText& out, int begin, int end) const;

    void setOverallProperty(int id, const TText& source);
    static void setFontProperties(int id, TextStyle& target, const TextStyle& source);
    // All per-character properties: those of setFontProperties, outline and kerning.
    static void setCharacterProperty(int id, TextStyle& target, const TextStyle& source);

    // Copies of the current state into a snapshot; only what differs is written.
    void refreshUndoBaseline() { synchronise(m_undoBaseline, m_current); }
    void markEditStart();

    // From the first preview on until it is taken back or another record is set, the state of before is kept.
    void markPreviewStart();
    bool isPreviewing() const { return m_previewing; }
    // Gives every style the value that it had before the preview; returns whether there was one.
    bool takeBackPreview();
    // Does the same to a copy of the current record.
    void removePreviewFrom(TText& copy) const;

    static void synchronise(TText& target, const TText& source);

    void saveForNextInsert(const TText& style, int property, int cursorPosition);
    bool nextInsertSaved() const { return m_styleSaved; }
    void forgetNextInsert() { m_styleSaved = false; }
    int savedProperty() const { return m_savedProperty; }
    int savedCursorPosition() const { return m_savedCursorPosition; }
    void setSavedCursorPosition(int position) { m_savedCursorPosition = position; }

    // Scales the shadow with the smallest size: overwrites direction and blur of the record, whose signs
    // stay.
    static void setItemShadowInfo(TText& record);
    static int getMinmumSize(const TText& record);
    static int getRadioValueofStandardSize(int size);

    // The text that a style stands for, without half pairs.
    static QString textOf(const TextStyle& style);
    // Text of the style at index i of a run of characters.
    static QString storedText(const QString& characters, qsizetype index);
    // Brings a record of any origin to one style per position and at most CHARACTER_LIMIT characters.
    static void normalise(TText& record);

private:
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
    // -2: none; -1: cleared by a move of the cursor.
    int m_savedCursorPosition = -2;
};
