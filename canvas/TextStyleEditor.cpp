#include "canvas/TextStyleEditor.h"

#include "canvas/CharacterFormat.h"
#include "canvas/GraphicsText.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextPainter.h"
#include "canvas/TouchTextEditor.h"

#include <QGraphicsDropShadowEffect>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QTextOption>
#include <algorithm>
#include <cmath>

namespace
{

// Styles that the document lays out alike.
bool sameLayout(const TextStyle& a, const TextStyle& b)
{
    return a.fontIsTheSame(b) && a.getTextKerning() == b.getTextKerning() &&
           (a.isTextEdge() != 0) == (b.isTextEdge() != 0);
}

int documentLength(const QTextDocument& document)
{
    return document.characterCount() - 1;
}

} // namespace

// While one lives, changes of the document come from here and are not read back.
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

TextStyleEditor::TextStyleEditor(GraphicsText& item) : m_item(item), m_styles(item.styles())
{
    m_undoTimer.setSingleShot(true);
    m_undoTimer.setInterval(EDIT_AUTO_SAVE_TIME);
    QObject::connect(&m_undoTimer, &QTimer::timeout, &item, &GraphicsText::slotUndoTimeOut);
}

// Loading

void TextStyleEditor::ensureFamily(TextStyle& style)
{
    const QString wanted = QString::fromStdString(style.getFontFamily());
    if (CharacterFormat::familyIsInstalled(wanted))
        return;
    style.setFontFamily(InputLanguageFonts::substituteFamily().toStdString());
    Q_EMIT m_item.signalShowMessageWhenUsingDefaultFont(wanted);
}

void TextStyleEditor::insertRecord()
{
    QTextCursor cursor(m_item.document());
    cursor.beginEditBlock();
    cursor.select(QTextCursor::Document);
    cursor.removeSelectedText();
    // Texts of a title often have the same height: with the last one's margins, the text that comes now need
    // not be laid out again for its own.
    QTextBlockFormat format = cursor.blockFormat();
    format.setLeftMargin(BOUNDING_RECT_EXPAND_REGION_FOR_HANDLE);
    format.setRightMargin(BOUNDING_RECT_EXPAND_REGION_FOR_HANDLE);
    cursor.setBlockFormat(format);
    for (int begin = 0; begin < m_styles.count();) {
        QString text;
        TextStyle& first = *m_styles.at(begin);
        ensureFamily(first);
        int end = begin;
        do {
            text += StyleDocument::textOf(*m_styles.at(end));
            if (++end < m_styles.count())
                ensureFamily(*m_styles.at(end));
        } while (end < m_styles.count() && sameLayout(first, *m_styles.at(end)));
        cursor.insertText(text, CharacterFormat::layoutFormat(first, m_item.canvasRatio()));
        begin = end;
    }
    cursor.endEditBlock();
}

void TextStyleEditor::initShowText()
{
    const Guard guard(*this);
    insertRecord();
    if (m_styles.isEmpty() && !m_styles.lastAlpha().textItems().empty())
        setCaretHeight(*m_styles.lastAlpha().textItems().front());
    updateWidthAndAlign(0.0);
    applyShadow();
}

void TextStyleEditor::resetDocument(const TText& record, int cursorPosition)
{
    m_undoTimer.stop();
    m_styles.setCurrent(record);
    const TText& current = m_styles.current();
    GraphicsText* parent = m_item.parentTextItem();
    if (parent) {
        parent->setPos(current.getXValue(), current.getYValue());
        m_item.setPos(0.0, 0.0);
    }
    initShowText();
    if (cursorPosition >= 0) {
        QTextCursor cursor = m_item.textCursor();
        cursor.setPosition(std::min(cursorPosition, documentLength(*m_item.document())));
        m_item.setTextCursor(cursor);
    }
}

// Typing

void TextStyleEditor::documentChanged(int position, int removed, int added)
{
    m_item.textPainter().invalidate();
    if (m_guard > 0 || (removed == 0 && added == 0))
        return;
    // The document counts its last paragraph in when it is filled for the first time.
    removed = std::clamp(removed, 0, std::max(m_styles.count() - position, 0));
    added = std::max(documentLength(*m_item.document()) - (m_styles.count() - removed), 0);
    added = cutOffCharsBeyondMaxNum(position, added);
    trimUnchanged(position, removed, added);
    if (removed == 0 && added == 0)
        return;

    m_item.touchEditor().clearHandleCaret();
    m_undoFlag = 1;
    const bool previewTakenBack = m_styles.takeBackPreview(); // new characters do not take it over
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
        applyFormats(0, m_styles.count());
    }
    showCurrentTextStyle();
    m_item.touchEditor().clearHandleCaret();
}

