#pragma once

#include "Journal.h"
#include "library/ArchiveAction.h"
#include "tests/app/Siblings.h"

#include <QObject>
#include <functional>
#include <memory>

class ArchiveList;
class CanvasScene;
class FolderPicker;
class GraphicsText;
class TemplatePicker;
class TitlerWindow;

// A long session of an operator in the real window, without a screen: a folder is opened; titles are edited,
// copied, pasted, created, deleted, moved and saved as templates; folders are created, copied and renamed;
// everything is closed. Siblings replaces the other processes. After each step the journal gets what the
// operator sees.
//
// Needs a QApplication, and KSInputContext::install() before it. GUI thread.
class OperatorSession : public QObject
{
    Q_OBJECT

public:
    static const QString FOLDER;      // exists at the start
    static const QString MADE_FOLDER; // created in the session; its later name follows
    static const QString RENAMED_FOLDER;
    static const QString COPIED_FOLDER;
    static const QStringList STEMS;   // of the titles that exist at the start
    static const QString PRESET_TEXT; // texts of the titles in the templates
    static const QString USER_TEXT;

    // titleRoot: the folder that contains the title folders. isReady() returns false when no ports are free.
    explicit OperatorSession(const QString& titleRoot);
    ~OperatorSession() override;
    bool isReady() const { return m_window != nullptr; }

    // Types a first text into each title, so that its pictures are made.
    void makePictures();
    // Runs the session. With healBeforeClose the faults are stopped before each Close.
    void play(bool healBeforeClose);
    // Opens every folder, shows every title and closes.
    void look();
    // Runs this number of short sessions: the folder is opened, two titles are edited, one is pasted and
    // deleted, and everything is closed. Writes memory, descriptors and threads in use to the journal at
    // intervals.
    void soak(int sessions);
    void end();

private:
    void step(const char* name, const std::function<void()>& action, const Journal::Folders& foreseen = {});
    void report(const char* phase, const char* name, const Journal::Folders& folders);
    Journal::Folders seen() const;
    void noteList();
    QJsonArray told();

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
    // Adds the texts of a new title of the open folder to m_known, if there is one.
    void noteNewTitle(const QStringList& before, const QStringList& texts);
    Journal::Folders withTexts(const QString& stem, const QStringList& texts) const;

    void watchDialogs();

    QString m_root;
    Siblings m_siblings;
    std::unique_ptr<TitlerWindow> m_window;
    ArchiveList* m_list = nullptr;
    CanvasScene* m_scene = nullptr;
    FolderPicker* m_folders = nullptr;
    TemplatePicker* m_templates = nullptr;
    std::function<void()> m_inFolders;
    std::function<void()> m_inTemplates;
    QString m_open;           // name of the open folder
    int m_lastMark = 1000;    // above every window number that the program itself tells
    bool m_isSlow = false;    // whether something was not saved in time
    Journal::Folders m_known; // as last seen by the operator
};
