#pragma once

#include "touchui/KSCombobox.h"

// The box of the font size, with a list wider than the box.
class SizeCombox : public KSCombobox
{
    Q_OBJECT
public:
    static constexpr int LIST_WIDTH = 110;

    using KSCombobox::KSCombobox;

protected:
    void adjustPopupListSize() override;
};
