#include "canvas/GraphicsText.h"

#include "canvas/IInputLanguageSource.h"
#include "canvas/InputLanguageFonts.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectParts.h"
#include "canvas/TextPainter.h"
#include "canvas/TextShadowEffect.h"
#include "canvas/TextStyleEditor.h"
#include "canvas/TouchTextEditor.h"
#include "support/LogManager.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QAbstractEventDispatcher>
#include <QAbstractTextDocumentLayout>
#include <QClipboard>
#include <QGraphicsScene>
#include <QGraphicsSceneContextMenuEvent>
#include <QGraphicsSceneMouseEvent>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QMimeData>
#include <QPainter>
#include <QStyleHints>
#include <QStyleOptionGraphicsItem>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextOption>
#include <algorithm>
#include <utility>

using namespace TextObjectConstants;

namespace
{

// Returns whether the event is a blink of the document's own caret, which is not painted: it would only cause
// repaints.
bool isBlinkOfCaret(QObject* watched, const QEvent* event)
{
    if (event->type() != QEvent::Timer)
        return false;
    const int blink = QGuiApplication::styleHints()->cursorFlashTime() / 2;
    const int id = static_cast<const QTimerEvent*>(event)->timerId();
    const QList<QAbstractEventDispatcher::TimerInfo> timers =
        QAbstractEventDispatcher::instance()->registeredTimers(watched);
    return std::any_of(timers.begin(), timers.end(), [blink, id](const auto& timer) {
        return timer.timerId == id && timer.interval == blink;
    });
}

} // namespace

GraphicsText::GraphicsText(TText* record, int id, QGraphicsItem* parent, QGraphicsScene* scene)
    : QGraphicsTextItem(parent), m_styles(std::make_unique<StyleDocument>()), m_placement(*this)
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
    : QGraphicsTextItem(parent)
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
    setAcceptTouchEvents(true);
    // The frame is larger than the child. A finger on it must not drag the parent without the child.
    if (m_parentObject)
        setAcceptedMouseButtons(Qt::NoButton);
    setAcceptDrops(false);
    // Undo steps are formed from the records; the document's own undo would conflict with them.
    document()->setUndoRedoEnabled(false);
    document()->setDocumentMargin(DOCUMENT_MARGIN);
    QTextOption option = document()->defaultTextOption();
    // An object is as wide as its longest line, which must not be wrapped because of rounding.
    option.setWrapMode(QTextOption::NoWrap);
    document()->setDefaultTextOption(option);

    m_shadowEffect = new TextShadowEffect(*this);
    m_shadowEffect->setColor(DROP_SHADOW_COLOR);
    m_shadowEffect->setOffset(0.0, 0.0);
    m_shadowEffect->setEnabled(false);
    setGraphicsEffect(m_shadowEffect);

    installEventFilter(this);
    QAbstractTextDocumentLayout* layout = document()->documentLayout();
    const QObjectList parts = children();
    for (QObject* part : parts) {
        part->installEventFilter(this);
        disconnect(layout, &QAbstractTextDocumentLayout::update, part, nullptr);
    }
    connect(layout, &QAbstractTextDocumentLayout::update, this, &GraphicsText::repaintLayout);
    if (IInputLanguageSource* source = IInputLanguageSource::instance()) {
        connect(source, &IInputLanguageSource::signalsInputLanguageInfo, this,
                &GraphicsText::slotObjectDisplayInputLanguage);
    }
}

void GraphicsText::makeUnits()
{
    m_painter = std::make_unique<TextPainter>(*document(), *m_styles);
    const TextObjectParts parts{*document(), *m_styles, m_painter->carets(), m_placement, *this, *this};
    m_styleEditor = std::make_unique<TextStyleEditor>(parts);
    m_touchEditor = std::make_unique<TouchTextEditor>(parts, *m_styleEditor);
    connect(&m_styleEditor->undoTimer(), &QTimer::timeout, this, &GraphicsText::slotUndoTimeOut);
    connect(&m_touchEditor->longPressTimer(), &QTimer::timeout, this, &GraphicsText::slotLongPressed);
}

// The pair

GraphicsText* GraphicsText::parentTextItem() const
{
    QGraphicsItem* parent = parentItem();
    return parent && parent->type() == Type ? static_cast<GraphicsText*>(parent) : nullptr;
}

GraphicsText* GraphicsText::childTextItem() const
{
    const QList<QGraphicsItem*> children = childItems();
    for (QGraphicsItem* child : children)
        if (child->type() == Type)
            return static_cast<GraphicsText*>(child);
    return nullptr;
}

