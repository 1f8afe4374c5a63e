#pragma once

#include <benchmark/benchmark.h>

#include <map>
#include <string>
#include <vector>

namespace bench {

/// Prints what Google Benchmark prints, and keeps the medians of every benchmark for a table of ratios.
class RatioReport : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override;

    /// Median microseconds of the benchmark of that name, for example "FullLoad/15": of processor time, which leaves
    /// out what else the machine is busy with (the work is one thread's), and of the time that passed, with waits for
    /// the disk. They throw std::out_of_range when it did not run.
    double processorTime(const std::string& name) const { return processorTimes_.at(name); }
    double passedTime(const std::string& name) const { return passedTimes_.at(name); }

private:
    std::map<std::string, double> processorTimes_;
    std::map<std::string, double> passedTimes_;
};

}  // namespace bench
