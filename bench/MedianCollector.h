// A console reporter that also keeps the median time per iteration of every benchmark run (and the
// fastest repetition's, where asked), so a benchmark's summary can print rates and ratios from the
// same run.
#pragma once

#include <benchmark/benchmark.h>
#include <map>
#include <string>
#include <vector>

namespace orvbench {

class MedianCollector : public benchmark::ConsoleReporter {
public:
    void ReportRuns(std::vector<Run> const& runs) override {
        for (Run const& run : runs) {
            if (run.run_type != Run::RT_Aggregate) {
                continue;
            }
            double perIteration = run.GetAdjustedRealTime() / benchmark::GetTimeUnitMultiplier(run.time_unit);
            std::string name = run.run_name.function_name + "/" + run.run_name.args;
            if (run.aggregate_name == "median") {
                seconds[name] = perIteration;
            } else if (run.aggregate_name == "min") {
                fastest[name] = perIteration;
            }
        }
        ConsoleReporter::ReportRuns(runs);
    }
    // Seconds per iteration of "function/args" ("BM_Read/" when there are no arguments); 0 if absent.
    double Seconds(std::string const& name) const {
        auto it = seconds.find(name);
        return it == seconds.end() ? 0.0 : it->second;
    }

    // The same for the fastest repetition, where a benchmark asks for that statistic (Fastest()).
    double FastestSeconds(std::string const& name) const {
        auto it = fastest.find(name);
        return it == fastest.end() ? 0.0 : it->second;
    }

    std::map<std::string, double> seconds;
    std::map<std::string, double> fastest;
};

// The statistic a benchmark adds with ->ComputeStatistics("min", Fastest): on a shared machine,
// the fastest repetition is the one least disturbed by others, the closest to the code's own cost.
inline double Fastest(std::vector<double> const& v) {
    double best = v.empty() ? 0.0 : v.front();
    for (double x : v) {
        best = x < best ? x : best;
    }
    return best;
}

} // namespace orvbench
