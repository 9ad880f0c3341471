// Drives an appliance by lines of text, and answers each with an event.
//
// Lines are carried out in their order; a wait holds back those behind it. A line that was carried out gives
// {"event":"ok","command":..}, one that cannot be gives {"event":"error","command":..,"message":..}, a wait
// that takes too long
// {"event":"timeout","command":..}.
#pragma once

#include "appliance/Appliance.h"
#include "appliance/CommandLine.h"

#include <QDeadlineTimer>
#include <QObject>
#include <QTimer>

#include <deque>
#include <functional>
#include <map>

class CommandInterpreter : public QObject
{
    Q_OBJECT

public:
    static constexpr int DEFAULT_WAIT_MS = 30000;

    // The appliance must outlive the interpreter.
    CommandInterpreter(Appliance& appliance, Appliance::EventSink sink, QObject* parent = nullptr);
    ~CommandInterpreter() override;

    // Carries the line out, or keeps it until the wait before it is over. Empty lines and lines that begin
    // with # do nothing.
    void addLine(const QString& line);
    // Asks for the end once all lines are carried out.
    void endOfInput();

Q_SIGNALS:
    void quitRequested();

private:
    // Returns what is wrong, or an empty text.
    using Handler = std::function<QString(const CommandLine& command)>;
    // True once what is waited for has come, with its event sent.
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
