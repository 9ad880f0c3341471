#pragma once

#include "titlectl/Finding.h"

#include <QString>

class CheckedFolder;
class CheckedTitle;

// One rule of the check before air. Rules of folders are applied to whole folders, rules of titles to each
// title that the folder's order names.
struct CheckRule {
    QString id;      // as in --without
    QString summary; // one line without a full stop
    // Append what they find, without the id; one of the two is null.
    void (*checkFolder)(const CheckedFolder& folder, FindingList& findings) = nullptr;
    void (*checkTitle)(const CheckedTitle& title, FindingList& findings) = nullptr;
};
