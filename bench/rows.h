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

void add_row(const std::string &row, const std::string &rival, double goal);

/// A row with a rival; the run ends with the ratio of the two beside the goal.
template <class Ours, class Theirs>
void compare(const std::string &row, double goal, Ours ours, const std::string &rival,
             Theirs theirs)
{
    add_row(row, rival, goal);
    measure(row + "/vantrel", ours);
    measure(row + "/" + rival, theirs);
}

void colour_rows();
