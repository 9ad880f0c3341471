#include "canvas/CanvasScene.h"

#include "canvas/CreateItemCommand.h"
#include "canvas/DeleteItemCommand.h"
#include "canvas/EditTextCommand.h"
#include "canvas/GraphicsPixmap.h"
#include "canvas/ICanvasHost.h"
#include "canvas/InputLanguageFonts.h"
#include "canvas/MessageBoxController.h"
#include "canvas/MoveItemCommand.h"
#include "canvas/NewTextStyle.h"
#include "canvas/SafeAreaLines.h"
#include "canvas/SceneKeyboard.h"
#include "canvas/ShownTitle.h"
#include "canvas/SoftKeyboardField.h"
#include "canvas/StyleComparison.h"
#include "canvas/StyleDispatch.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextObjectList.h"
#include "canvas/TextPairMaker.h"
#include "document/Archive.h"
#include "document/CanvasController.h"
#include "document/FontStyle.h"
#include "document/PngWriter.h"
#include "document/TText.h"
#include "support/LogManager.h"
#include "touchui/FieldName.h"

#include <QAction>
#include <QCoreApplication>
#include <QGraphicsSceneMouseEvent>
#include <QGraphicsView>
#include <QInputMethodEvent>
#include <QMetaMethod>
#include <QPainter>
#include <QPixmap>
#include <QTextCursor>
#include <QTextDocument>
#include <algorithm>
#include <cmath>

using namespace TextObjectConstants;

namespace
{

constexpr int SAFE_AREA_ABOVE_TEXTS = 4;
constexpr double SAME_PLACE = 1e-12;

} // namespace

QEvent CanvasScene::mRegisterEvent(QEvent::User);
const QString CanvasScene::FAMILY_FOR_CN_MODULE = QStringLiteral("DFHeiW5-A");

CanvasScene::CanvasScene(std::unique_ptr<IThumbnailRender> render, QObject* parent)
    : QGraphicsScene(parent)
    , m_pairs(std::make_unique<TextPairMaker>(*this))
    , m_keyboard(std::make_unique<SceneKeyboard>())
    , m_texts(std::make_unique<TextObjectList>(*this))
    , m_safeArea(std::make_unique<SafeAreaLines>(*this))
{
    // An index costs more than it saves: there are only a few items, and their size changes with every key.
    setItemIndexMethod(NoIndex);
    if (render)
        connect(render.get(), &IThumbnailRender::saveHalfThumbnailsOK, this, &CanvasScene::signalSaveOk);
    m_title = std::make_unique<ShownTitle>(std::move(render));
    FontStyle remembered;
    CanvasController().getTextStyle(&remembered);
    m_newTextStyle = std::make_unique<NewTextStyle>(tr("Title goes here"), remembered);
}

CanvasScene::~CanvasScene()
{
    // Items emit signals to the scene while they are destroyed.
    blockSignals(true);
    for (GraphicsText* item : std::as_const(*m_texts).listed())
        item->disconnect(this);
    m_texts->listed().clear();
    clear();
}

const Archive* CanvasScene::archive() const
{
    return m_title->archive();
}

// Showing a title

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

// Clears the pointers before the items are destroyed.
void CanvasScene::removeAllItems()
{
    m_texts->listed().clear();
    m_safeArea->forget();
    m_currentPixmapItem = nullptr;
    m_keyboard->setItem(nullptr);
    QGraphicsScene::clear();
}

void CanvasScene::leaveTitle()
{
    leaveEditing();
    m_currentPressedObjectId = -1; // an object under a finger is deleted, too, if it is blank
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
    m_title->forget();
}

bool CanvasScene::archiveIsNull(const Archive* archive)
{
    if (archive)
        return false;
    // Without this a later save would empty the title that was shown before.
    m_title->forget();
    if (m_drawSafeArea)
        drawSafeAreaRect();
    Q_EMIT signalDisableNewTextButton(true);
    return true;
}

