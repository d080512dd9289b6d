// Google Benchmark target.  Each benchmark times, interleaved in one run, the
// host's scalar routine, both plug-in sets and memcpy (memset for fills) on
// the same bytes, and reports the ratios as counters:
//   x_sse41, x_avx2   speed-up over the host's routine
//   mem_avx2          AVX2 bandwidth as a fraction of memcpy/memset
// The reported time is the AVX2 routine's.  Sizes: 1x1 (per-call cost),
// 64x64, 1024x1024, 4096x4096.  Conversions are also timed against OpenCV
// (OpenCV/<routine>, counter x_opencv) when it is installed.
#include <benchmark/benchmark.h>

#include <string>

#include "bench/timing.h"
#include "frame/entry.h"
#include "host/host_record.h"
#include "host/plugin.h"
#include "host/routine_list.h"
#ifdef HALIDEQK_HAVE_OPENCV
#include "bench/opencv_peers.h"
#endif

namespace {

using bench::Seconds;

void RunRoutine(benchmark::State &state, const host::RoutineInfo *r, void *sse41, void *avx2) {
    const int rows = int(state.range(0)), columns = int(state.range(1));
    host::Workload w0 = r->workload(r->reference, rows, columns);
    host::Workload w1 = r->workload(sse41, rows, columns);
    host::Workload w2 = r->workload(avx2, rows, columns);
    host::Workload mem = host::BandwidthBaseline(w2);
    double t0 = 0, t1 = 0, t2 = 0, tm = 0;
    for (auto _ : state) {
        t0 += Seconds(w0.run);
        t1 += Seconds(w1.run);
        const double s = Seconds(w2.run);
        t2 += s;
        tm += Seconds(mem.run);
        state.SetIterationTime(s);
    }
    state.counters["x_sse41"] = t0 / t1;
    state.counters["x_avx2"] = t0 / t2;
    state.counters["mem_avx2"] = tm / t2;
    state.SetBytesProcessed(int64_t(state.iterations() * w2.bytesMoved));
}

}  // namespace

int main(int argc, char **argv) {
    static host::Plugin plugin(host::DefaultPluginPath());
    static host::HostRecord record;
    int16_t result = 1;
    plugin.pluginMain(kSelectorStartup, record.record(), &result);
    if (result != kResultOK) return 1;
    record.announceNoise();

    for (const host::RoutineInfo &r : host::BuiltRoutines()) {
        void *sse41 = plugin.routine("sse41", r.name), *avx2 = plugin.routine("avx2", r.name);
        if (sse41 == nullptr || avx2 == nullptr) continue;
        benchmark::RegisterBenchmark(r.name, RunRoutine, &r, sse41, avx2)
            ->Args({1, 1})
            ->Args({64, 64})
            ->Args({1024, 1024})
            ->Args({4096, 4096})
            ->UseManualTime()
            ->Unit(benchmark::kMicrosecond);
    }
#ifdef HALIDEQK_HAVE_OPENCV
    RegisterOpenCvPeers(plugin);
#endif
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
