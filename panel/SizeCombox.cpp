#include "panel/SizeCombox.h"

void SizeCombox::adjustPopupListSize()
{
    KSCombobox::adjustPopupListSize();
    setListWidth(LIST_WIDTH, 0);
}
