#pragma once

#include "library/TitleClipboard.h"
#include "library/TitleFileOperations.h"

#include <QFont>
#include <QList>
#include <QObject>
#include <QPointer>
#include <QString>
#include <memory>

class Archive;
class ArchiveController;
class ArchiveItem;
class ArchiveList;
class ArchiveMenu;
class CanvasScene;
class ITitlerAPPEventFilterController;
class ListedTitles;
class QAction;
class QPoint;
class QUndoCommand;

// The option menu of the title list and its actions: create, copy, paste and delete titles, and save them as
// templates. Every change of the list is emitted as an undo command. GUI thread.
class TitleMenuActions : public QObject
{
    Q_OBJECT

public:
    static const int MENU_FONT_SIZE = 28; // pixels

    // The titles are those of the list. None of them is owned, and all must outlive this object.
    TitleMenuActions(ArchiveList* list, ListedTitles& titles, ArchiveController& controller);
    ~TitleMenuActions() override;

    // Opens the menu for a title, or with null for the empty area after the last one. pos is in coordinates
    // of the item or of the area.
    void showOptionMenu(ArchiveItem* item, const QPoint& pos, QWidget* area);
    bool isMenuShowing() const;
    void hideMenu();
    // Reports to the sibling processes whether a popup is open: a press in one of them closes it.
    void sendTitlerAppEvent(bool open);
    void setMenuFont(const QString& family);
    void translateText();

    void selectOptionMenuItem(QAction* action);
    // Sets the canvas, which is not owned; it makes the pictures of the selected title.
    void setMainScene(CanvasScene* scene) { m_scene = scene; }
    // See ArchiveList::createArchiveFromTemplate().
    void createArchiveFromTemplate(Archive* temp);
    void clearCopyArchive() { m_clipboard.clear(); }

    // Sets the row after which titles are created and pasted; -1 for none.
    void setOperationPosition(int position) { m_operationPosition = position; }
    // Call when rows, in ascending order, were removed from the list.
    void rowsRemoved(const QList<int>& rows);

Q_SIGNALS:
    // See the signals of ArchiveList.
    void deleteCommandSignal(QUndoCommand* command);
    void pasteCommandSignal(QUndoCommand* command);
    void addUserSignal(QString name);
    void startTemplatePicker();
    void startUserTemplatePicker();
    void archiveListMenuShow();
    void signalStartPasteArchive();
    void menuAboutToClose();

private:
    void createOptionMenu();
    void exeCreateArchive();
    void exeCopyArchive();
    void exePasteArchive();
    void exeDeleteArchive();
    void exeAddUserArchive();
    void emitPasteCommand(std::unique_ptr<Archive> archive);
    void waitForCanvas();

    ArchiveList* m_list;
    ListedTitles& m_titles;
    CanvasScene* m_scene = nullptr;
    ArchiveController& m_controller;
    TitleFileOperations m_files;
    TitleClipboard m_clipboard;
    std::unique_ptr<ArchiveMenu> m_menu; // made at first use; a child of the list
    QFont m_menuFont;
    QPointer<ITitlerAPPEventFilterController> m_eventController;
    int m_operationPosition = -1;
};
