#include "canvas/GraphicsText.h"

#include "canvas/IInputLanguageSource.h"
#include "canvas/InputLanguageFonts.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextItemSurface.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextObjectParts.h"
#include "canvas/TextPainter.h"
#include "canvas/TextShadowEffect.h"
#include "canvas/TextStyleEditor.h"
#include "canvas/TouchTextEditor.h"
#include "support/LogManager.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QGraphicsScene>
#include <QPainter>
#include <QStyleOptionGraphicsItem>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextOption>

using namespace TextObjectConstants;

GraphicsText::GraphicsText(TText* record, int id, QGraphicsItem* parent, QGraphicsScene* scene)
    : ReportingTextItem(parent), m_styles(std::make_unique<StyleDocument>()), m_placement(*this)
{
    if (record)
        m_styles->setCurrent(*record);
    if (id != 0)
        m_styles->current().setTextObjectID(id);
    initDataForGraphicsText();
    if (scene)
        scene->addItem(this);
}

GraphicsText::GraphicsText(bool parentObject, QGraphicsItem* parent, QGraphicsScene* scene)
    : ReportingTextItem(parent)
    , m_styles(std::make_unique<StyleDocument>())
    , m_placement(*this)
    , m_parentObject(parentObject)
{
    initDataForGraphicsText();
    if (scene)
        scene->addItem(this);
}

GraphicsText::~GraphicsText() = default;

void GraphicsText::initDataForGraphicsText()
{
    makeUnits();

    setFlag(ItemIsMovable);
    setFlag(ItemIsSelectable);
    setFlag(ItemUsesExtendedStyleOption); // so that only what is exposed is painted
    // The frame is larger than the child. A finger on it must not drag the parent without the child.
    if (m_parentObject)
        setAcceptedMouseButtons(Qt::NoButton);
    // Undo steps are formed from the records; the document's own undo would conflict with them.
    document()->setUndoRedoEnabled(false);
    document()->setDocumentMargin(DOCUMENT_MARGIN);
    QTextOption option = document()->defaultTextOption();
    // An object is as wide as its longest line, which must not be wrapped because of rounding.
    option.setWrapMode(QTextOption::NoWrap);
    document()->setDefaultTextOption(option);

    if (IInputLanguageSource* source = IInputLanguageSource::instance()) {
        connect(source, &IInputLanguageSource::signalsInputLanguageInfo, this,
                &GraphicsText::slotObjectDisplayInputLanguage);
    }
}

void GraphicsText::makeUnits()
{
    m_shadowEffect = new TextShadowEffect(*this);
    m_shadowEffect->setColor(DROP_SHADOW_COLOR);
    m_shadowEffect->setOffset(0.0, 0.0);
    m_shadowEffect->setEnabled(false);
    setGraphicsEffect(m_shadowEffect);

    m_painter = std::make_unique<TextPainter>(*document(), *m_styles);
    m_surface = std::make_unique<TextItemSurface>(*this, *m_painter, *m_shadowEffect);
    const TextObjectParts parts{*document(), *m_styles, m_painter->carets(), m_placement, *m_surface, *this};
    m_styleEditor = std::make_unique<TextStyleEditor>(parts);
    m_touchEditor = std::make_unique<TouchTextEditor>(parts, *m_styleEditor);
    if (!m_parentObject)
        setInput(m_touchEditor.get());
    connect(&m_styleEditor->undoTimer(), &QTimer::timeout, this, &GraphicsText::slotUndoTimeOut);
    connect(&m_touchEditor->longPressTimer(), &QTimer::timeout, this, &GraphicsText::slotLongPressed);
}

// The pair

GraphicsText* GraphicsText::parentTextItem() const
{
    return qgraphicsitem_cast<GraphicsText*>(parentItem());
}

GraphicsText* GraphicsText::childTextItem() const
{
    const QList<QGraphicsItem*> children = childItems();
    for (QGraphicsItem* child : children)
        if (auto* text = qgraphicsitem_cast<GraphicsText*>(child))
            return text;
    return nullptr;
}

bool GraphicsText::isParentItem() const
{
    return m_parentObject && !childItems().isEmpty();
}

void GraphicsText::parentFollows()
{
    m_surface->parentFollows();
}

void GraphicsText::placeAt(QPointF position)
{
    m_styles->current().setXValue(float(position.x()));
    m_styles->current().setYValue(float(position.y()));
    m_placement.placePair(position);
    m_styles->refreshUndoBaseline();
}

// Records and styles

TText* GraphicsText::getItemTText() const
{
    return &m_styles->current();
}

TText* GraphicsText::getTextList() const
{
    auto copy = std::make_unique<TText>(m_styles->current());
    m_styles->removePreviewFrom(*copy);
    copy->setText(toPlainText().toStdString());
    return copy.release();
}

