// What every exported function gives for one fixed set of inputs: the same bits in every build, on
// every processor.
//
//     bits DIGEST FILE
//
// compares the digest of all results with the one in the file DIGEST, and writes that of each
// function to FILE, so that the files of two builds tell which functions differ.
#include "functions.h"

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <map>

namespace {

/// splitmix64 (Steele, Lea, Flood 2014): the same numbers from every standard library.
class Random {
public:
    explicit Random(std::uint64_t seed) : state(seed) {}

    std::uint64_t next()
    {
        std::uint64_t z = state += 0x9E3779B97F4A7C15;
        z = (z ^ (z >> 30)) * 0xBF58476D1CE4E5B9;
        z = (z ^ (z >> 27)) * 0x94D049BB133111EB;
        return z ^ (z >> 31);
    }
    int below(int n) { return static_cast<int>(next() % static_cast<std::uint64_t>(n)); }
    bool one_in(int n) { return below(n) == 0; }
    double uniform(double low, double high)
    {
        return low + (high - low) * (static_cast<double>(next() >> 11) * 0x1p-53);
    }

private:
    std::uint64_t state;
};

/// FNV-1a over 64-bit words, the high half of each product folded into the low one.
class Digest {
public:
    void add(std::uint64_t word)
    {
        value = (value ^ word) * 0x100000001B3;
        value ^= value >> 32;
    }

