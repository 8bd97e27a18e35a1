#pragma once

/// The argument check of the exported functions: a violated invariant makes the function return 0,
/// or the result that the second form names. Configured with VANTREL_CHECKED it is also reported on
/// standard error, in one line with the function, its source file and the expression that names the
/// invariant. The forms with OF name the function, for what several exported functions share.
#define VANTREL_REQUIRE(condition, expression) VANTREL_REQUIRE_OF(__func__, condition, expression)
#define VANTREL_REQUIRE_ELSE(condition, expression, result)                                        \
    VANTREL_REQUIRE_OF_ELSE(__func__, condition, expression, result)
#define VANTREL_REQUIRE_OF(function, condition, expression)                                        \
    VANTREL_REQUIRE_OF_ELSE(function, condition, expression, 0)

#define VANTREL_REQUIRE_OF_ELSE(function, condition, expression, result)                           \
    do {                                                                                           \
        if (!(condition)) {                                                                        \
            ::vantrel::violated(function, __FILE__, expression);                                   \
            return result;                                                                         \
        }                                                                                          \
    } while (false)

namespace vantrel {

#ifdef VANTREL_CHECKED
void violated(const char *function, const char *file, const char *expression);
#else
constexpr void violated(const char *, const char *, const char *) {}
#endif

} // namespace vantrel
