#include "canvas/CanvasScene.h"

#include "canvas/CreateItemCommand.h"
#include "canvas/DeleteItemCommand.h"
#include "canvas/EditTextCommand.h"
#include "canvas/GraphicsPixmap.h"
#include "canvas/ICanvasHost.h"
#include "canvas/MessageBoxController.h"
#include "canvas/MoveItemCommand.h"
#include "canvas/NewTextStyle.h"
#include "canvas/SafeAreaLines.h"
#include "canvas/SaveOutage.h"
#include "canvas/SoftKeyboardField.h"
#include "canvas/StyleComparison.h"
#include "canvas/TextObjectList.h"
#include "document/Archive.h"
#include "document/CanvasController.h"
#include "document/FontStyle.h"
#include "document/TText.h"
#include "support/LogManager.h"
#include "touchui/FieldName.h"
#include "touchui/KSInputContext.h"

#include <QAction>
#include <QCoreApplication>
#include <QFileInfo>
#include <QGraphicsSceneMouseEvent>
#include <QGraphicsView>
#include <QInputMethodEvent>
#include <QMetaMethod>
#include <QPainter>
#include <QTextCursor>
#include <QTextDocument>
#include <algorithm>
#include <cmath>

namespace
{

constexpr int SafeAreaAboveTexts = 4;
constexpr double SamePlace = 1e-12;
// More steps than objects could need to leave a free place.
constexpr int MaximumCascade = 1000;

} // namespace

QEvent CanvasScene::mRegisterEvent(QEvent::User);
const QString CanvasScene::FAMILY_FOR_CN_MODULE = QStringLiteral("DFHeiW5-A");

CanvasScene::CanvasScene(std::unique_ptr<IThumbnailRender> render, QObject* parent)
    : QGraphicsScene(parent)
    , m_controller(std::make_unique<CanvasController>())
    , m_defaultFontStyle(std::make_unique<FontStyle>())
    , m_thumbnailRender(std::move(render))
    , m_texts(std::make_unique<TextObjectList>(*this))
    , m_safeArea(std::make_unique<SafeAreaLines>(*this))
{
    // A handful of items that change their size with every key: an index costs more than it saves.
    setItemIndexMethod(NoIndex);
    SaveOutage::instance(); // from here on titles may be saved
    m_controller->getTextStyle(m_defaultFontStyle.get());
    m_newTextStyle = std::make_unique<NewTextStyle>(tr("Title goes here"), *m_defaultFontStyle);
    if (m_thumbnailRender) {
        connect(m_thumbnailRender.get(), &IThumbnailRender::saveHalfThumbnailsOK, this,
                &CanvasScene::signalSaveOk);
    }
}

CanvasScene::~CanvasScene()
{
    // Items report to this class while they go.
    blockSignals(true);
    for (GraphicsText* item : std::as_const(*m_texts).listed())
        item->disconnect(this);
    m_texts->listed().clear();
    clear();
}

const Archive* CanvasScene::archive() const
{
    return m_archive.get();
}

// Showing a title; see CanvasSceneSaving.cpp for saving one

void CanvasScene::savePreviousArchiveInfo()
{
    if (itemIsEditorInteraction()) {
        leaveEditing();
        slotDeleteEmptyItems();
        disableTextPropertyArea();
    } else if (itemIsSelectionMode()) {
        clearItemsSelectionMode();
        slotDeleteEmptyItems();
        disableTextPropertyArea();
    }
    m_defaultFontUsed = false;
    removeAllItems();
}

// The pointers go before what they point to.
void CanvasScene::removeAllItems()
{
    m_texts->listed().clear();
    m_safeArea->forget();
    m_currentPixmapItem = nullptr;
    m_itemForKeyboard = nullptr;
    QGraphicsScene::clear();
}

void CanvasScene::leaveTitle()
{
    leaveEditing();
    m_currentPressedObjectId = -1; // nor is one spared that a finger was on
    slotDeleteEmptyItems();
    slotMakeSceneThumnail();
}

