// What every exported function gives for one fixed set of inputs.
//
//     bits LIST FILE [FIRST]
//
// writes all results to FILE. Those of the functions that use + - * / and the square root alone are
// the same bits in every build: their digest stands in LIST, functions.txt. The mathematics library
// differs from system to system: what rests on it is compared with FIRST, the file of another
// build, and a second digest in LIST is that of the same results in thousandths. The distance of
// two results is counted in units in the last place of the result or, where that is more, of the
// scale in LIST: the size of the terms that cancel out in it.
//
// Behind a rounding or a threshold (L*C*h, words, responses, display values) a last place can
// become a step. None can hide: the smallest, 0.000001, is millions of units. And none is taken by
// chance: numbers with all their digits are drawn, which lie within a last place of a step once in
// some 10^10 results.
#include "golden.h"

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <fstream>
#include <map>
#include <set>
#include <sstream>
#include <stdexcept>

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

/// A measured spectrum or one of an ink in steps, a mixture of two of them, or noise.
std::vector<double> draw_spectrum(Random &random)
{
    static const std::vector<double> kSpectra[] = {
        golden_values("paper"),     golden_values("magenta"),   golden_values("yellow"),
        golden_values("magenta50"), golden_values("yellow50"),  golden_values("magenta_yellow"),
        golden_values("cyan_ink"),  golden_values("green_ink"), golden_values("teal_ink"),
        golden_values("two_dips"),  golden_values("orange_ink")};
    std::vector<double> refl = kSpectra[random.below(std::size(kSpectra))];
    const auto &other = kSpectra[random.below(std::size(kSpectra))];
    const int kind = random.below(3);
    const double share = random.uniform(0, 1);
    for (std::size_t i = 0; i < refl.size(); ++i) {
        if (kind == 1)
            refl[i] = share * refl[i] + (1 - share) * other[i];
        else if (kind == 2)
            refl[i] = random.uniform(0, 100);
        refl[i] = or_awkward(random, refl[i]);
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

/// What each function gave, one call after the other.
using Results = std::map<std::string, std::vector<double>>;

/// functions.txt
struct List {
    std::vector<const Function *> exact, libm;
    std::map<std::string, double> scales; ///< of those in libm
    std::uint64_t digest = 0, thousandths = 0;
    double bound = 0;
};

List read_list(const std::string &file)
{
    List list;
    std::set<std::string> missing;
    for (const Function &function : functions())
        missing.insert(function.name);
    std::ifstream in(file);
    for (std::string line; std::getline(in, line);) {
        std::istringstream words(line);
        std::string key;
        if (!(words >> key) || key == "#")
            continue;
        if (key == "digest" || key == "thousandths") {
            words >> std::hex >> (key == "digest" ? list.digest : list.thousandths);
            continue;
        }
        if (key == "bound") {
            words >> list.bound;
            continue;
        }
        for (std::string name; words >> name;) {
            if (!missing.erase(name))
                throw std::runtime_error(file + ": no such function, or twice: " + name);
            const bool exact = key == "exact";
            (exact ? list.exact : list.libm).push_back(find_function(name));
            if (!exact)
                list.scales[name] = std::stod(key);
        }
    }
    for (const std::string &name : missing)
        throw std::runtime_error(file + ": missing: " + name);
    return list;
}

Results run(const List &list)
{
    constexpr int kExactRounds = 2400, kLibmRounds = 600;
    Results results;
    std::map<std::string, int> successes;
    const auto call = [&](const Function &function, int round) {
        Random random(digest(function.name) + static_cast<std::uint64_t>(round));
        const auto values = outcome(function, draw_arguments(random, function));
        successes[function.name] += values[0] != 0;
        auto &all = results[function.name];
        all.insert(all.end(), values.begin(), values.end());
    };
    for (const Function *function : list.libm)
        for (int round = 0; round < kLibmRounds; ++round)
            call(*function, round);
    // In turn, since some set what others read.
    for (int round = 0; round < kExactRounds; ++round)
        for (const Function *function : list.exact)
            call(*function, round);
    for (const auto &[name, count] : successes)
        if (count < kLibmRounds / 50)
            throw std::runtime_error(name + " succeeds in " + std::to_string(count) + " calls");
    return results;
}

double as_it_is(double value) { return value; }

// In steps of 2^-10, of large results of a millionth. A zero has no sign here.
double in_thousandths(double value)
{
    if (!std::isfinite(value))
        return value;
    const double step = std::ldexp(1.0, std::ilogb(std::fmax(std::fabs(value), 1024)) - 20);
    return std::round(value / step) * step + 0.0;
}

std::uint64_t digest_of(const std::vector<const Function *> &functions, const Results &results,
                        double (*seen)(double))
{
    Digest result;
    for (const Function *function : functions)
        for (const double value : results.at(function->name))
            result.add(std::bit_cast<std::uint64_t>(seen(value)));
    return result.value;
}

/// Prints a digest, and whether it is the one of the list.
bool is_digest(const char *name, std::uint64_t digest, std::uint64_t listed)
{
    std::printf("    %s %016llx\n", name, static_cast<unsigned long long>(digest));
    if (digest != listed)
        std::printf("    expected %016llx: these are not the same numbers\n",
                    static_cast<unsigned long long>(listed));
    return digest == listed;
}

void write(const Results &results, const std::string &file)
{
    std::ofstream out(file, std::ios::binary);
    for (const auto &[name, values] : results)
        out.write(reinterpret_cast<const char *>(values.data()),
                  static_cast<std::streamsize>(values.size() * sizeof(double)));
    if (!out.flush())
        throw std::runtime_error(file + ": cannot be written");
}

Results read(const std::string &file, Results like)
{
    std::ifstream in(file, std::ios::binary);
    for (auto &[name, values] : like)
        in.read(reinterpret_cast<char *>(values.data()),
                static_cast<std::streamsize>(values.size() * sizeof(double)));
    if (!in || in.peek() != EOF)
        throw std::runtime_error(file + ": not the results of the same calls");
    return like;
}

double distance(double first, double value, double scale)
{
    if (std::bit_cast<std::uint64_t>(first) == std::bit_cast<std::uint64_t>(value))
        return 0;
    const double size = std::fmax(std::fabs(first), scale);
    const double distance = std::fabs(first - value) / (std::nextafter(size, INFINITY) - size);
    return std::isnan(distance) ? INFINITY : distance;
}

/// Prints the greatest distance, and every function that is beyond the bound.
bool compare(const List &list, const Results &results, const Results &first)
{
    std::pair<double, std::string> greatest;
    bool good = true;
    for (const auto &[name, values] : results) {
        const auto scale = list.scales.find(name);
        double most = 0;
        for (std::size_t i = 0; i < values.size(); ++i)
            most = std::fmax(most, distance(first.at(name)[i], values[i],
                                            scale != list.scales.end() ? scale->second : 0));
        if (most > (scale != list.scales.end() ? list.bound : 0)) {
            std::printf("    %s is %g units from the first build\n", name.c_str(), most);
            good = false;
        }
        greatest = std::max(greatest, {most, name});
    }
    std::printf("    greatest distance from the first build: %.2f units (bound %g) %s\n",
                greatest.first, list.bound, greatest.first > 0 ? greatest.second.c_str() : "");
    return good;
}

} // namespace

int main(int argc, char **argv)
try {
    if (argc < 3)
        throw std::runtime_error("usage: bits LIST FILE [FIRST]");
    const List list = read_list(argv[1]);
    const Results results = run(list);
    write(results, argv[2]);
    bool good = is_digest("digest", digest_of(list.exact, results, as_it_is), list.digest);
    good &=
        is_digest("thousandths", digest_of(list.libm, results, in_thousandths), list.thousandths);
    if (argc > 3)
        good &= compare(list, results, read(argv[3], results));
    return good ? 0 : 1;
} catch (const std::exception &error) {
    std::fprintf(stderr, "bits: %s\n", error.what());
    return 2;
}
