#include "canvas/TextStyleEditor.h"

#include "canvas/CharacterFormat.h"
#include "canvas/ITextObjectListener.h"
#include "canvas/ITextSurface.h"
#include "canvas/InputLanguageFonts.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextPlacement.h"

#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <algorithm>

using namespace TextObjectConstants;

namespace
{

int documentLength(const QTextDocument& document)
{
    return document.characterCount() - 1;
}

} // namespace

// While a guard exists, changes of the document are made here and are not read back.
class TextStyleEditor::Guard
{
public:
    explicit Guard(TextStyleEditor& editor) : m_editor(editor) { ++m_editor.m_guard; }
    ~Guard() { --m_editor.m_guard; }
    Guard(const Guard&) = delete;
    Guard& operator=(const Guard&) = delete;

private:
    TextStyleEditor& m_editor;
};

TextStyleEditor::TextStyleEditor(const TextObjectParts& parts)
    : m_document(parts.document)
    , m_styles(parts.styles)
    , m_placement(parts.placement)
    , m_surface(parts.surface)
    , m_listener(parts.listener)
    , m_layout(parts)
{
    m_undoTimer.setSingleShot(true);
    m_undoTimer.setInterval(EDIT_AUTO_SAVE_TIME);
}

// Loading

void TextStyleEditor::ensureFamily(TextStyle& style)
{
    const QString wanted = QString::fromStdString(style.getFontFamily());
    if (CharacterFormat::familyIsInstalled(wanted))
        return;
    style.setFontFamily(InputLanguageFonts::substituteFamily().toStdString());
    m_listener.familyReplaced(wanted);
}

void TextStyleEditor::initShowText()
{
    const Guard guard(*this);
    for (TextStyle* style : m_styles.current().textItems())
        ensureFamily(*style);
    m_layout.insertRecord();
    if (m_styles.isEmpty() && !m_styles.lastAlpha().textItems().empty())
        m_layout.setCaretHeight(*m_styles.lastAlpha().textItems().front());
    m_layout.forgetWidth();
    m_layout.updateWidthAndAlign();
    applyShadow();
}

void TextStyleEditor::resetDocument(const TText& record, int cursorPosition)
{
    m_undoTimer.stop();
    m_styles.setCurrent(record);
    const TText& current = m_styles.current();
    m_placement.placePair(QPointF(current.getXValue(), current.getYValue()));
    initShowText();
    if (cursorPosition >= 0) {
        QTextCursor cursor = m_surface.selection();
        cursor.setPosition(std::min(cursorPosition, documentLength(m_document)));
        m_surface.select(cursor);
    }
}

// Typing

void TextStyleEditor::documentChanged(int position, int removed, int added)
{
    if (m_guard > 0 || (removed == 0 && added == 0))
        return;
    // The document includes its last paragraph break in the count when it is filled for the first time.
    removed = std::clamp(removed, 0, std::max(m_styles.count() - position, 0));
    added = std::max(documentLength(m_document) - (m_styles.count() - removed), 0);
    added = cutOffCharsBeyondMaxNum(position, added);
    trimUnchanged(position, removed, added);
    if (removed == 0 && added == 0)
        return;

    m_listener.textTyped();
    m_undoFlag = 1;
    const bool previewTakenBack = m_styles.takeBackPreview(); // new characters must not inherit the preview
    if (removed > 0 && added > 0) {
        replaceCharacters(position, removed, added);
    } else {
        startBurst();
        if (removed > 0)
            charsRemovedChange(position, removed);
        else
            charsAddedChange(position, added);
    }
    reconcile();
    if (previewTakenBack) {
        const Guard guard(*this);
        m_layout.applyFormats(0, m_styles.count());
        m_layout.updateWidthAndAlign();
    }
    showCurrentTextStyle();
    m_listener.textTyped();
}

void TextStyleEditor::repairTexts(int begin, int end)
{
    const QString text = m_document.toPlainText();
    for (int i = std::max(begin, 0); i < std::min({end, m_styles.count(), int(text.size())}); ++i) {
        const std::string wanted = StyleDocument::storedText(text, i).toStdString();
        if (m_styles.at(i)->getText() != wanted)
            m_styles.at(i)->setText(wanted);
    }
}

