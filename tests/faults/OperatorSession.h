// An operator's day on the real window, without a screen: a folder is opened, titles are edited, copied,
// pasted, made, deleted, moved and saved as templates, folders are made, copied and renamed, and all is
// closed. Siblings stand in for the other processes. What the operator saw after each step goes into the
// journal.
//
// Needs a QApplication and KSInputContext::install before it. GUI thread.
#pragma once

#include "../app/Siblings.h"
#include "Journal.h"
#include "library/ArchiveAction.h"

#include <QObject>
#include <functional>
#include <memory>

class ArchiveList;
class CanvasScene;
class FolderPicker;
class GraphicsText;
class TemplatePicker;
class TitlerWindow;

class OperatorSession : public QObject
{
    Q_OBJECT

public:
    static const QString FOLDER;      // the one that is there
    static const QString MADE_FOLDER; // made in the session, and its later name
    static const QString RENAMED_FOLDER;
    static const QString COPIED_FOLDER;
    static const QStringList STEMS;   // of the titles that are there
    static const QString PRESET_TEXT; // what the titles of the templates say
    static const QString USER_TEXT;

    // titleRoot is the folder of the title folders. False from isReady when no ports are free.
    explicit OperatorSession(const QString& titleRoot);
    ~OperatorSession() override;
    bool isReady() const { return mWindow != nullptr; }

    // Writes a first text into each title, so that it gets its pictures.
    void makePictures();
    // The session. With healBeforeClose the faults end before each Close.
    void play(bool healBeforeClose);
    // Opens every folder, looks at every title and closes.
    void look();
    // So many sessions one after the other: the folder is opened, two titles edited, one pasted and deleted,
    // and all is closed. Memory, descriptors and threads in use go into the journal now and then.
    void soak(int sessions);
    void end();

private:
    void step(const char* name, const std::function<void()>& action, const Journal::Folders& foreseen = {});
    void report(const char* phase, const char* name, const Journal::Folders& folders);
    Journal::Folders seen() const;
    void noteList();
    QJsonArray told() const;

    void request(const QString& folder);
    void inEditor(bool healBeforeClose);
    void inFolderPicker(bool healBeforeClose);
    void close(bool healFirst);
    void settle();
    void tap(int row);
    void type(int id, const QString& text);
    void leaveText();
    void choose(ArchiveAction::ARCHIVE_ACTION_TYPE type, int row);
    void move(int from, int to);
    void takeTemplate(bool ofUser);
    void makeFolder(const QString& name);
    void nameFolder(const QString& name);
    QModelIndex rowOf(const QString& folder) const;
    // Makes what a new title of the open folder says known, in case there is one.
    void noteNewTitle(const QStringList& before, const QStringList& texts);
    Journal::Folders withTexts(const QString& stem, const QStringList& texts) const;

    void watchDialogs();

    QString mRoot;
    Siblings mSiblings;
    std::unique_ptr<TitlerWindow> mWindow;
    ArchiveList* mList = nullptr;
    CanvasScene* mScene = nullptr;
    FolderPicker* mFolders = nullptr;
    TemplatePicker* mTemplates = nullptr;
    std::function<void()> mInFolders;
    std::function<void()> mInTemplates;
    QString mOpen;           // name of the open folder
    bool mIsSlow = false;    // something was not saved in time
    Journal::Folders mKnown; // as the operator has seen them last
};
