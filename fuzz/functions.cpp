// Calls exported functions as arbitrary bytes spell them (see encoding.h), and stops at a result
// that the header does not allow.
#include "functions.h"
#include "encoding.h"

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <optional>
#include <set>

namespace {

class Bytes {
public:
    Bytes(const std::uint8_t *data, std::size_t size) : at(data), left(size) {}
    bool empty() const { return left == 0; }

    template <class Value> Value next()
    {
        Value value{};
        const std::size_t count = std::min(left, sizeof value);
        if (count)
            std::memcpy(&value, at, count);
        at += count;
        left -= count;
        return value;
    }

    double next_double()
    {
        const auto value = next<double>();
        std::byte pattern[sizeof value];
        std::fill(std::begin(pattern), std::end(pattern), Slot::kPattern);
        // copied into an output, the pattern would pass for one that is not written
        return std::memcmp(&value, pattern, sizeof value) == 0 ? 0 : value;
    }

    std::int32_t next_int()
    {
        const auto value = next<std::int8_t>();
        return value == kWideInt ? next<std::int32_t>() : value;
    }

private:
    const std::uint8_t *at;
    std::size_t left;
};

/// The settable state, as it is when the library is loaded.
class State {
public:
    State()
    {
        GetHiFiConstants(hifi, nullptr, nullptr, nullptr);
        GetHexachromeConstants(hexachrome, nullptr, nullptr);
        GetSpectralXConstants(&tolerance, &reserved, &centre, &inner, &outer);
        GetAChromaticConstants(&L1, &L2, &C1, &C2);
        std::memcpy(weights, den_weight, sizeof weights);
    }