int TextStyleEditor::cutOffCharsBeyondMaxNum(int position, int added)
{
    const QString text = m_document.toPlainText();
    const qsizetype characters = text.size() - text.count(QLatin1Char('\n'));
    if (characters <= CHARACTER_LIMIT)
        return added;
    // Removes only what was just inserted, backwards from the cursor.
    QTextCursor cursor = m_surface.selection();
    const int end = cursor.position();
    int begin = end;
    for (qsizetype excess = characters - CHARACTER_LIMIT; excess > 0 && begin > position; --begin)
        excess -= text.at(begin - 1) == QLatin1Char('\n') ? 0 : 1;
    if (begin > position && text.at(begin).isLowSurrogate())
        --begin;
    if (begin == end)
        return added;
    const Guard guard(*this);
    cursor.setPosition(begin);
    cursor.setPosition(end, QTextCursor::KeepAnchor);
    cursor.removeSelectedText();
    m_layout.finishLayout();
    m_layout.updateWidthAndAlign();
    return std::max(added - (end - begin), 0);
}

// With every event of an input method the document reports the whole paragraph as replaced, although only the
// committed characters changed. Replacing them all would lose their styles.
void TextStyleEditor::trimUnchanged(int& position, int& removed, int& added) const
{
    const QTextBlock block = m_document.findBlock(position);
    if (removed == 0 || added == 0 || position != block.position() || added < block.length() - 1)
        return;
    const QString text = m_document.toPlainText();
    const auto isSame = [&](int style, int character) {
        return m_styles.at(style)->getText() == StyleDocument::storedText(text, character).toStdString();
    };
    while (removed > 0 && added > 0 && isSame(position, position)) {
        ++position;
        --removed;
        --added;
    }
    while (removed > 0 && added > 0 && isSame(position + removed - 1, position + added - 1)) {
        --removed;
        --added;
    }
}

void TextStyleEditor::replaceCharacters(int position, int removed, int added)
{
    pushLastEditTextIntoStack();
    TText before = m_styles.current();
    TText beforeLast = m_styles.lastAlpha();
    charsRemovedChange(position, removed);
    charsAddedChange(position, added);
    emitEdited(before, beforeLast);
    m_listener.selectionModeChanged(false, false);
}

void TextStyleEditor::reconcile()
{
    const int length = documentLength(m_document);
    while (m_styles.count() > length)
        m_styles.remove(m_styles.count() - 1);
    if (m_styles.count() < length)
        charsAddedChange(m_styles.count(), length - m_styles.count());
}

bool TextStyleEditor::startsFilledLine(int position, int added) const
{
    const QTextBlock block = m_document.findBlock(position);
    return block.isValid() && block.position() == position && added < block.length() - 1;
}

void TextStyleEditor::styleNewCharacter(int position, bool startOfLine, QChar character, TextStyle& style)
{
    m_styles.copyNeighbourStyle(position, startOfLine, character, style);
    if (m_styles.nextInsertSaved()) {
        m_styles.copyTTextToTextStyle(style, m_styles.nextInsert());
        if (m_styles.savedProperty() == PropertyFamily)
            InputLanguageFonts::replaceLastFontWithCurrentCharFont(character, style.getFontFamily());
        m_styles.forgetNextInsert();
    } else if (m_styles.isEmpty()) {
        m_styles.copyTTextToTextStyle(style, m_styles.lastAlpha());
        if (m_ensurePending && m_ensureMode == 1) {
            style.setFontFamily(
                InputLanguageFonts::getDefaultFontAccordingToLanguage(character, true).toStdString());
            m_ensurePending = false;
        }
    }
    ensureFamily(style);
    style.setAlphaDefaultFontOfInputLanguage(
        InputLanguageFonts::getDefaultFontAccordingToLanguage(character, false).toStdString());
}

void TextStyleEditor::charsAddedChange(int position, int added)
{
    const Guard guard(*this);
    const QString text = m_document.toPlainText().mid(position, added);
    for (int i = 0; i < int(text.size()); ++i) {
        auto style = std::make_unique<TextStyle>();
        const int at = position + i;
        styleNewCharacter(at, i == 0 && startsFilledLine(at, added), text.at(i), *style);
        style->setText(StyleDocument::storedText(text, i).toStdString());
        std::vector<std::unique_ptr<TextStyle>> one;
        one.push_back(std::move(style));
        m_styles.insert(at, std::move(one));
    }
    repairTexts(position - 1, position + int(text.size()) + 1);
    m_layout.applyFormats(position, position + int(text.size()));
    if (!m_styles.isEmpty())
        m_layout.setCaretHeight(*m_styles.at(0));
    m_layout.updateAfterTyping(position);
    applyShadow();
    m_styles.forgetNextInsert();
}

