#include "appliance/CommandInterpreter.h"

#include "appliance/KeyStrokes.h"
#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"

namespace
{

const int WAIT_POLL_MS = 10;
const char* const BAD_NUMBER = "a number is missing or wrong";
const char* const BAD_COUNT = "wrong number of arguments";

} // namespace

CommandInterpreter::CommandInterpreter(Appliance& appliance, Appliance::EventSink sink, QObject* parent)
    : QObject(parent), m_appliance(appliance), m_sink(std::move(sink))
{
    m_waitTimer.setInterval(WAIT_POLL_MS);
    connect(&m_waitTimer, &QTimer::timeout, this, &CommandInterpreter::checkWait);
    addTitlerCommands();
    addKeyboardCommands();
    addServiceCommands();
    addFileCommands();
    addStateCommands();
    addWaitCommands();
    m_handlers["quit"] = [this](const CommandLine&) {
        m_lines.clear();
        Q_EMIT quitRequested();
        return QString();
    };
}

CommandInterpreter::~CommandInterpreter() = default;

void CommandInterpreter::addLine(const QString& line)
{
    m_lines.push_back(line);
    runLines();
}

void CommandInterpreter::endOfInput()
{
    m_inputEnded = true;
    runLines();
}

void CommandInterpreter::runLines()
{
    while (m_waitCondition == nullptr && !m_lines.empty()) {
        const CommandLine command(m_lines.front());
        m_lines.pop_front();
        if (!command.word().isEmpty() && !command.word().startsWith('#'))
            carryOut(command);
    }
    if (m_inputEnded && m_waitCondition == nullptr) {
        m_inputEnded = false;
        Q_EMIT quitRequested();
    }
}

void CommandInterpreter::carryOut(const CommandLine& command)
{
    const auto found = m_handlers.find(command.word());
    if (found == m_handlers.end()) {
        report("error", command.line(), "unknown command");
        return;
    }
    const QString problem = found->second(command);
    if (!problem.isEmpty())
        report("error", command.line(), problem);
    else if (m_waitCondition == nullptr)
        report("ok", command.line());
}

void CommandInterpreter::report(const char* event, const QString& command, const QString& message)
{
    QJsonObject json{{"event", event}, {"command", command}};
    if (!message.isEmpty())
        json.insert("message", message);
    m_sink(json);
}

QString CommandInterpreter::startWait(const CommandLine& command, int milliseconds, Condition condition)
{
    if (condition())
        return QString();
    m_waitCondition = std::move(condition);
    m_waitCommand = command.line();
    m_waitDeadline.setRemainingTime(milliseconds);
    m_waitTimer.start();
    return QString();
}

void CommandInterpreter::checkWait()
{
    if (m_waitCondition == nullptr)
        return;
    const bool fulfilled = m_waitCondition();
    if (!fulfilled && !m_waitDeadline.hasExpired())
        return;
    m_waitTimer.stop();
    m_waitCondition = nullptr;
    report(fulfilled ? "ok" : "timeout", m_waitCommand);
    runLines();
}

CommandInterpreter::Handler
CommandInterpreter::withTitler(std::function<QString(ITitler& titler, const CommandLine&)> action)
{
    return [this, action](const CommandLine& command) {
        ITitler* titler = m_appliance.titler();
        return titler != nullptr ? action(*titler, command) : QString("the titler does not listen");
    };
}

template <typename Notify>
CommandInterpreter::Handler
CommandInterpreter::withNotify(std::function<QString(Notify& client, const CommandLine&)> action)
{
    return [this, action](const CommandLine& command) {
        auto* client = m_appliance.notifyOf<Notify>();
        return client != nullptr ? action(*client, command) : QString(Notify::Calls::NAME) + " has no client";
    };
}

template <typename CallBack>
CommandInterpreter::Handler
CommandInterpreter::withCallBack(std::function<QString(CallBack& client, const CommandLine&)> action)
{
    return [this, action](const CommandLine& command) {
        auto* client = m_appliance.callBackOf<CallBack>();
        return client != nullptr ? action(*client, command)
                                 : QString(CallBack::Calls::NAME) + " has no client";
    };
}

