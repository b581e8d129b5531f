// A console reporter that also keeps the median time per iteration of every benchmark run, so a
// benchmark's summary can print rates and ratios from the same run.
#pragma once

#include <benchmark/benchmark.h>
#include <map>
#include <string>

namespace orvbench {

class MedianCollector : public benchmark::ConsoleReporter {
public:
    void ReportRuns(std::vector<Run> const& runs) override {
        for (Run const& run : runs) {
            if (run.run_type == Run::RT_Aggregate && run.aggregate_name == "median") {
                seconds[run.run_name.function_name + "/" + run.run_name.args] =
                    run.GetAdjustedRealTime() / benchmark::GetTimeUnitMultiplier(run.time_unit);
            }
        }
        ConsoleReporter::ReportRuns(runs);
    }
    // Seconds per iteration of "function/args" ("BM_Read/" when there are no arguments); 0 if absent.
    double Seconds(std::string const& name) const {
        auto it = seconds.find(name);
        return it == seconds.end() ? 0.0 : it->second;
    }

    std::map<std::string, double> seconds;
};

} // namespace orvbench