void TextStyleEditor::charsRemovedChange(int position, int count)
{
    const Guard guard(*this);
    bool emptied = false;
    for (int i = 0; i < count; ++i) {
        if (m_styles.remove(position)) {
            emptied = true;
            m_listener.selectionModeChanged(false, false);
        }
    }
    if (emptied)
        m_layout.setCaretHeight(*m_styles.lastAlpha().textItems().front());
    repairTexts(position - 1, position + 1);
    m_layout.finishLayout();
    m_layout.updateWidthAndAlign();
    applyShadow();
}

void TextStyleEditor::setFontFamilyEnsureMode(int mode)
{
    m_ensureMode = mode;
    m_ensurePending = true;
}

// Undo steps of typing

void TextStyleEditor::startBurst()
{
    if (!m_undoTimer.isActive())
        m_styles.markEditStart();
    m_undoTimer.start();
}

void TextStyleEditor::undoTimeOut()
{
    m_undoTimer.stop();
    if (m_styles.editStart() == m_styles.current())
        return;
    TText before = m_styles.editStart();
    TText beforeLast = m_styles.editStartLastAlpha();
    emitEdited(before, beforeLast);
}

void TextStyleEditor::pushLastEditTextIntoStack()
{
    if (m_undoTimer.isActive())
        undoTimeOut();
}

void TextStyleEditor::emitEdited(TText& before, TText& beforeLast)
{
    m_listener.contentsEdited(before, m_styles.current(), beforeLast, m_styles.lastAlpha());
}

// Style changes

void TextStyleEditor::changeAllStyleWhenSelectionMode(const TText& source, int id, bool overall, int undoFlag)
{
    m_undoFlag = undoFlag;
    if (id == PropertyPosition) {
        changeTextItemPosition(source.getXValue(), source.getYValue());
        reportMovedObject();
        return;
    }
    selectWholeText();
    m_surface.setFocusFlag(FocusObject);
    if (overall) {
        changeAllStyleWhenHasSelection(source, id);
    } else {
        changePartStyleWhenHasSelection(source, id, undoFlag);
        clearSelection();
    }
}

void TextStyleEditor::changeAllStyleWhenHasSelection(const TText& source, int id)
{
    pushLastEditTextIntoStack();
    cancelPreview();
    const Guard guard(*this);
    TText before = m_styles.current();
    TText beforeLast = m_styles.lastAlpha();
    m_styles.setOverallProperty(id, source);
    // Only place and shadow depend on these properties, so no new layout of the text is needed.
    if (m_styles.isEmpty())
        m_layout.forgetWidth();
    m_layout.updateWidthAndAlign();
    applyShadow();
    const bool wasEdited = m_surface.isWritable();
    m_surface.setWritable(false);
    m_surface.setFocusFlag(FocusObject);
    showStyleOfWholeText();
    m_surface.parentFollows();
    TText after = m_styles.current();
    m_listener.contentsEdited(before, after, beforeLast, m_styles.lastAlpha());
    // The next undo step starts here, even if the last change was a preview.
    m_styles.refreshUndoBaseline();
    m_listener.selectionModeChanged(true, true);
    m_styles.forgetNextInsert();
    // The object is now selected as a whole, so nothing can be typed into it.
    if (wasEdited)
        m_listener.keyboardWanted(false);
}

void TextStyleEditor::changePartStyleWhenHasSelection(const TText& source, int id, int undoFlag)
{
    pushLastEditTextIntoStack();
    if (undoFlag == PreviewedChange)
        m_styles.markPreviewStart();
    else
        cancelPreview(); // the undo step starts at the state before the preview
    m_undoFlag = undoFlag;
    const QTextCursor cursor = m_surface.selection();
    const Guard guard(*this);
    TText before = m_styles.undoBaseline();
    TText beforeLast = m_styles.lastAlpha();
    changeSelectionProperty(id, source, cursor.anchor(), cursor.position());
    applyShadow();
    if (undoFlag == CommittedChange) {
        emitEdited(before, beforeLast);
        m_styles.refreshUndoBaseline();
    }
    m_styles.forgetNextInsert();
    m_surface.repaint();
}

void TextStyleEditor::cancelPreview()
{
    if (!m_styles.takeBackPreview())
        return;
    const Guard guard(*this);
    m_layout.applyFormats(0, m_styles.count());
    m_layout.updateWidthAndAlign();
    applyShadow();
    m_undoFlag = CommittedChange;
    m_styles.refreshUndoBaseline();
}

