// Benchmark workloads of the depth and layout conversions: packed rows,
// samples inside each depth's scale, dithering on.
#pragma once

#include "host/workloads.h"

namespace host {

template <typename S>
struct WorkloadFor<void(const S *, uint8_t *, int, int, int, int, uint8_t)> {
    static Workload make(void (*fn)(const S *, uint8_t *, int, int, int, int, uint8_t), int rows,
                         int columns) {
        Workload w;
        const int srb = columns * int(sizeof(S));
        auto src = detail::Samples<S>(size_t(rows) * columns);
        auto dst = detail::RandomBytes(size_t(rows) * columns);
        w.storage = {src, dst};
        w.run = [=] { fn(detail::Data<S>(src), dst->data(), rows, columns, srb, columns, 1); };
        w.bytesMoved = double(rows) * (srb + columns);
        return w;
    }
};

template <>
struct WorkloadFor<halideqk::sig::RGB48toRGB24> {
    static Workload make(halideqk::sig::RGB48toRGB24 *fn, int rows, int columns) {
        Workload w;
        const size_t n = size_t(rows) * columns;
        auto r = detail::Samples<uint16_t>(n), g = detail::Samples<uint16_t>(n),
             b = detail::Samples<uint16_t>(n);
        auto ro = detail::RandomBytes(n), go = detail::RandomBytes(n), bo = detail::RandomBytes(n);
        w.storage = {r, g, b, ro, go, bo};
        w.run = [=] {
            fn(detail::Data<uint16_t>(r), detail::Data<uint16_t>(g), detail::Data<uint16_t>(b), ro->data(),
               go->data(), bo->data(), rows, columns, columns * 2, columns, 1);
        };
        w.bytesMoved = 9.0 * double(n);
        return w;
    }
};

// 16-bit data on the 0..65535 scale put on 0..32768, in place.
template <>
struct WorkloadFor<halideqk::sig::ScaledGray16> {
    static Workload make(halideqk::sig::ScaledGray16 *fn, int rows, int columns) {
        Workload w;
        auto data = detail::RandomBytes(size_t(rows) * columns * 2);
        w.storage = {data};
        w.run = [=] { fn(detail::Data<uint16_t>(data), 65535, 32768, rows, columns, columns * 2); };
        w.bytesMoved = 4.0 * double(rows) * columns;
        return w;
    }
};

template <>
struct WorkloadFor<halideqk::sig::Interleave4to4> {
    static Workload make(halideqk::sig::Interleave4to4 *fn, int rows, int columns) {
        Workload w;
        const size_t n = size_t(rows) * columns;
        auto p1 = detail::RandomBytes(n), p2 = detail::RandomBytes(n), p3 = detail::RandomBytes(n),
             p4 = detail::RandomBytes(n), dst = detail::RandomBytes(4 * n);
        w.storage = {p1, p2, p3, p4, dst};
        w.run = [=] {
            fn(p1->data(), p2->data(), p3->data(), p4->data(), detail::Data<uint32_t>(dst), u32(rows),
               u32(columns), u32(columns), u32(columns * 4));
        };
        w.bytesMoved = 8.0 * double(n);
        return w;
    }
};

}  // namespace host
