// The checking build: every refused argument is reported in one line.
#include "golden.h"

#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <sstream>

namespace {

struct Invariants {
    std::string file;
    std::vector<std::string> expressions;
};

std::map<std::string, Invariants> read_invariants()
{
    std::map<std::string, Invariants> all;
    std::ifstream in(VANTREL_INVARIANTS);
    for (std::string line; std::getline(in, line);) {
        const std::size_t colon = line.find(':');
        if (line.front() == '#' || colon == std::string::npos)
            continue;
        std::istringstream names(line.substr(colon + 1));
        for (std::string name; names >> name;) {
            std::istringstream words(line.substr(0, colon));
            words >> all[name].file >> std::ws;
            for (std::string expression; std::getline(words, expression, '|');)
                all[name].expressions.push_back(expression);
        }
    }
    return all;
}

std::string reported_by(const Function &function, std::vector<Slot> &slots)
{
    testing::internal::CaptureStderr();
    function.call(slots);
    return testing::internal::GetCapturedStderr();
}

std::string line(const std::string &function, const std::string &file,
                 const std::string &expression)
{
    return "vantrel: " + function + " (" + file + "): violated: " + expression + "\n";
}

} // namespace

TEST(CheckingBuild, ReportsEveryRefusedArgumentInOneLine)
{
    const auto invariants = read_invariants();
    for (const GoldenCase &good : one_good_call_each()) {
        std::size_t checked = 0;
        for (std::size_t i = 0; i < good.slots.size(); ++i) {
            auto calls = spoilt_calls(good, i);
            if (calls.empty())
                continue;
            const auto row = invariants.find(good.function->name);
            ASSERT_NE(row, invariants.end()) << good.function->name;
            const auto &[file, expressions] = row->second;
            const std::string &expression =
                expressions.size() == 1 ? expressions[0] : expressions.at(checked);
            ++checked;
            for (auto &slots : calls) {
                EXPECT_EQ(reported_by(*good.function, slots),
                          expression == "-" ? "" : line(good.function->name, file, expression))
                    << good.function->name << " argument " << i;
            }
        }
        const auto row = invariants.find(good.function->name);
        EXPECT_TRUE(row == invariants.end() || row->second.expressions.size() == 1 ||
                    row->second.expressions.size() == checked)
            << good.function->name << " has other arguments than its row";
    }
}

TEST(CheckingBuild, ReportsWhatTheGoldenTablesSay)
{
    const auto invariants = read_invariants();
    for (GoldenCase &golden : read_all_golden()) {
        const std::string said = reported_by(*golden.function, golden.slots);
        const std::string &name = golden.function->name;
        EXPECT_EQ(said, golden.reported.empty()
                            ? ""
                            : line(name, invariants.at(name).file, golden.reported))
            << golden.where;
    }
}