void TextStyleEditor::changeSelectionProperty(int id, const TText& source, int from, int to)
{
    if (from == to) {
        changeSelectionPropertyWhenObjectIsEmpty(id, source);
        return;
    }
    const auto& given = source.textItems();
    const int begin = std::min(from, to);
    const int end = std::min({std::max(from, to), begin + int(given.size()), m_styles.count()});
    for (int i = begin; i < end; ++i) {
        StyleDocument::setCharacterProperty(id, *m_styles.at(i), *given[size_t(i - begin)]);
        ensureFamily(*m_styles.at(i));
    }
    m_layout.applyFormats(begin, end);
    m_layout.updateWidthAndAlign();
}

void TextStyleEditor::changeSelectionPropertyWhenObjectIsEmpty(int id, const TText& source)
{
    if (m_styles.isEmpty() || source.textItems().empty())
        return;
    StyleDocument::setCharacterProperty(id, *m_styles.at(0), *source.textItems().front());
    ensureFamily(*m_styles.at(0));
    m_layout.applyFormats(0, 1);
    m_layout.setCaretHeight(*m_styles.at(0));
    m_layout.updateWidthAndAlign();
}

void TextStyleEditor::saveStyleForNextInsert(const TText& style, int undoFlag, int id)
{
    if (undoFlag != 1)
        return;
    m_styles.saveForNextInsert(style, id, m_surface.selection().position());
    if (!style.textItems().empty())
        m_layout.setCaretHeight(*style.textItems().front());
}

void TextStyleEditor::changeTextItemPosition(float x, float y)
{
    pushLastEditTextIntoStack();
    TText& current = m_styles.current();
    const QPointF old(current.getXValue(), current.getYValue());
    const TextPlacement::Side side = m_placement.itemIsOutOfRange(QPointF(x, y));
    if (side == TextPlacement::Inside)
        m_placement.setPlace(QPointF(x, y));
    else
        m_placement.adjustItemPos(side);
    const QPointF now = m_placement.textPlace();
    current.setXValue(float(now.x()));
    current.setYValue(float(now.y()));
    m_placement.clearMoved();
    m_listener.objectMoved(old, now);
}

void TextStyleEditor::reportMovedObject()
{
    const TText& current = m_styles.current();
    TText report = m_styles.isEmpty() ? m_styles.nextInsert() : current;
    report.setXValue(current.getXValue());
    report.setYValue(current.getYValue());
    m_listener.styleShown(report);
    m_styles.refreshUndoBaseline();
}

// Reports to the panel

void TextStyleEditor::reportStyle(const TextStyle& style)
{
    TText report;
    m_styles.copyTextStyle(report, style);
    m_listener.styleShown(report);
}

void TextStyleEditor::showTextStyleOfCursorPosition(const QTextCursor& cursor)
{
    const auto& saved = m_styles.nextInsert().textItems();
    if (m_styles.savedCursorPosition() == cursor.position() && !saved.empty()) {
        reportStyle(*saved.front());
        return;
    }
    m_styles.forgetNextInsert();
    m_styles.setSavedCursorPosition(-2);
    if (!m_surface.isWritable())
        return;
    if (const TextStyle* style = m_styles.at(std::max(cursor.position() - 1, 0)))
        reportStyle(*style);
}

void TextStyleEditor::showCurrentTextStyle()
{
    const QTextCursor cursor = m_surface.selection();
    if (m_styles.isEmpty()) {
        TText report = m_styles.lastAlpha();
        report.setXValue(m_styles.current().getXValue());
        report.setYValue(m_styles.current().getYValue());
        m_listener.styleShown(report);
    } else if (!cursor.hasSelection()) {
        showTextStyleOfCursorPosition(cursor);
    } else {
        m_styles.setSavedCursorPosition(-2);
        TText report;
        m_styles.copySelection(report, cursor.selectionStart(), cursor.selectionEnd());
        m_listener.styleShown(report);
    }
    if (m_undoFlag == 1)
        m_styles.refreshUndoBaseline();
}

void TextStyleEditor::selectWholeText()
{
    QTextCursor cursor = m_surface.selection();
    cursor.select(QTextCursor::Document);
    m_surface.select(cursor);
}

void TextStyleEditor::clearSelection()
{
    QTextCursor cursor = m_surface.selection();
    cursor.clearSelection();
    m_surface.select(cursor);
}

void TextStyleEditor::showStyleOfWholeText()
{
    selectWholeText();
    showCurrentTextStyle();
    clearSelection();
}

void TextStyleEditor::applyShadow()
{
    TText& record = m_styles.isEmpty() ? m_styles.lastAlpha() : m_styles.current();
    StyleDocument::setItemShadowInfo(record);
    m_surface.showShadow(*record.getTextShadow());
}