void CanvasScene::leaveEditing()
{
    const bool wasEdited = itemIsEditorInteraction();
    clearItemsSelectionAndFocus();
    if (wasEdited)
        slotSendCustomEvent(nullptr);
}

void CanvasScene::clearCanvas()
{
    endPreview();
    removeAllItems();
    m_archive.reset();
}

bool CanvasScene::archiveIsNull(const Archive* archive)
{
    if (archive)
        return false;
    // A later save must not empty the title that was shown before.
    m_archive.reset();
    if (m_drawSafeArea)
        drawSafeAreaRect();
    Q_EMIT signalDisableNewTextButton(true);
    return true;
}

void CanvasScene::slotUpdateArchive(const Archive* archive)
{
    endPreview();
    const auto previous = m_currentPixmapItem ? m_currentPixmapItem->source() : nullptr; // a paste shares it
    savePreviousArchiveInfo();
    // A text that was being typed until now is in no picture yet.
    if (m_archive && (!archive || archive->getPath() != m_archive->getPath()))
        slotMakeSceneThumnail();
    if (archiveIsNull(archive))
        return;
    if (archive != m_archive.get())
        m_archive = std::make_unique<Archive>(*archive);
    Q_EMIT signalDisableNewTextButton(false);
    resetLastFontInfo();
    const QString background = m_archive->getFullPathOfBgResource();
    if (!background.isEmpty()) {
        addCGraphicsPixmapItem(background, QPointF(m_archive->getBgPointX(), m_archive->getBgPointY()),
                               m_archive->getBgPointZ());
    }
    for (TText* record : m_archive->getText()) {
        if (record)
            buildPair(record);
    }
    m_topZ = int(m_texts->maxZValue());
    reportMissingFamily();
    if (m_thumbnailRender && lacksPictures())
        m_thumbnailRender->makeThumbnail(m_archive.get(), true);
    if (m_drawSafeArea)
        drawSafeAreaRect();
}

GraphicsText* CanvasScene::buildPair(TText* record)
{
    auto* parent = new GraphicsText(true, nullptr, this);
    auto* child = new GraphicsText(record, 0, parent, nullptr);
    const TText& shown = *child->getItemTText();
    parent->setPos(shown.getXValue(), shown.getYValue());
    parent->setZValue(shown.getZValue());
    child->setZValue(shown.getZValue());
    connectSignalAndSlot(child);
    child->setInputLanguage(m_languageRow);
    child->setPos(0.0, 0.0);
    child->initShowText();
    m_texts->listed().append(child);
    m_currentItem = child;
    m_currentParentItem = parent;
    return child;
}

GraphicsText* CanvasScene::rebuildItem(TText* record, TText& lastAlpha)
{
    if (GraphicsText* old = findTextItem(record->getTextObjectID()))
        deleteItem(old); // came back with a file that could not be written without it
    auto* parent = new GraphicsText(true, nullptr, this);
    parent->setPos(record->getXValue(), record->getYValue());
    parent->setZValue(record->getZValue());
    auto* child = new GraphicsText(false, parent, nullptr);
    connectSignalAndSlot(child);
    child->setLastAlpaTextStyleValue(lastAlpha);
    child->resetDocument(record, 0);
    QList<GraphicsText*> items = getTextItemList();
    items.append(child);
    setTextItemList(items);
    child->setPos(0.0, 0.0);
    child->setZValue(record->getZValue());
    child->changeItemToSolidLineState();
    m_currentItem = child;
    m_currentParentItem = parent;
    return child;
}

void CanvasScene::reportMissingFamily()
{
    if (!m_defaultFontUsed)
        return;
    m_defaultFontUsed = false;
    const ICanvasHost* host = ICanvasHost::instance();
    if (!host || !host->windowIsVisible()) {
        Q_EMIT signalHasMessageToShowInformation(true, m_missingFamily);
        return;
    }
    if (MessageBoxController* messages = MessageBoxController::getInstance())
        messages->postMessage(MessageDef::MESSAGE_FONT_MISSING, m_missingFamily);
    saveArchive();
    m_thumbnailNeeded = true;
}

