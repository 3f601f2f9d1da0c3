#include "bd/refptr.h"

struct Plain {
};

/** Shares an object that cannot be deleted through a base. */
void Share(Plain* plain)
{
    const bd::RefPtr<Plain> pointer(plain);
}
