// Runs every registered case through Google Benchmark and prints the ratio
// table. With --pvx_markdown=FILE the table is also written as markdown.
//
// With --pvx_rounds=N the cases that --benchmark_filter selects are timed
// interleaved instead: N rounds, each running pvx, the peer and memref in
// turn (the first of them rotating from round to round) for a batch of about
// 20 ms of back-to-back calls, the first call of a batch untimed to warm the
// caches. The table then holds the median over the rounds of the time per
// call. On a shared machine the load changes from second to second; batches
// interleaved this closely see the same load, so their ratio holds steady
// from run to run where the ratio of separately timed runs does not. Two
// more columns give the ratios of the fastest batches: what each side reaches
// when the machine is quiet, where a median also counts the rounds that other
// tenants disturbed (a kernel that reads and writes the cache can suffer from
// them more than a plain copy does).
#include <opencv2/core.hpp>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <map>
#include <memory>
#include <regex>
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

// Median over the rounds of the microseconds per call of a batch.
std::map<std::string, double> Interleaved(const std::regex& filter, int rounds)
{
    std::map<std::string, double> times;
    for (const Case& c : Cases()) {
        if (!std::regex_search(c.name, filter)) continue;
        const std::pair<const char*, const std::function<void()>*> all[] = {
            {"pvx", &c.pvx}, {"peer", &c.peer}, {"memref", &c.memref}};
        std::vector<std::pair<const char*, const std::function<void()>*>> fns;
        for (const auto& f : all)
            if (*f.second) fns.push_back(f);
        using Clock = std::chrono::steady_clock;
        auto since = [](Clock::time_point t0) {
            return std::chrono::duration<double, std::micro>(Clock::now() - t0).count();
        };
        std::vector<int> batch(fns.size());
        for (std::size_t i = 0; i < fns.size(); ++i) {
            (*fns[i].second)();
            auto t0 = Clock::now();
            (*fns[i].second)();
            batch[i] = std::max(1, static_cast<int>(20000.0 / std::max(since(t0), 1.0)));
        }
        std::vector<std::vector<double>> us(fns.size());
        for (int r = 0; r < rounds; ++r)
            for (std::size_t k = 0; k < fns.size(); ++k) {
                std::size_t i = (k + static_cast<std::size_t>(r)) % fns.size();
                const std::function<void()>& fn = *fns[i].second;
                fn();
                auto t0 = Clock::now();
                for (int j = 0; j < batch[i]; ++j) fn();
                us[i].push_back(since(t0) / batch[i]);
            }
        for (std::size_t i = 0; i < fns.size(); ++i) {
            std::sort(us[i].begin(), us[i].end());
            times[c.name + "/" + fns[i].first] = us[i][us[i].size() / 2];
            times[c.name + "/" + fns[i].first + "/best"] = us[i].front();
        }
        std::fprintf(stderr, "timed %s\n", c.name.c_str());
    }
    return times;
}

}  // namespace

void Register(Case c)
{
    Cases().push_back(std::move(c));
}

}  // namespace pvxbench

int main(int argc, char** argv)
{
    using namespace pvxbench;
    std::string markdown, filter = ".";
    int rounds = 0;
    std::vector<char*> args;
    for (int i = 0; i < argc; ++i) {
        if (std::strncmp(argv[i], "--pvx_markdown=", 15) == 0) markdown = argv[i] + 15;
        else if (std::strncmp(argv[i], "--pvx_rounds=", 13) == 0) rounds = std::atoi(argv[i] + 13);
        else args.push_back(argv[i]);
        if (std::strncmp(argv[i], "--benchmark_filter=", 19) == 0) filter = argv[i] + 19;
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
    if (rounds > 0) reporter.times = Interleaved(std::regex(filter), rounds);
    else benchmark::RunSpecifiedBenchmarks(&reporter);

    std::string table = "| case | pvx us | peer us | peer/pvx | memref/pvx |";
    table += rounds > 0 ? " best peer/pvx | best memref/pvx |\n|---|---:|---:|---:|---:|---:|---:|\n"
                        : "\n|---|---:|---:|---:|---:|\n";
    auto ratio = [](double num, double den) {
        char r[32] = "-";
        if (num > 0 && den > 0) std::snprintf(r, sizeof r, "%.2fx", num / den);
        return std::string(r);
    };
    for (const Case& c : Cases()) {
        auto get = [&](const std::string& v) {
            auto it = reporter.times.find(c.name + "/" + v);
            return it == reporter.times.end() ? -1.0 : it->second;
        };
        double p = get("pvx"), q = get("peer"), m = get("memref");
        if (p <= 0) continue;
        char row[512], peer[32] = "-";
        if (q > 0) std::snprintf(peer, sizeof peer, "%.1f", q);
        std::snprintf(row, sizeof row, "| %s | %.1f | %s | %s | %s |", c.name.c_str(), p, peer, ratio(q, p).c_str(),
                      ratio(m, p).c_str());
        table += row;
        if (rounds > 0) {
            double pb = get("pvx/best");
            table += " " + ratio(get("peer/best"), pb) + " | " + ratio(get("memref/best"), pb) + " |";
        }
        table += "\n";
    }
    std::printf("\n%s", table.c_str());
    if (!markdown.empty()) std::ofstream(markdown) << table;
    benchmark::Shutdown();
    return disagree ? 1 : 0;
}
