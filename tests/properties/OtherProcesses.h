#pragma once

#include "TitleAccount.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "library/FolderNameRules.h"
#include "messaging/services/ServiceFamilies.h"
#include "tests/app/Siblings.h"
#include "tests/library/TemplateFixture.h"

#include <QRandomGenerator>
#include <thread>

using Counts = QMap<QString, int>;

// Random actions of the other processes of the appliance while the operator works, including their changes on
// the disk: file manager, message boxes, languages and masks over the window. Counts the actions.
class OtherProcesses
{
public:
    OtherProcesses(Siblings& siblings, TemplateFixture& files, TitleAccount& account, Counts& counts,
                   quint32 seed)
        : m_siblings(siblings), m_files(files), m_account(account), m_counts(counts), m_random(seed)
    {
    }

    // Returns a random name for folders and templates; some are not allowed for folders.
    QString anyName()
    {
        static const QStringList names{QStringLiteral("News"),
                                       QStringLiteral("evening news"),
                                       QString::fromUtf8("速報"),
                                       QString::fromUtf8("快讯 晚间"),
                                       QString::fromUtf8("속보"),
                                       QString::fromUtf8("Новости"),
                                       QString::fromUtf8("😀 e\u0301"),
                                       QStringLiteral("twenty characters ab"),
                                       QStringLiteral("twenty-one characters"),
                                       QStringLiteral("a/b"),
                                       QStringLiteral("x.y"),
                                       QStringLiteral(" lead and trail "),
                                       QString()};
        const QString name = names.at(below(int(names.size())));
        return below(2) == 0 ? name : name + QString::number(below(30));
    }
    QStringList folders() const
    {
        return QDir(m_files.titleRoot()).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    }

    // Carries out one random action. openFolder: the folder that is open in the window, or empty.
    void act(const QString& openFolder)
    {
        const int kind = below(100);
        if (kind < 14)
            renameFolder();
        else if (kind < 24 || folders().size() > MOST_FOLDERS)
            deleteFolder(openFolder);
        else if (kind < 36)
            importTemplate();
        else if (kind < 46)
            renameTemplate();
        else if (kind < 56)
            deleteTemplate();
        else if (kind < 68)
            changeLanguage();
        else if (kind < 84)
            maskDialog();
        else
            pressElsewhere();
    }

    // Shows a mask for a requested message box, and answers the box after a random number of calls.
    void serveMessages()
    {
        takeMessages();
        if (m_boxes.isEmpty()) {
            if (m_dialogMask > 0 && --m_dialogMask == 0)
                messages()->hideDialogOpacityWidget();
            return;
        }
        if (!m_boxIsUp) {
            messages()->showMessageOpacityWidget();
            m_boxIsUp = true;
        } else if (below(4) == 0) {
            answer(m_boxes.takeFirst());
        }
    }
    bool isAsking() const { return !m_boxes.isEmpty(); }

private:
    int below(int limit) { return m_random.bounded(limit); }
    void count(const char* what) { ++m_counts[QLatin1String(what)]; }
    static ShowMessageController* messages() { return ShowMessageController::getInstance(); }
    static EditTitlerController* fileManager() { return EditTitlerController::getInstance(); }
    QString path(const QString& folder) const { return m_files.titleRoot() + QLatin1Char('/') + folder; }

    // Reads the requested message boxes. Sends another call first and waits for it, so that all earlier ones
    // have arrived.
    void takeMessages()
    {
        using Proxy = MessageCenterRemoteProxy;
        messages()->changeTopWindow(MessageDefine::TOP_WINDOW_TITLER);
        while (m_siblings.countOf(Proxy::INTERFACE_ID, Proxy::METHOD_setTopWindow) == 0)
            std::this_thread::yield();
        for (QByteArray call : m_siblings.argumentsOf(Proxy::INTERFACE_ID, Proxy::METHOD_postMessage)) {
            MessageDefine::_tagMessageParam message;
            MessageCenterParams::deserialize_postMessage_param(message, call.data(), long(call.size()));
            m_boxes.append(message.messageId);
            ++m_counts[QString("message %1").arg(message.messageId)];
        }
        m_siblings.forget();
    }
    void answer(int message)
    {
        const bool hasTwoButtons =
            message == MessageDef::MESSAGE_DELETE_TEMPLATE || message == MessageDef::MESSAGE_CONFIRM_CLOSE;
        const bool isOk = hasTwoButtons && below(3) != 0;
        if (m_boxes.isEmpty()) {
            messages()->hideMessageOpacityWidget();
            m_boxIsUp = false;
        }
        count(isOk ? "boxes answered OK" : "boxes answered Cancel");
        const qsizetype templatesBefore = templates().size();
        messages()->closeMessageNotify(
            {1, isOk ? MessageDefine::CLOSE_OK : MessageDefine::CLOSE_CANCEL, message});
        if (templates().size() < templatesBefore)
            count("templates deleted by the operator");
    }

