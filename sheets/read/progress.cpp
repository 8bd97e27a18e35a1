#include "read/progress.h"

#include <fmt/format.h>

#include <chrono>
#include <cstdio>
#include <string>
#include <unistd.h>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kWidth = 40;
constexpr double kInterval = 0.1; // seconds

double seconds()
{
    using Clock = std::chrono::steady_clock;
    static const Clock::time_point begin = Clock::now();
    return std::chrono::duration<double>(Clock::now() - begin).count();
}

void print(const std::string &text)
{
    static_cast<void>(std::fputs(text.c_str(), stderr));
    static_cast<void>(std::fflush(stderr));
}

} // namespace

Progress::Progress(const char *what, std::size_t total)
    : what(what), total(total), terminal(isatty(STDERR_FILENO) != 0)
{
    static_cast<void>(seconds());
}

Progress::~Progress()
{
    if (drawn)
        print("\r\x1b[K");
}

void Progress::done(std::size_t amount)
{
    if (!terminal || seconds() < next)
        return;
    next = seconds() + kInterval;
    drawn = true;
    const double share = static_cast<double>(amount) / static_cast<double>(total);
    const auto full = static_cast<std::size_t>(share * static_cast<double>(kWidth));
    print(
        fmt::format("\r{} [{:<{}}] {:3.0f} %", what, std::string(full, '='), kWidth, share * 100));
}

} // namespace vantrel::sheets
