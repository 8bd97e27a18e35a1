// The checking build: every refused argument is reported in one line.
#include "golden.h"

#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <sstream>

namespace {

struct Report {
    std::string function, expression;
};

struct Invariants {
    std::string file;
    std::vector<Report> reports;
};

std::map<std::string, Invariants> read_invariants()
{
    std::map<std::string, Invariants> all;
    std::ifstream in(VANTREL_INVARIANTS);
    for (std::string line; std::getline(in, line);) {
        std::istringstream words(line);
        std::string name, word;
        if (!(words >> name) || name.front() == '#')
            continue;
        Invariants row;
        std::string reporter = name.substr(name.rfind(':') + 1);
        words >> row.file >> std::ws;
        for (std::string expression; std::getline(words, expression, '|');) {
            if (expression.starts_with("as "))
                reporter = expression.substr(3);
            else
                row.reports.push_back({reporter, expression});
        }
        all[name] = row;
    }
    return all;
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
            const auto &[file, reports] = row->second;
            const auto &[reporter, expression] =
                reports.size() == 1 ? reports[0] : reports.at(checked);
            ++checked;
            for (auto &slots : calls) {
                testing::internal::CaptureStderr();
                good.function->call(slots);
                const std::string said = testing::internal::GetCapturedStderr();
                if (expression == "-")
                    EXPECT_EQ(said, "") << good.function->name << " argument " << i;
                else
                    EXPECT_EQ(said, "vantrel: " + reporter + " (" + file +
                                        "): violated: " + expression + "\n")
                        << good.function->name << " argument " << i;
            }
        }
    }
}