TText* GraphicsText::getLastAlpaTextStyleValue() const
{
    return &m_styles->lastAlpha();
}

void GraphicsText::setLastAlpaTextStyleValue(TText& style)
{
    m_styles->lastAlpha() = style;
}

void GraphicsText::initShowText()
{
    m_styleEditor->initShowText();
    m_styles->refreshUndoBaseline();
}

void GraphicsText::resetDocument(TText* record, int cursorPos)
{
    if (!record)
        return;
    m_styleEditor->resetDocument(*record, cursorPos);
    m_styles->refreshUndoBaseline();
}

bool GraphicsText::isHandleCaret() const
{
    return m_touchEditor->isHandleCaret();
}

bool GraphicsText::isDoubleClickedSelection() const
{
    return m_touchEditor->isDoubleClickedSelection();
}

void GraphicsText::changeAllStyleWhenSelectionMode(TText* source, int id, bool overall, int undoFlag)
{
    if (source)
        m_styleEditor->changeAllStyleWhenSelectionMode(*source, id, overall, undoFlag);
}

void GraphicsText::changeAllStyleWhenEditMode(TText* source, int id, bool overall, int undoFlag)
{
    changeAllStyleWhenSelectionMode(source, id, overall, undoFlag);
}

void GraphicsText::changeAllStyleWhenHasSelection(TText* source, int id)
{
    if (source)
        m_styleEditor->changeAllStyleWhenHasSelection(*source, id);
}

void GraphicsText::changePartStyleWhenHasSelection(TText* source, int id, int undoFlag)
{
    if (source)
        m_styleEditor->changePartStyleWhenHasSelection(*source, id, undoFlag);
}

void GraphicsText::saveStyleForNextInsert(TText* style, int undoFlag, int id)
{
    if (style)
        m_styleEditor->saveStyleForNextInsert(*style, undoFlag, id);
}

void GraphicsText::cancelPreview()
{
    m_styleEditor->cancelPreview();
}

void GraphicsText::setInputLanguage(int row)
{
    if (row >= 0 && row < InputLanguageFonts::LANGUAGE_ROWS)
        InputLanguageFonts::mInputLanguage = row;
}

void GraphicsText::setFontFamilyEnsureMode(int mode)
{
    m_styleEditor->setFontFamilyEnsureMode(mode);
}

void GraphicsText::setRadio(double ratio, bool big)
{
    m_bigScene = big;
    document()->setDocumentMargin(big ? BIG_DOCUMENT_MARGIN : DOCUMENT_MARGIN);
    m_painter->setRatio(ratio);
}

double GraphicsText::canvasRatio() const
{
    return m_painter->ratio();
}

quint64 GraphicsText::contentVersion() const
{
    return m_painter->contentVersion();
}

void GraphicsText::cancelTouch()
{
    if (!m_parentObject)
        m_touchEditor->cancelTouch();
}

QRectF GraphicsText::inkRect() const
{
    return m_painter->inkRect();
}

void GraphicsText::initNewTextSelectAll()
{
    m_touchEditor->initNewTextSelectAll();
}

void GraphicsText::changeItemToSolidLineState()
{
    m_touchEditor->changeItemToSolidLineState();
}

void GraphicsText::pushLastEditTextIntoStack()
{
    m_styleEditor->pushLastEditTextIntoStack();
}

bool GraphicsText::isTyping() const
{
    return m_styleEditor->isTyping();
}

void GraphicsText::discardBurst()
{
    m_styleEditor->discardBurst();
}

void GraphicsText::getSelectionInfo(int begin, int end, int current, int mode)
{
    m_touchEditor->getSelectionInfo(begin, end, current, mode);
}

void GraphicsText::showCurrentTextStyle()
{
    m_styleEditor->showCurrentTextStyle();
}

bool GraphicsText::isBlank() const
{
    return toPlainText().simplified().trimmed().isEmpty();
}

// ITextObjectListener: reports that name the object

void GraphicsText::objectMoved(QPointF from, QPointF to)
{
    Q_EMIT signalObjectPositionChanged(getItemTText()->getTextObjectID(), from, to);
}

void GraphicsText::textTyped()
{
    m_touchEditor->clearHandleCaret();
}

void GraphicsText::objectPressed()
{
    Q_EMIT signalNotifySceneCurrentMousePressedObjectId(getItemTText()->getTextObjectID());
}

void GraphicsText::editingBegins()
{
    Q_EMIT signalGetSceneInputLanguage(this);
}

void GraphicsText::keyboardWanted(bool wanted)
{
    Q_EMIT signalNotifySceneCurrentObjectInEditMode(wanted ? this : nullptr);
}

