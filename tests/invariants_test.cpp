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
        const std::size_t colon = line.find(':');
        if (line.front() == '#' || colon == std::string::npos)
            continue;
        std::istringstream names(line.substr(colon + 1));
        for (std::string name; names >> name;) {
            std::istringstream words(line.substr(0, colon));
            std::string reporter = name;
            words >> all[name].file >> std::ws;
            for (std::string expression; std::getline(words, expression, '|');) {
                if (expression.starts_with("as "))
                    reporter = expression.substr(3);
                else
                    all[name].reports.push_back({reporter, expression});
            }
        }
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