void CanvasScene::addCGraphicsPixmapItem(const QString& path, QPointF position, double z)
{
    m_currentPixmapItem = new GraphicsPixmap(path);
    addItem(m_currentPixmapItem);
    m_currentPixmapItem->setPos(position);
    m_currentPixmapItem->setZValue(z);
    Q_EMIT signalPixmapItemInserted(m_currentPixmapItem);
}

// New objects

void CanvasScene::pushCommand(QUndoCommand* command)
{
    static const QMetaMethod pushed = QMetaMethod::fromSignal(&CanvasScene::signalPushUndoCommandIntoStack);
    if (isSignalConnected(pushed)) {
        Q_EMIT signalPushUndoCommandIntoStack(command);
        return;
    }
    // Without a stack the change is done all the same, once and for all.
    const std::unique_ptr<QUndoCommand> owned(command);
    owned->redo();
}

void CanvasScene::addCGraphicsTextItem()
{
    endPreview();
    if (itemIsEditorInteraction()) {
        saveArchive();
        m_thumbnailNeeded = true;
        clearItemsSelectionAndFocus();
    } else if (itemIsSelectionMode()) {
        clearItemsSelectionMode();
    }
    slotDeleteEmptyItems(); // also one that nobody sees any more: it would count among the four
    if (m_texts->listed().size() >= MAX_TEXT_OBJECTS) {
        Q_EMIT signalTextInserted();
        Q_EMIT signalNewTextInsertedFailed();
        disableTextPropertyArea();
        if (MessageBoxController* messages = MessageBoxController::getInstance())
            messages->postMessage(MessageDef::MESSAGE_TEXT_OBJECT_LIMIT);
        return;
    }
    m_panelTold = false;
    Q_EMIT signalBeginNewTextItem();
    auto* command = new CreateItemCommand(this);
    const bool made = command->objectId() >= 0;
    pushCommand(command);
    Q_EMIT signalTextInserted();
    if (!made || !m_currentItem)
        return;
    m_newTextFlag = 1;
    m_currentItem->initNewTextSelectAll();
    Q_EMIT signalSceneNotifyIfExistSelectedObject(true);
    Q_EMIT signalSceneNotifyTextPropertyAreaObjectSelectionMode(false, false);
    Q_EMIT signalStartEditTextItem();
}

int CanvasScene::initCGraphicsTextItem()
{
    const int id = m_texts->freeId(MAX_TEXT_OBJECTS);
    if (id < 0)
        return id;
    TText record;
    record.setText(std::string());
    m_newTextStyle->applyTo(record);
    record.setTextObjectID(id);
    const QPointF place = getInitItemScenePosition();
    record.setXValue(float(place.x()));
    record.setYValue(float(place.y()));
    m_topZ = int(m_texts->maxZValue()) + 1;
    record.setZValue(float(m_topZ));

    auto* parent = new GraphicsText(true, nullptr, this);
    auto* child = new GraphicsText(&record, 0, parent, nullptr);
    parent->setPos(place);
    parent->setZValue(m_topZ);
    child->setZValue(m_topZ);
    connectSignalAndSlot(child);
    child->setInputLanguage(m_languageRow);
    TText lastAlpha;
    const int ensureMode = initItemLastAlphaStyleWithLastTextStyle(lastAlpha);
    child->setLastAlpaTextStyleValue(lastAlpha);
    child->setFontFamilyEnsureMode(ensureMode);
    child->initShowText();
    m_texts->listed().append(child);
    m_currentItem = child;
    m_currentParentItem = parent;

    const QRectF area = parent->layoutRect();
    parent->moveBy(-area.width() / 2.0, -area.height() / 2.0);
    child->getItemTText()->setXValue(float(parent->x()));
    child->getItemTText()->setYValue(float(parent->y()));
    setSafeAreaRectLineZValue(m_topZ + SafeAreaAboveTexts);
    return id;
}

