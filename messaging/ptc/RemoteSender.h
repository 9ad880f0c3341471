#pragma once

#include "messaging/ptc/ISender.h"

namespace PTC
{

// Base class of the senders to other processes.
class RemoteSender : public IRemoteSender
{
public:
    explicit RemoteSender(long id);

    long getId() override;
    void setId(long id) override;
    bool initialize(long identity) override;
    // Returns the peer's client number, or -1 before initialize.
    virtual long getIdentity();

private:
    long m_id;
    long m_identity = -1;
};

} // namespace PTC
