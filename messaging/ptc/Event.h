// One call on its way: whom it is for, which method, and the packed arguments.
#pragma once

namespace PTC
{

class Event
{
public:
    Event(long objectId, long methodId, void* data, long size, bool remote, bool callback)
        : m_objectId(objectId)
        , m_methodId(methodId)
        , m_data(data)
        , m_callback(callback)
        , m_size(size)
        , m_remote(remote)
    {
    }

    long getObjectId() const { return m_objectId; }
    long getMethodId() const { return m_methodId; }
    // Packed arguments of getSize() bytes. The event never frees them: the sender's belong to the caller of
    // the proxy, the receiver's were allocated with array new and are freed by whoever handles the event.
    void* getData() const { return m_data; }
    void setData(void* data) { m_data = data; }
    long getSize() const { return m_size; }
    // Look in the callback adapters rather than in the adapters.
    bool isCallback() const { return m_callback; }
    // The call crosses a process border.
    bool isRemote() const { return m_remote; }

private:
    long m_objectId;
    long m_methodId;
    void* m_data;
    bool m_callback;
    long m_size;
    bool m_remote;
};

} // namespace PTC
