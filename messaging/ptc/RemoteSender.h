// Base of the senders to other processes.
#pragma once

#include "messaging/ptc/ISender.h"

namespace PTC
{

class RemoteSender : public IRemoteSender
{
public:
    explicit RemoteSender(long id);

    long getId() override;
    void setId(long id) override;
    bool initialize(long identity) override;
    // The peer's client number, -1 before initialize.
    virtual long getIdentity();

private:
    long m_id;
    long m_identity = -1;
};

} // namespace PTC
