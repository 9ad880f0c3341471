#pragma once

#include "appliance/Sibling.h"
#include "messaging/ptc/IProxyBase.h"
#include "messaging/services/ITitler.h"

#include <QJsonArray>
#include <QString>

#include <deque>
#include <functional>
#include <map>
#include <memory>
#include <optional>

// Stands in for the processes that surround a titler: the main process and the sub panel process with the
// services that a titler calls, their state, and the caller of the titler. Everything runs in one thread.
class Appliance : private ITitlerCallBack
{
public:
    using EventSink = std::function<void(const QJsonObject& event)>;

    // The sink receives every call of a titler as
    //     {"event":"call","service":..,"method":..,"args":{..}}
    // and every result as {"event":"callback",..}.
    explicit Appliance(EventSink sink);
    ~Appliance() override;

    // Starts to listen as both processes. Returns false if a port cannot be bound.
    bool start();
    // Tries once to connect both processes to the titler; returns whether they are connected.
    bool connectToTitler();
    // Returns null while the titler does not listen.
    ITitler* titler();
    // Registers for the results of create sessions. Returns false while the titler does not listen.
    bool registerAtTitler();

    // Returns the proxy for a client's callback interface; null until a client has registered it.
    template <typename CallBack>
    CallBack* callBackOf()
    {
        return dynamic_cast<CallBack*>(m_clients[CallBack::Calls::NAME].callBack.get());
    }
    template <typename Notify>
    Notify* notifyOf()
    {
        return dynamic_cast<Notify*>(m_clients[Notify::Calls::NAME].notify.get());
    }
    // Returns the id that the service has assigned to its client; -1 before.
    int clientIdOf(const QString& service);

    // Removes and returns the oldest call to the method that was not taken yet. At most KEPT_CALLS calls are
    // kept.
    std::optional<QJsonObject> takeCall(const QString& service, const QString& method);
    int countCalls(const QString& service, const QString& method) const;
    // Removes and returns the oldest result that was not taken yet.
    std::optional<QJsonObject> takeResult();
    void forgetCallsAndResults();

    // The state that the services report.
    struct State {
        int systemLanguage = 1;
        int inputLanguage = 1;
        int module = 0;
        int topWindow = 0;
    };
    State state;

    struct Options {
        bool keyEcho = true;      // the soft keyboard sends received keys back
        bool stateOnClose = true; // the soft keyboard reports its state when it is closed
        bool eventEcho = true;    // touch lock announcements go to all clients, including the sender
    };
    Options options;

private:
    static constexpr std::size_t KEPT_CALLS = 10000;

    struct Client {
        std::unique_ptr<PTC::IProxyBase> callBack;
        std::unique_ptr<PTC::IProxyBase> notify;
        int clientId = -1;
    };
    struct KeptCall {
        QJsonObject event;
        bool taken = false;
    };

    void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param) override;
    void handleCall(const ServiceDescription& service, const ServiceMethod& method, const QJsonObject& args,
                    std::unique_ptr<PTC::IProxyBase> proxy);
    void keep(const QJsonObject& event);
    void giveClientId(const QString& service);
    template <typename CallBack>
    bool giveClientId(void (CallBack::*give)(int), const QString& service, int id);
    void unregister(const QString& service, const QString& method, int clientId);
    // method is the id of a method of that service.
    void answer(long interfaceId, long method, const QJsonObject& args);
    void answerMessageCenter(long method, const QJsonObject& args);
    void answerEventFilter(long method, const QJsonObject& args);
    void answerKeyboard(long method, const QJsonObject& args);
    void answerSystemSetup(long method);

    EventSink m_sink;
    std::map<QString, Client> m_clients;
    std::deque<KeptCall> m_calls;
    std::deque<QJsonObject> m_results;
    int m_lastClientId = 0;
    std::unique_ptr<Sibling> m_main;
    std::unique_ptr<Sibling> m_subPanel;
    std::unique_ptr<ITitler> m_titler;
};