int CanvasScene::initItemLastAlphaStyleWithLastTextStyle(TText& record)
{
    const QString ofLanguage = GraphicsText::LAST_KEEPED_FONT[size_t(m_languageRow)][GraphicsText::Asian];
    QString family;
    int ensureMode = 2;
    if (m_panelTold) {
        // What the panel shows holds. It shows the family of a new language until a text is selected.
        if (m_languageChanged && m_newTextStyle->family() == ofLanguage)
            ensureMode = 1;
    } else if (m_cnFamilyFlag) {
        family = FAMILY_FOR_CN_MODULE;
        ensureMode = 0;
    } else if (m_languageChanged) {
        family = ofLanguage;
        ensureMode = 1;
    }
    m_languageChanged = false;
    record = m_newTextStyle->firstCharacter(family);
    return ensureMode;
}

QPointF CanvasScene::getInitItemScenePosition()
{
    setSafeAreaRectLineZValue(-1);
    QPointF place = sceneRect().center();
    for (int i = 0; i < MaximumCascade; ++i) {
        const QGraphicsItem* under = itemAt(place, QTransform());
        if (!under || under->type() != GraphicsText::Type)
            break;
        place += QPointF(OFFSET, -OFFSET);
    }
    setSafeAreaRectLineZValue(m_topZ + SafeAreaAboveTexts);
    return place;
}

// Items

QList<QGraphicsItem*> CanvasScene::enableItems() const
{
    return m_texts->enableItems();
}

GraphicsText* CanvasScene::findTextItem(int id) const
{
    return m_texts->find(id);
}

QList<GraphicsText*> CanvasScene::getTextItemList() const
{
    return m_texts->listed();
}

void CanvasScene::setTextItemList(const QList<GraphicsText*>& items)
{
    m_texts->listed() = items;
}

