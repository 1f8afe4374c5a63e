#include "RatioReport.h"

namespace bench {

void RatioReport::ReportRuns(const std::vector<Run>& runs) {
    ConsoleReporter::ReportRuns(runs);
    for (const Run& run : runs) {
        if (run.run_type == Run::RT_Aggregate && run.aggregate_name == "median") {
            const std::string name = run.run_name.function_name + "/" + run.run_name.args;
            const double unit = benchmark::GetTimeUnitMultiplier(run.time_unit) / 1e6;
            processorTimes_[name] = run.GetAdjustedCPUTime() / unit;
            passedTimes_[name] = run.GetAdjustedRealTime() / unit;
        }
    }
}

}  // namespace bench
