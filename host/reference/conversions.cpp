// Depth and layout conversions, one sample at a time.
#include <cmath>
#include <cstdint>

#include "host/reference/dither_noise.h"
#include "host/reference/rows.h"
#include "host/reference_routines.h"

namespace {

using host_ref::DitherNoise;
using host_ref::Row;

// Low 8 bits of (v * 255 + n) >> 15.
u8 DitherTo8(uint32_t v, int n) { return u8((int32_t(v) * 255 + n) >> 15); }

// trunc((clamp(v, 0, 1) * 8355840 + n) / 32768), in single precision; NaN as 0.
u8 FloatTo8(float v, int n) {
    const float c = std::isnan(v) ? 0.0f : v < 0.0f ? 0.0f : v > 1.0f ? 1.0f : v;
    // This file is compiled without contraction: the product is rounded on
    // its own before the noise is added.
    const float t = c * 8355840.0f + float(n);
    return u8(int32_t(t * (1.0f / 32768.0f)));
}

}  // namespace

namespace host_ref {

void Gray8toGray16(const u8 *src, u16 *dst, int rows, int columns, int srcRowBytes, int dstRowBytes) {
    for (int y = 0; y < rows; ++y) {
        const u8 *in = Row(src, y, srcRowBytes);
        u16 *out = Row(dst, y, dstRowBytes);
        for (int x = 0; x < columns; ++x) out[x] = u16((uint32_t(in[x]) * 32768 + 127) / 255);
    }
}

void Gray16toGray8(const u16 *src, u8 *dst, int rows, int columns, int srcRowBytes, int dstRowBytes,
                   u8 dither) {
    for (int y = 0; y < rows; ++y) {
        const u16 *in = Row(src, y, srcRowBytes);
        u8 *out = Row(dst, y, dstRowBytes);
        for (int x = 0; x < columns; ++x) out[x] = DitherTo8(in[x], DitherNoise(x, y, dither != 0));
    }
}

void Gray32toGray8(const float *src, u8 *dst, int rows, int columns, int srcRowBytes, int dstRowBytes,
                   u8 dither) {
    for (int y = 0; y < rows; ++y) {
        const float *in = Row(src, y, srcRowBytes);
        u8 *out = Row(dst, y, dstRowBytes);
        for (int x = 0; x < columns; ++x) out[x] = FloatTo8(in[x], DitherNoise(x, y, dither != 0));
    }
}

void RGB48toRGB24(const u16 *r, const u16 *g, const u16 *b, u8 *rOut, u8 *gOut, u8 *bOut, int rows,
                  int columns, int srcRowBytes, int dstRowBytes, u8 dither) {
    for (int y = 0; y < rows; ++y) {
        const u16 *ri = Row(r, y, srcRowBytes), *gi = Row(g, y, srcRowBytes), *bi = Row(b, y, srcRowBytes);
        u8 *ro = Row(rOut, y, dstRowBytes), *go = Row(gOut, y, dstRowBytes), *bo = Row(bOut, y, dstRowBytes);
        for (int x = 0; x < columns; ++x) {
            const int n = DitherNoise(x, y, dither != 0);
            ro[x] = DitherTo8(ri[x], n);
            go[x] = DitherTo8(gi[x], n);
            bo[x] = DitherTo8(bi[x], n);
        }
    }
}

// (v * targetMax + sourceMax / 2) / sourceMax, truncated, or targetMax above
// sourceMax.  Worked in 64 bits, which equals the 32-bit formula wherever that
// does not overflow.  A scale maximum below 1 leaves the data alone.
void ScaledGray16toGray16(u16 *data, int sourceMax, int targetMax, int rows, int columns, int rowBytes) {
    if (sourceMax < 1) return;
    for (int y = 0; y < rows; ++y) {
        u16 *row = Row(data, y, rowBytes);
        for (int x = 0; x < columns; ++x) {
            const int v = row[x];
            const int64_t q = v > sourceMax
                                  ? targetMax
                                  : (int64_t(v) * targetMax + sourceMax / 2) / sourceMax;
            row[x] = u16(q);
        }
    }
}

void Interleave4to4(const u8 *s1, const u8 *s2, const u8 *s3, const u8 *s4, u32 *dst, u32 rows,
                    u32 columns, u32 srcRowBytes, u32 dstRowBytes) {
    if (rows > 0x7FFFFFFFu || columns > 0x7FFFFFFFu) return;
    for (int y = 0; y < int(rows); ++y) {
        const int srb = int(srcRowBytes), drb = int(dstRowBytes);
        const u8 *a = Row(s1, y, srb), *b = Row(s2, y, srb), *c = Row(s3, y, srb), *d = Row(s4, y, srb);
        u32 *out = Row(dst, y, drb);
        for (int x = 0; x < int(columns); ++x)
            out[x] = u32(a[x]) | u32(b[x]) << 8 | u32(c[x]) << 16 | u32(d[x]) << 24;
    }
}

}  // namespace host_ref
