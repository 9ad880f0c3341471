#pragma once

#include "messaging/ptc/IAdapterBase.h"

namespace PTC
{

class IProxyBase;

// Base class of the adapters of services that this process offers.
class Adapter : public IAdapter
{
public:
    explicit Adapter(long id);

    long getId() override;
    void setProxyFactory(IProxyFactory* factory) override;
    // Returns a proxy from the proxy factory, owned by the caller; null without a factory.
    virtual IProxyBase* createProxy(long type, long id, long client);

private:
    IProxyFactory* m_proxyFactory = nullptr;
    long m_id;
};

} // namespace PTC
