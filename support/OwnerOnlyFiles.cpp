#include "support/OwnerOnlyFiles.h"

void OwnerOnlyFiles::setUmask()
{
    const mode_t before = ::umask(REFUSED); // the umask cannot be asked for
    ::umask(before | REFUSED);
}