void TextStyleEditor::repairTexts(int begin, int end)
{
    const QString text = m_item.toPlainText();
    for (int i = std::max(begin, 0); i < std::min({end, m_styles.count(), int(text.size())}); ++i) {
        const std::string wanted = StyleDocument::storedText(text, i).toStdString();
        if (m_styles.at(i)->getText() != wanted)
            m_styles.at(i)->setText(wanted);
    }
}

int TextStyleEditor::cutOffCharsBeyondMaxNum(int position, int added)
{
    const QString text = m_item.toPlainText();
    const qsizetype characters = text.size() - text.count(QLatin1Char('\n'));
    if (characters <= CHARACTER_LIMIT)
        return added;
    // Only what has just come may go, from the cursor backwards.
    QTextCursor cursor = m_item.textCursor();
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
    finishLayout();
    updateWidthAndAlign(m_lastWidth);
    return std::max(added - (end - begin), 0);
}

// With every event of an input method the document reports the whole paragraph, whose characters are the same
// but for what was committed. They would lose their styles.
void TextStyleEditor::trimUnchanged(int& position, int& removed, int& added) const
{
    const QTextBlock block = m_item.document()->findBlock(position);
    if (removed == 0 || added == 0 || position != block.position() || added < block.length() - 1)
        return;
    const QString text = m_item.toPlainText();
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
    Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(false, false);
}

void TextStyleEditor::reconcile()
{
    const int length = documentLength(*m_item.document());
    while (m_styles.count() > length)
        m_styles.remove(m_styles.count() - 1);
    if (m_styles.count() < length)
        charsAddedChange(m_styles.count(), length - m_styles.count());
}

bool TextStyleEditor::startsFilledLine(int position, int added) const
{
    const QTextBlock block = m_item.document()->findBlock(position);
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
    const QString text = m_item.toPlainText().mid(position, added);
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
    applyFormats(position, position + int(text.size()));
    if (!m_styles.isEmpty())
        setCaretHeight(*m_styles.at(0));
    updateWidthAndAlign(m_lastWidth);
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
            Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(false, false);
        }
    }
    if (emptied)
        setCaretHeight(*m_styles.lastAlpha().textItems().front());
    repairTexts(position - 1, position + 1);
    finishLayout();
    updateWidthAndAlign(m_lastWidth);
    applyShadow();
}

void TextStyleEditor::setCaretHeight(const TextStyle& style)
{
    // The height of an empty line comes from the item's font; setting it lays the document out.
    QFont font = m_item.font();
    font.setFamily(QString::fromStdString(style.getFontFamily()));
    font.setPixelSize(CharacterFormat::pixelSize(style, m_item.canvasRatio()));
    if (font != m_item.font())
        m_item.setFont(font);
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
    Q_EMIT m_item.signalObjectContentsEdited(&before, &m_styles.current(), &beforeLast,
                                             &m_styles.lastAlpha());
}

// Style changes

void TextStyleEditor::applyFormats(int begin, int end)
{
    end = std::min(end, documentLength(*m_item.document()));
    QTextCursor cursor(m_item.document());
    cursor.beginEditBlock();
    while (begin < end) {
        const TextStyle* first = m_styles.at(begin);
        if (!first)
            break;
        int next = begin + 1;
        while (next < end && m_styles.at(next) && sameLayout(*first, *m_styles.at(next)))
            ++next;
        cursor.setPosition(begin);
        cursor.setPosition(next, QTextCursor::KeepAnchor);
        cursor.setCharFormat(CharacterFormat::layoutFormat(*first, m_item.canvasRatio()));
        begin = next;
    }
    cursor.endEditBlock();
}

void TextStyleEditor::changeAllStyleWhenSelectionMode(const TText& source, int id, bool overall, int undoFlag)
{
    m_undoFlag = undoFlag;
    if (id == PropertyPosition) {
        changeTextItemPosition(source.getXValue(), source.getYValue());
        reportMovedObject();
        return;
    }
    selectWholeText();
    m_item.setFocusFlag(FocusObject);
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
    // Only place and shadow depend on these properties, so the text stays laid out.
    updateWidthAndAlign(m_styles.isEmpty() ? 0.0 : m_lastWidth);
    applyShadow();
    const bool wasEdited = m_item.textInteractionFlags() == Qt::TextEditorInteraction;
    m_item.setTextInteractionFlags(Qt::NoTextInteraction);
    m_item.setFocusFlag(FocusObject);
    showStyleOfWholeText();
    m_item.parentFollows();
    TText after = m_styles.current();
    Q_EMIT m_item.signalObjectContentsEdited(&before, &after, &beforeLast, &m_styles.lastAlpha());
    // The next step starts here, also when the last change was a preview.
    m_styles.refreshUndoBaseline();
    Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(true, true);
    m_styles.forgetNextInsert();
    // The object is selected now, and nothing can be typed into it.
    if (wasEdited)
        Q_EMIT m_item.signalNotifySceneCurrentObjectInEditMode(nullptr);
}

