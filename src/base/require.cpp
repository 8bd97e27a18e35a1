#include "base/require.h"

#ifdef VANTREL_CHECKED
#include <cstdio>

namespace vantrel {

void violated(const char *function, const char *file, const char *expression)
{
    std::fprintf(stderr, "vantrel: %s (%s): violated: %s\n", function, file, expression);
}

} // namespace vantrel
#endif
