#pragma once

#include <QList>
#include <QObject>
#include <QString>
#include <memory>

class Archive;
class ArchiveInitThread;

// Loads the titles of a folder in a thread, for one folder at a time. GUI thread.
class TitleLoader : public QObject
{
    Q_OBJECT

public:
    TitleLoader();
    // Ends the thread.
    ~TitleLoader() override;

    // Starts to load the titles of the folder. A folder that is still being loaded is dropped.
    void load(const QString& folder);
    // Ends the thread. loaded() is not emitted any more.
    void end();

Q_SIGNALS:
    // Passes the titles to the receiver, which takes ownership of the records.
    void loaded(const QList<Archive*>& archives);

private:
    void takeTitles(const QList<Archive*>& archives);

    std::unique_ptr<ArchiveInitThread> m_thread;
    bool m_isEnding = false; // while the thread may still deliver titles
};