void CanvasScene::slotUpdateArchive(const Archive* archive)
{
    endPreview();
    // Kept so that a pasted title can share it.
    const auto previous = m_currentPixmapItem ? m_currentPixmapItem->source() : nullptr;
    savePreviousArchiveInfo();
    // The pictures do not show yet what was typed last.
    const Archive* before = m_title->archive();
    if (before && (!archive || archive->getPath() != before->getPath()))
        slotMakeSceneThumnail();
    if (archiveIsNull(archive))
        return;
    m_title->show(*archive);
    Q_EMIT signalDisableNewTextButton(false);
    resetLastFontInfo();
    const Archive& shown = *m_title->archive();
    const QString background = shown.getFullPathOfBgResource();
    if (!background.isEmpty()) {
        addCGraphicsPixmapItem(background, QPointF(shown.getBgPointX(), shown.getBgPointY()),
                               shown.getBgPointZ());
    }
    for (TText* record : shown.getText()) {
        if (!record)
            continue;
        InputLanguageFonts::mInputLanguage = m_newTextStyle->languageRow();
        addText(m_pairs->make(*record));
    }
    m_topZ = int(m_texts->maxZValue());
    reportMissingFamily();
    m_title->makeLackingPictures();
    if (m_drawSafeArea)
        drawSafeAreaRect();
}

void CanvasScene::addText(GraphicsText* item)
{
    m_texts->listed().append(item);
    m_currentItem = item;
}

GraphicsText* CanvasScene::rebuildItem(TText* record, TText& lastAlpha)
{
    if (GraphicsText* old = findTextItem(record->getTextObjectID()))
        deleteItem(old); // restored together with a file that could not be written without it
    addText(m_pairs->make(*record, lastAlpha, NewTextStyle::FirstCharacter().ensureMode));
    m_currentItem->changeItemToSolidLineState();
    return m_currentItem;
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
    saveArchiveFlag();
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
    // Without an undo stack the change is made and cannot be undone.
    const std::unique_ptr<QUndoCommand> owned(command);
    owned->redo();
}

void CanvasScene::addCGraphicsTextItem()
{
    endPreview();
    if (itemIsEditorInteraction()) {
        saveArchive();
        saveArchiveFlag();
        clearItemsSelectionAndFocus();
    } else if (itemIsSelectionMode()) {
        clearItemsSelectionMode();
    }
    slotDeleteEmptyItems(); // deletes hidden empty objects, too, which would count towards the limit of four
    if (m_texts->listed().size() >= MAX_TEXT_OBJECTS) {
        Q_EMIT signalTextInserted();
        Q_EMIT signalNewTextInsertedFailed();
        disableTextPropertyArea();
        if (MessageBoxController* messages = MessageBoxController::getInstance())
            messages->postMessage(MessageDef::MESSAGE_TEXT_OBJECT_LIMIT);
        return;
    }
    m_newTextStyle->askPanel();
    Q_EMIT signalBeginNewTextItem();
    auto* command = new CreateItemCommand(this);
    const bool made = command->objectId() >= 0;
    pushCommand(command);
    Q_EMIT signalTextInserted();
    if (!made || !m_currentItem)
        return;
    m_keyboard->expectNewText();
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
    setSafeAreaRectLineZValue(-1); // the line would hide the items below it
    const QPointF place = m_pairs->getInitItemScenePosition();
    m_topZ = int(m_texts->maxZValue()) + 1;
    addText(m_pairs->makeNew(id, place, m_topZ, *m_newTextStyle));
    setSafeAreaRectLineZValue(m_topZ + SAFE_AREA_ABOVE_TEXTS);
    return id;
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
    m_pairs->connectToScene(item);
}

// Style changes

bool CanvasScene::isTheSame(TText* style) const
{
    return StyleComparison::isTheSame(*style);
}

void CanvasScene::slotChangeObjectTextStyle(TText* style, int id, int undoFlag)
{
    if (!style || style->textItems().empty())
        return;
    GraphicsText* item = m_texts->findTheActiveItem();
    takeBackPreviews(undoFlag == CancelledChange ? nullptr : item);
    if (undoFlag == CancelledChange) {
        saveArchiveFlag();
        return;
    }
    if (undoFlag == CommittedChange)
        m_newTextStyle->rememberChange(*style);
    if (!item)
        return;
    m_newTextStyle->propertyChanged(id);
    if (StyleDispatch::apply(*item, *style, id, undoFlag, *m_newTextStyle))
        saveArchiveFlag();
}

void CanvasScene::takeBackPreviews(const GraphicsText* except)
{
    const QList<GraphicsText*> texts = m_texts->listed();
    for (GraphicsText* item : texts)
        if (item != except)
            item->cancelPreview();
}

void CanvasScene::endPreview()
{
    Q_EMIT signalEndPreview();
    takeBackPreviews();
}

void CanvasScene::slotUpdateCurrentTextProperty(TText& style)
{
    m_newTextStyle->rememberProperty(style);
}