void CommandInterpreter::addTitlerCommands()
{
    m_handlers["register"] = [this](const CommandLine&) {
        return m_appliance.registerAtTitler() ? QString() : QString("the titler does not listen");
    };
    m_handlers["create"] = withTitler([](ITitler& titler, const CommandLine& command) {
        bool valid = true;
        const int type = command.number(0, 0, &valid);
        if (!valid) {
            return QString(BAD_NUMBER);
        }
        titler.showTitlerCreate(type);
        return QString();
    });
    m_handlers["edit"] = withTitler([](ITitler& titler, const CommandLine& command) {
        // The type may follow a path in quotes or a path without blanks.
        bool isType = command.arguments().size() == 2;
        const int type = isType ? command.number(1, &isType) : 0;
        const QString path = isType ? command.arguments().first() : command.rest();
        titler.showTitlerEdit({isType ? type : 0, path.toStdWString()});
        return QString();
    });
    m_handlers["dialog-mask"] = withTitler([](ITitler& titler, const CommandLine& command) {
        bool valid = true;
        const bool show = command.number(0, &valid) != 0;
        if (valid) {
            titler.showDialogMaskWidget(show);
        }
        return valid ? QString() : QString(BAD_NUMBER);
    });
    m_handlers["message-mask"] = withTitler([](ITitler& titler, const CommandLine& command) {
        bool valid = true;
        const bool show = command.number(0, &valid) != 0;
        if (valid) {
            titler.showMessageMaskWidget(show);
        }
        return valid ? QString() : QString(BAD_NUMBER);
    });
    m_handlers["sub"] = withCallBack<IShowTitlerControllerCallBack>(
        [](IShowTitlerControllerCallBack& client, const CommandLine&) {
            client.showTitler();
            return QString();
        });
}

void CommandInterpreter::addKeyboardCommands()
{
    using Keyboard = ISoftKeyBoardControllerCallBack;
    const auto addText = [&](const char* word, void (Keyboard::*send)(std::wstring)) {
        m_handlers[word] = withCallBack<Keyboard>([send](Keyboard& client, const CommandLine& command) {
            (client.*send)(command.rest().toStdWString());
            return QString();
        });
    };
    addText("string", &Keyboard::sendInputString);
    addText("string-enter", &Keyboard::sendInputStringOnEnterPressing);
    addText("string-changed", &Keyboard::sendInputStringOnTextChanged);
    const auto sendKeys = [](Keyboard& client, const auto& keys) {
        for (const SubCommonDefine::tagSoftKeyBoardKeyData& key : keys)
            client.sendKey(key);
        return QString();
    };
    m_handlers["key"] = withCallBack<Keyboard>([sendKeys](Keyboard& client, const CommandLine& command) {
        const auto named = KeyStrokes::ofName(command.rest());
        return sendKeys(client, named.empty() ? KeyStrokes::ofText(command.rest()) : named);
    });
    m_handlers["key-text"] = withCallBack<Keyboard>([sendKeys](Keyboard& client, const CommandLine& command) {
        return sendKeys(client, KeyStrokes::ofText(command.rest()));
    });
    m_handlers["key-close"] = withCallBack<Keyboard>([](Keyboard& client, const CommandLine&) {
        SubCommonDefine::tagSoftKeyBoardKeyData key;
        key.eventType = KeyStrokes::KEYBOARD_CLOSED;
        client.sendKey(key);
        return QString();
    });
    m_handlers["cursor"] = withCallBack<Keyboard>([](Keyboard& client, const CommandLine& command) {
        bool valid = true;
        const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos position{
            command.number(0, &valid), command.number(1, &valid), command.number(2, &valid),
            command.number(3, &valid)};
        if (valid) {
            client.sendInputStringSelectionPos(position);
        }
        return valid ? QString() : QString(BAD_NUMBER);
    });
    m_handlers["keyboard-state"] = withCallBack<Keyboard>([](Keyboard& client, const CommandLine& command) {
        bool valid = true;
        const bool shown = command.number(0, &valid) != 0;
        if (valid) {
            client.sendSoftKeyboardState(shown);
        }
        return valid ? QString() : QString(BAD_NUMBER);
    });
}

