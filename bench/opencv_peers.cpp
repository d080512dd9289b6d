// The conversions against OpenCV's nearest equivalents, timed interleaved in
// one run on the same sizes:
//   Gray8toGray16         convertTo(CV_16U, 32768 / 255)
//   Gray16toGray8         convertTo(CV_8U, 255 / 32768)     (ours dithers)
//   Gray32toGray8         convertTo(CV_8U, 255)             (ours dithers)
//   RGB48toRGB24          three such convertTo calls        (ours dithers)
//   ScaledGray16toGray16  convertTo(CV_16U, 32768 / 65535), in place
//   Interleave4to4        merge of four planes into CV_8UC4
// Counter x_opencv: OpenCV's time over the AVX2 routine's (above 1: ours is faster).
#include "bench/opencv_peers.h"

#include <benchmark/benchmark.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

#include <opencv2/core.hpp>

#include "bench/timing.h"
#include "host/routine_list.h"

namespace {

using bench::Seconds;

using PeerMaker = std::function<std::function<void()>(int rows, int columns)>;

std::function<void()> Convert(int rows, int columns, int from, int to, double scale, int planes) {
    auto src = std::make_shared<std::vector<cv::Mat>>();
    auto dst = std::make_shared<std::vector<cv::Mat>>();
    for (int i = 0; i < planes; ++i) {
        src->emplace_back(rows, columns, from);
        cv::randu(src->back(), 0, from == CV_32F ? 1 : 256);
        dst->emplace_back(rows, columns, to);
    }
    return [=] {
        for (int i = 0; i < planes; ++i) (*src)[i].convertTo((*dst)[i], to, scale);
    };
}

const std::map<std::string, PeerMaker> &Peers() {
    static const std::map<std::string, PeerMaker> peers = {
        {"Gray8toGray16", [](int r, int c) { return Convert(r, c, CV_8U, CV_16U, 32768.0 / 255.0, 1); }},
        {"Gray16toGray8", [](int r, int c) { return Convert(r, c, CV_16U, CV_8U, 255.0 / 32768.0, 1); }},
        {"Gray32toGray8", [](int r, int c) { return Convert(r, c, CV_32F, CV_8U, 255.0, 1); }},
        {"RGB48toRGB24", [](int r, int c) { return Convert(r, c, CV_16U, CV_8U, 255.0 / 32768.0, 3); }},
        {"ScaledGray16toGray16",
         [](int r, int c) {
             auto m = std::make_shared<cv::Mat>(r, c, CV_16U);
             cv::randu(*m, 0, 65536);
             return std::function<void()>([m] { m->convertTo(*m, CV_16U, 32768.0 / 65535.0); });
         }},
        {"Interleave4to4",
         [](int r, int c) {
             auto planes = std::make_shared<std::vector<cv::Mat>>();
             for (int i = 0; i < 4; ++i) {
                 planes->emplace_back(r, c, CV_8U);
                 cv::randu(planes->back(), 0, 256);
             }
             auto out = std::make_shared<cv::Mat>(r, c, CV_8UC4);
             return std::function<void()>([=] { cv::merge(*planes, *out); });
         }},
    };
    return peers;
}

void RunPeer(benchmark::State &state, const host::RoutineInfo *r, void *avx2, const PeerMaker *peer) {
    const int rows = int(state.range(0)), columns = int(state.range(1));
    host::Workload ours = r->workload(avx2, rows, columns);
    std::function<void()> theirs = (*peer)(rows, columns);
    double to = 0, tc = 0;
    for (auto _ : state) {
        const double s = Seconds(ours.run);
        to += s;
        tc += Seconds(theirs);
        state.SetIterationTime(s);
    }
    state.counters["x_opencv"] = tc / to;
}

}  // namespace

void RegisterOpenCvPeers(const host::Plugin &plugin) {
    for (const host::RoutineInfo &r : host::BuiltRoutines()) {
        auto it = Peers().find(r.name);
        void *avx2 = plugin.routine("avx2", r.name);
        if (it == Peers().end() || avx2 == nullptr) continue;
        benchmark::RegisterBenchmark((std::string("OpenCV/") + r.name).c_str(), RunPeer, &r, avx2, &it->second)
            ->Args({64, 64})
            ->Args({1024, 1024})
            ->Args({4096, 4096})
            ->UseManualTime()
            ->Unit(benchmark::kMicrosecond);
    }
}