    QString freshName(const QStringList& used)
    {
        for (;;) {
            const QString name = anyName();
            if (FolderNameRules::isFolderName(name) && !used.contains(name, Qt::CaseInsensitive))
                return name;
        }
    }
    // Renames a folder of the root on the disk. Returns the old and the new name, or nothing if that failed.
    QStringList renameOneOf(const QString& root, const QStringList& names)
    {
        if (names.isEmpty())
            return {};
        const QString before = names.at(below(int(names.size())));
        const QString after = freshName(names);
        return QDir(root).rename(before, after) ? QStringList{before, after} : QStringList();
    }
    void renameFolder()
    {
        const QStringList renamed = renameOneOf(m_files.titleRoot(), folders());
        if (renamed.isEmpty())
            return;
        count("folders renamed by the file manager");
        fileManager()->updateFolderNameInCurrentProjectNotify(
            {1, path(renamed.first()).toStdWString(), path(renamed.last()).toStdWString()});
    }
    // Deletes a folder. Spares folders that are nearly full and mostly the open one: the file manager checks
    // which is open, but the operator may open another one meanwhile.
    void deleteFolder(const QString& openFolder)
    {
        const QStringList names = folders();
        if (names.size() < FEWEST_FOLDERS)
            return;
        const QString name = names.at(below(int(names.size())));
        if ((path(name) == openFolder && below(10) != 0) ||
            TitleAccount::stemsIn(path(name)).size() > LONG_FOLDER)
            return;
        m_account.folderGoes(path(name));
        QDir(path(name)).removeRecursively();
        count("folders deleted by the file manager");
        fileManager()->updateTitlerFolderInFileManagerDelete(name.toStdWString());
    }

    QStringList templates() const
    {
        return QDir(m_files.userRoot()).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
    }
    // Imports a template, sometimes one with an existing name.
    void importTemplate()
    {
        const QStringList names = templates();
        if (names.size() > MOST_TEMPLATES)
            return deleteTemplate();
        const QString name =
            !names.isEmpty() && below(4) == 0 ? names.at(below(int(names.size()))) : freshName(names);
        m_files.makeUserPictures(name);
        FileManagerDefine::tagImportNotify notice;
        notice.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
        notice.path = name.toStdWString();
        count("templates imported");
        fileManager()->importNotify(notice);
    }
    void renameTemplate()
    {
        const QStringList renamed = renameOneOf(m_files.userRoot(), templates());
        if (renamed.isEmpty())
            return;
        FileManagerDefine::tagRenameNotify notice;
        notice.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
        notice.strings[0] = renamed.first().toStdWString();
        notice.strings[2] = renamed.last().toStdWString();
        notice.strings[3] = (m_files.userRoot() + '/' + renamed.last() + '/').toStdWString();
        count("templates renamed by the file manager");
        fileManager()->renameTitlerTemplateNotify(notice);
    }
    void deleteTemplate()
    {
        const QStringList names = templates();
        if (names.isEmpty())
            return;
        const QString name = names.at(below(int(names.size())));
        QDir(m_files.userRoot() + '/' + name).removeRecursively();
        FileManagerDefine::tagDeleteNotify notice;
        notice.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
        notice.path = m_files.userTitle(name).toStdWString();
        count("templates deleted by the file manager");
        fileManager()->deleteNotify(notice);
    }

    void changeLanguage()
    {
        auto* setup = SystemSetupInfoController::getInstance();
        count("languages changed");
        if (below(2) == 0)
            setup->setSystemLanguageNotify(below(4));
        else
            setup->setInputLanguageNotify(below(12));
    }
    void maskDialog()
    {
        if (m_dialogMask > 0)
            return;
        count("masks shown");
        m_dialogMask = 1 + below(6);
        messages()->showDialogOpacityWidget();
    }
    // Reports a press in another process, which closes transient controls here.
    void pressElsewhere()
    {
        count("presses in other processes");
        TitlerAPPEventFilterController::getInstance()->postRestoreOriginalNotify(
            {1, APPEventDefine::LOCKTYPE_NONE, false, APPEventDefine::EVENTREVICER_RESTORE_ALL});
    }

    static constexpr int FEWEST_FOLDERS = 6;
    static constexpr int MOST_FOLDERS = 9;
    static constexpr int LONG_FOLDER = 90;
    static constexpr int MOST_TEMPLATES = 12;

    Siblings& m_siblings;
    TemplateFixture& m_files;
    TitleAccount& m_account;
    Counts& m_counts;
    QRandomGenerator m_random;
    QList<int> m_boxes; // message ids, that of the visible box first
    bool m_boxIsUp = false;
    int m_dialogMask = 0; // number of calls until the mask is hidden
};
