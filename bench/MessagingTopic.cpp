// A call to another process and its answer, compared with the same bytes on a plain socket.
#include "bench/CallPeer.h"
#include "bench/PairList.h"
#include "bench/PeerProcess.h"
#include "bench/Topics.h"
#include "messaging/ptc/CallbackAdapter.h"
#include "messaging/ptc/Event.h"
#include "messaging/ptc/Proxy.h"
#include "messaging/ptc/SocketFrame.h"
#include "messaging/services/ServiceCall.h"
#include "messaging/services/TitlerAdapter.h"
#include "messaging/services/TitlerParams.h"

#include <QCoreApplication>
#include <QEventLoop>
#include <array>
#include <unistd.h>

namespace
{

constexpr double AIM = 1.3;
constexpr long ANSWER_ADAPTER = 7;

// Unpacks and counts the answers.
class AnswerAdapter : public PTC::CallbackAdapter
{
public:
    explicit AnswerAdapter(long& answers) : PTC::CallbackAdapter(ANSWER_ADAPTER), m_answers(answers) {}

    void receive(PTC::Event* event) override
    {
        _CALLBACK_TITLER_PARAMTER result;
        TitlerParams::deserialize_finishTitlerCreateCallback_param(result, event->getData(),
                                                                   event->getSize());
        ++m_answers;
    }
    void setTarget(void*) override {}

private:
    long& m_answers;
};

void callAndAnswer(benchmark::State& state)
{
    PeerProcess peer;
    long answers = 0;
    CallFactory factory;
    if (!peer.startRole(QStringLiteral("--call-peer")) ||
        !factory.listen(CallFactory::CALLER, new AnswerAdapter(answers), true)) {
        state.SkipWithError("the processes do not listen");
        return;
    }
    PTC::Proxy proxy(TitlerAdapter::INTERFACE_ID, true);
    PTC::ISender* sender = factory.connectTo(CallFactory::PEER);
    if (!sender) {
        state.SkipWithError("no connection");
        return;
    }
    proxy.setSender(sender);
    const _tagCallBackInfo info{ANSWER_ADAPTER, CallFactory::CALLER};
    ServiceCall::invoke(proxy, TitlerAdapter::METHOD_registerCallBack,
                        TitlerParams::serialize_registerCallBack_param(info));
    long calls = 0;
    for ([[maybe_unused]] auto _ : state) {
        ServiceCall::invoke(proxy, TitlerAdapter::METHOD_showTitlerCreate,
                            TitlerParams::serialize_showTitlerCreate_param(1));
        ++calls;
        while (answers < calls)
            QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    }
}

void bareFrames(benchmark::State& state)
{
    PeerProcess peer;
    const int connection = peer.startRole(QStringLiteral("--raw-peer")) ? RawPeer::connectToPeer() : -1;
    if (connection == -1) {
        state.SkipWithError("no connection");
        return;
    }
    std::array<char, SocketFrame::FRAME_SIZE> frame{};
    for ([[maybe_unused]] auto _ : state) {
        if (!RawPeer::exchange(connection, frame.data())) {
            state.SkipWithError("the connection broke");
            break;
        }
    }
    close(connection);
}

} // namespace

void Topics::addMessaging(PairList& list)
{
    list.add({"call_and_answer", AIM, PairList::Clock::Wall}, benchmark::kMicrosecond, callAndAnswer,
             bareFrames);
}
