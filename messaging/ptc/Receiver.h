// Finds the adapter of an event. Its maps belong to the thread that handles the events.
#pragma once

#include "messaging/ptc/IReceiver.h"

#include <map>
#include <memory>
#include <vector>

namespace PTC
{

class Receiver : public IReceiver
{
public:
    explicit Receiver(long id);
    ~Receiver() override;
    Receiver(const Receiver&) = delete;
    Receiver& operator=(const Receiver&) = delete;

    long getId() override;
    // Handles the event in the caller's thread, and frees it with its data.
    void recv(Event* event) override;
    void addAdapter(IAdapterBase* adapter) override;
    void addCBAdapter(IAdapterBase* adapter) override;
    void removeCBAdapter(long id) override;

    // Hands the event to its adapter; without one, nothing happens. The event stays the caller's.
    virtual void handleEvent(Event* event);

private:
    using AdapterMap = std::map<long, std::unique_ptr<IAdapterBase>>;

    void enter(AdapterMap& adapters, IAdapterBase* adapter);

    AdapterMap m_adapters;
    AdapterMap m_callbackAdapters;
    std::vector<std::unique_ptr<IAdapterBase>> m_lostAdapters; // their ids were taken
    long m_id;
};

} // namespace PTC
