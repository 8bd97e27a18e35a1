// Which patches of a sheet are the partners of which of another.
#pragma once

#include "read/measurement.h"

#include <array>
#include <cstddef>
#include <set>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

namespace vantrel::sheets {

enum class Pairing { automatic, name, id, device, order };
inline constexpr std::array kPairings = {Pairing::automatic, Pairing::name, Pairing::id,
                                         Pairing::device, Pairing::order};
std::string_view name_of(Pairing pairing); // auto, name, id, device, order
std::string phrase_of(Pairing pairing);    // "by device values": not of automatic

struct PairingRequest {
    Pairing by = Pairing::automatic;
    bool force = false; // pairs too whose device values disagree; not of automatic
    bool each = false;  // repeats of a patch are judged one by one
    bool zones = false; // all patches of an aim are repeats of one, whatever their names
};

// An aim and what was measured for it: places in the two sheets, of several their mean.
struct Pair {
    std::vector<std::size_t> reference, sample;

    friend bool operator<(const Pair &first, const Pair &second)
    {
        return std::tie(first.reference, first.sample) < std::tie(second.reference, second.sample);
    }
};

// The places of several pairs, each once.
struct JoinedPairs {
    std::set<std::size_t> reference, sample;

    void add(const Pair &pair)
    {
        reference.insert(pair.reference.begin(), pair.reference.end());
        sample.insert(pair.sample.begin(), pair.sample.end());
    }
    Pair pair() const
    {
        return {{reference.begin(), reference.end()}, {sample.begin(), sample.end()}};
    }
};

// What came of a key.
struct PairingTry {
    Pairing by = Pairing::automatic;
    std::size_t reference = 0, sample = 0; // patches that find a partner
    std::size_t disagreeing = 0; // of the sample, those whose partners differ in device values
};

struct Pairs {
    Pairing by = Pairing::automatic; // not that
    std::vector<Pair> matched;       // in the order of the reference
    std::vector<std::size_t> only_reference, only_sample;
    std::vector<PairingTry> passed_over; // by automatic pairing
};

// Patches with the same key are partners: an aim may serve any number of them, and among several
// aims with the key the one of the same device values, or else of the same name, is taken. Patches
// of one sheet that have the key, the device values and the name in common are repeats of a patch.
//
// Device values agree that differ by less than a rounded percent. A pairing in which they disagree
// is refused, and passed over by automatic pairing, which takes the key that pairs most: names,
// ids, device values, the first of equals; or else the place, where the sheets are equally long.
// Where no device values tell which of two keys is right, the one whose pairs are nearer in colour
// is taken, with a warning; so it is, the place too, where patches of one key are far apart, which
// is_of_others() tells. Aims of one key that are far apart serve as many patches, of which each is
// judged, one by one in their order. Throws RequestError.
Pairs pairs_of(const Measurement &reference, const Measurement &sample,
               const PairingRequest &request, std::vector<std::string> &warnings);

} // namespace vantrel::sheets