void TextStyleEditor::changePartStyleWhenHasSelection(const TText& source, int id, int undoFlag)
{
    pushLastEditTextIntoStack();
    if (undoFlag == PreviewedChange)
        m_styles.markPreviewStart();
    else
        cancelPreview(); // the step of undo leads from before the preview to this change
    m_undoFlag = undoFlag;
    const QTextCursor cursor = m_item.textCursor();
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
    m_item.update();
}

void TextStyleEditor::cancelPreview()
{
    if (!m_styles.takeBackPreview())
        return;
    const Guard guard(*this);
    applyFormats(0, m_styles.count());
    updateWidthAndAlign(m_lastWidth);
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
    applyFormats(begin, end);
    updateWidthAndAlign(m_lastWidth);
}

void TextStyleEditor::changeSelectionPropertyWhenObjectIsEmpty(int id, const TText& source)
{
    if (m_styles.isEmpty() || source.textItems().empty())
        return;
    StyleDocument::setCharacterProperty(id, *m_styles.at(0), *source.textItems().front());
    ensureFamily(*m_styles.at(0));
    applyFormats(0, 1);
    setCaretHeight(*m_styles.at(0));
    updateWidthAndAlign(m_lastWidth);
}

void TextStyleEditor::saveStyleForNextInsert(const TText& style, int undoFlag, int id)
{
    if (undoFlag != 1)
        return;
    m_styles.saveForNextInsert(style, id, m_item.textCursor().position());
    if (!style.textItems().empty())
        setCaretHeight(*style.textItems().front());
}

void TextStyleEditor::changeTextItemPosition(float x, float y)
{
    pushLastEditTextIntoStack();
    TText& current = m_styles.current();
    const QPointF old(current.getXValue(), current.getYValue());
    TouchTextEditor& touch = m_item.touchEditor();
    const int side = touch.itemIsOutOfRange(QPointF(x, y));
    if (side == 0)
        m_item.placedItem()->setPos(x, y);
    else
        touch.adjustItemPos(side);
    const QPointF now = m_item.scenePos();
    current.setXValue(float(now.x()));
    current.setYValue(float(now.y()));
    touch.clearPositionChanged();
    Q_EMIT m_item.signalObjectPositionChanged(current.getTextObjectID(), old, now);
}

void TextStyleEditor::reportMovedObject()
{
    const TText& current = m_styles.current();
    TText report = m_styles.isEmpty() ? m_styles.nextInsert() : current;
    report.setXValue(current.getXValue());
    report.setYValue(current.getYValue());
    Q_EMIT m_item.signalNotifyPropertyAreaObjectSelectionStyleChange(&report);
    m_styles.refreshUndoBaseline();
}

// What the panel shows

void TextStyleEditor::reportStyle(const TextStyle& style)
{
    TText report;
    m_styles.copyTextStyle(report, style);
    Q_EMIT m_item.signalNotifyPropertyAreaObjectSelectionStyleChange(&report);
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
    if (m_item.textInteractionFlags() != Qt::TextEditorInteraction)
        return;
    if (const TextStyle* style = m_styles.at(std::max(cursor.position() - 1, 0)))
        reportStyle(*style);
}

void TextStyleEditor::showCurrentTextStyle()
{
    const QTextCursor cursor = m_item.textCursor();
    if (m_styles.isEmpty()) {
        TText report = m_styles.lastAlpha();
        report.setXValue(m_styles.current().getXValue());
        report.setYValue(m_styles.current().getYValue());
        Q_EMIT m_item.signalNotifyPropertyAreaObjectSelectionStyleChange(&report);
    } else if (!cursor.hasSelection()) {
        showTextStyleOfCursorPosition(cursor);
    } else {
        m_styles.setSavedCursorPosition(-2);
        TText report;
        m_styles.copySelection(report, cursor.selectionStart(), cursor.selectionEnd());
        Q_EMIT m_item.signalNotifyPropertyAreaObjectSelectionStyleChange(&report);
    }
    if (m_undoFlag == 1)
        m_styles.refreshUndoBaseline();
}

void TextStyleEditor::selectWholeText()
{
    QTextCursor cursor = m_item.textCursor();
    cursor.select(QTextCursor::Document);
    m_item.setTextCursor(cursor);
}

