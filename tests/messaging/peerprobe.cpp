// Echoes records for a peer that is written in another language: it listens as client number 1003, prints
// each record that it reads as one line of JSON, packs it again and sends it to client number 1000.
#include "appliance/JsonRecords.h"
#include "messaging/ptc/Adapter.h"
#include "messaging/ptc/CallbackProxy.h"
#include "messaging/ptc/Event.h"
#include "messaging/ptc/QtReceiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"
#include "messaging/ptc/SocketRemoteSender.h"
#include "messaging/services/RecordPacking.h"
#include "messaging/services/ServiceFamilies.h"
#include "messaging/services/ServiceTable.h"

#include <QCoreApplication>
#include <QJsonArray>
#include <QJsonDocument>

#include <cstdio>
#include <functional>
#include <vector>

namespace
{

const long ECHO_OBJECT = 900;
const long ECHO_ADAPTER = 901; // of the peer

QString text(const std::wstring& wide)
{
    return QString::fromStdWString(wide);
}

QJsonArray texts(const std::wstring* wide, int count)
{
    QJsonArray array;
    for (int i = 0; i < count; ++i)
        array.append(text(wide[i]));
    return array;
}

QJsonObject describe(const FileManagerDefine::tagRenameNotify& r)
{
    return {
        {"fileType", r.fileType}, {"second", r.second}, {"third", r.third}, {"strings", texts(r.strings, 4)}};
}

QJsonObject describe(const FileManagerDefine::tagImportNotify& r)
{
    QJsonArray last;
    for (const int value : r.last)
        last.append(value);
    return {{"fileType", r.fileType},
            {"fileTypeHigh", r.fileTypeHigh},
            {"third", r.third},
            {"fourth", static_cast<qint64>(r.fourth)},
            {"fifth", r.fifth},
            {"path", text(r.path)},
            {"seventh", r.seventh},
            {"eighth", r.eighth},
            {"strings", texts(r.strings, 3)},
            {"twelfth", r.twelfth},
            {"thirteenth", r.thirteenth},
            {"last", last}};
}

QJsonObject describe(const FileManagerDefine::tagDeleteNotify& r)
{
    return {{"first", r.first},     {"fileType", r.fileType}, {"result", r.result},
            {"path", text(r.path)}, {"fifth", r.fifth},       {"sixth", static_cast<qint64>(r.sixth)},
            {"seventh", r.seventh}};
}

QJsonObject describe(const SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos& r)
{
    return {{"begin", r.begin}, {"end", r.end}, {"current", r.current}, {"mode", r.mode}};
}

QJsonObject describe(const SystemSetupDef::tagSystemLanguageParam& r)
{
    return {{"first", r.first}, {"systemLanguage", r.systemLanguage}, {"inputLanguage", r.inputLanguage}};
}

QJsonObject describe(const SystemSetupDef::tagSystemInformation& r)
{
    return {{"model", r.model}};
}

QJsonObject describe(const _SHOW_TITLER_PARAMTER& r)
{
    return {{"type", r.type}, {"path", text(r.path)}};
}

QJsonObject describe(int value)
{
    return {{"value", value}};
}

QJsonObject describe(const std::wstring& value)
{
    return {{"value", text(value)}};
}

template <typename Record>
requires requires(const Record& record)
{
    JsonRecords::toJson(record);
}
QJsonObject describe(const Record& record)
{
    return JsonRecords::toJson(record);
}

struct Echo {
    QJsonObject description;
    simplebuffer packed;
};

template <typename Record>
Echo echo(void* data, long size)
{
    Record record{};
    RecordPacking::deserialize(record, data, size);
    return {describe(record), RecordPacking::serialize(record)};
}

// By method id from 1.
const std::vector<std::function<Echo(void* data, long size)>> ECHOES = {
    echo<APPEventDefine::_tagAPPEvent>,
    echo<MessageDefine::_tagTopWindowParam>,
    echo<MessageDefine::_tagMessageParam>,
    echo<MessageDefine::_tagCloseParam>,
    echo<SubCommonDefine::tagFOLDER_TYPE>,
    echo<FileManagerDefine::tagTitleChangeStatusParam>,
    echo<FileManagerDefine::tagChangeFolderNameParam>,
    echo<SubCommonDefine::tagSoftKeyBoardInitData>,
    echo<SubCommonDefine::tagSoftKeyBoardKeyData>,
    echo<SubCommonDefine::taLimitInfo>,
    echo<FileManagerDefine::tagRenameNotify>,
    echo<FileManagerDefine::tagImportNotify>,
    echo<FileManagerDefine::tagDeleteNotify>,
    echo<FileManagerDefine::tagTitlerPathParam>,
    echo<SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos>,
    echo<SystemSetupDef::tagSystemLanguageParam>,
    echo<SystemSetupDef::tagSystemInformation>,
    echo<_SHOW_TITLER_PARAMTER>,
    echo<_CALLBACK_TITLER_PARAMTER>,
    echo<_tagCallBackInfo>,
    echo<_tagNotifyInfo>,
    echo<int>,
    echo<std::wstring>,
};

class EchoAdapter : public PTC::Adapter
{
public:
    explicit EchoAdapter(PTC::CallbackProxy& peer) : PTC::Adapter(ECHO_OBJECT), m_peer(peer) {}

    void receive(PTC::Event* event) override
    {
        const long method = event->getMethodId();
        if (method == 0) {
            QCoreApplication::quit();
            return;
        }
        if (method < 1 || method > static_cast<long>(ECHOES.size()))
            return;
        const Echo answer = ECHOES[static_cast<std::size_t>(method - 1)](event->getData(), event->getSize());
        std::puts(QJsonDocument(answer.description).toJson(QJsonDocument::Compact).constData());
        std::fflush(stdout);
        ServiceCall::invoke(m_peer, method, answer.packed);
    }
    void setTarget(void*) override {}

private:
    PTC::CallbackProxy& m_peer;
};

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication application(argc, argv);
    SocketRemoteSender sender(ServiceTable::TITLER_CLIENT_KEY);
    if (!sender.initialize(ServiceTable::MAIN_CLIENT))
        return 1;
    PTC::CallbackProxy peer(ECHO_ADAPTER, true);
    peer.setSender(&sender);
    SocketRemoteReceiver listener(0);
    auto* receiver = new PTC::QtReceiver(ServiceTable::TITLER_CLIENT_KEY);
    receiver->addAdapter(new EchoAdapter(peer));
    listener.addReceiver(receiver);
    if (!listener.initialize(ServiceTable::TITLER_CLIENT))
        return 1;
    return QCoreApplication::exec();
}
