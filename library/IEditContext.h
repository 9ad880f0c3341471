// What the title list has to know of the request that the operator is working on.
// The application implements it; the list and its undo commands only ask and report.
#pragma once

#include <string>

class IEditContext
{
public:
    virtual ~IEditContext() = default;

    // True while a peer waits for new titles: the list then offers a template at once.
    virtual bool isCreateNew() = 0;
    // True when the title, named by its plain file name, was made during this request.
    virtual bool isNewCreateFile(std::wstring fileName) = 0;
    virtual void insertFilePath(std::wstring fileName) = 0;
    virtual void deleteFilePath(std::wstring fileName) = 0;

    // The one context, not owned. Null is allowed and means that nobody asked for anything. GUI thread.
    static IEditContext* instance() { return sInstance; }
    static void setInstance(IEditContext* context) { sInstance = context; }
    // isCreateNew of the one context; false without one.
    static bool isCreateNewNow() { return sInstance && sInstance->isCreateNew(); }

private:
    inline static IEditContext* sInstance = nullptr;
};
