// The column of thumbnails: the titles of the current folder, in the folder's order.
//
// A tap selects a title and sends it to the canvas; a right click or a long hold opens the option menu, from
// which titles are created, copied, pasted, deleted and saved as templates; in move mode titles are dragged
// to another place. Every change goes out as an undo command, which the receiver takes over and pushes. The
// selected item is the title on the canvas, the operation item the one that the menu acts on. GUI thread
// only.
#pragma once

#include "document/Archive.h"
#include "library/ArchiveItems.h"
#include "library/TitleMenuActions.h"
#include "library/TitleRows.h"
#include "library/TitleSelection.h"
#include "touchui/KSScrollViewerWidget.h"

#include <QImage>
#include <QList>
#include <QPointer>
#include <QString>
#include <memory>
#include <utility>

class ArchiveController;
class ArchiveInitThread;
class ArchiveItem;
class ArchiveOrder;
class ArchiveRow;
class CanvasScene;
class QAction;
class QLabel;
class QUndoCommand;

class ArchiveList : public KSScrollViewerWidget
{
    Q_OBJECT

public:
    static const int LIMIT_REMAIN = 200; // with KB_MILLION: kilobytes that must stay free on the disk
    static const int KB_MILLION = 1000;
    static const int MENU_FONT_SIZE = 28; // pixels

    // The label shows the name of the folder; it is not owned and must outlive the list. With autoInit the
    // last folder, or else the first one, is opened at once.
    ArchiveList(QLabel* folderLabel, bool autoInit, QWidget* parent = nullptr);
    ~ArchiveList() override;

    QString getCurrentPath() const { return mCurrentPath; }
    ArchiveItem* getCurrentOperationArchive() const { return mSelection.operation(); }
    ArchiveItem* getSelectedArchive() const { return mSelection.selected(); }
    bool IsOptionMenuShowing() const { return mActions->isMenuShowing(); }
    int getItemIndex(ArchiveItem* item) const;
    // Null when there is no such item. Items are made when they come into view or are asked for here, and may
    // be given back when a long folder is scrolled on; who needs one longer holds it.
    ArchiveItem* archiveItem(int index) const;
    // Full path of the title file, which needs no item. Empty when there is none.
    QString titlePath(int index) const;
    bool isMoveMode() const { return mMoveMode; }
    // Whether an item is being dragged.
    bool getMoveState() const { return mMoving; }

    // Opens the last folder, or else the first one; its titles follow from a thread of their own.
    void initArchiveList();

    // Selects the item and shows it on the canvas; an index outside the list clears both.
    void selectArchive(int index);
    // Moves the border to the item.
    void selectOperationArchive(int index);
    void setSelectItemState(ArchiveItem* item);
    void setDefaultItemState(ArchiveItem* item);
    void setOperationItemState(ArchiveItem* item) { mSelection.mark(item); }
    void clearOperationItemState(ArchiveItem* item) { mSelection.removeBorder(item); }
    void clearOldFlagState();
    // Remembers the title as the last one and sends it to the canvas.
    void saveLastArchivePathAndNotifyCanvasUpdate(ArchiveItem* item);

    // Empties the list, the path and the label.
    void cleanArchiveList();
    void clearCopyArchive() { mActions->clearCopyArchive(); }
    // Removes the files of titles that are no longer in the list, if the folder's order can be trusted to
    // name all others.
    void synchronizationFolderFile();
    void stopArchiveListTapAndHoldTimer() { stopTapAndHoldTimer(); }
    void setSystemLanFont(QString family);
    void translateText();

    // An item without its child widgets, which follow when it is on screen. The list is its parent.
    ArchiveItem* createBaseItem(Archive* archive) { return mItems.make(archive); }
    // The given item, or a new, complete one of the record.
    ArchiveItem* createPasteUndoItem(Archive* archive, ArchiveItem* item);

    // The item of a row of this list, with the record that it shows. For the row.
    ArchiveItem* makeItem(ArchiveRow& row);

    // One entry an item, with its index and file name; the caller owns the entries.
    QList<ArchiveOrder*> getArchiveOrderList() const;
    // What the disk refuses is kept and written when it takes it.
    void saveArchiveListOrder();

    // Emits startTemplatePicker. Any thread.
    void startPicker() { Q_EMIT startTemplatePicker(); }