void TextStyleEditor::clearSelection()
{
    QTextCursor cursor = m_item.textCursor();
    cursor.clearSelection();
    m_item.setTextCursor(cursor);
}

void TextStyleEditor::showStyleOfWholeText()
{
    selectWholeText();
    showCurrentTextStyle();
    clearSelection();
}

// Layout

void TextStyleEditor::updateWidthAndAlign(double oldWidth)
{
    const Guard guard(*this);
    m_item.announceGeometryChange();
    adjustLeftAndRightMargin();
    const double width = naturalWidth();
    if (m_item.textWidth() != width)
        m_item.setTextWidth(width);
    setDocumentAlign(oldWidth, width);
    m_lastWidth = width;
    if (GraphicsText* parent = m_item.parentTextItem())
        parent->setTextWidth(width);
    m_item.parentFollows();
    m_item.textPainter().invalidate();
    m_item.update();
}

// The width that the document has without a text width. Lines never wrap, so they tell it whatever width is
// set, and the document need not be laid out twice. Margins count in 64ths of a pixel, as the layout rounds
// them.
double TextStyleEditor::naturalWidth() const
{
    const auto rounded = [](double margin) { return std::floor(margin * 64.0) / 64.0; };
    const QTextDocument& document = *m_item.document();
    double widest = 0.0;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        const QTextBlockFormat format = block.blockFormat();
        const double margins = rounded(format.leftMargin()) + rounded(format.rightMargin());
        for (int i = 0; i < block.layout()->lineCount(); ++i)
            widest = std::max(widest, block.layout()->lineAt(i).naturalTextWidth() + margins);
    }
    return widest + 2.0 * rounded(document.documentMargin());
}

// While the document reports a removal it has not laid itself out yet; a change of width makes it do so.
void TextStyleEditor::finishLayout()
{
    m_item.setTextWidth(-1.0);
}

void TextStyleEditor::adjustLeftAndRightMargin()
{
    QTextDocument& document = *m_item.document();
    double tallest = 0.0;
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        if (block.layout()->lineCount() > 0)
            tallest = std::max(tallest, block.layout()->lineAt(0).height());
    }
    BOUNDING_RECT_EXPAND_REGION = MARGIN_SHARE_OF_LINE * tallest;
    BOUNDING_RECT_EXPAND_REGION_FOR_HANDLE = BOUNDING_RECT_EXPAND_REGION / 2.0;
    const double margin = BOUNDING_RECT_EXPAND_REGION_FOR_HANDLE;

    QTextCursor cursor(&document);
    cursor.beginEditBlock();
    for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
        QTextBlockFormat format = block.blockFormat();
        if (qFuzzyCompare(format.leftMargin(), margin) && qFuzzyCompare(format.rightMargin(), margin))
            continue;
        format.setLeftMargin(margin);
        format.setRightMargin(margin);
        cursor.setPosition(block.position());
        cursor.setBlockFormat(format);
    }
    cursor.endEditBlock();
}

void TextStyleEditor::setDocumentAlign(double oldWidth, double width)
{
    const int align = m_styles.current().getTextAlign();
    const Qt::Alignment wanted =
        align == 0 ? Qt::AlignHCenter : (align == 1 ? Qt::AlignRight : Qt::AlignLeft);
    QTextOption option = m_item.document()->defaultTextOption();
    if (option.alignment() != wanted) {
        option.setAlignment(wanted);
        m_item.document()->setDefaultTextOption(option);
        if (GraphicsText* parent = m_item.parentTextItem())
            parent->document()->setDefaultTextOption(option);
    }
    GraphicsText* parent = m_item.parentTextItem();
    if (!parent || oldWidth == 0.0 || (align != 0 && align != 1))
        return;
    const double shift = (oldWidth - width) * (align == 0 ? CENTERPERCNTAGE : 1.0);
    if (shift == 0.0)
        return;
    parent->moveBy(shift, 0.0);
    m_styles.current().setXValue(float(m_item.scenePos().x()));
}

void TextStyleEditor::applyShadow()
{
    TText& record = m_styles.isEmpty() ? m_styles.lastAlpha() : m_styles.current();
    StyleDocument::setItemShadowInfo(record);
    const TShadow& shadow = *record.getTextShadow();
    QGraphicsDropShadowEffect& effect = *m_item.shadowEffect();
    effect.setOffset(shadow.getShadowDirectionX() * m_item.canvasRatio(),
                     shadow.getShadowDirectionY() * m_item.canvasRatio());
    effect.setBlurRadius(shadow.getShadowBlurRadius());
    effect.setEnabled(shadow.getShadowDirectionX() != 0 || shadow.getShadowDirectionY() != 0);
}
