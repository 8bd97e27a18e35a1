#pragma once

/// The argument check of the exported functions: a violated invariant makes the function return 0.
/// Configured with VANTREL_CHECKED it is also reported on standard error, in one line with the
/// function, its source file and the expression that names the invariant.
#define VANTREL_REQUIRE(condition, expression)                                                     \
    do {                                                                                           \
        if (!(condition))                                                                          \
            return ::vantrel::violated(__func__, __FILE__, expression);                            \
    } while (false)

namespace vantrel {

#ifdef VANTREL_CHECKED
int violated(const char *function, const char *file, const char *expression);
#else
constexpr int violated(const char *, const char *, const char *) { return 0; }
#endif

} // namespace vantrel
