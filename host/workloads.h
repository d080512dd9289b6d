// Benchmark workloads: for a routine of a given signature, buffers of a given
// size filled with random data and a call that runs the routine on them.
#pragma once

#include <cstdint>
#include <cstring>
#include <functional>
#include <memory>
#include <random>
#include <type_traits>
#include <vector>

#include "adapters/signatures.h"

namespace host {

struct Workload {
    std::function<void()> run;  // one call of the routine
    double bytesMoved = 0;      // bytes read plus bytes written by one call
    bool writeOnly = false;     // a fill: compare against memset, not memcpy
    std::vector<std::shared_ptr<std::vector<uint8_t>>> storage;
};

namespace detail {

inline std::shared_ptr<std::vector<uint8_t>> RandomBytes(size_t n) {
    auto v = std::make_shared<std::vector<uint8_t>>(n);
    std::mt19937 rng(7);
    for (auto &b : *v) b = uint8_t(rng());
    return v;
}

template <typename T>
T *Data(const std::shared_ptr<std::vector<uint8_t>> &v) {
    return reinterpret_cast<T *>(v->data());
}

// `count` samples of the depth's domain: any byte for 8-bit, 0..32768 for
// 16-bit, 0..0.999 for float.
template <typename T>
std::shared_ptr<std::vector<uint8_t>> Samples(size_t count) {
    if constexpr (std::is_same_v<T, uint8_t>) {
        return RandomBytes(count);
    } else {
        auto v = std::make_shared<std::vector<uint8_t>>(count * sizeof(T));
        T *p = reinterpret_cast<T *>(v->data());
        for (size_t i = 0; i < count; ++i) {
            if constexpr (std::is_same_v<T, float>) p[i] = float(i % 1000) / 1000.f;
            else p[i] = T(i * 2654435761u % 32769u);
        }
        return v;
    }
}

}  // namespace detail

template <typename Sig>
struct WorkloadFor;

template <typename P, typename V>
struct WorkloadFor<void(P *, int, V)> {
    static Workload make(void (*fn)(P *, int, V), int rows, int columns) {
        const int count = rows * columns;
        Workload w;
        auto dst = detail::RandomBytes(size_t(count) * sizeof(V));
        w.storage = {dst};
        w.run = [fn, dst, count] { fn(detail::Data<V>(dst), count, V(0x5A)); };
        w.bytesMoved = double(count) * sizeof(V);
        w.writeOnly = true;
        return w;
    }
};

template <typename T>
struct WorkloadFor<void(const T *, T *, int)> {
    static Workload make(void (*fn)(const T *, T *, int), int rows, int columns) {
        const int count = rows * columns;
        Workload w;
        auto src = detail::RandomBytes(size_t(count) * sizeof(T));
        auto dst = detail::RandomBytes(size_t(count) * sizeof(T));
        w.storage = {src, dst};
        w.run = [fn, src, dst, count] { fn(detail::Data<T>(src), detail::Data<T>(dst), count); };
        w.bytesMoved = 2.0 * count * sizeof(T);
        return w;
    }
};

template <typename T>
struct WorkloadFor<void(T *, int, int, int, T)> {
    static Workload make(void (*fn)(T *, int, int, int, T), int rows, int columns) {
        Workload w;
        const int rowBytes = columns * int(sizeof(T));
        auto dst = detail::RandomBytes(size_t(rows) * rowBytes);
        w.storage = {dst};
        w.run = [=] { fn(detail::Data<T>(dst), rows, columns, rowBytes, T(0x5A)); };
        w.bytesMoved = double(rows) * rowBytes;
        w.writeOnly = true;
        return w;
    }
};

template <typename S, typename D>
struct WorkloadFor<void(const S *, D *, int, int, int, int)> {
    static Workload make(void (*fn)(const S *, D *, int, int, int, int), int rows, int columns) {
        Workload w;
        const int srb = columns * int(sizeof(S)), drb = columns * int(sizeof(D));
        auto src = detail::RandomBytes(size_t(rows) * srb);
        auto dst = detail::RandomBytes(size_t(rows) * drb);
        w.storage = {src, dst};
        w.run = [=] { fn(detail::Data<S>(src), detail::Data<D>(dst), rows, columns, srb, drb); };
        w.bytesMoved = double(rows) * (srb + drb);
        return w;
    }
};

// Stepped moves are timed on packed rows (both steps 1).
template <typename T>
struct WorkloadFor<void(const T *, T *, int, int, int, int, int, int)> {
    static Workload make(void (*fn)(const T *, T *, int, int, int, int, int, int), int rows,
                         int columns) {
        Workload w;
        auto src = detail::RandomBytes(size_t(rows) * columns * sizeof(T));
        auto dst = detail::RandomBytes(size_t(rows) * columns * sizeof(T));
        w.storage = {src, dst};
        w.run = [=] {
            fn(detail::Data<T>(src), detail::Data<T>(dst), rows, columns, columns, columns, 1, 1);
        };
        w.bytesMoved = 2.0 * rows * columns * sizeof(T);
        return w;
    }
};

// The memory-bandwidth yardstick for a workload: memcpy (or memset, for a
// fill) over the same number of bytes.
Workload BandwidthBaseline(const Workload &w);

// Builds the workload of the routine `fn` (of signature Sig).
template <typename Sig>
Workload MakeWorkload(void *fn, int rows, int columns) {
    return WorkloadFor<Sig>::make(reinterpret_cast<Sig *>(fn), rows, columns);
}

}  // namespace host

namespace host {

template <typename T>
struct WorkloadFor<void(const T *, T *, const T *, int, int, int, int, int)> {
    static Workload make(void (*fn)(const T *, T *, const T *, int, int, int, int, int), int rows,
                         int columns) {
        Workload w;
        const int rb = columns * int(sizeof(T));
        const size_t n = size_t(rows) * columns;
        auto src = detail::Samples<T>(n), dst = detail::Samples<T>(n), mask = detail::Samples<T>(n);
        w.storage = {src, dst, mask};
        w.run = [=] {
            fn(detail::Data<T>(src), detail::Data<T>(dst), detail::Data<T>(mask), rows, columns, rb, rb, rb);
        };
        w.bytesMoved = 4.0 * rows * rb;  // three read, one written
        return w;
    }
};

template <>
struct WorkloadFor<void(short, uint8_t *, const uint8_t *, int, int, int, int)> {
    static Workload make(void (*fn)(short, uint8_t *, const uint8_t *, int, int, int, int), int rows,
                         int columns) {
        Workload w;
        auto dst = detail::RandomBytes(size_t(rows) * columns), mask = detail::RandomBytes(size_t(rows) * columns);
        w.storage = {dst, mask};
        w.run = [=] { fn(short(0x1A7), dst->data(), mask->data(), rows, columns, columns, columns); };
        w.bytesMoved = 3.0 * rows * columns;
        return w;
    }
};

}  // namespace host

#include "host/conversion_workloads.h"
