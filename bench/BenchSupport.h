// Benchmark support: rows, their baselines and the ratio table.
//
// Every benchmark of zel is measured next to a baseline from the same run:
// the floor (the least work that gives the same effect, e.g. calling the
// handler straight from a vector) or a peer (a plain alternative way to do
// the same job). A program registers its rows with row(), pairs each measured
// row with its baseline with compare(), and hands control to runMain(), which
// runs the rows with Google Benchmark's console output and then prints one
// table:
//
//     feature                        ns/item   baseline                 ns/item   ratio
//     delivery/GetNodeRes/.../1000      9.1   delivery/.../floor/1000      6.3   1.44x floor
//
// A comparison may carry a target, the largest ratio that is acceptable
// (target()); its line then ends in PASS or FAIL, and a last line per program
// counts them ("targets met: N of M"), and scripts/bench.sh lists them all.
// A target compares time per item by default, or whole iterations (a growth
// target, such as "ten times the settings cost at most twelve times the
// time"), and may measure the feature against a peer the other way round
// (peer / feature >= 1 is feature / peer <= 1).
//
// Times are CPU time per item (single-threaded rows; CPU time is less
// disturbed than wall time when the machine is shared). With
// --benchmark_repetitions=N the table uses the median of the repetitions.
// Rows are short by default (--benchmark_min_time=0.2 unless given).
// There is no timed assertion anywhere: the numbers are for reading.
#ifndef ZEL_BENCH_BENCHSUPPORT_H
#define ZEL_BENCH_BENCHSUPPORT_H

