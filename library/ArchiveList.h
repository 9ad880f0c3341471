#pragma once

#include "document/Archive.h"
#include "library/ArchiveItems.h"
#include "library/TitleMenuActions.h"
#include "library/TitleRows.h"
#include "library/TitleSelection.h"
#include "support/FolderLock.h"
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

// The column of thumbnails: the titles of the current folder, in the order of the folder.
//
// A tap selects a title and sends it to the canvas; a right click or a long press opens the option menu,
// which creates, copies, pastes and deletes titles and saves them as templates; in move mode titles are
// dragged to another place. Every change is emitted as an undo command, which the receiver owns and pushes.
// The selected item is the title on the canvas, the operation item the one that the menu acts on. GUI thread
// only.
class ArchiveList : public KSScrollViewerWidget
{
    Q_OBJECT

public:
    static const int LIMIT_REMAIN = 200; // with KB_MILLION: kilobytes that must stay free on the disk
    static const int KB_MILLION = 1000;
    static const int MENU_FONT_SIZE = 28; // pixels

    // The label shows the name of the folder; it is not owned and must outlive the list. With autoInit the
    // last folder used, or otherwise the first one, is opened at once.
    ArchiveList(QLabel* folderLabel, bool autoInit, QWidget* parent = nullptr);
    ~ArchiveList() override;

    QString getCurrentPath() const { return m_currentPath; }
    ArchiveItem* getCurrentOperationArchive() const { return m_selection.operation(); }
    ArchiveItem* getSelectedArchive() const { return m_selection.selected(); }
    bool IsOptionMenuShowing() const { return m_actions->isMenuShowing(); }
    int getItemIndex(ArchiveItem* item) const;
    // Returns the item, or null for an index out of range. Items are made when they scroll into view or when
    // they are requested here, and may be given back when a long folder is scrolled on; use HeldArchiveItem
    // to keep one.
    ArchiveItem* archiveItem(int index) const;
    // Returns the full path of the title file without making an item. Empty for an index out of range.
    QString titlePath(int index) const;
    bool isMoveMode() const { return m_moveMode; }
    // Returns whether an item is being dragged.
    bool getMoveState() const { return m_moving; }

    // Opens the last folder used, or otherwise the first one; a thread loads its titles.
    void initArchiveList();

    // Selects the item and shows it on the canvas; an index out of range clears selection and canvas.
    void selectArchive(int index);
    // Moves the border to the item.
    void selectOperationArchive(int index);
    void setSelectItemState(ArchiveItem* item);
    void setDefaultItemState(ArchiveItem* item);
    void setOperationItemState(ArchiveItem* item) { m_selection.mark(item); }
    void clearOperationItemState(ArchiveItem* item) { m_selection.removeBorder(item); }
    void clearOldFlagState();
    // Stores the title as the last one used and sends it to the canvas.
    void saveLastArchivePathAndNotifyCanvasUpdate(ArchiveItem* item);

    // Empties the list, the path and the label.
    void cleanArchiveList();
    void clearCopyArchive() { m_actions->clearCopyArchive(); }
    // Saves the order again if its file is damaged. Removes the files of titles that are no longer in the
    // list, unless the order could not be read when the folder was opened, or not be written since.
    void synchronizationFolderFile();
    void stopArchiveListTapAndHoldTimer() { stopTapAndHoldTimer(); }
    void setSystemLanFont(QString family);
    void translateText();

    // Makes an item without child widgets, which are created when it is on screen. The list is its parent.
    ArchiveItem* createBaseItem(Archive* archive) { return m_items.make(archive); }
    // Returns the given item or, for null, a new one of the record, complete with child widgets.
    ArchiveItem* createPasteUndoItem(Archive* archive, ArchiveItem* item);

    // Makes the item of a row of this list, with its record. Called by the row.
    ArchiveItem* makeItem(ArchiveRow& row);

    // Returns the index and file name of each item; the caller owns the entries.
    QList<ArchiveOrder*> getArchiveOrderList() const;
    // Saves the order. If the disk refuses it, it is kept and written later.
    void saveArchiveListOrder();

