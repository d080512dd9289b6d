// Adapters of the depth and layout conversions.
#pragma once

#include <climits>

#include "adapters/buffer_desc.h"
#include "adapters/signatures.h"
#include "tables/dither_noise.h"

namespace halideqk::adapters {

// The dither noise table as the pipelines' "noisePtr": 8192 entries, min 0,
// stride 1.  The table is built on the first call from any thread.
struct DitheredNoiseHelper {
    static BufferDesc setup() {
        static const uint16_t *const table = DitheredNoiseTable::GetNoiseTable();
        return BufferDesc::Run(table, DitheredNoiseTable::kSize);
    }
};

// (src, dst, rows, columns, srcRowBytes, dstRowBytes, dither): one plane to
// 8 bits, dithered when `dither` is non-zero.
template <auto Pipeline>
struct DitherTo8 {
    template <typename S>
    static void run(const S *src, u8 *dst, int rows, int columns, int srcRowBytes, int dstRowBytes,
                    u8 dither) {
        if (Empty(rows, columns)) return;
        BufferDesc in = BufferDesc::Plane(src, rows, columns, srcRowBytes);
        BufferDesc noise = DitheredNoiseHelper::setup();
        BufferDesc out = BufferDesc::Plane(dst, rows, columns, dstRowBytes);
        Pipeline(in.raw(), noise.raw(), dither != 0, kDitherPhase, out.raw());
    }
};

// (r, g, b, rOut, gOut, bOut, rows, columns, srcRowBytes, dstRowBytes,
// dither): three 16-bit planes to three 8-bit planes, one noise value per
// pixel.  The sources share one row stride, the outputs another.
template <auto Pipeline>
struct ThreePlanesTo8 {
    static void run(const u16 *r, const u16 *g, const u16 *b, u8 *rOut, u8 *gOut, u8 *bOut, int rows,
                    int columns, int srcRowBytes, int dstRowBytes, u8 dither) {
        if (Empty(rows, columns)) return;
        BufferDesc rs = BufferDesc::Plane(r, rows, columns, srcRowBytes);
        BufferDesc gs = BufferDesc::Plane(g, rows, columns, srcRowBytes);
        BufferDesc bs = BufferDesc::Plane(b, rows, columns, srcRowBytes);
        BufferDesc noise = DitheredNoiseHelper::setup();
        BufferDesc ro = BufferDesc::Plane(rOut, rows, columns, dstRowBytes);
        BufferDesc go = BufferDesc::Plane(gOut, rows, columns, dstRowBytes);
        BufferDesc bo = BufferDesc::Plane(bOut, rows, columns, dstRowBytes);
        Pipeline(rs.raw(), gs.raw(), bs.raw(), noise.raw(), dither != 0, kDitherPhase, ro.raw(),
                 go.raw(), bo.raw());
    }
};

// (data, sourceMax, targetMax, rows, columns, rowBytes), in place.  A scale
// maximum below 1 describes no scale: the data is left as it is rather than
// divided by zero.
template <auto Pipeline>
struct RescaleInPlace {
    static void run(u16 *data, int sourceMax, int targetMax, int rows, int columns, int rowBytes) {
        if (Empty(rows, columns) || sourceMax < 1) return;
        BufferDesc in = BufferDesc::Plane(data, rows, columns, rowBytes);
        BufferDesc out = in;
        Pipeline(in.raw(), sourceMax, targetMax, out.raw());
    }
};

// (s1, s2, s3, s4, dst, rows, columns, srcRowBytes, dstRowBytes), all
// unsigned: four 8-bit planes into 32-bit pixels.  Sizes above INT_MAX are
// negative ints passed through an unsigned parameter and write nothing; row
// bytes are reinterpreted as signed, so upward rows work as elsewhere.
template <auto Pipeline>
struct Interleave4 {
    static void run(const u8 *s1, const u8 *s2, const u8 *s3, const u8 *s4, u32 *dst, u32 rows,
                    u32 columns, u32 srcRowBytes, u32 dstRowBytes) {
        if (rows > u32(INT_MAX) || columns > u32(INT_MAX)) return;
        const int r = int(rows), c = int(columns);
        if (Empty(r, c)) return;
        const int32_t srb = int32_t(srcRowBytes), drb = int32_t(dstRowBytes);
        BufferDesc p1 = BufferDesc::Plane(s1, r, c, srb), p2 = BufferDesc::Plane(s2, r, c, srb);
        BufferDesc p3 = BufferDesc::Plane(s3, r, c, srb), p4 = BufferDesc::Plane(s4, r, c, srb);
        BufferDesc out = BufferDesc::Plane(dst, r, c, drb);
        Pipeline(p1.raw(), p2.raw(), p3.raw(), p4.raw(), out.raw());
    }
};

}  // namespace halideqk::adapters
