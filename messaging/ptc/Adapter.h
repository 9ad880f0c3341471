// Base of the adapters of offered services.
#pragma once

#include "messaging/ptc/IAdapterBase.h"

namespace PTC
{

class IProxyBase;

class Adapter : public IAdapter
{
public:
    explicit Adapter(long id);

    long getId() override;
    void setProxyFactory(IProxyFactory* factory) override;
    // The proxy factory's answer, null without a factory.
    virtual IProxyBase* createProxy(long type, long id, long client);

private:
    IProxyFactory* m_proxyFactory = nullptr;
    long m_id;
};

} // namespace PTC