bool GraphicsText::isParentItem() const
{
    return m_parentObject && !childItems().isEmpty();
}

void GraphicsText::announceGeometryChange()
{
    if (GraphicsText* parent = parentTextItem())
        parent->prepareGeometryChange();
}

void GraphicsText::parentFollows()
{
    GraphicsText* parent = parentTextItem();
    if (!parent)
        return;
    parent->m_focusFlag = m_focusFlag;
    if (parent->textInteractionFlags() != textInteractionFlags())
        parent->setTextInteractionFlags(textInteractionFlags());
    QTextDocument& frame = *parent->document();
    if (frame.defaultTextOption().alignment() != document()->defaultTextOption().alignment())
        frame.setDefaultTextOption(document()->defaultTextOption());
    if (frame.textWidth() != textWidth())
        frame.setTextWidth(textWidth());
    parent->update();
}

void GraphicsText::update(const QRectF& rect)
{
    QGraphicsTextItem::update(rect);
    if (QGraphicsItem* parent = parentItem())
        parent->update();
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

int GraphicsText::getBoundingLineStatus() const
{
    if (m_focusFlag == FocusObject)
        return textInteractionFlags() == Qt::NoTextInteraction ? FocusObject : FocusEdit;
    return m_focusFlag;
}

int GraphicsText::getStatusId() const
{
    const QTextCursor cursor = textCursor();
    if (cursor.hasSelection())
        return 1;
    if (getBoundingLineStatus() == FocusObject)
        return 0;
    if (getBoundingLineStatus() == FocusEdit && textInteractionFlags() == Qt::TextEditorInteraction)
        return 2;
    return -1;
}

void GraphicsText::setFocusFlag(int flag)
{
    m_focusFlag = flag;
    update();
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

// ITextSurface: what the units need from the item

void GraphicsText::setWritable(bool writable)
{
    setTextInteractionFlags(writable ? Qt::TextEditorInteraction : Qt::NoTextInteraction);
}

void GraphicsText::handleByTextItem(QEvent::Type type, QEvent& event)
{
    switch (type) {
    case QEvent::GraphicsSceneMousePress:
        QGraphicsTextItem::mousePressEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::GraphicsSceneMouseMove:
        QGraphicsTextItem::mouseMoveEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::GraphicsSceneMouseRelease:
        QGraphicsTextItem::mouseReleaseEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::GraphicsSceneMouseDoubleClick:
        QGraphicsTextItem::mouseDoubleClickEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::KeyPress:
        QGraphicsTextItem::keyPressEvent(static_cast<QKeyEvent*>(&event));
        break;
    default:
        break;
    }
}

void GraphicsText::layoutChanged()
{
    parentFollows();
    m_painter->invalidate();
    update();
}

void GraphicsText::repaintBlock(int position)
{
    const QTextBlock block = document()->findBlock(position);
    if (!block.isValid()) {
        update();
        return;
    }
    const QRectF lines = document()->documentLayout()->blockBoundingRect(block);
    const double reach = lines.height() / 2.0 + HANDLEPIXMAPHEIGHT;
    // The frame behind it is painted again with the scene.
    QGraphicsTextItem::update(QRectF(layoutRect().left(), lines.top(), layoutRect().width(), lines.height())
                                  .adjusted(-reach, -reach, reach, reach));
}

void GraphicsText::blockChanged(int position)
{
    m_painter->invalidate();
    repaintBlock(position);
    m_isBlockRepainted = true;
}

// At the end of an edit the layout requests a repaint of everything, because it finds nothing left to do: the
// block was laid out when its formats were applied. That is the request after blockChanged().
void GraphicsText::repaintLayout(const QRectF& area)
{
    const bool isEverything = area.topLeft().isNull() && area.height() > layoutRect().height();
    if (!std::exchange(m_isBlockRepainted, false) || !isEverything)
        QGraphicsTextItem::update(area);
}

void GraphicsText::showShadow(const TShadow& shadow)
{
    m_shadowEffect->setOffset(shadow.getShadowDirectionX() * canvasRatio(),
                              shadow.getShadowDirectionY() * canvasRatio());
    m_shadowEffect->setBlurRadius(shadow.getShadowBlurRadius());
    m_shadowEffect->setEnabled(shadow.getShadowDirectionX() != 0 || shadow.getShadowDirectionY() != 0);
}

// ITextObjectListener: what the units report

void GraphicsText::contentsEdited(TText& before, TText& after, TText& lastBefore, TText& lastAfter)
{
    Q_EMIT signalObjectContentsEdited(&before, &after, &lastBefore, &lastAfter);
}

void GraphicsText::objectMoved(QPointF from, QPointF to)
{
    Q_EMIT signalObjectPositionChanged(getItemTText()->getTextObjectID(), from, to);
}

void GraphicsText::styleShown(TText& style)
{
    Q_EMIT signalNotifyPropertyAreaObjectSelectionStyleChange(&style);
}

void GraphicsText::selectionModeChanged(bool shadowAndAlign, bool move)
{
    Q_EMIT signalNotifyTextPropertyAreaObjectSelectionMode(shadowAndAlign, move);
}

void GraphicsText::objectSelected()
{
    Q_EMIT signalNotifyIfExistSelectedObject(true);
}

void GraphicsText::familyReplaced(const QString& family)
{
    Q_EMIT signalShowMessageWhenUsingDefaultFont(family);
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
    m_painter->invalidate();
    m_styleEditor->documentChanged(position, removed, added);
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
        paintFrame(painter);
    } else {
        m_touchEditor->paintBelowGlyphs(painter);
        m_painter->drawSelection(painter, textCursor(), hasFocus());
        m_painter->drawItemText(painter, option ? option->exposedRect : boundingRect());
        if (getBoundingLineStatus() == FocusEdit)
            m_touchEditor->paintAboveGlyphs(painter);
    }
    painter->restore();
}

void GraphicsText::paintFrame(QPainter* painter)
{
    const GraphicsText* child = childTextItem();
    const int status = child ? child->getBoundingLineStatus() : FocusNone;
    if (status == FocusObject || (status == FocusEdit && child->getFocusFlag() == FocusEdit))
        m_painter->drawItemBoundingRect(painter, child->boundingRect(), status);
}

// Events

void GraphicsText::mousePressEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_parentObject)
        handleByTextItem(QEvent::GraphicsSceneMousePress, *event);
    else
        m_touchEditor->mousePress(event);
}

