#pragma once

#include <QMetaType>
#include <string>

// A request to show the window, as passed on by EditContextController and ShowTitlerController.
struct _titler_paramter {
    enum Mode {
        CREATE_OR_EDIT = 0, // from ITitler; a create session sends its result when the window is closed
        SUB_PANEL = 1,      // from the sub panel; no result is wanted
        SHOW_ONLY = 2,      // also the meaning of every other value
    };

    int mode = SHOW_ONLY;
    std::wstring path; // folder or title file; empty opens the folder picker
};
using titler_paramter = _titler_paramter;

Q_DECLARE_METATYPE(titler_paramter)
