#pragma once

#include "canvas/GraphicsText.h"
#include "canvas/IThumbnailRender.h"
#include "messaging/services/SystemSetupDef.h"

#include <QEvent>
#include <QGraphicsScene>
#include <QList>
#include <QPointer>
#include <memory>

class Archive;
class GraphicsPixmap;
class NewTextStyle;
class QAction;
class QUndoCommand;
class SafeAreaLines;
class SceneKeyboard;
class ShownTitle;
class TextObjectList;
class TextPairMaker;

namespace SubCommonDefine
{
struct tagSoftKeyBoardInitData;
}

// The edit canvas: shows one title, owns its text objects, passes style changes to the right object, creates
// the undo commands for changes of objects, saves the title and opens and closes the soft keyboard. Scene
// coordinates are the 1280 by 720 canvas. GUI thread only.
class CanvasScene : public QGraphicsScene
{
    Q_OBJECT
public:
    static constexpr int SIDEBYSIDE = 2;
    // Distance by which a new object is shifted when its place is taken.
    static constexpr int OFFSET = 20;
    static constexpr int ZVALUE = 1000;
    static constexpr int MAX_TEXT_OBJECTS = 4;

    static constexpr int ALL_STYLE_CHANGED_WHEN_SELECTION_MODE = 0;
    static constexpr int ALL_STYLE_CHANGED_WHEN_EDIT_MODE = 1;
    static constexpr int ALL_STYLE_CHANGED_WHEN__HAS_SELECTION_MODE = 2;
    static constexpr int PART_STYLE_CHANGED_WHEN_HAS_SELECTION_MODE = 3;
    static constexpr int STYLE_SAVED_FOR_NEXT_INSER_MODE = 4;
    static constexpr int NO_EDIT_MODE = -1;

    // Sent to the scene itself to open or close the soft keyboard.
    static QEvent mRegisterEvent;
    static const QString FAMILY_FOR_CN_MODULE;

    // Takes ownership of the picture maker. With null no pictures are made and isEditFinish() is always true.
    explicit CanvasScene(std::unique_ptr<IThumbnailRender> render, QObject* parent = nullptr);
    ~CanvasScene() override;

    void saveArchive();
    // Marks the pictures of the title as out of date.
    void saveArchiveFlag();
    void createThumnailPicture();
    bool isEditFinish() const;
    // Blocks until the pictures are written, or until none has been written for a long time because the disk
    // hangs; they are written when it works again. Returns isEditFinish().
    bool waitForPictures() const;
    // Call before another title is shown: commits what is being edited, deletes blank objects and makes the
    // pictures.
    void leaveTitle();
    // Empties the canvas without saving.
    void clearCanvas();

    bool itemIsEditorInteraction() const;
    bool itemIsSelectionMode() const;
    void clearItemsSelectionMode();
    void clearItemsSelectionAndFocus();
    void disableTextPropertyArea() { Q_EMIT signalSceneNotifyIfExistSelectedObject(false); }

    // Returns the items that are not deleted. Deleted objects stay in the scene, hidden, so every loop over
    // items has to use this list.
    QList<QGraphicsItem*> enableItems() const;
    // Returns the children of the objects shown.
    QList<GraphicsText*> getTextItemList() const;
    void setTextItemList(const QList<GraphicsText*>& items);
    // Returns the enabled child with the id, or null.
    GraphicsText* findTextItem(int id) const;
    // Hides and disables the pair; undo creates a new one.
    void deleteItem(GraphicsText* item);
    void deleteSelectedItems();
    void connectSignalAndSlot(GraphicsText* item);
    // Creates an object with the style of the panel. Returns its id, or -1 when there are four already.
    int initCGraphicsTextItem();
    // Creates a pair that shows the record, connects it and adds it to the list. For undo.
    GraphicsText* rebuildItem(TText* record, TText& lastAlpha);
    void setCurrentEditItemId(int id) { m_currentEditItemId = id; }
    int currentEditItemId() const { return m_currentEditItemId; }
    void setModuleInfo(SystemSetupDef::emInformationModel model);
    void slotSceneInputLanguageChanged(SystemSetupDef::emInputLanguageType language);
    void resetLastFontInfo();

    static GraphicsText* getParentItem(GraphicsText* item) { return item ? item->parentTextItem() : nullptr; }
    bool isTheSame(TText* style) const;
    QString getDataInfo(const SubCommonDefine::tagSoftKeyBoardInitData& data) const;
    QString getNewTextDataInfo(const QString& text) const;
    QString getDoubleClickDataInfo(const QString& text) const;
    QString getCommonStateDataInfo(const QString& text, GraphicsText* item) const;

