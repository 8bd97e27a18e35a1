#include "base/require.h"

#ifdef VANTREL_CHECKED
#include <cstdio>

namespace vantrel {

int violated(const char *function, const char *file, const char *expression)
{
    std::fprintf(stderr, "vantrel: %s (%s): violated: %s\n", function, file, expression);
    return 0;
}

} // namespace vantrel
#endif