// Undo commands

void CanvasScene::slotCreateEditUndoCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast)
{
    setCurrentEditItemId(newText->getTextObjectID());
    pushCommand(new EditTextCommand(oldText, newText, oldLast, newLast, this));
}

void CanvasScene::slotCreateMoveUndoCommand(int id, QPointF from, QPointF to)
{
    if (std::abs(from.x() - to.x()) <= SAME_PLACE && std::abs(from.y() - to.y()) <= SAME_PLACE)
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
    for (GraphicsText* item : texts)
        if (item->isBlank() && item->getItemTText()->getTextObjectID() != m_currentPressedObjectId)
            pushDeleteCommand(item);
    update();
}

void CanvasScene::deleteSelectedItems()
{
    endPreview();
    const QList<GraphicsText*> texts = m_texts->enabledTexts();
    for (GraphicsText* item : texts)
        if (item->getBoundingLineStatus() != FocusNone && !item->isBlank())
            pushDeleteCommand(item);
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
        QGraphicsScene::mouseReleaseEvent(event); // an item may have grabbed the mouse on a double click
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
    for (GraphicsText* item : texts)
        if (item->textInteractionFlags() == Qt::TextEditorInteraction)
            setFocusItem(item, Qt::OtherFocusReason);
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
    // The object being edited keeps the focus while the panel or the keyboard is used.
    if (!itemIsEditorInteraction())
        QGraphicsScene::focusOutEvent(event);
}

// Saving

void CanvasScene::saveArchive()
{
    if (m_title->save(*m_texts, m_currentPixmapItem))
        m_contentsChanged = false;
}

void CanvasScene::saveArchiveFlag()
{
    m_title->setPicturesNeeded();
}

void CanvasScene::slotSaveArchive(GraphicsText* item)
{
    saveArchive();
    saveArchiveFlag();
    if (item)
        item->update();
}

void CanvasScene::slotMakeSceneThumnail()
{
    m_title->makeNeededPictures();
}

void CanvasScene::createThumnailPicture()
{
    m_title->makeSmallPicture();
}

bool CanvasScene::isEditFinish() const
{
    return m_title->isEditFinish();
}

bool CanvasScene::waitForPictures() const
{
    return m_title->waitForPictures();
}

void CanvasScene::generateThumbnail(QSize size, const QString& path)
{
    QPixmap picture(size);
    if (picture.isNull())
        return;
    picture.fill(Qt::transparent);
    QPainter painter(&picture);
    painter.setRenderHint(QPainter::Antialiasing);
    render(&painter);
    painter.end();
    PngWriter::save(picture.toImage(), path);
}

void CanvasScene::folderRenamed(const QString& before, const QString& after)
{
    if (!m_title->folderRenamed(before, after) || !itemIsEditorInteraction())
        return;
    leaveEditing();
    slotDeleteEmptyItems();
    disableTextPropertyArea();
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
    m_safeArea->draw(m_topZ + SAFE_AREA_ABOVE_TEXTS);
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
    m_newTextStyle->setFamilyOfModel(china ? FAMILY_FOR_CN_MODULE : QString());
    InputLanguageFonts::IS_CN_MODULE = china;
    resetLastFontInfo();
}

void CanvasScene::resetLastFontInfo()
{
    if (m_module == 1)
        InputLanguageFonts::fillLastFonts(FAMILY_FOR_CN_MODULE);
    else
        InputLanguageFonts::resetLastFonts();
}

void CanvasScene::slotSceneInputLanguageChanged(SystemSetupDef::emInputLanguageType language)
{
    m_newTextStyle->setLanguageRow(InputLanguageFonts::languageRow(language));
    resetLastFontInfo();
}

void CanvasScene::slotSetItemInputlanguage(GraphicsText* item)
{
    if (item)
        item->setInputLanguage(m_newTextStyle->languageRow());
}

void CanvasScene::slotShowMessageWhenUsingDefaultFont(QString family)
{
    m_defaultFontUsed = true;
    m_missingFamily = family;
}

// Soft keyboard

void CanvasScene::slotSendCustomEvent(GraphicsText* item)
{
    m_keyboard->setItem(item);
    QCoreApplication::sendEvent(this, &mRegisterEvent);
}

void CanvasScene::customEvent(QEvent* event)
{
    if (event->type() == mRegisterEvent.type())
        m_keyboard->request(views().isEmpty() ? nullptr : views().first(), tr("Text Input"));
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