#include <benchmark/benchmark.h>

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <unistd.h>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace zelbench {

struct Comparison
{
    std::string feature;
    std::string baseline;
    std::string kind;      // "floor", "peer" or "growth"
    double maxRatio = 0;   // 0: no target
    bool perItem = true;   // ratio of times per item, or per iteration
    std::string target;    // the target's name in the summary
};

// True for a smoke run (scripts/bench.sh --smoke, ZEL_BENCH_SMOKE=1): rows use
// small sizes, so that every program is seen to build and run in seconds.
inline bool smoke()
{
    const char* value = std::getenv("ZEL_BENCH_SMOKE");
    return value && *value && std::string(value) != "0";
}

// n normally, small in a smoke run.
inline int size(int n, int smokeSize)
{
    return smoke() ? smokeSize : n;
}

inline std::map<std::string, double>& itemsPerIteration()
{
    static std::map<std::string, double> items;
    return items;
}

inline std::vector<Comparison>& comparisons()
{
    static std::vector<Comparison> list;
    return list;
}

// Registers one row. items is how many operations (deliveries, calls,
// settings, ...) one iteration performs: the table shows time per item and
// Google Benchmark an items/s rate.
template <class Fn>
benchmark::internal::Benchmark* row(const std::string& name, double items, Fn fn)
{
    itemsPerIteration()[name] = items;
    return benchmark::RegisterBenchmark(name.c_str(), [fn, items](benchmark::State& state) mutable {
        fn(state);
        state.SetItemsProcessed(static_cast<int64_t>(static_cast<double>(state.iterations()) * items));
    });
}

// Pairs a measured row with its baseline row; kind is "floor" or "peer".
inline void compare(const std::string& feature, const std::string& baseline, const char* kind)
{
    comparisons().push_back(Comparison{feature, baseline, kind, 0, true, std::string()});
}

// The same with a target: the ratio (time per item, or per iteration when
// perItem is false) may be at most maxRatio. name labels it in the summary.
inline void target(const std::string& name, const std::string& feature, const std::string& baseline, const char* kind,
                   double maxRatio, bool perItem = true)
{
    comparisons().push_back(Comparison{feature, baseline, kind, maxRatio, perItem, name});
}

// Console output as usual, and the CPU time per iteration of every row kept
// for the table (all repetitions; the median is used).
class CollectingReporter : public benchmark::ConsoleReporter
{
public:
    explicit CollectingReporter(OutputOptions options)
        : ConsoleReporter(options)
    {
    }

    void ReportRuns(const std::vector<Run>& runs) override
    {
        for (const Run& run : runs) {
            if (run.error_occurred || run.iterations <= 0)
                continue;
            const double seconds = run.GetAdjustedCPUTime() / benchmark::GetTimeUnitMultiplier(run.time_unit);
            const std::string& name = run.run_name.function_name;
            if (run.run_type == Run::RT_Iteration)
                mSamples[name].push_back(seconds);
            else if (run.aggregate_name == "median")
                mMedians[name] = seconds;
        }
        ConsoleReporter::ReportRuns(runs);
    }

    // Seconds per iteration, or a negative value when the row did not run.
    double secondsPerIteration(const std::string& name) const
    {
        const auto median = mMedians.find(name);
        if (median != mMedians.end())
            return median->second;
        const auto samples = mSamples.find(name);
        if (samples == mSamples.end() || samples->second.empty())
            return -1.0;
        std::vector<double> sorted = samples->second;
        std::sort(sorted.begin(), sorted.end());
        const std::size_t middle = sorted.size() / 2;
        return sorted.size() % 2 ? sorted[middle] : (sorted[middle - 1] + sorted[middle]) / 2;
    }

private:
    std::map<std::string, std::vector<double>> mSamples;
    std::map<std::string, double> mMedians;
};

inline std::string formatTime(double nanoseconds)
{
    char text[32];
    if (nanoseconds >= 1e6)
        std::snprintf(text, sizeof text, "%.2f ms", nanoseconds / 1e6);
    else if (nanoseconds >= 1e4)
        std::snprintf(text, sizeof text, "%.1f us", nanoseconds / 1e3);
    else
        std::snprintf(text, sizeof text, "%.1f ns", nanoseconds);
    return text;
}

inline void printTable(const char* title, const CollectingReporter& reporter)
{
    std::size_t featureWidth = 7;
    std::size_t baselineWidth = 8;
    for (const Comparison& comparison : comparisons()) {
        featureWidth = std::max(featureWidth, comparison.feature.size());
        baselineWidth = std::max(baselineWidth, comparison.baseline.size());
    }
    std::printf("\n== %s: CPU time per item (per iteration for growth); ratio = feature / baseline\n", title);
    std::printf("%-*s %12s   %-*s %12s %9s\n", static_cast<int>(featureWidth), "feature", "time",
                static_cast<int>(baselineWidth), "baseline", "time", "ratio");
    int printed = 0;
    int passed = 0;
    int failed = 0;
    for (const Comparison& comparison : comparisons()) {
        const double feature = reporter.secondsPerIteration(comparison.feature);
        const double baseline = reporter.secondsPerIteration(comparison.baseline);
        if (feature < 0 || baseline <= 0)
            continue; // filtered out
        // Per item, so rows may run different batch sizes; per iteration for
        // growth targets, which compare whole jobs of different sizes.
        const double featureItems = comparison.perItem ? itemsPerIteration()[comparison.feature] : 1.0;
        const double baselineItems = comparison.perItem ? itemsPerIteration()[comparison.baseline] : 1.0;
        const double featureTime = feature * 1e9 / featureItems;
        const double baselineTime = baseline * 1e9 / baselineItems;
        const double ratio = featureTime / baselineTime;
        std::string verdict;
        if (comparison.maxRatio > 0 && smoke()) {
            // Small sizes say nothing about the targets, which are set for
            // the full ones.
            char text[160];
            std::snprintf(text, sizeof text, "  target <= %.2fx: not judged at smoke sizes (%s)", comparison.maxRatio,
                          comparison.target.c_str());
            verdict = text;
        } else if (comparison.maxRatio > 0) {
            const bool pass = ratio <= comparison.maxRatio;
            char text[160];
            std::snprintf(text, sizeof text, "  target <= %.2fx: %s (%s)", comparison.maxRatio, pass ? "PASS" : "FAIL",
                          comparison.target.c_str());
            verdict = text;
            ++(pass ? passed : failed);
        }
        std::printf("%-*s %12s   %-*s %12s %8.2fx %s%s\n", static_cast<int>(featureWidth),
                    comparison.feature.c_str(), formatTime(featureTime).c_str(), static_cast<int>(baselineWidth),
                    comparison.baseline.c_str(), formatTime(baselineTime).c_str(), ratio, comparison.kind.c_str(),
                    verdict.c_str());
        ++printed;
    }
    if (printed == 0)
        std::printf("(no pair of rows ran)\n");
    if (passed + failed > 0)
        std::printf("targets met: %d of %d\n", passed, passed + failed);
    std::fflush(stdout);
}

// Runs the registered rows and prints the ratio table; the body of main().
inline int runMain(int argc, char** argv, const char* title)
{
    std::vector<char*> args(argv, argv + argc);
    bool minTimeGiven = false;
    // A reporter given to RunSpecifiedBenchmarks chooses its own colours:
    // colour for a terminal unless --benchmark_color says otherwise.
    int color = isatty(fileno(stdout)) ? 1 : 0;
    for (int i = 1; i < argc; ++i) {
        const std::string arg = argv[i];
        if (arg.compare(0, 20, "--benchmark_min_time") == 0)
            minTimeGiven = true;
        if (arg == "--benchmark_color=false" || arg == "--benchmark_color=no" || arg == "--benchmark_color=0")
            color = 0;
        if (arg == "--benchmark_color=true" || arg == "--benchmark_color=yes" || arg == "--benchmark_color=1")
            color = 1;
    }
    static char defaultMinTime[] = "--benchmark_min_time=0.2";
    if (!minTimeGiven)
        args.insert(args.begin() + 1, defaultMinTime);
    int count = static_cast<int>(args.size());
    args.push_back(nullptr);

    benchmark::Initialize(&count, args.data());
    if (benchmark::ReportUnrecognizedArguments(count, args.data()))
        return 1;
    CollectingReporter reporter(color ? benchmark::ConsoleReporter::OO_Color
                                      : benchmark::ConsoleReporter::OO_None);
    benchmark::RunSpecifiedBenchmarks(&reporter);
    printTable(title, reporter);
    benchmark::Shutdown();
    return 0;
}

} // namespace zelbench

#endif