void GraphicsText::mouseMoveEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_parentObject)
        handleByTextItem(QEvent::GraphicsSceneMouseMove, *event);
    else
        m_touchEditor->mouseMove(event);
}

void GraphicsText::mouseReleaseEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_parentObject)
        handleByTextItem(QEvent::GraphicsSceneMouseRelease, *event);
    else
        m_touchEditor->mouseRelease(event);
}

void GraphicsText::cancelTouch()
{
    if (!m_parentObject)
        m_touchEditor->cancelTouch();
}

void GraphicsText::mouseDoubleClickEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_parentObject)
        handleByTextItem(QEvent::GraphicsSceneMouseDoubleClick, *event);
    else
        m_touchEditor->mouseDoubleClick(event);
}

void GraphicsText::contextMenuEvent(QGraphicsSceneContextMenuEvent* event)
{
    if (!event) {
        LOG_DEBUG_OPERATE(L"Edit Area", 200, L"ContextMenu has no Event ");
        return;
    }
    event->accept();
}

void GraphicsText::keyPressEvent(QKeyEvent* event)
{
    if (m_parentObject) {
        handleByTextItem(QEvent::KeyPress, *event);
        return;
    }
    // Pasted text takes the style of the place where it is inserted, not the one it was copied with.
    if (event->matches(QKeySequence::Paste) && textInteractionFlags() == Qt::TextEditorInteraction) {
        textCursor().insertText(QGuiApplication::clipboard()->text());
        event->accept();
        return;
    }
    m_touchEditor->keyPress(event);
}

void GraphicsText::focusOutEvent(QFocusEvent* event)
{
    if (!m_parentObject) {
        LOG_DEBUG_OPERATE(L"Edit Area", 200,
                          L"focus out focus position " + std::to_wstring(textCursor().position()));
    }
    QGraphicsTextItem::focusOutEvent(event);
}

void GraphicsText::dragEnterEvent(QGraphicsSceneDragDropEvent*)
{
}

void GraphicsText::dragLeaveEvent(QGraphicsSceneDragDropEvent*)
{
}

void GraphicsText::dragMoveEvent(QGraphicsSceneDragDropEvent*)
{
}

void GraphicsText::dropEvent(QGraphicsSceneDragDropEvent*)
{
}

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

bool GraphicsText::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != this && watched->parent() == this && isBlinkOfCaret(watched, event))
        return true;
    if (watched == this && !m_parentObject && m_touchEditor->filter(event))
        return true;
    return QGraphicsTextItem::eventFilter(watched, event);
}

QVariant GraphicsText::itemChange(GraphicsItemChange change, const QVariant& value)
{
    if (change == ItemSelectedHasChanged && !m_parentObject)
        Q_EMIT signalObjectSelectedHasChanged(this);
    return QGraphicsTextItem::itemChange(change, value);
}
