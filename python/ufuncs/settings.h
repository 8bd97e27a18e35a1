// The constants that a host can set, as one value: under which settings a thread computes.
//
// The library has one set of them for the process. A block of an image may have been made under
// others, in a process far away: its thread asks for these, and they stand in for those of the
// process while its loops run. Loops under the same settings run side by side, others wait.
#pragma once

#include "vantrel.h"

#include <cstdint>
#include <type_traits>

struct Settings {
    double hifi[3] = {}, hexachrome[2] = {}; ///< centres; the shapes are in the weights
    double spectralx[5] = {};
    double achromatic[4] = {};
    std::int64_t weights[NUM_STATUSES][NUM_RESPONSES][VANTREL_BANDS] = {}; ///< den_weight

    bool operator==(const Settings &) const = default;
};
static_assert(std::is_trivially_copyable_v<Settings>);

/// The settings of the process, when no loop runs.
Settings process_settings();
void set_process_settings(const Settings &settings);

/// Calls a setter or a getter when no loop runs.
class Exclusive {
public:
    Exclusive();
    ~Exclusive();
    Exclusive(const Exclusive &) = delete;
    Exclusive &operator=(const Exclusive &) = delete;
};

/// What the loops of this thread run under from now on; null: the settings of the process.
void use_settings(const Settings *settings);

/// A loop of this thread runs as long as one of these lives.
class Running {
public:
    Running();
    ~Running();
    Running(const Running &) = delete;
    Running &operator=(const Running &) = delete;
};
