#include "bench/ratio_reporter.h"

#include <cstdio>

namespace bench {

void RatioReporter::ReportRuns(const std::vector<Run>& runs) {
    for (const Run& run : runs)
        if (run.run_type == Run::RT_Aggregate && run.aggregate_name == "median")
            medians_[run.run_name.function_name + (run.run_name.args.empty() ? "" : "/") +
                     run.run_name.args] = run.GetAdjustedRealTime();
    ConsoleReporter::ReportRuns(runs);
}

double RatioReporter::medianOf(const std::string& name) const {
    const auto found = medians_.find(name);
    return found == medians_.end() ? 0 : found->second;
}

void RatioReporter::printRatio(const std::string& what, const std::string& name,
                               const std::string& peer) const {
    const double time = medianOf(name);
    const double peerTime = medianOf(peer);
    if (time > 0 && peerTime > 0)
        std::printf("%-58s %.2f times as fast\n", what.c_str(), peerTime / time);
}

void RatioReporter::printGrowth(const std::string& what, const std::string& large, const std::string& small,
                                double sizeRatio) const {
    const double largeTime = medianOf(large);
    const double smallTime = medianOf(small);
    if (largeTime > 0 && smallTime > 0)
        std::printf("%-58s %.2f times as long\n", what.c_str(), largeTime / smallTime / sizeRatio);
}

} // namespace bench
