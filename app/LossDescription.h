#pragma once

#include "support/RefusedWrites.h"

#include <QCoreApplication>
#include <QString>
#include <string>
#include <vector>

// Describes unsaved work to the operator. GUI thread.
class LossDescription
{
    Q_DECLARE_TR_FUNCTIONS(LossDescription)

public:
    // Returns a text that names titles by their first text, and the folders whose order is not saved; of many
    // only the first few.
    static QString of(const std::vector<RefusedWrites::File>& files);

private:
    static QString titleName(const std::string& path);
};