    std::uint64_t value = 0xCBF29CE484222325;
};

std::uint64_t digest(const std::string &text)
{
    Digest result;
    for (const char c : text)
        result.add(static_cast<std::uint64_t>(c));
    return result.value;
}

// A number in 256 is one of these.
double or_awkward(Random &random, double value)
{
    constexpr double kInf = std::numeric_limits<double>::infinity();
    constexpr double kAwkward[] = {
        0.0,   -0.0,   -1.0, 1e-5,  100.0,
        1e308, 5e-324, kInf, -kInf, std::numeric_limits<double>::quiet_NaN()};
    return random.one_in(256) ? kAwkward[random.below(std::size(kAwkward))] : value;
}

/// An ink with one or two absorptions on a paper, in steps of 100 nm, or noise.
std::vector<double> draw_spectrum(Random &random)
{
    std::vector<double> refl(VANTREL_BANDS, random.uniform(70, 95));
    const int kind = random.below(3);
    for (int peaks = 1 + random.below(2); kind != 2 && peaks > 0; --peaks) {
        const double centre = random.uniform(0, 31), width = random.uniform(2, 10);
        const double depth = random.uniform(0.1, 0.99);
        for (int i = 0; i < VANTREL_BANDS; ++i) {
            const double at = (kind == 1 ? 10 * (i / 10) + 5 : i) - centre;
            refl[i] *= 1 - depth / (1 + at * at / (width * width));
        }
    }
    for (double &band : refl) {
        if (kind == 2)
            band = random.uniform(0, 100);
        band = or_awkward(random, band);
    }
    return refl;
}

/// A white in Y, x, y; or percentages, coordinates, densities, bands, wavelengths, in one list out
/// of four whole.
std::vector<double> draw_numbers(Random &random, std::size_t count)
{
    if (count == 3 && random.one_in(4)) {
        const double Y = random.uniform(60, 110), x = random.uniform(0.3, 0.36);
        return {Y, x, random.uniform(0.3, 0.37)};
    }
    constexpr std::pair<double, double> kRanges[] = {
        {0, 100}, {-100, 100}, {0, 3}, {0, 31}, {390, 710}};
    const auto [low, high] = kRanges[random.below(std::size(kRanges))];
    const bool whole = random.one_in(4);
    std::vector<double> numbers(count);
    for (double &number : numbers) {
        number = random.uniform(low, high);
        number = or_awkward(random, whole ? std::trunc(number) : number);
    }
    return numbers;
}

int draw_index(Random &random, char kind)
{
    if (random.one_in(64))
        return -1;
    switch (kind) {
    case 'k':
        return random.below(NUM_ILLUM_OBS);
    case 's':
        return random.below(NUM_STATUSES);
    case 'r':
        return random.below(NUM_RESPONSES);
    default: // a choice, a band, a percentage, a wavelength
        constexpr std::pair<int, int> kRanges[] = {{0, 4}, {0, 31}, {0, 101}, {391, 319}};
        const auto [first, count] = kRanges[random.below(std::size(kRanges))];
        return first + random.below(count);
    }
}

std::vector<double> draw(Random &random, const Argument &argument)
{
    if (argument.kind == 'd')
        return draw_numbers(random, 1);
    if (argument.kind != 'a')
        return {static_cast<double>(draw_index(random, argument.kind))};
    if (argument.count == 124) { // the curves of a polarisation adjustment
        std::vector<double> weights(argument.count);
        for (double &weight : weights)
            weight = random.uniform(0, 1);
        return weights;
    }
    if (argument.count % VANTREL_BANDS != 0)
        return draw_numbers(random, argument.count);
    std::vector<double> spectra;
    while (spectra.size() < argument.count)
        for (const double refl : draw_spectrum(random))
            spectra.push_back(refl);
    return spectra;
}

std::vector<Slot> draw_arguments(Random &random, const Function &function)
{
    std::vector<Slot> slots = function.slots();
    for (std::size_t i = 0; i < slots.size(); ++i) {
        slots[i].null = function.arguments[i].nullable && random.one_in(3);
        if (!slots[i].output)
            slots[i].values = draw(random, function.arguments[i]);
    }
    return slots;
}

/// All that a call returns and writes. Of a not-a-number, processors choose sign and payload.
std::vector<double> outcome(const Function &function, std::vector<Slot> slots)
{
    std::vector<double> results = {function.call(slots)};
    for (const Slot &slot : slots)
        if (slot.output) {
            results.insert(results.end(), slot.values.begin(), slot.values.end());
            results.push_back(static_cast<double>(digest(slot.text) >> 11));
        }
    for (double &result : results)
        if (std::isnan(result))
            result = std::numeric_limits<double>::quiet_NaN();
    return results;
}

/// WebAssembly has no exceptions here.
[[noreturn]] void give_up(const std::string &why)
{
    std::fprintf(stderr, "bits: %s\n", why.c_str());
    std::exit(2);
}

/// The digest of what each function gave.
std::map<std::string, Digest> run()
{
    constexpr int kRounds = 2400, kRoundsOfDefaults = 600, kLeastSuccesses = 12;
    std::map<std::string, Digest> digests;
    std::map<std::string, int> successes;
    // In turn, since some set what others read; at first none does.
    for (int round = 0; round < kRounds; ++round)
        for (const Function &function : functions()) {
            if (round < kRoundsOfDefaults && function.name.starts_with("Set"))
                continue;
            Random random(digest(function.name) + static_cast<std::uint64_t>(round));
            const auto values = outcome(function, draw_arguments(random, function));
            successes[function.name] += values[0] != 0;
            for (const double value : values)
                digests[function.name].add(std::bit_cast<std::uint64_t>(value));
        }
    for (const auto &[name, count] : successes)
        if (count < kLeastSuccesses)
            give_up(name + " succeeds in " + std::to_string(count) + " calls");
    return digests;
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 3)
        give_up("usage: bits DIGEST FILE");
    std::uint64_t expected = 0;
    std::ifstream(argv[1]) >> std::hex >> expected;
    Digest all;
    std::ofstream out(argv[2]);
    for (const auto &[name, digest] : run()) {
        out << std::hex << digest.value << ' ' << name << '\n';
        all.add(digest.value);
    }
    if (!out.flush())
        give_up(std::string(argv[2]) + ": cannot be written");
    std::printf("    digest %016llx\n", static_cast<unsigned long long>(all.value));
    if (all.value == expected)
        return 0;
    std::printf("    expected %016llx: these are not the same numbers\n",
                static_cast<unsigned long long>(expected));
    return 1;
}
