#pragma once

#include <string>

// What the title list needs to know about the request that the operator is working on. The application
// implements it; the list and its undo commands only query it and report to it.
class IEditContext
{
public:
    virtual ~IEditContext() = default;

    // Returns whether a peer waits for new titles: the list then offers a template at once.
    virtual bool isCreateNew() = 0;
    // Returns whether the title, given by its plain file name, was created during this request.
    virtual bool isNewCreateFile(std::wstring fileName) = 0;
    virtual void insertFilePath(std::wstring fileName) = 0;
    virtual void deleteFilePath(std::wstring fileName) = 0;

    // Returns the instance, which is not owned; null means that there is no request. GUI thread.
    static IEditContext* instance() { return s_instance; }
    static void setInstance(IEditContext* context) { s_instance = context; }
    // Returns isCreateNew() of the instance; false without one.
    static bool isCreateNewNow() { return s_instance && s_instance->isCreateNew(); }

private:
    inline static IEditContext* s_instance = nullptr;
};
