// How a fuzzer says that something does not hold.
#pragma once

#include <cstdio>
#include <cstdlib>

inline void require(bool holds, const char *fault)
{
    if (holds)
        return;
    std::fprintf(stderr, "FAULT: %s\n", fault);
    std::abort();
}
