#pragma once

namespace PTC
{

// One remote call: the object it is addressed to, the method, and the packed arguments.
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
    // The packed arguments, getSize() bytes. The event never frees them: when sending they belong to the
    // caller of the proxy; when receiving they were allocated with new[] and are freed by the handler of the
    // event.
    void* getData() const { return m_data; }
    void setData(void* data) { m_data = data; }
    long getSize() const { return m_size; }
    // Returns whether the event is for a callback adapter instead of a service adapter.
    bool isCallback() const { return m_callback; }
    // Returns whether the call is sent to another process.
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
