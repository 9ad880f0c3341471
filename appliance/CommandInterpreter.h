#pragma once

#include "appliance/Appliance.h"
#include "appliance/CommandLine.h"

#include <QDeadlineTimer>
#include <QObject>
#include <QTimer>

#include <deque>
#include <functional>
#include <map>

// Controls an appliance by lines of text and answers each line with an event.
//
// Lines are executed in order; a wait delays the lines behind it. The events are
//     {"event":"ok","command":..} for a line that was executed,
//     {"event":"error","command":..,"message":..} for one that cannot be executed,
//     {"event":"timeout","command":..} for a wait that takes too long.
class CommandInterpreter : public QObject
{
    Q_OBJECT

public:
    static constexpr int DEFAULT_WAIT_MS = 30000;

    // The appliance must outlive the interpreter.
    CommandInterpreter(Appliance& appliance, Appliance::EventSink sink, QObject* parent = nullptr);
    ~CommandInterpreter() override;

    // Executes the line, or queues it while a wait is pending. Ignores empty lines and lines that begin with
    // #.
    void addLine(const QString& line);
    // Requests the end of the program after all lines are executed.
    void endOfInput();

Q_SIGNALS:
    void quitRequested();

private:
    // Returns an error message, or an empty text on success.
    using Handler = std::function<QString(const CommandLine& command)>;
    // Returns whether the awaited condition has occurred; if so, has sent its event.
    using Condition = std::function<bool()>;

    void addTitlerCommands();
    void addKeyboardCommands();
    void addServiceCommands();
    void addFileCommands();
    void addStateCommands();
    void addWaitCommands();
    void addOption(const QString& word, bool Appliance::Options::*option);

    template <typename Notify>
    Handler withNotify(std::function<QString(Notify& client, const CommandLine&)> action);
    template <typename CallBack>
    Handler withCallBack(std::function<QString(CallBack& client, const CommandLine&)> action);
    Handler withTitler(std::function<QString(ITitler& titler, const CommandLine&)> action);

    void runLines();
    void carryOut(const CommandLine& command);
    QString startWait(const CommandLine& command, int milliseconds, Condition condition);
    void checkWait();
    void report(const char* event, const QString& command, const QString& message = QString());

    Appliance& m_appliance;
    Appliance::EventSink m_sink;
    std::map<QString, Handler> m_handlers;
    std::deque<QString> m_lines;
    bool m_inputEnded = false;
    Condition m_waitCondition;
    QString m_waitCommand;
    QDeadlineTimer m_waitDeadline;
    QTimer m_waitTimer;
};
