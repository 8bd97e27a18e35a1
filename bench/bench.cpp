#include "rows.h"

#include <cstdio>
#include <map>
#include <vector>

namespace {

struct Row {
    std::string name, rival;
    double goal;
};
std::vector<Row> rows;

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

} // namespace

void add_row(const std::string &row, const std::string &rival, double goal)
{
    rows.push_back({row, rival, goal});
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
    Reporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);

    std::printf("\n%-26s %-22s %9s %9s %7s %6s\n", "row", "rival", "vantrel", "rival", "ratio",
                "goal");
    for (const Row &row : rows) {
        const double ours = reporter.median[row.name + "/vantrel"];
        const double theirs = reporter.median[row.name + "/" + row.rival];
        if (ours > 0 && theirs > 0)
            std::printf("%-26s %-22s %6.1f ns %6.1f ns %7.2f %6.2f%s\n", row.name.c_str(),
                        row.rival.c_str(), ours, theirs, ours / theirs, row.goal,
                        ours / theirs > row.goal ? "  missed" : "");
    }
}
