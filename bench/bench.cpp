#include "rows.h"

#include <cstdio>
#include <map>
#include <vector>

namespace {

struct Ratio {
    std::string ours, theirs;
    double goal;
};
std::vector<Ratio> ratios;

/// Prints as the console does and keeps the median of each benchmark for the ratios.
class Reporter : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run> &runs) override
    {
        ConsoleReporter::ReportRuns(runs);
        for (const Run &run : runs)
            if (run.aggregate_name == "median")
                median[run.run_name.function_name] = run.GetAdjustedCPUTime();
    }
    std::map<std::string, double> median;
};

/// The rival of a row, or a row itself.
std::string label(const std::string &name)
{
    const std::size_t colon = name.find(": ");
    return colon == std::string::npos ? name : name.substr(colon + 2);
}

} // namespace

void add_ratio(const std::string &ours, const std::string &theirs, double goal)
{
    ratios.push_back({ours, theirs, goal});
}

int main(int argc, char **argv)
{
    std::vector<char *> arguments(argv, argv + argc);
    char repetitions[] = "--benchmark_repetitions=9";
    char interleaved[] = "--benchmark_enable_random_interleaving=true";
    char aggregates[] = "--benchmark_report_aggregates_only=true";
    char time[] = "--benchmark_min_time=0.05";
    arguments.insert(arguments.begin() + 1, {repetitions, interleaved, aggregates, time});
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data()))
        return 2;

    colour_rows();
    density_rows();
    Reporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);

    std::printf("\n%-26s %9s   %-28s %9s %7s %6s\n", "vantrel", "", "beside", "", "ratio", "goal");
    for (const auto &[ours, theirs, goal] : ratios) {
        const double mine = reporter.median[ours], beside = reporter.median[theirs];
        if (mine <= 0 || beside <= 0)
            continue; // left out by a filter
        const double ratio = mine / beside;
        std::printf("%-26s %6.1f ns   %-28s %6.1f ns %7.2f", ours.c_str(), mine,
                    label(theirs).c_str(), beside, ratio);
        if (goal > 0)
            std::printf(" %6.2f%s", goal, ratio > goal ? "  missed" : "");
        std::printf("\n");
    }
}
