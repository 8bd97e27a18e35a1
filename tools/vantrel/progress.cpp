#include "progress.h"

#include "system.h"

#include <fmt/format.h>

#include <chrono>
#include <cstdio>
#include <string>

namespace vantrel::program {
namespace {

constexpr std::size_t kWidth = 40;
constexpr double kInterval = 0.1; // seconds

using Clock = std::chrono::steady_clock;

bool drawn = false;
double next = 1; // seconds after the first bar was asked for

void print(const std::string &text)
{
    static_cast<void>(std::fputs(text.c_str(), stderr));
    static_cast<void>(std::fflush(stderr));
}

} // namespace

sheets::Tell progress_bar()
{
    if (!is_terminal(Stream::error))
        return {};
    static const Clock::time_point begin = Clock::now();
    return [](const char *what, double share) {
        if (share >= 1)
            wipe_bar();
        const double now = std::chrono::duration<double>(Clock::now() - begin).count();
        if (share >= 1 || now < next)
            return;
        next = now + kInterval;
        drawn = true;
        const auto full = static_cast<std::size_t>(share * static_cast<double>(kWidth));
        print(fmt::format("\r{} [{:<{}}] {:3.0f} %", what, std::string(full, '='), kWidth,
                          share * 100));
    };
}

void wipe_bar()
{
    if (drawn)
        print("\r\x1b[K");
    drawn = false;
}

} // namespace vantrel::program
