#pragma once

#include "library/IEditContext.h"

#include <QString>
#include <QStringList>
#include <string>

// The request that the operator works on, as long as it exists.
class FakeEditContext : public IEditContext
{
public:
    FakeEditContext() { setInstance(this); }
    ~FakeEditContext() override { setInstance(nullptr); }

    bool isCreateNew() override { return createNew; }
    bool isNewCreateFile(std::wstring fileName) override
    {
        return files.contains(QString::fromStdWString(fileName));
    }
    void insertFilePath(std::wstring fileName) override { files.append(QString::fromStdWString(fileName)); }
    void deleteFilePath(std::wstring fileName) override
    {
        files.removeAll(QString::fromStdWString(fileName));
    }

    bool createNew = false;
    QStringList files; // made during the request
};
