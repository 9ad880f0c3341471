#include "support/OwnerOnlyFiles.h"

void OwnerOnlyFiles::setUmask()
{
    const mode_t before = ::umask(REFUSED); // the umask can only be read by setting it
    ::umask(before | REFUSED);
}
