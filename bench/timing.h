// Wall-clock time of one call, for benchmarks that time several routines
// interleaved in one loop.
#pragma once

#include <chrono>
#include <functional>

namespace bench {

inline double Seconds(const std::function<void()> &fn) {
    const auto t0 = std::chrono::steady_clock::now();
    fn();
    return std::chrono::duration<double>(std::chrono::steady_clock::now() - t0).count();
}

}  // namespace bench
