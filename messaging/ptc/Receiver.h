#pragma once

#include "messaging/ptc/IReceiver.h"

#include <map>
#include <memory>
#include <vector>

namespace PTC
{

// Passes each event to its adapter. The maps are used only in the thread that handles the events.
class Receiver : public IReceiver
{
public:
    explicit Receiver(long id);
    ~Receiver() override;
    Receiver(const Receiver&) = delete;
    Receiver& operator=(const Receiver&) = delete;

    long getId() override;
    // Handles the event in the calling thread and frees it with its data.
    void recv(Event* event) override;
    void addAdapter(IAdapterBase* adapter) override;
    void addCBAdapter(IAdapterBase* adapter) override;
    void removeCBAdapter(long id) override;

    // Passes the event to its adapter; ignores it if there is none. The caller keeps the event.
    virtual void handleEvent(Event* event);

private:
    using AdapterMap = std::map<long, std::unique_ptr<IAdapterBase>>;

    void enter(AdapterMap& adapters, IAdapterBase* adapter);

    AdapterMap m_adapters;
    AdapterMap m_callbackAdapters;
    std::vector<std::unique_ptr<IAdapterBase>> m_lostAdapters; // whose ids were already in use
    long m_id;
};

} // namespace PTC
