// The results of benchmarks on the console, and their ratio.
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <map>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

/** Keeps the single results of each benchmark. */
class RatioReporter : public benchmark::ConsoleReporter {
public:
    RatioReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run>& runs) override {
        for (const Run& run : runs) {
            _failed = _failed || run.error_occurred;
            if (run.run_type == Run::RT_Iteration && !run.error_occurred)
                _times[run.run_name.function_name].push_back(run.GetAdjustedRealTime());
        }
        ConsoleReporter::ReportRuns(runs);
    }

    /** 0 for a benchmark without results. */
    double medianOf(const std::string& benchmark) {
        auto& times = _times[benchmark];
        if (times.empty())
            return 0;
        const auto middle = times.begin() + static_cast<std::ptrdiff_t>(times.size() / 2);
        std::nth_element(times.begin(), middle, times.end());
        return *middle;
    }

    /** @return False when a benchmark has failed, or there is nothing to compare. */
    bool printRatio(const char* what, const char* mine, const char* plain) {
        const double mineTakes = medianOf(mine);
        const double plainTakes = medianOf(plain);
        if (_failed || mineTakes <= 0 || plainTakes <= 0)
            return false;
        std::printf("\n%s, medians: %s %.2f ms, %s %.2f ms, ratio %.2f\n", what, mine, mineTakes,
                    plain, plainTakes, mineTakes / plainTakes);
        return true;
    }

private:
    std::map<std::string, std::vector<double>> _times;
    bool _failed = false;
};
