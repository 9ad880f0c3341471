// Says in the operator's words what of his work is in memory only. GUI thread.
#pragma once

#include "support/RefusedWrites.h"

#include <QCoreApplication>
#include <QString>
#include <string>
#include <vector>

class LossDescription
{
    Q_DECLARE_TR_FUNCTIONS(LossDescription)

public:
    // Names titles by their first text, and the folders whose order is concerned; the first few of many.
    static QString of(const std::vector<RefusedWrites::File>& files);

private:
    static QString titleName(const std::string& path);
};