    // Waits for the titles of a long folder when their number matters.
    bool checkArchiveListIsFull();
    bool checkDiskSpaceIsFull() const;
    // Whatever changes the list needs the final places of the titles: waits for a check that still runs.
    void finishCheck();
    // Keeps the record of an item that is to be made.
    Archive* own(std::unique_ptr<Archive> record) { return mItems.own(std::move(record)); }
    // Blocks until the canvas has written out the selected title.
    void waitForCanvas();

Q_SIGNALS:
    // Null: there is no title to show. The record stays the list's.
    void signalUpdateCanvas(const Archive* archive);
    // The receiver owns the command.
    void deleteCommandSignal(QUndoCommand* command);
    void pasteCommandSignal(QUndoCommand* command);
    void createCommandSignal(QUndoCommand* command);
    void focusCommandSignal(QUndoCommand* command);
    void moveCommandSignal(QUndoCommand* command);
    void addUserSignal(QString name);
    void signalStartMove(KSBaseItemWidget* item);
    void signalItemsCanDrag(bool canDrag);
    void startTemplatePicker();
    void startUserTemplatePicker();
    // A title is no longer selected: the canvas makes its pictures now.
    void itemSetDefaultState();
    void archiveListMenuShow();
    void cleanUndoStack();
    void signalAddArchiveData();
    void signalAddOneArchiveData(ArchiveItem* item);
    void signalStartPasteArchive();

public Q_SLOTS:
    void slotHideOptionMenu() { mActions->hideMenu(); }
    void slotMenuAboutToClose();
    void slotDragOneItem(KSBaseItemWidget* item, int index, KSScrollViewerWidget* scrollArea);
    void slotItemDrop();
    void moveButtonClicked(bool isMoveMode);
    void slotAddArchiveData();
    void slotAddOneArchiveData(ArchiveItem* item);
    // A title has been saved: reads it again and shows the picture in its item.
    void refreshBaseItem(QString archiveFilePath, QImage leftImage);
    void itemLongHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void itemReleasedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void itemPressedAndHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea,
                                 bool& willMenuPopup);
    void itemRightPressedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void itemFlickEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea,
                        bool& willFlick);
    void selectOptionMenuItem(QAction* action) { mActions->selectOptionMenuItem(action); }
    // Makes a title from the template's record, behind the operation item.
    void createArchiveFromTemplate(Archive* temp) { mActions->createArchiveFromTemplate(temp); }
    void refreshArchiveList(QString path);
    void refreshArchiveListForChangeFolderName(QString before, QString after);
    void refreshArchiveListInFile(QString path, QString fileName);
    // Takes over the records.
    void getArchiveListSuccessed(QList<Archive*> archivesList);
    void moveCurrentArchiveItemVisble();
    // Not owned.
    void setMainScene(CanvasScene* mainScene) { mMainScene = mainScene; }
    void wheelEvent(QWheelEvent* event) override;

private:
    void initArchiveListConnect();
    void connectMenuActions();
    void setMenuFont(const QString& family);
    void initArchiveListData();
    void initArchiveListRefreshData();
    void endInitThread();
    void openFolder(const QString& path);
    void clearOldArchiveList();
    void beginCheck();
    void removeUnreadable();
    void requestContents();
    void giveBackItems();
    ArchiveRow* archiveRow(int index) const;
    ArchiveItem* madeItem(int index) const;
    ArchiveItem* readableItem(int index);
    int findTitle(const QString& path) const;
    // False when there is no such title, or its file cannot be read.
    bool selectTitle(const QString& path);
    void resetPositions();
    void setFolderLabel();
    void prepareOrder();
    bool orderIsDamaged() const;
    void offerTemplateOrReportFull();
    ArchiveItem* findItem(const QString& path) const;

    std::unique_ptr<ArchiveController> mController;
    std::unique_ptr<ArchiveInitThread> mInitThread;
    bool mIgnoreLoaded = false; // a loader that is being ended may still deliver
    TitleRows mRows;
    ArchiveItems mItems;
    bool mContentsRequested = false;
    bool mGiveBackRequested = false;
    std::unique_ptr<TitleMenuActions> mActions;
    QLabel* mFolderLabel;
    CanvasScene* mMainScene = nullptr;
    // A folder whose order could not be read when it was opened, or not be written since, is not cleaned up
    // before it is opened again.
    enum class CleanUp { Allowed, Withheld };
    CleanUp mCleanUp = CleanUp::Withheld;
    QString mCurrentPath;
    TitleSelection mSelection;
    QPointer<ArchiveItem> mDraggedItem;
    int mMoveSource = -1;   // row of the item that is being dragged
    bool mMoveMode = false; // titles can be dragged
    bool mMoving = false;
    bool mLongHold = false; // the release of the finger that opened the menu selects nothing
};