void CommandInterpreter::addServiceCommands()
{
    m_handlers["message-close"] = withNotify<IMessageCenterNotify>([this](IMessageCenterNotify& client,
                                                                          const CommandLine& command) {
        bool valid = true;
        const int messageId = command.number(0, &valid);
        const int closeType = command.number(1, &valid);
        if (valid)
            client.closeMessageNotify({m_appliance.clientIdOf(IMessageCenter::NAME), closeType, messageId});
        return valid ? QString() : QString(BAD_NUMBER);
    });
    m_handlers["top-window"] =
        withNotify<IMessageCenterNotify>([this](IMessageCenterNotify& client, const CommandLine& command) {
            bool valid = true;
            const int topWindow = command.number(0, &valid);
            if (valid) {
                m_appliance.state.topWindow = topWindow;
                client.getTopWindowNotify(topWindow);
            }
            return valid ? QString() : QString(BAD_NUMBER);
        });
    m_handlers["power-off"] =
        withNotify<IPowerManagerNotify>([](IPowerManagerNotify& client, const CommandLine&) {
            client.powerOff();
            return QString();
        });
    m_handlers["power-on"] =
        withNotify<IPowerManagerNotify>([](IPowerManagerNotify& client, const CommandLine&) {
            client.powerOn();
            return QString();
        });
    m_handlers["load-project"] = withNotify<IProjectDataManagerNotify>(
        [](IProjectDataManagerNotify& client, const CommandLine& command) {
            bool valid = true;
            const int projectState = command.number(0, &valid);
            if (valid) {
                client.loadNotify(projectState);
            }
            return valid ? QString() : QString(BAD_NUMBER);
        });
    const auto event = [this](const CommandLine& command, int receiverIndex, bool* valid) {
        APPEventDefine::_tagAPPEvent announcement;
        announcement.clientId = m_appliance.clientIdOf(IAPPEventFilter::NAME);
        announcement.eventReceiver = command.number(receiverIndex, 0, valid);
        return announcement;
    };
    m_handlers["lock"] =
        withNotify<IAPPEventFilterNotify>([event](IAPPEventFilterNotify& client, const CommandLine& command) {
            bool valid = true;
            APPEventDefine::_tagAPPEvent announcement = event(command, 2, &valid);
            announcement.lockType = command.number(0, &valid);
            announcement.flag = command.number(1, &valid) != 0;
            if (valid) {
                client.postAPPEventFilterNotify(announcement);
            }
            return valid ? QString() : QString(BAD_NUMBER);
        });
    m_handlers["restore-original"] =
        withNotify<IAPPEventFilterNotify>([event](IAPPEventFilterNotify& client, const CommandLine& command) {
            bool valid = true;
            const APPEventDefine::_tagAPPEvent announcement = event(command, 0, &valid);
            if (valid) {
                client.postRestoreOriginalNotify(announcement);
            }
            return valid ? QString() : QString(BAD_NUMBER);
        });
    m_handlers["restore-focus"] =
        withNotify<IAPPEventFilterNotify>([](IAPPEventFilterNotify& client, const CommandLine&) {
            client.postRestoreFocusNotify();
            return QString();
        });
}

void CommandInterpreter::addFileCommands()
{
    using Files = IFileManagerControllerNotify;
    m_handlers["rename-folder"] = withNotify<Files>([this](Files& client, const CommandLine& command) {
        const QStringList names = command.arguments();
        if (names.size() != 2)
            return QString(BAD_COUNT);
        client.updateFolderNameInCurrentProjectNotify({m_appliance.clientIdOf(IFileManagerController::NAME),
                                                       names[0].toStdWString(), names[1].toStdWString()});
        return QString();
    });
    m_handlers["delete-folder"] = withNotify<Files>([](Files& client, const CommandLine& command) {
        client.updateTitlerFolderInFileManagerDelete(command.rest().toStdWString());
        return QString();
    });
    m_handlers["import"] = withNotify<Files>([](Files& client, const CommandLine& command) {
        bool valid = true;
        FileManagerDefine::tagImportNotify notice;
        notice.fileType = command.number(0, &valid);
        if (!valid || command.arguments().size() != 2) {
            return QString(valid ? BAD_COUNT : BAD_NUMBER);
        }
        notice.path = command.arguments().at(1).toStdWString();
        client.importNotify(notice);
        return QString();
    });
    m_handlers["delete-template"] = withNotify<Files>([](Files& client, const CommandLine& command) {
        FileManagerDefine::tagDeleteNotify notice;
        notice.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
        notice.path = command.rest().toStdWString();
        client.deleteNotify(notice);
        return QString();
    });
    m_handlers["rename-template"] = withNotify<Files>([](Files& client, const CommandLine& command) {
        const QStringList names = command.arguments();
        if (names.size() != 3) {
            return QString(BAD_COUNT);
        }
        FileManagerDefine::tagRenameNotify notice;
        notice.fileType = FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE;
        notice.strings[0] = names[0].toStdWString();
        notice.strings[2] = names[1].toStdWString();
        notice.strings[3] = names[2].toStdWString();
        client.renameTitlerTemplateNotify(notice);
        return QString();
    });
}

