#pragma once

#include <QList>
#include <QString>

// Something wrong that a check has found.
struct Finding {
    QString file;   // full path of the file, or of the folder
    QString object; // what in the file, such as "text 2"; empty for the file itself
    QString rule;   // id of the rule
    QString reason; // one line without a full stop

    bool operator==(const Finding&) const = default;
};

using FindingList = QList<Finding>;
