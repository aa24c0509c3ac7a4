// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdio>
#include <map>
#include <string>
#include <vector>

/// Sets what is measured beside its floor, the least code that could do the work, and prints the ratios of
/// both:
///
///     BENCHMARK(publish)->Arg(1);
///     BENCHMARK(signal)->Arg(1);
///     const bool compared = Ratios::compare("publish(), 1 subscriber", "publish/1", "signal/1", 0.25);
///
///     int main(int argc, char** argv)
///     {
///         return Ratios::run(argc, argv);
///     }
///
/// Subject and floor run in turns, several times in one process, and the shortest time of each counts:
/// whatever else the machine does can only make them longer.
namespace Ratios {

struct Row
{
    std::string what;
    std::string subject;
    std::string floor;
    double goal;
};

inline std::vector<Row>& rows()
{
    static std::vector<Row> all;
    return all;
}

/// Names are those that the run prints. A goal of 0 means that the ratio is only told.
inline bool compare(const std::string& what, const std::string& subject, const std::string& floor,
                    double goal = 0.0)
{
    rows().push_back({what, subject, floor, goal});
    return true;
}

/// Keeps the shortest time of every benchmark, in nanoseconds an iteration: of processor time, or of what a
/// benchmark that keeps its own time set.
class Reporter : public benchmark::ConsoleReporter
{
public:
    Reporter() : ConsoleReporter(OO_None) {}

    void ReportRuns(const std::vector<Run>& runs) override
    {
        std::vector<Run> medians;
        for (const Run& run : runs) {
            if (run.run_type == Run::RT_Iteration && !run.error_occurred) {
                keepShortest(run);
            } else if (run.error_occurred || run.aggregate_name == "median") {
                medians.push_back(run);
            }
        }
        ConsoleReporter::ReportRuns(medians);
    }

    void printRatios() const
    {
        std::printf("\n%-58s %12s %12s %8s %8s\n", "", "subject ns", "floor ns", "ratio", "goal");
        for (const Row& row : rows()) {
            const auto subject = m_times.find(row.subject);
            const auto floor = m_times.find(row.floor);
            if (subject == m_times.end() || floor == m_times.end()) {
                std::printf("%-58s not measured\n", row.what.c_str());
                continue;
            }
            print(row, subject->second, floor->second);
        }
    }

private:
    void keepShortest(const Run& run)
    {
        const bool ownClock = run.run_name.time_type == "manual_time";
        const double accumulated = ownClock ? run.real_accumulated_time : run.cpu_accumulated_time;
        const double time = accumulated * 1e9 / double(run.iterations);
        const auto known = m_times.emplace(run.run_name.str(), time).first;
        known->second = std::min(known->second, time);
    }

    static void print(const Row& row, double subject, double floor)
    {
        const double ratio = subject / floor;
        std::printf("%-58s %12.2f %12.2f %8.3f", row.what.c_str(), subject, floor, ratio);
        if (row.goal > 0) {
            std::printf(" %8.3g  %s", row.goal, ratio <= row.goal ? "met" : "MISSED");
        }
        std::printf("\n");
    }

    std::map<std::string, double> m_times;
};

/// Arguments of the command line override the defaults that stand here.
inline int run(int argc, char** argv)
{
    std::vector<std::string> texts{argv[0], "--benchmark_repetitions=7", "--benchmark_min_time=0.05",
                                   "--benchmark_enable_random_interleaving=true"};
    texts.insert(texts.end(), argv + 1, argv + argc);
    std::vector<char*> arguments;
    for (std::string& text : texts) {
        arguments.push_back(text.data());
    }
    int count = int(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data())) {
        return 1;
    }
    Reporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    reporter.printRatios();
    return 0;
}

} // namespace Ratios