// The state is kept while no client is connected, and reported to the next one.
void CommandInterpreter::addStateCommands()
{
    m_handlers["language"] = [this](const CommandLine& command) {
        bool valid = true;
        const int systemLanguage = command.number(0, &valid);
        const int inputLanguage = command.number(1, &valid);
        if (!valid)
            return QString(BAD_NUMBER);
        m_appliance.state.systemLanguage = systemLanguage;
        m_appliance.state.inputLanguage = inputLanguage;
        if (auto* client = m_appliance.callBackOf<ISystemSetupManagerCallBack>())
            client->getLanguageInfoCallBack(
                {m_appliance.clientIdOf(ISystemSetupManager::NAME), systemLanguage, inputLanguage});
        return QString();
    };
    const auto addLanguage = [&](const char* word, int Appliance::State::*field,
                                 void (ISystemSetupManagerNotify::*send)(int)) {
        m_handlers[word] = [this, field, send](const CommandLine& command) {
            bool valid = true;
            const int language = command.number(0, &valid);
            if (!valid) {
                return QString(BAD_NUMBER);
            }
            m_appliance.state.*field = language;
            if (auto* client = m_appliance.notifyOf<ISystemSetupManagerNotify>()) {
                (client->*send)(language);
            }
            return QString();
        };
    };
    addLanguage("system-language", &Appliance::State::systemLanguage,
                &ISystemSetupManagerNotify::setSystemLanguageNotify);
    addLanguage("input-language", &Appliance::State::inputLanguage,
                &ISystemSetupManagerNotify::setInputLanguageNotify);
    m_handlers["module"] = [this](const CommandLine& command) {
        bool valid = true;
        const int module = command.number(0, &valid);
        if (!valid) {
            return QString(BAD_NUMBER);
        }
        m_appliance.state.module = module;
        if (auto* client = m_appliance.callBackOf<ISystemSetupManagerCallBack>()) {
            client->getInformationCallBack({module});
        }
        return QString();
    };
    addOption("key-echo", &Appliance::Options::keyEcho);
    addOption("state-on-close", &Appliance::Options::stateOnClose);
    addOption("event-echo", &Appliance::Options::eventEcho);
}

void CommandInterpreter::addOption(const QString& word, bool Appliance::Options::*option)
{
    m_handlers[word] = [this, option](const CommandLine& command) {
        if (command.rest() != "on" && command.rest() != "off")
            return QString("on or off");
        m_appliance.options.*option = command.rest() == "on";
        return QString();
    };
}

void CommandInterpreter::addWaitCommands()
{
    m_handlers["wait-titler"] = [this](const CommandLine& command) {
        bool valid = true;
        const int patience = command.number(0, DEFAULT_WAIT_MS, &valid);
        return valid ? startWait(command, patience, [this] { return m_appliance.connectToTitler(); })
                     : QString(BAD_NUMBER);
    };
    m_handlers["wait-result"] = [this](const CommandLine& command) {
        bool valid = true;
        const int patience = command.number(0, DEFAULT_WAIT_MS, &valid);
        return !valid ? QString(BAD_NUMBER) : startWait(command, patience, [this] {
            std::optional<QJsonObject> result = m_appliance.takeResult();
            if (result) {
                result->insert("event", "result");
                m_sink(*result);
            }
            return result.has_value();
        });
    };
    m_handlers["wait-call"] = [this](const CommandLine& command) {
        bool valid = command.arguments().size() >= 2;
        const int patience = command.number(2, DEFAULT_WAIT_MS, &valid);
        if (!valid) {
            return QString(BAD_COUNT);
        }
        return startWait(command, patience,
                         [this, service = command.arguments().at(0), method = command.arguments().at(1)] {
                             std::optional<QJsonObject> call = m_appliance.takeCall(service, method);
                             if (call) {
                                 call->insert("event", "waited-call");
                                 m_sink(*call);
                             }
                             return call.has_value();
                         });
    };
    m_handlers["count"] = [this](const CommandLine& command) {
        if (command.arguments().size() != 2) {
            return QString(BAD_COUNT);
        }
        const QString service = command.arguments().at(0);
        const QString method = command.arguments().at(1);
        m_sink({{"event", "count"},
                {"service", service},
                {"method", method},
                {"count", m_appliance.countCalls(service, method)}});
        return QString();
    };
    m_handlers["clear"] = [this](const CommandLine&) {
        m_appliance.forgetCallsAndResults();
        return QString();
    };
}
