// Schedules shared by every kernel family.
//
// Two-dimensional kernels cut the rows into strips of 64 when the rectangle
// has at least 65 rows and at least 65 columns, one worker-pool task per
// strip; smaller rectangles run on the calling thread.  Within a row the
// samples go one vector at a time, with a guarded tail so nothing is written
// past the last column.
#pragma once

#include "Halide.h"

namespace halideqk {

inline constexpr int kStripRows = 64;
inline constexpr int kMinParallelExtent = 65;

// Vectorises `f` along x at `vector_lanes`, and splits rows into parallel
// strips when the output (of extents `columns` x `rows`) is large enough.
// Takes a stage so that each specialisation of a kernel can be given it.
inline void schedule_rows(Halide::Stage f, const Halide::Var &x, const Halide::Var &y,
                          const Halide::Expr &columns, const Halide::Expr &rows, int vector_lanes) {
    using Halide::TailStrategy;
    Halide::Var yo("yo"), yi("yi");
    f.specialize(rows >= kMinParallelExtent && columns >= kMinParallelExtent)
        .split(y, yo, yi, kStripRows, TailStrategy::GuardWithIf)
        .parallel(yo)
        .vectorize(x, vector_lanes, TailStrategy::GuardWithIf);
    f.vectorize(x, vector_lanes, TailStrategy::GuardWithIf);
}

// One-dimensional runs go one vector-sized chunk per worker-pool task; the
// last chunk writes only the elements that remain.
inline void schedule_run(Halide::Func f, const Halide::Var &x, int vector_lanes) {
    using Halide::TailStrategy;
    Halide::Var xo("xo"), xi("xi");
    f.split(x, xo, xi, vector_lanes, TailStrategy::GuardWithIf).vectorize(xi).parallel(xo);
}

// Number of lanes of one native vector of `t` for the generator's target:
// 16 bytes for SSE4.1, 32 bytes for AVX2.
inline int vector_lanes(const Halide::Target &target, const Halide::Type &t) {
    return target.natural_vector_size(t);
}

}  // namespace halideqk

// A generator templated on its element type needs the dependent Input and
// Output names of its base spelled out.
#define HALIDEQK_TEMPLATE_GENERATOR(Self)                                  \
    using Base = Halide::Generator<Self>;                                  \
    template <typename X>                                                  \
    using Input = typename Base::template Input<X>;                        \
    template <typename X>                                                  \
    using Output = typename Base::template Output<X>

namespace halideqk {

// Reads a buffer that is either a two-dimensional image or, for a constant
// source or an absent mask, a zero-dimensional value seen at every position.
template <typename B>
Halide::Expr at(const B &buffer, int dims, const Halide::Var &x, const Halide::Var &y) {
    return dims == 0 ? Halide::Expr(buffer()) : Halide::Expr(buffer(x, y));
}

}  // namespace halideqk
