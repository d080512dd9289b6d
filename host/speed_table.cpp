#include <algorithm>
#include <chrono>
#include <string>

#include "host/commands.h"
#include "host/routine_list.h"

namespace host {

double BestSeconds(const std::function<void()> &fn, double budget) {
    using Clock = std::chrono::steady_clock;
    fn();  // warm caches and the worker pool
    double best = 1e30, spent = 0;
    int runs = 0;
    while ((spent < budget || runs < 3) && runs < 100000) {
        const auto t0 = Clock::now();
        fn();
        const double s = std::chrono::duration<double>(Clock::now() - t0).count();
        best = std::min(best, s);
        spent += s;
        ++runs;
    }
    return best;
}

void SpeedTable(const Plugin &plugin, std::FILE *out, bool quick) {
    struct Size {
        int rows, columns;
    };
    const std::vector<Size> sizes = quick ? std::vector<Size>{{1, 1}, {64, 64}, {256, 256}}
                                          : std::vector<Size>{{1, 1}, {64, 64}, {1024, 1024}, {4096, 4096}};
    const double budget = quick ? 0.01 : 0.25;
    std::fprintf(out, "%-20s %-10s %12s %12s %12s %8s %8s %9s %9s\n", "routine", "shape",
                 "host us", "sse41 us", "avx2 us", "x sse41", "x avx2", "avx2 GB/s", "of mem");
    for (const RoutineInfo &r : BuiltRoutines()) {
        void *sse41 = plugin.routine("sse41", r.name), *avx2 = plugin.routine("avx2", r.name);
        if (sse41 == nullptr || avx2 == nullptr) continue;
        for (const Size &s : sizes) {
            Workload host = r.workload(r.reference, s.rows, s.columns);
            Workload w1 = r.workload(sse41, s.rows, s.columns);
            Workload w2 = r.workload(avx2, s.rows, s.columns);
            Workload mem = BandwidthBaseline(w2);
            const double th = BestSeconds(host.run, budget), t1 = BestSeconds(w1.run, budget);
            const double t2 = BestSeconds(w2.run, budget), tm = BestSeconds(mem.run, budget);
            const double gbs = w2.bytesMoved / t2 / 1e9;
            const std::string shape = std::to_string(s.rows) + "x" + std::to_string(s.columns);
            std::fprintf(out, "%-20s %-10s %12.2f %12.2f %12.2f %8.1f %8.1f %9.2f %8.0f%%\n", r.name,
                         shape.c_str(), th * 1e6, t1 * 1e6, t2 * 1e6, th / t1, th / t2, gbs,
                         100.0 * tm / t2);
        }
    }
    std::fprintf(out, "(\"of mem\": AVX2 bandwidth as a share of %s on the same bytes)\n",
                 "memcpy, or memset for fills");
}

}  // namespace host
