#pragma once

#include <benchmark/benchmark.h>
#include <map>
#include <string>

namespace bench {

// Prints the benchmarks as usual, and keeps the median time of each for the ratios that are told at the end.
class RatioReporter : public benchmark::ConsoleReporter {
public:
    RatioReporter() : ConsoleReporter(OO_Tabular) {}

    void ReportRuns(const std::vector<Run>& runs) override;

    // Prints how many times as fast `name` was as `peer`, by their medians. Nothing when one was not run.
    void printRatio(const std::string& what, const std::string& name, const std::string& peer) const;
    // Prints the median time per element of `large` in times that of `small`.
    void printGrowth(const std::string& what, const std::string& large, const std::string& small,
                     double sizeRatio) const;

private:
    double medianOf(const std::string& name) const;

    std::map<std::string, double> medians_; // by benchmark
};

} // namespace bench