    void restore() const
    {
        SetHiFiConstants(hifi, nullptr, nullptr, nullptr);
        SetHexachromeConstants(hexachrome, nullptr, nullptr);
        SetSpectralXConstants(&tolerance, &reserved, &centre, &inner, &outer);
        SetAChromaticConstants(&L1, &L2, &C1, &C2);
        std::memcpy(den_weight, weights, sizeof weights);
    }

private:
    double hifi[3], hexachrome[2];
    double tolerance, reserved, centre, inner, outer;
    double L1, L2, C1, C2;
    decltype(den_weight) weights;
};

void read_array(Bytes &bytes, std::vector<Slot> &slots, std::size_t index,
                const std::vector<Argument> &arguments)
{
    Slot &slot = slots[index];
    switch (bytes.next<std::uint8_t>() % kInputForms) {
    case kEachValue:
        for (double &value : slot.values)
            value = bytes.next_double();
        break;
    case kOneValue:
        std::fill(slot.values.begin(), slot.values.end(), bytes.next_double());
        break;
    case kHalves:
        for (double &value : slot.values)
            value = bytes.next<std::uint8_t>() / 2.0;
        break;
    case kAsBefore:
        for (std::size_t i = index; i-- > 0;)
            if (arguments[i].kind == 'a' && arguments[i].count == arguments[index].count) {
                slot.values = slots[i].values;
                break;
            }
        break;
    default:
        slot.null = !arguments[index].unchecked;
    }
}

/// The input that an output is to share its array with; past the end where it has its own.
std::size_t read_output(Bytes &bytes, std::vector<Slot> &slots, std::size_t index,
                        const std::vector<Argument> &arguments)
{
    const auto form = bytes.next<std::uint8_t>();
    slots[index].null = form % kOutputForms == kNullOutput && !arguments[index].unchecked;
    std::vector<std::size_t> alike;
    for (std::size_t i = 0; i < slots.size(); ++i)
        if (arguments[i].kind == 'a' && !arguments[i].output &&
            arguments[i].count == arguments[index].count)
            alike.push_back(i);
    const bool in_place = form % kOutputForms == kInPlace && !alike.empty();
    return in_place ? alike[form / kOutputForms % alike.size()] : slots.size();
}

[[noreturn]] void stop(const Function &function, const char *fault, double result)
{
    std::fprintf(stderr, "FAULT: %s returned %g: %s\n", function.name.c_str(), result, fault);
    std::abort();
}

/// Answers other than 0 and 1.
bool is_documented(const std::string &name, double result)
{
    if (name == "GetNumIlluminantObservers")
        return result == int{NUM_ILLUM_OBS};
    if (name == "GetNumStatuses")
        return result == int{NUM_STATUSES};
    if (name == "GetNumResponses")
        return result == int{NUM_RESPONSES};
    if (name == "GetNumStatusResponses")
        return result == 0 || result == 4 || result == 6 || result == 7;
    if (name == "DetermineDensityResponse" || name == "PolDetermineDensityResponse")
        return (result >= 0 && result <= 28) || (result >= 420 && std::fmod(result, 20) == 0);
    if (name == "ReflToHueGray" || name == "PolReflToHueGray")
        return result == 0 || result == 1 || result == 9;
    if (name == "ChooseBPWavelen")
        return result >= 0 && result < 3;
    if (name == "CalculateSpectralDensity")
        return std::isnan(result) || result <= 7;
    if (name == "DensityRatio")
        return std::isnan(result) || result <= 1000;
    static const std::set<std::string> any_double = {"CIEDE2000::Calculate",
                                                     "CIEDE2000::ConvertToDegrees",
                                                     "CIEDE2000::ConvertToRadians",
                                                     "CalculateSpecialDensity",
                                                     "Saunderson",
                                                     "UnSaunderson"};
    return any_double.contains(name) || result == 0 || result == 1;
}

/// What a function writes where it fails, if it writes.
std::optional<double> on_failure(const std::string &name)
{
    static const std::map<std::string, double> values = {
        {"ReflToCIEYxy", 0},           {"XYZToCIEYxy", 0},  {"XYZToxyz", 0},
        {"PolReflToDensities", 0},     {"LabToDEcmc", 999}, {"ReflToWhiteE313_98", -999},
        {"CIEYxyToWhiteE313_98", -999}};
    const auto found = values.find(name);
    return found == values.end() ? std::nullopt : std::optional(found->second);
}

bool left_alone_in_part(const Slot &slot)
{
    const std::size_t size = (slot.memory.size() - 2 * Slot::kGuard) / slot.values.size();
    for (std::size_t i = 0; i < slot.values.size(); ++i) {
        const auto element = slot.memory.begin() + Slot::kGuard + i * size;
        if (std::all_of(element, element + size, [](auto b) { return b == Slot::kPattern; }))
            return true;
    }
    return false;
}

/// Past the last response: wavelengths, bands, and what Status CCR2 answers with 0, count as well.
int response_limit(const std::string &name, double status)
{
    if (name == "GetNormalizedDensityWeights" || name == "ReflToReflDensity" ||
        name == "DensitytoIntegratedRefl")
        return NUM_RESPONSES;
    if (status == int{SPECTRAL_STATUS})
        return 710;
    const bool by_band = status == int{SPECTRALX_STATUS} || status == int{CCR2_STATUS};
    return by_band ? int{VANTREL_BANDS} : int{NUM_RESPONSES};
}

/// Whether a checked pointer is null, or an index out of range. The words of a colour are asked for
/// by a choice that may leave out any of them.
bool refusable(const Function &function, const std::vector<Slot> &slots)
{
    for (std::size_t i = 0; i < slots.size(); ++i) {
        const Argument &argument = function.arguments[i];
        const bool optional_words = function.name == "VerbalColorDifference" && i > 4;
        if (slots[i].null && !argument.nullable && !optional_words)
            return true;
        const int limit = argument.kind == 'k'   ? int{NUM_ILLUM_OBS}
                          : argument.kind == 's' ? int{NUM_STATUSES}
                          : argument.kind == 'r'
                              ? response_limit(function.name, slots[i - 1].values[0])
                              : 0;
        const double value = slots[i].values[0];
        if (limit > 0 && (value < 0 || value >= limit))
            return true;
    }
    return false;
}

void check(const Function &function, const std::vector<Slot> &slots, double result)
{
    // their arguments say which of the outputs they write
    static const std::set<std::string> choosy = {
        "VerbalColorDifference", "CalculateSpectralXDensity", "FindDensityMax", "FindDensityMin"};
    const std::string &name = function.name;
    if (!is_documented(name, result))
        stop(function, "not a documented answer", result);
    const bool refused = refusable(function, slots);
    if (result != 0 && refused)
        stop(function, "accepted a null pointer or an index out of range", result);
    const bool failed = result == 0 || result == 9;
    for (std::size_t i = 0; i < slots.size(); ++i) {
        const Slot &slot = slots[i];
        if (!slot.output || slot.in_place)
            continue;
        if (slot.overrun)
            stop(function, "wrote beyond the end", result);
        if (slot.null)
            continue;
        if (!failed && !choosy.contains(name) && left_alone_in_part(slot))
            stop(function, "left an output as it was", result);
        if (!failed || !slot.written)
            continue;
        const auto allowed = refused ? std::nullopt : on_failure(name);
        const bool as_documented =
            allowed ? slot.values == std::vector(slot.values.size(), *allowed)
                    : name == "GetNormalizedDensityWeights" && (i == 3 || i == 5);
        if (!as_documented)
            stop(function, "wrote an output although it failed", result);
    }
}

bool same(double a, double b) { return a == b || (std::isnan(a) && std::isnan(b)); }

/// With an output in the array of an input, a function gives the same.
void check_in_place(const Function &function, std::vector<Slot> slots, std::size_t output,
                    std::size_t input)
{
    std::vector<Slot> apart = slots;
    const double expected = function.call(apart);
    check(function, apart, expected);
    slots[output].in_place = &slots[input];
    const double result = function.call(slots);
    check(function, slots, result);
    if (!same(result, expected))
        stop(function, "another answer in place", result);
    for (std::size_t i = 0; expected == 1 && i < slots.size(); ++i)
        if (slots[i].output && !slots[i].null &&
            !std::equal(slots[i].values.begin(), slots[i].values.end(), apart[i].values.begin(),
                        same))
            stop(function, "other values in place", result);
}

/// Of the arrays for three inks, what a call with fewer may read.
void keep_inks(const Function &function, std::vector<Slot> &slots)
{
    static const std::set<std::string> counted = {"EstimateRefls", "EstimateColor",
                                                  "EstimateReflsForBestVisualColor"};
    const double inks = counted.contains(function.name) ? slots[0].values[0] : 0;
    if (inks != 1 && inks != 2)
        return;
    for (const std::size_t i : {1, 2})
        slots[i].values.resize(slots[i].values.size() / 3 * static_cast<std::size_t>(inks));
}

void call_next(Bytes &bytes)
{
    const std::size_t index = bytes.next<std::uint8_t>() % (functions().size() + 1);
    if (index == functions().size()) {
        auto &status = den_weight[bytes.next<std::uint8_t>() % NUM_STATUSES];
        auto &row = status[bytes.next<std::uint8_t>() % NUM_RESPONSES];
        row[bytes.next<std::uint8_t>() % VANTREL_BANDS] = bytes.next<std::int64_t>();
        return;
    }
    const Function &function = functions()[index];
    const auto &arguments = function.arguments;
    std::vector<Slot> slots = function.slots();
    std::size_t shared_output = 0, shared_input = slots.size();
    for (std::size_t i = 0; i < slots.size(); ++i) {
        if (arguments[i].output) {
            const std::size_t input = read_output(bytes, slots, i, arguments);
            if (input < slots.size()) {
                shared_output = i;
                shared_input = input;
            }
        } else if (arguments[i].kind == 'a') {
            read_array(bytes, slots, i, arguments);
        } else {
            slots[i].values[0] = arguments[i].kind == 'd' ? bytes.next_double() : bytes.next_int();
        }
    }
    keep_inks(function, slots);
    if (shared_input < slots.size() && !slots[shared_input].null) {
        check_in_place(function, slots, shared_output, shared_input);
        return;
    }
    const double result = function.call(slots);
    check(function, slots, result);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    static const State state;
    state.restore();
    Bytes bytes(data, size);
    for (int calls = 0; calls < 32 && !bytes.empty(); ++calls)
        call_next(bytes);
    return 0;
}
