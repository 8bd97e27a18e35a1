// Runs the golden tables, and uses their calls to attack the boundary.
#include "golden.h"

#include <gtest/gtest.h>

#include <cfenv>
#include <climits>
#include <cmath>
#include <cxxabi.h>
#include <fstream>
#include <limits>
#include <map>
#include <set>

namespace {

constexpr double kInf = std::numeric_limits<double>::infinity();
constexpr double kNan = std::numeric_limits<double>::quiet_NaN();

bool agrees(double got, double wanted, std::optional<double> tolerance)
{
    if (std::isnan(wanted))
        return std::isnan(got);
    if (std::isinf(wanted))
        return got == wanted;
    const double allowed = tolerance.value_or(1e-12 * std::fmax(1, std::fabs(wanted)));
    return got == wanted || std::fabs(got - wanted) <= allowed;
}

void check_output(const Slot &slot, const std::string &expected, std::optional<double> tolerance)
{
    EXPECT_FALSE(slot.overrun) << "wrote beyond the end";
    if (expected == "unwritten") {
        EXPECT_FALSE(slot.written) << "wrote an output that was to stay as it was";
    } else if (expected.front() == '"') {
        EXPECT_EQ('"' + slot.text, expected);
    } else if (expected != "*" && expected != "null") {
        EXPECT_TRUE(slot.written) << "left an output unwritten";
        const std::vector<double> values = golden_values(expected);
        ASSERT_EQ(values.size(), slot.values.size());
        for (std::size_t i = 0; i < values.size(); ++i)
            EXPECT_PRED3(agrees, slot.values[i], values[i], tolerance) << "element " << i;
    }
}

/// What a call says on standard error.
std::string said(const Function &function, std::vector<Slot> &slots, double &result)
{
    testing::internal::CaptureStderr();
    result = function.call(slots);
    return testing::internal::GetCapturedStderr();
}

/// What the checking build says of a refused call, in one line.
std::string report(const Function &function, const std::string &violated)
{
#ifdef VANTREL_CHECKED
    if (!violated.empty() && violated != "-")
        return "vantrel: " + function.name + " (" + function.file + "): violated: " + violated +
               "\n";
#endif
    return "";
}

bool no_output_touched(const std::vector<Slot> &slots)
{
    return std::none_of(slots.begin(), slots.end(),
                        [](const Slot &slot) { return slot.written || slot.overrun; });
}

} // namespace

void PrintTo(const std::optional<double> &tolerance, std::ostream *out)
{
    *out << (tolerance ? std::to_string(*tolerance) : "1e-12 relative");
}

TEST(Golden, EveryLine)
{
    for (GoldenCase &golden : read_all_golden()) {
        SCOPED_TRACE(golden.where + " " + golden.function->name);
        double result = 0;
        EXPECT_EQ(said(*golden.function, golden.slots, result),
                  report(*golden.function, golden.reported));
        EXPECT_PRED3(agrees, result, golden.returns, golden.tolerance) << "returned";
        std::size_t next = 0;
        for (const Slot &slot : golden.slots)
            if (slot.output)
                check_output(slot, golden.outputs[next++], golden.tolerance);
    }
}

// A host that rounds upward gets other last places, those of the polarisation intercept and of what
// is in single precision sooner, or the other branch where two meet (those of L* to 0.00001).
TEST(Golden, AnotherRoundingModeChangesLastPlaces)
{
    const std::map<std::string, double> sooner = {{"CalcLabch", 1e-6},
                                                  {"CIEDE2000::Calculate", 1e-8},
                                                  {"LabToDE2000Ex", 1e-8},
                                                  {"ReflToPolIntercept", 1e-8},
                                                  {"XYZToCIELab", 1e-5}};
    for (const int mode : {FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO})
        for (GoldenCase &golden : one_good_call_each()) {
            SCOPED_TRACE(golden.where + " " + golden.function->name);
            const auto found = sooner.find(golden.function->name);
            const double places = found == sooner.end() ? 1e-10 : found->second;
            std::vector<Slot> otherwise = golden.slots;
            const double result = golden.function->call(golden.slots);
            std::fesetround(mode);
            const double other_result = golden.function->call(otherwise);
            EXPECT_EQ(std::fegetround(), mode);
            std::fesetround(FE_TONEAREST);
            EXPECT_PRED3(agrees, other_result, result, places * std::fmax(1, std::fabs(result)));
            for (std::size_t i = 0; i < otherwise.size(); ++i)
                for (std::size_t e = 0; e < otherwise[i].values.size(); ++e)
                    EXPECT_PRED3(agrees, otherwise[i].values[e], golden.slots[i].values[e],
                                 places * std::fmax(1, std::fabs(golden.slots[i].values[e])));
        }

    // A quarter turn that is rounded up or down leaves an angle of up to another one.
    for (double h = 0; h < 6.3; h += 0.01) {
        const CIELABCOORD first = {50, 60 * std::cos(h), 60 * std::sin(h)},
                          second = {51, 58 * std::cos(h), 58 * std::sin(h + 0.02)};
        double nearest = 0, other = 0;
        LabToDE2000(&first, &second, 1, 1, &nearest);
        for (const int mode : {FE_UPWARD, FE_DOWNWARD, FE_TOWARDZERO}) {
            std::fesetround(mode);
            LabToDE2000(&first, &second, 1, 1, &other);
            std::fesetround(FE_TONEAREST);
            EXPECT_NEAR(other, nearest, 1e-8);
        }
    }
}

