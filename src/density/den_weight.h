#pragma once

#include "base/spectrum.h"

#include <cstdint>

namespace vantrel {

inline bool is_status(int status) { return status >= 0 && status < NUM_STATUSES; }
inline bool is_response(int response) { return response >= 0 && response < NUM_RESPONSES; }

/// The responses that a status measures, in the order of a density set.
struct StatusResponses {
    int count;
    int ids[NUM_RESPONSES];

    const int *begin() const { return ids; }
    const int *end() const { return ids + count; }
};

const StatusResponses &responses_of(int status);

using Weights = std::span<const std::int64_t, kBands>;

inline Weights weights_of(int status, int response) { return den_weight[status][response]; }

/// First and last band with a weight, the band of the largest weight, and that weight; the bands in
/// nm. Zero where there is none.
struct Profile {
    int first, peak, last;
    std::int64_t peak_weight;

    bool operator==(const Profile &) const = default;
};

constexpr Profile profile(Weights weights)
{
    Profile result{};
    for (int i = 0; i < kBands; ++i) {
        const int nm = 400 + 10 * i;
        if (weights[i] > result.peak_weight) {
            result.peak_weight = weights[i];
            result.peak = nm;
        }
        if (weights[i] != 0) {
            if (result.first == 0)
                result.first = nm;
            result.last = nm;
        }
    }
    return result;
}

/// The row scaled to 100 at its largest weight.
Bands normalized(Weights weights, std::int64_t peak_weight);

} // namespace vantrel