void CanvasScene::connectSignalAndSlot(GraphicsText* item)
{
    using Text = GraphicsText;
    const QTextDocument* document = item->document();
    connect(item, &Text::signalSoftWareClosedWhenEditObject, this,
            &CanvasScene::signalSceneSoftWareClosedWhenEditObject);
    connect(item, &Text::signalNotifyIfExistSelectedObject, this,
            &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    connect(item, &Text::signalGetSceneInputLanguage, this, &CanvasScene::slotSetItemInputlanguage);
    connect(item, &Text::signalObjectHasLostFocus, this, &CanvasScene::slotObjectLostFocus);
    connect(item, &Text::signalObjectSelectedHasChanged, this, &CanvasScene::signalItemSelected);
    connect(document, &QTextDocument::contentsChange, item, &Text::slotObjectDocumentChange);
    connect(item, &Text::signalNotifyPropertyAreaObjectSelectionStyleChange, this,
            &CanvasScene::signalNotifyPropertyAreaUpdateCurrentTextStyle);
    connect(document, &QTextDocument::contentsChange, this, &CanvasScene::slotObjectContentsChange);
    connect(item, &Text::xChanged, item, &Text::slotObjectPositionChanged);
    connect(item, &Text::yChanged, item, &Text::slotObjectPositionChanged);
    connect(item, &Text::signalObjectPositionChanged, this, &CanvasScene::slotCreateMoveUndoCommand);
    connect(item, &Text::signalNotifySceneCurrentMousePressedObjectId, this,
            &CanvasScene::slotSetCurrentMousePressedObjectId);
    connect(item, &Text::signalObjectContentsEdited, this, &CanvasScene::slotCreateEditUndoCommand);
    connect(item, &Text::signalNotifySceneCurrentObjectInEditMode, this, &CanvasScene::slotSendCustomEvent);
    connect(item, &Text::signalNotifyTextPropertyAreaObjectSelectionMode, this,
            &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    connect(item, &Text::signalSaveArchive, this, &CanvasScene::slotSaveArchive);
    connect(item, &Text::signalEndPreview, this, &CanvasScene::endPreview);
    connect(item, &Text::signalDeleteItem, this, &CanvasScene::slotDeleteEmptyItems);
    connect(item, &Text::signalShowMessageWhenUsingDefaultFont, this,
            &CanvasScene::slotShowMessageWhenUsingDefaultFont);
}

// Style changes

bool CanvasScene::isTheSame(TText* style) const
{
    return StyleComparison::isTheSame(*style);
}

int CanvasScene::getItemTextEditId(int status, bool overall, bool same)
{
    switch (status) {
    case 0:
        return ALL_STYLE_CHANGED_WHEN_SELECTION_MODE;
    case 1:
        return overall ? ALL_STYLE_CHANGED_WHEN__HAS_SELECTION_MODE
                       : PART_STYLE_CHANGED_WHEN_HAS_SELECTION_MODE;
    case 2:
        if (!same)
            return NO_EDIT_MODE;
        return overall ? ALL_STYLE_CHANGED_WHEN_EDIT_MODE : STYLE_SAVED_FOR_NEXT_INSER_MODE;
    default:
        return NO_EDIT_MODE;
    }
}

void CanvasScene::slotChangeObjectTextStyle(TText* style, int id, int undoFlag)
{
    if (!style || style->textItems().empty())
        return;
    GraphicsText* item = m_texts->findTheActiveItem();
    takeBackPreviews(undoFlag == GraphicsText::CancelledChange ? nullptr : item);
    if (undoFlag == GraphicsText::CancelledChange) {
        m_thumbnailNeeded = true;
        return;
    }
    if (undoFlag == GraphicsText::CommittedChange)
        m_newTextStyle->rememberChange(*style);
    const bool same = isTheSame(style);
    if (!item)
        return;
    m_languageChanged = false;
    if (id == GraphicsText::PropertyFamily)
        m_cnFamilyFlag = false;
    const bool overall = id == GraphicsText::PropertyShadow || id == GraphicsText::PropertyAlign ||
                         id == GraphicsText::PropertyPosition;
    const int mode = getItemTextEditId(item->getStatusId(), overall, same);
    changeItemTextStyleAccordingToItemStatus(item, style, id, mode, overall, undoFlag);
}

void CanvasScene::changeItemTextStyleAccordingToItemStatus(GraphicsText* item, TText* style, int id, int mode,
                                                           bool overall, int undoFlag)
{
    switch (mode) {
    case ALL_STYLE_CHANGED_WHEN_SELECTION_MODE:
        item->changeAllStyleWhenSelectionMode(style, id, overall, undoFlag);
        break;
    case ALL_STYLE_CHANGED_WHEN_EDIT_MODE:
        item->changeAllStyleWhenEditMode(style, id, overall, undoFlag);
        break;
    case ALL_STYLE_CHANGED_WHEN__HAS_SELECTION_MODE:
        item->changeAllStyleWhenHasSelection(style, id);
        break;
    case PART_STYLE_CHANGED_WHEN_HAS_SELECTION_MODE:
        item->changePartStyleWhenHasSelection(style, id, undoFlag);
        break;
    case STYLE_SAVED_FOR_NEXT_INSER_MODE:
        item->saveStyleForNextInsert(&m_newTextStyle->lastTextStyle(), undoFlag, id);
        item->setTextInteractionFlags(Qt::TextEditorInteraction);
        item->setFocus();
        return;
    default:
        break;
    }
    m_thumbnailNeeded = true;
}

void CanvasScene::takeBackPreviews(const GraphicsText* except)
{
    const QList<GraphicsText*> texts = m_texts->listed();
    for (GraphicsText* item : texts) {
        if (item != except)
            item->cancelPreview();
    }
}

void CanvasScene::endPreview()
{
    Q_EMIT signalEndPreview();
    takeBackPreviews();
}

void CanvasScene::slotUpdateCurrentTextProperty(TText& style)
{
    m_newTextStyle->rememberProperty(style);
    m_panelTold = true;
}

// Undo commands

void CanvasScene::slotCreateEditUndoCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast)
{
    setCurrentEditItemId(newText->getTextObjectID());
    pushCommand(new EditTextCommand(oldText, newText, oldLast, newLast, this));
}

void CanvasScene::slotCreateMoveUndoCommand(int id, QPointF from, QPointF to)
{
    if (std::abs(from.x() - to.x()) <= SamePlace && std::abs(from.y() - to.y()) <= SamePlace)
        return;
    setCurrentEditItemId(id);
    pushCommand(new MoveItemCommand(this, id, from, to));
}

void CanvasScene::pushDeleteCommand(GraphicsText* item)
{
    item->pushLastEditTextIntoStack();
    setCurrentEditItemId(item->getItemTText()->getTextObjectID());
    pushCommand(new DeleteItemCommand(this, item->getItemTText()));
}

void CanvasScene::slotDeleteEmptyItems()
{
    const QList<GraphicsText*> texts = m_texts->enabledTexts();
    for (GraphicsText* item : texts) {
        if (item->isBlank() && item->getItemTText()->getTextObjectID() != m_currentPressedObjectId)
            pushDeleteCommand(item);
    }
    update();
}

void CanvasScene::deleteSelectedItems()
{
    endPreview();
    const QList<GraphicsText*> texts = m_texts->enabledTexts();
    for (GraphicsText* item : texts) {
        if (item->getBoundingLineStatus() != GraphicsText::FocusNone && !item->isBlank())
            pushDeleteCommand(item);
    }
    update();
    disableTextPropertyArea();
}

void CanvasScene::slotObjectLostFocus(GraphicsText* item)
{
    if (!m_contentsChanged || !item)
        return;
    if (item->isBlank())
        pushDeleteCommand(item);
    update();
}

void CanvasScene::deleteItem(GraphicsText* item)
{
    m_texts->hide(item);
}

// Selection and focus

void CanvasScene::mousePressEvent(QGraphicsSceneMouseEvent* event)
{
    if (event->button() != Qt::LeftButton)
        return;
    endPreview();
    m_currentPressedObjectId = -1;
    QGraphicsScene::mousePressEvent(event);
}

void CanvasScene::mouseDoubleClickEvent(QGraphicsSceneMouseEvent* event)
{
    endPreview();
    QGraphicsScene::mouseDoubleClickEvent(event);
}

void CanvasScene::mouseReleaseEvent(QGraphicsSceneMouseEvent* event)
{
    if (event->button() != Qt::LeftButton) {
        QGraphicsScene::mouseReleaseEvent(event); // it may have grabbed an object by a double click
        return;
    }
    const bool pressed = m_currentPressedObjectId != -1;
    m_texts->releaseAllBut(m_currentPressedObjectId);
    if (pressed) {
        LOG_USER_OPERATE(L"Edit Area", 200, L"Select Text Object");
        Q_EMIT signalStartEditTextItem();
        slotDeleteEmptyItems();
    }
    Q_EMIT signalSceneNotifyIfExistSelectedObject(pressed);
    if (!pressed)
        slotSendCustomEvent(nullptr);
    m_currentPressedObjectId = -1;
    QGraphicsScene::mouseReleaseEvent(event);
    Q_EMIT signalCanvasSceneMousePressed();
}

void CanvasScene::clearItemsSelectionMode()
{
    endPreview();
    m_texts->clearSelectionMode();
}

void CanvasScene::clearItemsSelectionAndFocus()
{
    endPreview();
    m_texts->releaseAllBut(-1);
}

bool CanvasScene::itemIsSelectionMode() const
{
    return m_texts->isSelectionMode();
}

bool CanvasScene::itemIsEditorInteraction() const
{
    return m_texts->isEditorInteraction();
}

void CanvasScene::keyPressEvent(QKeyEvent* event)
{
    endPreview();
    const QList<GraphicsText*> texts = m_texts->enabledTexts();
    for (GraphicsText* item : texts) {
        if (item->textInteractionFlags() == Qt::TextEditorInteraction)
            setFocusItem(item, Qt::OtherFocusReason);
    }
    QGraphicsScene::keyPressEvent(event);
}

void CanvasScene::inputMethodEvent(QInputMethodEvent* event)
{
    if (!event->commitString().isEmpty() || !event->preeditString().isEmpty() ||
        event->replacementLength() > 0)
        endPreview();
    QGraphicsScene::inputMethodEvent(event);
}

void CanvasScene::focusOutEvent(QFocusEvent* event)
{
    // The object that is edited keeps the focus while the panel or the keyboard is used.
    if (!itemIsEditorInteraction())
        QGraphicsScene::focusOutEvent(event);
}

// Background and safe area

void CanvasScene::slotShowCanvasBG(QAction* action)
{
    if (!action)
        return;
    bool isNumber = false;
    const int kind = action->data().toInt(&isNumber);
    QColor color = Qt::transparent;
    if (isNumber && kind == 1)
        color = Qt::white;
    else if (isNumber && kind == 0)
        color = Qt::black;
    setBackgroundBrush(color);
}

void CanvasScene::drawSafeAreaRect()
{
    m_safeArea->draw(m_topZ + SafeAreaAboveTexts);
}

void CanvasScene::removeSafeAreaRect()
{
    m_safeArea->remove();
}

void CanvasScene::setSafeAreaRectLineZValue(int z)
{
    m_safeArea->setZValue(z);
}

void CanvasScene::slotDrawSafeArea(bool draw)
{
    m_drawSafeArea = draw;
    if (draw)
        drawSafeAreaRect();
    else
        removeSafeAreaRect();
}

// Fonts and language

void CanvasScene::setModuleInfo(SystemSetupDef::emInformationModel model)
{
    const bool china = model == SystemSetupDef::emInformationModelChina;
    m_module = china ? 1 : 0;
    m_cnFamilyFlag = china;
    GraphicsText::IS_CN_MODULE = china;
    resetLastFontInfo();
}

void CanvasScene::resetLastFontInfo()
{
    if (m_module == 1)
        GraphicsText::fillLastFonts(FAMILY_FOR_CN_MODULE);
    else
        GraphicsText::resetLastFonts();
}

void CanvasScene::slotSceneInputLanguageChanged(SystemSetupDef::emInputLanguageType language)
{
    const int row = GraphicsText::languageRow(language);
    m_languageChanged = m_languageChanged || row != m_languageRow;
    m_languageRow = row;
    resetLastFontInfo();
}

void CanvasScene::slotSetItemInputlanguage(GraphicsText* item)
{
    if (item)
        item->setInputLanguage(m_languageRow);
}

void CanvasScene::slotShowMessageWhenUsingDefaultFont(QString family)
{
    m_defaultFontUsed = true;
    m_missingFamily = family;
}

// Soft keyboard

void CanvasScene::slotSendCustomEvent(GraphicsText* item)
{
    m_itemForKeyboard = item;
    QCoreApplication::sendEvent(this, &mRegisterEvent);
}

void CanvasScene::customEvent(QEvent* event)
{
    if (event->type() != mRegisterEvent.type())
        return;
    if (m_itemForKeyboard) {
        openKeyboardForItem(m_itemForKeyboard);
    } else if (KSInputContext* context = KSInputContext::instance()) {
        context->dummyCloseSoftKeyBoardWindow();
    }
}

void CanvasScene::openKeyboardForItem(GraphicsText* item)
{
    KSInputContext* context = KSInputContext::instance();
    QWidget* view = views().isEmpty() ? nullptr : views().first();
    if (context && view)
        context->setFocusWidget(view);
    QString data;
    if (item->isDoubleClickedSelection()) {
        data = getDoubleClickDataInfo(QString());
    } else if (m_newTextFlag == 0) {
        data = getCommonStateDataInfo(QString(), item);
    } else {
        KSInputContext::resetFocusWidget();
        data = getNewTextDataInfo(QString());
        m_newTextFlag = 0;
    }
    item->setObjectName(data);
    if (!context || !view)
        return;
    context->setFocusWidget(view);
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    context->filterEvent(&request);
}

QString CanvasScene::getDataInfo(const SubCommonDefine::tagSoftKeyBoardInitData& data) const
{
    return FieldName::write(data);
}

QString CanvasScene::getNewTextDataInfo(const QString& text) const
{
    return SoftKeyboardField::newText(tr("Text Input"), text);
}

QString CanvasScene::getDoubleClickDataInfo(const QString& text) const
{
    return SoftKeyboardField::doubleClick(tr("Text Input"), text);
}

QString CanvasScene::getCommonStateDataInfo(const QString& text, GraphicsText* item) const
{
    return SoftKeyboardField::commonState(tr("Text Input"), text, *item);
}
