// The ordered-dither noise of the depth conversions, as a Halide expression.
//
// With the table T (8192 entries), the phase p and (x, y) counted from the
// rectangle's first column and row:
//   dithering on:  n = (T[(p + x + 193 y) mod 8192] ^ T[(p + x + 521 y + 3647) mod 8192]) & 0x7FFF
//   dithering off: n = 16384
//
// Along a row both indices advance by one per column, so each row reads two
// contiguous windows of the table that may wrap once.  The kernel keeps the
// table twice over in a ring of 16384 entries, built once per call: for rows
// of up to 8192 columns both windows are then plain dense loads from
// ring[(start mod 8192) + x].  Wider rows fall back to per-lane lookups.
#pragma once

#include "Halide.h"
#include "kernels/common/schedule.h"

namespace halideqk {

inline constexpr int kNoiseSize = 8192;

class DitherNoise {
public:
    template <typename TableInput>
    DitherNoise(const TableInput &table, const Halide::Expr &dither, const Halide::Expr &phase,
                const Halide::Expr &columns)
        : dither_(dither), phase_(phase), ringFits_(columns <= kNoiseSize) {
        using namespace Halide;
        ring_ = Func("noise_ring");
        ring_(i_) = cast<uint16_t>(0);
        ring_(r_.x) = table(r_.x);
        ring_(r_.x + kNoiseSize) = table(r_.x);
        lookup_ = Func("noise_table");
        lookup_(i_) = table(i_ & (kNoiseSize - 1));
    }

    // n(x, y) as a 32-bit signed value, 0..32767 with dithering on.
    Halide::Expr at(const Halide::Var &x, const Halide::Var &y) const {
        using namespace Halide;
        Expr start1 = phase_ + 193 * y, start2 = phase_ + 521 * y + 3647;
        Expr dense = ring_((start1 & (kNoiseSize - 1)) + x) ^ ring_((start2 & (kNoiseSize - 1)) + x);
        Expr gathered = lookup_(start1 + x) ^ lookup_(start2 + x);
        Expr n = cast<int32_t>(select(ringFits_, dense, gathered) & 0x7FFF);
        return select(dither_, n, 16384);
    }

    // Schedules `out` for the three cases (no dithering; dithering on rows
    // that fit the ring; wider rows), each split into row strips.
    void schedule(Halide::Func out, const Halide::Var &x, const Halide::Var &y, const Halide::Expr &columns,
                  const Halide::Expr &rows, int vector_lanes) {
        using namespace Halide;
        Stage dithered = out.specialize(dither_);
        schedule_rows(dithered.specialize(ringFits_), x, y, columns, rows, vector_lanes);
        schedule_rows(dithered, x, y, columns, rows, vector_lanes);
        schedule_rows(out, x, y, columns, rows, vector_lanes);

        ring_.compute_at(out, Var::outermost()).vectorize(i_, vector_lanes);
        ring_.update(0).vectorize(r_.x, vector_lanes);
        ring_.update(1).vectorize(r_.x, vector_lanes);
    }

private:
    Halide::Expr dither_, phase_, ringFits_;
    Halide::Var i_{"i"};
    Halide::RDom r_{0, kNoiseSize, "r"};
    Halide::Func ring_, lookup_;
};

}  // namespace halideqk