void GraphicsText::keyboardClosed()
{
    LOG_DEBUG_OPERATE(L"Edit Area", 200, L"*****SoftKeyBoardClosed event is received*****");
    // Pushes the undo step of the typed text first, so that no later step is pushed before it.
    m_styleEditor->pushLastEditTextIntoStack();
    if (!(m_styles->undoBaseline() == m_styles->current())) {
        TText before = m_styles->undoBaseline();
        TText last = m_styles->lastAlpha();
        contentsEdited(before, m_styles->current(), last, m_styles->lastAlpha());
        m_styles->refreshUndoBaseline();
    }
    Q_EMIT signalSoftWareClosedWhenEditObject();
    Q_EMIT signalSaveArchive(this);
    if (isBlank()) {
        Q_EMIT signalNotifyIfExistSelectedObject(false);
        Q_EMIT signalDeleteItem();
    } else {
        changeItemToSolidLineState();
    }
}

// Slots

void GraphicsText::slotObjectDocumentChange(int position, int removed, int added)
{
    m_surface->beginChange();
    const bool isRepainted = m_styleEditor->documentChanged(position, removed, added);
    if (!isRepainted)
        m_painter->invalidate();
    m_surface->endChange(isRepainted);
}

void GraphicsText::slotObjectPositionChanged()
{
    m_placement.markMoved();
}

void GraphicsText::slotUndoTimeOut()
{
    m_styleEditor->undoTimeOut();
}

void GraphicsText::slotLongPressed()
{
    if (isEnabled())
        m_touchEditor->longPressed();
}

void GraphicsText::slotObjectDisplayInputLanguage(SystemSetupDef::emInputLanguageType language)
{
    InputLanguageFonts::mInputLanguage = InputLanguageFonts::languageRow(language);
}

// Geometry and painting

void GraphicsText::setBoundingRectFlag(bool flag)
{
    if (m_boundingRectFlag == flag)
        return;
    prepareGeometryChange();
    m_boundingRectFlag = flag;
}

QRectF GraphicsText::limitedBoundingRect() const
{
    const QRectF raster = m_bigScene ? BIG_SCENE_RECT : SCENE_RECT;
    const QRectF limit = raster.adjusted(-LIMITEDNUM, -LIMITEDNUM, LIMITEDNUM, LIMITEDNUM);
    const QRectF own(QPointF(0.0, 0.0), layoutRect().size());
    return own.intersected(limit.translated(-scenePos()));
}

QRectF GraphicsText::boundingRect() const
{
    if (m_boundingRectFlag)
        return limitedBoundingRect();
    const GraphicsText* child = m_parentObject ? childTextItem() : nullptr;
    if (!child)
        return layoutRect();
    // The frame is drawn around the child.
    constexpr double pen = ITEMBOUNDINGWIDTH / 2.0;
    return layoutRect().united(child->layoutRect()).adjusted(-pen, -pen, pen, pen);
}

void GraphicsText::paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget*)
{
    // The base class has nothing to paint: Qt's selection frame and the document's own caret are not wanted,
    // and its glyphs are transparent.
    painter->save();
    if (m_parentObject) {
        paintFrame(painter, option ? option->exposedRect : boundingRect());
    } else {
        m_touchEditor->paintBelowGlyphs(painter);
        m_painter->drawSelection(painter, textCursor(), hasFocus());
        m_painter->drawItemText(painter, option ? option->exposedRect : boundingRect());
        if (getBoundingLineStatus() == FocusEdit)
            m_touchEditor->paintAboveGlyphs(painter);
    }
    painter->restore();
}

void GraphicsText::paintFrame(QPainter* painter, const QRectF& exposed)
{
    const GraphicsText* child = childTextItem();
    const int status = child ? child->getBoundingLineStatus() : FocusNone;
    if (status == FocusObject || (status == FocusEdit && child->getFocusFlag() == FocusEdit))
        m_painter->drawItemBoundingRect(painter, child->boundingRect(), status, exposed);
}

// Events

void GraphicsText::customEvent(QEvent* event)
{
    if (m_parentObject)
        return;
    if (event->type() == QEvent::Type(KSInputContext::SoftKeyBoardCloseType)) {
        Q_EMIT signalEndPreview();
        keyboardClosed();
    } else if (event->type() == KSSoftKeyboardCursorSettingEvent::myType) {
        Q_EMIT signalEndPreview();
        const auto& setting = static_cast<KSSoftKeyboardCursorSettingEvent&>(*event);
        getSelectionInfo(setting.getCursorBeginPos(), setting.getCursorEndPos(),
                         setting.getCursorCurrentPos(), setting.getCursorSelectionMode());
    }
}

QVariant GraphicsText::itemChange(GraphicsItemChange change, const QVariant& value)
{
    if (change == ItemSelectedHasChanged && !m_parentObject)
        Q_EMIT signalObjectSelectedHasChanged(this);
    return ReportingTextItem::itemChange(change, value);
}
