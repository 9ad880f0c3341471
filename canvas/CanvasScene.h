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

// The edit canvas: shows one title, owns its text objects, sends style changes to the right object, makes the
// undo commands of object changes, saves the title and drives the soft keyboard. Scene coordinates are the
// 1280 by 720 canvas. GUI thread only.
class CanvasScene : public QGraphicsScene
{
    Q_OBJECT
public:
    static constexpr int SIDEBYSIDE = 2;
    // Cascade step of a new object.
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

    // Takes the picture maker over; null: no pictures are made and isEditFinish() is always true.
    explicit CanvasScene(std::unique_ptr<IThumbnailRender> render, QObject* parent = nullptr);
    ~CanvasScene() override;

    void saveArchive();
    // Marks that the pictures of the title are out of date.
    void saveArchiveFlag();
    void createThumnailPicture();
    bool isEditFinish() const;
    // Blocks until the pictures are written, or nothing has come of them for a long time: the disk hangs, and
    // they are written when it goes on. Returns isEditFinish().
    bool waitForPictures() const;
    // Call before the operator leaves the title shown: what is being edited is taken over, blank objects are
    // deleted, and the pictures are made.
    void leaveTitle();
    // Shows no title. Nothing is saved.
    void clearCanvas();

    bool itemIsEditorInteraction() const;
    bool itemIsSelectionMode() const;
    void clearItemsSelectionMode();
    void clearItemsSelectionAndFocus();
    void disableTextPropertyArea() { Q_EMIT signalSceneNotifyIfExistSelectedObject(false); }

    // Deleted objects stay in the scene hidden; every loop over items uses this list.
    QList<QGraphicsItem*> enableItems() const;
    // The children of the objects shown.
    QList<GraphicsText*> getTextItemList() const;
    void setTextItemList(const QList<GraphicsText*>& items);
    // The enabled child with the id, or null.
    GraphicsText* findTextItem(int id) const;
    // Hides and disables the pair; undo builds a new one.
    void deleteItem(GraphicsText* item);
    void deleteSelectedItems();
    void connectSignalAndSlot(GraphicsText* item);
    // Makes an object with the panel's style; the new id, or -1 when four exist.
    int initCGraphicsTextItem();
    // Makes, wires and lists a pair that shows the record, for undo.
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
    // The copy of the title shown, or null; owned by the scene.
    const Archive* archive() const;
    // Call when a folder was renamed: what is still to be saved in it is saved there. If it is that of the
    // title shown, what is being typed is taken over.
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
    // Call before the selection, its text or the title changes. Whoever previews a style ends that now, and
    // what is still previewed after that is taken back.
    void endPreview();

Q_SIGNALS:
    void signalTextInserted();
    void signalNewTextInsertedFailed();
    void signalItemSelected(QGraphicsItem* item);
    void signalPixmapItemInserted(QGraphicsPixmapItem* item);
    void signalSaveOk(QString path, QImage image);
    // Valid during the call only.
    void signalNotifyPropertyAreaUpdateCurrentTextStyle(TText* style);
    // The receiver owns the command.
    void signalPushUndoCommandIntoStack(QUndoCommand* command);
    void signalSceneNotifyIfExistSelectedObject(bool exists);
    void signalSceneNotifyTextPropertyAreaObjectSelectionMode(bool shadowAndAlign, bool move);
    void signalBeginNewTextItem();
    void signalStartEditTextItem();
    // A missing family found while the window was hidden, to be reported when it shows.
    void signalHasMessageToShowInformation(bool has, QString family);
    void signalDisableNewTextButton(bool disable);
    void signalCanvasSceneMousePressed();
    void signalSceneSoftWareClosedWhenEditObject();
    // The selection, its text or the title is about to change; what was selected still is.
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
    // Ends editing and selection, and puts the keyboard away that was open for them.
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