    // Emits startTemplatePicker. Any thread.
    void startPicker() { Q_EMIT startTemplatePicker(); }

    // Returns whether the folder has as many titles as allowed. For a long folder it waits for the check when
    // the result depends on it.
    bool checkArchiveListIsFull();
    bool checkDiskSpaceIsFull() const;
    // Waits for a running check of the titles. Call before the list is changed, since the check still changes
    // the rows.
    void finishCheck();
    // Keeps the record for an item that is about to be made.
    Archive* own(std::unique_ptr<Archive> record) { return m_items.own(std::move(record)); }
    // Blocks until the pictures of the selected title are written.
    void waitForCanvas();

Q_SIGNALS:
    // Sends a title to the canvas; null when there is none to show. The list keeps owning the record.
    void signalUpdateCanvas(const Archive* archive);
    // Passes an undo command to the receiver, which takes ownership of it.
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
    // Emitted when a title is deselected: the canvas makes its pictures then.
    void itemSetDefaultState();
    void archiveListMenuShow();
    void cleanUndoStack();
    void signalAddArchiveData();
    void signalAddOneArchiveData(ArchiveItem* item);
    void signalStartPasteArchive();

public Q_SLOTS:
    void slotHideOptionMenu() { m_actions->hideMenu(); }
    void slotMenuAboutToClose();
    void slotDragOneItem(KSBaseItemWidget* item, int index, KSScrollViewerWidget* scrollArea);
    void slotItemDrop();
    void moveButtonClicked(bool isMoveMode);
    void slotAddArchiveData();
    void slotAddOneArchiveData(ArchiveItem* item);
    // Called when a title was saved: reads it again and shows the picture in its item.
    void refreshBaseItem(QString archiveFilePath, QImage leftImage);
    void itemLongHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void itemReleasedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void itemPressedAndHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea,
                                 bool& willMenuPopup);
    void itemRightPressedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea);
    void itemFlickEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea,
                        bool& willFlick);
    void selectOptionMenuItem(QAction* action) { m_actions->selectOptionMenuItem(action); }
    // Makes a title from the template's record, after the operation item.
    void createArchiveFromTemplate(Archive* temp) { m_actions->createArchiveFromTemplate(temp); }
    void refreshArchiveList(QString path);
    void refreshArchiveListForChangeFolderName(QString before, QString after);
    void refreshArchiveListInFile(QString path, QString fileName);
    // Takes ownership of the records.
    void getArchiveListSuccessed(QList<Archive*> archivesList);
    void moveCurrentArchiveItemVisble();
    // Sets the canvas, which is not owned.
    void setMainScene(CanvasScene* mainScene) { m_mainScene = mainScene; }
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
    // Selects the title. Returns false when it does not exist or its file cannot be read.
    bool selectTitle(const QString& path);
    void resetPositions();
    void setFolderLabel();
    void prepareOrder();
    void lockFolder();
    bool orderIsDamaged() const;
    void offerTemplateOrReportFull();
    ArchiveItem* findItem(const QString& path) const;

    std::unique_ptr<ArchiveController> m_controller;
    std::unique_ptr<ArchiveInitThread> m_initThread;
    bool m_ignoreLoaded = false; // set while a loader is being ended, which may still deliver titles
    TitleRows m_rows;
    ArchiveItems m_items;
    bool m_contentsRequested = false;
    bool m_giveBackRequested = false;
    std::unique_ptr<TitleMenuActions> m_actions;
    QLabel* m_folderLabel;
    CanvasScene* m_mainScene = nullptr;
    // Whether unlisted title files of the folder may be removed. Withheld when the order could not be read or
    // written, until the folder is opened again.
    enum class CleanUp { Allowed, Withheld };
    CleanUp m_cleanUp = CleanUp::Withheld;
    QString m_currentPath;
    FolderLock m_folderLock; // of the current folder, against programs that write titles there
    TitleSelection m_selection;
    QPointer<ArchiveItem> m_draggedItem;
    int m_moveSource = -1;   // row of the dragged item
    bool m_moveMode = false; // whether titles can be dragged
    bool m_moving = false;
    bool m_longHold = false; // set by a long press: the release that follows must not select
};
