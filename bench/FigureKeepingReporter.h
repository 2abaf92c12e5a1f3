// The console table, and each run's figures kept by benchmark name for the
// ratios a benchmark prints after it.
#pragma once

#include <benchmark/benchmark.h>

#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

struct RunFigures {
    double secondsPerIteration;  // real time
    std::map<std::string, double> counters;
};

class FigureKeepingReporter : public benchmark::ConsoleReporter {
public:
    FigureKeepingReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run> &runs) override {
        for (const Run &run : runs) {
            if (run.iterations == 0) continue;
            RunFigures &kept = figures[run.benchmark_name()];
            kept.secondsPerIteration = run.real_accumulated_time / double(run.iterations);
            for (const auto &[name, counter] : run.counters) kept.counters[name] = counter.value;
        }
        ConsoleReporter::ReportRuns(runs);
    }

    // Null for a benchmark that did not run.
    const RunFigures *find(const std::string &name) const {
        const auto found = figures.find(name);
        return found != figures.end() ? &found->second : nullptr;
    }

    // A counter of two runs, to compare how a cost scales; empty unless
    // both ran.
    std::optional<std::pair<double, double>> counterOfBoth(const std::string &small, const std::string &large,
                                                           const std::string &counter) const {
        const RunFigures *smallRun = find(small);
        const RunFigures *largeRun = find(large);
        if (smallRun == nullptr || largeRun == nullptr) return std::nullopt;
        return std::make_pair(smallRun->counters.at(counter), largeRun->counters.at(counter));
    }

private:
    std::map<std::string, RunFigures> figures;
};

// Runs what the command line selects, keeping the figures in `reporter`.
inline void runBenchmarks(int argc, char **argv, FigureKeepingReporter &reporter) {
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks(&reporter);
    benchmark::Shutdown();
}
