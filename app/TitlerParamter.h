// A request to show the window, as EditContextController and ShowTitlerController hand it over.
#pragma once

#include <QMetaType>
#include <string>

struct _titler_paramter {
    enum Mode {
        CREATE_OR_EDIT = 0, // from ITitler; a create session sends its result back on close
        SUB_PANEL = 1,      // from the sub panel; no result is wanted
        SHOW_ONLY = 2,      // this and every other value
    };

    int mode = SHOW_ONLY;
    std::wstring path; // folder or title file; empty asks for the folder picker
};
using titler_paramter = _titler_paramter;

Q_DECLARE_METATYPE(titler_paramter)
