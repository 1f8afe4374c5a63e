#pragma once

#include <benchmark/benchmark.h>

#include <map>
#include <string>
#include <vector>

namespace bench {

/// Prints what Google Benchmark prints, and keeps the median processor time of every benchmark for a table of ratios.
class RatioReport : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override;

    /// Median microseconds of processor time of the benchmark of that name, for example "FullLoad/15". Other than the
    /// time that passes, it does not count what else the machine is busy with; the work is one thread's.
    /// Throws std::out_of_range when it did not run.
    double median(const std::string& name) const { return medians_.at(name); }
    bool has(const std::string& name) const { return medians_.count(name) != 0; }

private:
    std::map<std::string, double> medians_;
};

}  // namespace bench
