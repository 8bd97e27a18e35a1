#include "settings.h"

#include <algorithm>
#include <condition_variable>
#include <cstring>
#include <memory>
#include <mutex>

namespace {

std::mutex mutex;
std::condition_variable idle;
int running = 0;                      ///< loops
std::unique_ptr<Settings> of_process; ///< those of the process while others stand in for them
thread_local std::unique_ptr<Settings> wanted; ///< by this thread

Settings read()
{
    Settings now;
    GetHiFiConstants(now.hifi, nullptr, nullptr, nullptr);
    GetHexachromeConstants(now.hexachrome, nullptr, nullptr);
    auto &[tolerance, reserved, centre, inner, outer] = now.spectralx;
    GetSpectralXConstants(&tolerance, &reserved, &centre, &inner, &outer);
    auto &[L1, L2, C1, C2] = now.achromatic;
    GetAChromaticConstants(&L1, &L2, &C1, &C2);
    static_assert(sizeof now.weights == sizeof den_weight);
    std::memcpy(now.weights, den_weight, sizeof now.weights);
    return now;
}

void write(const Settings &settings)
{
    Settings s = settings;
    SetHiFiConstants(s.hifi, nullptr, nullptr, nullptr);
    SetHexachromeConstants(s.hexachrome, nullptr, nullptr);
    auto &[tolerance, reserved, centre, inner, outer] = s.spectralx;
    SetSpectralXConstants(&tolerance, &reserved, &centre, &inner, &outer);
    auto &[L1, L2, C1, C2] = s.achromatic;
    SetAChromaticConstants(&L1, &L2, &C1, &C2);
    std::memcpy(den_weight, s.weights, sizeof s.weights);
}

/// Whether a loop of this thread can run under what is in place now.
bool in_place()
{
    if (!wanted)
        return !of_process;
    return read() == *wanted;
}

} // namespace

Exclusive::Exclusive()
{
    std::unique_lock lock(mutex);
    idle.wait(lock, [] { return running == 0; });
    lock.release();
}

Exclusive::~Exclusive() { mutex.unlock(); }

Settings process_settings()
{
    const Exclusive exclusive;
    return read();
}

void set_process_settings(const Settings &settings)
{
    const Exclusive exclusive;
    write(settings);
}

void use_settings(const Settings *settings)
{
    wanted = settings ? std::make_unique<Settings>(*settings) : nullptr;
}

Running::Running()
{
    std::unique_lock lock(mutex);
    idle.wait(lock, [] { return running == 0 || in_place(); });
    if (!in_place()) {
        of_process = std::make_unique<Settings>(read());
        write(*wanted);
    }
    ++running;
}

Running::~Running()
{
    const std::lock_guard lock(mutex);
    if (--running > 0)
        return;
    if (of_process)
        write(*of_process);
    of_process = nullptr;
    idle.notify_all();
}
