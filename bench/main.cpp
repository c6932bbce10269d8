// Runs every registered case through Google Benchmark and prints the ratio
// table. With --pvx_markdown=FILE the table is also written as markdown.
#include <opencv2/core.hpp>

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "bench.h"

namespace pvxbench {
namespace {

std::vector<Case>& Cases()
{
    static std::vector<Case> cases;
    return cases;
}

// Collects the real time per iteration of each run as "case/variant"; with
// --benchmark_repetitions the best repetition counts, the figure least
// disturbed by other work on a shared machine.
class RatioReporter : public benchmark::ConsoleReporter {
public:
    void ReportRuns(const std::vector<Run>& runs) override
    {
        ConsoleReporter::ReportRuns(runs);
        for (const Run& r : runs) {
            if (r.error_occurred || r.run_type != Run::RT_Iteration) continue;
            double t = r.GetAdjustedRealTime();
            auto [it, fresh] = times.emplace(r.run_name.function_name, t);
            if (!fresh && t < it->second) it->second = t;
        }
    }
    std::map<std::string, double> times;
};

}  // namespace

void Register(Case c)
{
    Cases().push_back(std::move(c));
}

}  // namespace pvxbench

int main(int argc, char** argv)
{
    using namespace pvxbench;
    std::string markdown;
    std::vector<char*> args;
    for (int i = 0; i < argc; ++i) {
        if (std::strncmp(argv[i], "--pvx_markdown=", 15) == 0) markdown = argv[i] + 15;
        else args.push_back(argv[i]);
    }
    int n = static_cast<int>(args.size());
    cv::setNumThreads(1);
    benchmark::Initialize(&n, args.data());

    int disagree = 0;
    for (Case& c : Cases()) {
        if (c.agree && !c.agree()) {
            std::fprintf(stderr, "pvx and the peer disagree on %s\n", c.name.c_str());
            ++disagree;
        }
        auto add = [&](const char* variant, const std::function<void()>& fn) {
            if (!fn) return;
            benchmark::RegisterBenchmark((c.name + "/" + variant).c_str(), [fn, bytes = c.bytes](benchmark::State& st) {
                for (auto _ : st) fn();
                st.SetBytesProcessed(st.iterations() * bytes);
            })->Unit(benchmark::kMicrosecond)->UseRealTime();
        };
        add("pvx", c.pvx);
        add("peer", c.peer);
        add("memref", c.memref);
    }

    RatioReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter);

    std::string table = "| case | pvx us | peer us | peer/pvx | memref/pvx |\n|---|---:|---:|---:|---:|\n";
    for (const Case& c : Cases()) {
        auto get = [&](const char* v) {
            auto it = reporter.times.find(c.name + "/" + v);
            return it == reporter.times.end() ? -1.0 : it->second;
        };
        double p = get("pvx"), q = get("peer"), m = get("memref");
        if (p <= 0) continue;
        char peer[32] = "-", ratio[32] = "-", mem[32] = "-";
        if (q > 0) std::snprintf(peer, sizeof peer, "%.1f", q);
        if (q > 0) std::snprintf(ratio, sizeof ratio, "%.2fx", q / p);
        if (m > 0) std::snprintf(mem, sizeof mem, "%.2fx", m / p);
        char row[512];
        std::snprintf(row, sizeof row, "| %s | %.1f | %s | %s | %s |\n", c.name.c_str(), p, peer, ratio, mem);
        table += row;
    }
    std::printf("\n%s", table.c_str());
    if (!markdown.empty()) std::ofstream(markdown) << table;
    benchmark::Shutdown();
    return disagree ? 1 : 0;
}