TEST(Golden, CoversEveryExportedFunction)
{
    std::set<std::string> in_tables;
    for (const GoldenCase &golden : read_all_golden())
        in_tables.insert(golden.function->name);
    std::ifstream exports(VANTREL_EXPORTS);
    int count = 0;
    for (std::string symbol; std::getline(exports, symbol); ++count) {
        int status = 0;
        char *demangled = abi::__cxa_demangle(symbol.c_str(), nullptr, nullptr, &status);
        const std::string full = demangled ? demangled : symbol;
        std::free(demangled);
        const std::string name = full.substr(0, full.find('('));
        const bool life_cycle = name == "CIEDE2000::CIEDE2000" || name == "CIEDE2000::~CIEDE2000";
        EXPECT_TRUE(life_cycle || name == "den_weight" || in_tables.contains(name)) << name;
    }
    EXPECT_GT(count, 0);
}

TEST(Boundary, RefusesNullsAndBadIndicesAndWritesNothing)
{
    for (const GoldenCase &good : one_good_call_each())
        for (std::size_t i = 0; i < good.slots.size(); ++i)
            for (auto &slots : spoilt_calls(good, i)) {
                SCOPED_TRACE(good.function->name + " argument " + std::to_string(i));
                double result = 1;
                EXPECT_EQ(said(*good.function, slots, result),
                          report(*good.function, good.function->arguments[i].reported));
                EXPECT_EQ(result, 0);
                EXPECT_TRUE(no_output_touched(slots));
            }
}

TEST(Boundary, AnOutputMayTakeTheArrayOfAnInput)
{
    const auto same = [](double a, double b) { return a == b || (std::isnan(a) && std::isnan(b)); };
    for (const GoldenCase &golden : read_all_golden())
        for (std::size_t out = 0; out < golden.slots.size(); ++out)
            for (std::size_t in = 0; golden.slots[out].output && in < golden.slots.size(); ++in) {
                SCOPED_TRACE(golden.where + " output " + std::to_string(out));
                auto separate = golden.slots, shared = golden.slots;
                shared[out].in_place = golden.slots[in].output ? nullptr : &shared[in];
                EXPECT_EQ(golden.function->call(shared), golden.function->call(separate));
                if (separate[out].written)
                    EXPECT_TRUE(std::ranges::equal(shared[out].values, separate[out].values, same));
            }
}

// Any double is legal everywhere, and any int where no index is meant: nothing is written beyond
// the end of an output (and, under the sanitizers, nothing is undefined).
TEST(Boundary, SurvivesEveryNumber)
{
    const std::vector<double> doubles = {0,      -0.0,   kInf,   -kInf,  kNan, 1e300, -1e300,
                                         1e-300, 5e-324, 100.01, -0.001, 1e9,  -3e9,  1e19};
    const std::vector<double> ints = {INT_MIN, -1, 0, 1, 2, 3, 29, 30, 31, 100, 101, INT_MAX};
    for (const GoldenCase &good : one_good_call_each()) {
        if (good.function->name.starts_with("Set"))
            continue; // would change what the others measure
        for (std::size_t i = 0; i < good.slots.size(); ++i) {
            const Argument &argument = good.function->arguments[i];
            const bool number = argument.kind == 'd' || argument.kind == 'a';
            if (argument.output || argument.kind == 'k' || (!number && argument.unchecked))
                continue;
            for (const double value : number ? doubles : ints)
                for (std::size_t element = 0; element <= argument.count; ++element) {
                    auto slots = good.slots;
                    if (element < argument.count)
                        slots[i].values[element] = value;
                    else
                        slots[i].values.assign(argument.count, value);
                    good.function->call(slots);
                    EXPECT_TRUE(std::ranges::none_of(slots, &Slot::overrun))
                        << good.function->name << ": " << value << " in argument " << i;
                }
        }
    }
}
