#include "lanes.h"

#include <cstdlib>
#include <string_view>

LaneLoops lane_loops(const char *&fault)
{
    const char *variable = std::getenv("VANTREL_LANES");
    const std::string_view asked = variable ? variable : "";
    fault = nullptr;
#if defined(__x86_64__) && defined(__GNUC__) && !defined(_WIN32)
    const bool four = __builtin_cpu_supports("avx2");
    const bool eight = __builtin_cpu_supports("avx512f") && __builtin_cpu_supports("avx512dq") &&
                       __builtin_cpu_supports("avx512vl") && __builtin_cpu_supports("avx512bw");
    if (eight && (asked.empty() || asked == "8"))
        return lane_loops_8();
    if (four && (asked.empty() || asked == "4"))
        return lane_loops_4();
#endif
#ifdef __GNUC__
    if (asked.empty() || asked == "2")
        return lane_loops_2();
#endif
    if (!asked.empty() && asked != "off")
        fault = "VANTREL_LANES: off, 2, 4 or 8, and no more than the processor has";
    return {};
}