    void drawSafeAreaRect();
    void removeSafeAreaRect();
    void setSafeAreaRectLineZValue(int z);
    void generateThumbnail(QSize size, const QString& path);
    // Returns the copy of the title shown, which the scene owns, or null.
    const Archive* archive() const;
    // Call when a folder was renamed: pending writes for it go to its new path. If the title shown is in that
    // folder, text being typed is committed.
    void folderRenamed(const QString& before, const QString& after);

public Q_SLOTS:
    void addCGraphicsTextItem();
    void slotObjectLostFocus(GraphicsText* item);
    void slotInsertNewTextItem() { addCGraphicsTextItem(); }
    void slotChangeObjectTextStyle(TText* style, int id, int undoFlag);
    // Shows a copy of the title; null empties the canvas.
    void slotUpdateArchive(const Archive* archive);
    void slotObjectContentsChange() { m_contentsChanged = true; }
    void slotCreateMoveUndoCommand(int id, QPointF from, QPointF to);
    void slotSetCurrentMousePressedObjectId(int id) { m_currentPressedObjectId = id; }
    void slotCreateEditUndoCommand(TText* oldText, TText* newText, TText* oldLast, TText* newLast);
    void slotMakeSceneThumnail();
    void slotDrawSafeArea(bool draw);
    void slotShowCanvasBG(QAction* action);
    void slotSendCustomEvent(GraphicsText* item);
    void slotUpdateCurrentTextProperty(TText& style);
    void slotDeleteEmptyItems();
    void slotShowMessageWhenUsingDefaultFont(QString family);
    void slotSaveArchive(GraphicsText* item);
    void slotSetItemInputlanguage(GraphicsText* item);
    void slotNotifyEditAreaSizeToolBoxEditDone() {}
    // Call before the selection, its text or the title changes. Asks widgets that preview a style to end the
    // preview, then takes back any preview that is left.
    void endPreview();

Q_SIGNALS:
    void signalTextInserted();
    void signalNewTextInsertedFailed();
    void signalItemSelected(QGraphicsItem* item);
    void signalPixmapItemInserted(QGraphicsPixmapItem* item);
    void signalSaveOk(QString path, QImage image);
    // Reports the style of the selection, which is valid during the call only.
    void signalNotifyPropertyAreaUpdateCurrentTextStyle(TText* style);
    // Passes an undo command to the receiver, which owns it.
    void signalPushUndoCommandIntoStack(QUndoCommand* command);
    void signalSceneNotifyIfExistSelectedObject(bool exists);
    void signalSceneNotifyTextPropertyAreaObjectSelectionMode(bool shadowAndAlign, bool move);
    void signalBeginNewTextItem();
    void signalStartEditTextItem();
    // Reports a missing family that was found while the window was hidden, so that it can be shown later.
    void signalHasMessageToShowInformation(bool has, QString family);
    void signalDisableNewTextButton(bool disable);
    void signalCanvasSceneMousePressed();
    void signalSceneSoftWareClosedWhenEditObject();
    // Emitted before the selection, its text or the title changes, while the old selection is still in place.
    void signalEndPreview();

protected:
    void mouseDoubleClickEvent(QGraphicsSceneMouseEvent* event) override;
    void inputMethodEvent(QInputMethodEvent* event) override;
    void mousePressEvent(QGraphicsSceneMouseEvent* event) override;
    void mouseReleaseEvent(QGraphicsSceneMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void customEvent(QEvent* event) override;

private:
    void savePreviousArchiveInfo();
    void removeAllItems();
    // Ends editing and selection, and closes the soft keyboard that was open for them.
    void leaveEditing();
    bool archiveIsNull(const Archive* archive);
    void reportMissingFamily();
    void addText(GraphicsText* item);
    void pushCommand(QUndoCommand* command);
    void addCGraphicsPixmapItem(const QString& path, QPointF position, double z);
    void takeBackPreviews(const GraphicsText* except = nullptr);
    void pushDeleteCommand(GraphicsText* item);

    QPointer<GraphicsText> m_currentItem;
    // Owned by the scene's item tree.
    GraphicsPixmap* m_currentPixmapItem = nullptr;
    std::unique_ptr<ShownTitle> m_title;
    std::unique_ptr<NewTextStyle> m_newTextStyle;
    std::unique_ptr<TextPairMaker> m_pairs;
    std::unique_ptr<SceneKeyboard> m_keyboard;
    bool m_contentsChanged = false;
    int m_currentEditItemId = -1;
    int m_currentPressedObjectId = -1;
    bool m_drawSafeArea = false;
    std::unique_ptr<TextObjectList> m_texts;
    std::unique_ptr<SafeAreaLines> m_safeArea;
    bool m_defaultFontUsed = false;
    QString m_missingFamily;
    int m_topZ = 0;
    int m_module = 0;
};
