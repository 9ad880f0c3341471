#pragma once

#include <QDateTime>
#include <QList>
#include <QSize>
#include <QString>

class Archive;

// What is wrong with the picture files of a title and its background: one fault for each at most. Any thread.
class PictureStates
{
public:
    enum class State { Good, Missing, Torn, WrongSize, Old };
    struct Fault {
        QString picture; // such as "picture 1920"
        State state = State::Good;
        QString reason;
    };

    // titleChanged is when the title file was written; older pictures do not show the title as it is.
    PictureStates(const Archive& archive, const QDateTime& titleChanged);

    const QList<Fault>& faults() const { return m_faults; }

    // Returns the state of a picture file. An invalid size stands for any, an invalid time for any age; an
    // empty path is a missing file.
    static State stateOf(const QString& path, QSize size, const QDateTime& notBefore);

private:
    void judge(const QString& picture, const QString& path, QSize size, const QDateTime& notBefore);

    QList<Fault> m_faults;
};
