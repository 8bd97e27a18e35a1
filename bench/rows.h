// A benchmark row: the library's way and its rival's, measured in one run.
#pragma once

#include <benchmark/benchmark.h>

#include <string>

/// `work(i)` is called with i = 0, 1, 2, … and touches the i-th of the prepared inputs.
template <class Work> void measure(const std::string &name, Work work)
{
    benchmark::RegisterBenchmark(name.c_str(), [work](benchmark::State &state) {
        unsigned i = 0;
        for (auto _ : state)
            benchmark::DoNotOptimize(work(i++));
    });
}

/// The run ends with the ratio of the first benchmark to the second, beside the goal where there is
/// one.
void add_ratio(const std::string &ours, const std::string &theirs, double goal = 0);

/// A row with a rival.
template <class Ours, class Theirs>
void compare(const std::string &row, double goal, Ours ours, const std::string &rival,
             Theirs theirs)
{
    measure(row, ours);
    measure(row + ": " + rival, theirs);
    add_ratio(row, row + ": " + rival, goal);
}

void colour_rows();
void density_rows();
