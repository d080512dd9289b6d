// Rectangle blends: B from source s and destination d, mixed into d under the
// mask m.  Rows are reached by row bytes (shifted by the element size).
#include <cmath>

#include "host/reference/blend_math.h"
#include "host/reference_routines.h"

namespace host_ref {

namespace {

template <typename T>
const T *RowOf(const T *base, int y, int rowBytes) {
    constexpr int shift = sizeof(T) == 1 ? 0 : sizeof(T) == 2 ? 1 : 2;
    return base + long(y) * (rowBytes >> shift);
}
template <typename T>
T *RowOf(T *base, int y, int rowBytes) {
    constexpr int shift = sizeof(T) == 1 ? 0 : sizeof(T) == 2 ? 1 : 2;
    return base + long(y) * (rowBytes >> shift);
}

// Runs `blend(s, d, m)` over every sample; a null src means `constant`, a
// null mask means 255.
template <typename F>
void Each8(const u8 *src, u8 constant, u8 *dst, const u8 *mask, int rows, int columns, int srcRowBytes,
           int dstRowBytes, int maskRowBytes, F blend) {
    for (int y = 0; y < rows; ++y) {
        const u8 *s = src ? RowOf(src, y, srcRowBytes) : nullptr;
        const u8 *m = mask ? RowOf(mask, y, maskRowBytes) : nullptr;
        u8 *d = RowOf(dst, y, dstRowBytes);
        for (int x = 0; x < columns; ++x) d[x] = u8(blend(s ? s[x] : constant, d[x], m ? m[x] : 255));
    }
}

int Screen(int s, int d, int m) { return Interp255(d, Screen255(s, d), m); }
int Multiply(int s, int d, int m) { return Interp255(d, Mul255(s, d), m); }
int Darken(int s, int d, int m) { return s < d ? Interp255(d, s, m) : d; }
int Lighten(int s, int d, int m) { return s > d ? Interp255(d, s, m) : d; }
int HardLight(int s, int d, int m) {
    const int b = s < 128 ? Mul255(2 * s, d) : Screen255(2 * s - 256, d);
    return Interp255(d, b, m);
}
int Overlay(int s, int d, int m) {
    const int b = d < 128 ? Mul255(2 * d, s) : Screen255(2 * d - 255, s);
    return Interp255(d, b, m);
}
int SoftLight(int s, int d, int m) {
    if (s >= 128) return d + Mul255(Mul255(DodgeDelta()[d], 2 * s - 256), m);
    return d - Mul255(Mul255(BurnDelta()[d], 255 - 2 * s), m);
}
int Threshold(int s, int d, int m) { return m >= 128 ? s : d; }
int Reverse(int s, int d, int m) {
    if (m == 0) return s;
    if (m == 255) return d;
    if (d > s) return s + Mul255(d - s, m);
    if (s > d) return d + Mul255(s - d, 255 - m);
    return d;
}

}  // namespace

#define HOST_PLAIN(Name, F)                                                                       \
    void Name(const u8 *src, u8 *dst, const u8 *mask, int rows, int columns, int srb, int drb,    \
              int mrb) {                                                                          \
        Each8(src, 0, dst, mask, rows, columns, srb, drb, mrb, F);                                \
    }
#define HOST_CONST(Name, F)                                                                         \
    void Name(i16 value, u8 *dst, const u8 *mask, int rows, int columns, int drb, int mrb) {        \
        Each8(nullptr, u8(value & 0xFF), dst, mask, rows, columns, 0, drb, mrb, F);                 \
    }
#define HOST_SOLID(Name, F)                                                                   \
    void Name(const u8 *src, u8 *dst, int rows, int columns, int srb, int drb) {              \
        Each8(src, 0, dst, nullptr, rows, columns, srb, drb, 0, F);                           \
    }

HOST_PLAIN(BlendRect, [](int s, int d, int m) { return Interp255(d, s, m); })
HOST_PLAIN(ScreenBlend, Screen)
HOST_CONST(ScreenBlendConst, Screen)
HOST_PLAIN(MultiplyBlend, Multiply)
HOST_CONST(MultiplyBlendConst, Multiply)
HOST_PLAIN(DarkenOnly, Darken)
HOST_CONST(DarkenOnlyConst, Darken)
HOST_PLAIN(LightenOnly, Lighten)
HOST_CONST(LightenOnlyConst, Lighten)
HOST_PLAIN(HardLightBlend, HardLight)
HOST_CONST(HardLightConst, HardLight)
HOST_SOLID(HardLightSolid, HardLight)
HOST_PLAIN(OverlayBlend, Overlay)
HOST_CONST(OverlayBlendConst, Overlay)
HOST_SOLID(OverlayBlendSolid, Overlay)
HOST_PLAIN(SoftLightBlend, SoftLight)
HOST_CONST(SoftLightConst, SoftLight)
HOST_SOLID(SoftLightSolid, SoftLight)
HOST_PLAIN(ThresholdBlend, Threshold)
HOST_CONST(ThresholdBlendConst, Threshold)
HOST_PLAIN(ReverseBlend, Reverse)

namespace {

template <typename F>
void Each16(const u16 *src, u16 *dst, const u16 *mask, int rows, int columns, int srb, int drb, int mrb,
            F blend) {
    for (int y = 0; y < rows; ++y) {
        const u16 *s = RowOf(src, y, srb), *m = RowOf(mask, y, mrb);
        u16 *d = RowOf(dst, y, drb);
        for (int x = 0; x < columns; ++x) d[x] = DeepMix(d[x], blend(s[x], d[x]), m[x]);
    }
}

}  // namespace

void BlendRectDeep(const u16 *src, u16 *dst, const u16 *mask, int rows, int columns, int srb, int drb,
                   int mrb) {
    Each16(src, dst, mask, rows, columns, srb, drb, mrb, [](uint32_t s, uint32_t) { return s; });
}
void ScreenBlendDeep(const u16 *src, u16 *dst, const u16 *mask, int rows, int columns, int srb,
                     int drb, int mrb) {
    Each16(src, dst, mask, rows, columns, srb, drb, mrb,
           [](uint32_t s, uint32_t d) { return s + d - Mul32768(s, d); });
}
void MultiplyBlendDeep(const u16 *src, u16 *dst, const u16 *mask, int rows, int columns, int srb,
                       int drb, int mrb) {
    Each16(src, dst, mask, rows, columns, srb, drb, mrb,
           [](uint32_t s, uint32_t d) { return Mul32768(s, d); });
}

void BlendRectFloat(const float *src, float *dst, const float *mask, int rows, int columns, int srb,
                    int drb, int mrb) {
    for (int y = 0; y < rows; ++y) {
        const float *s = RowOf(src, y, srb), *m = RowOf(mask, y, mrb);
        float *d = RowOf(dst, y, drb);
        for (int x = 0; x < columns; ++x) {
            const float product = (s[x] - d[x]) * m[x];  // rounded, then the sum rounded
            d[x] = product + d[x];
        }
    }
}

}  // namespace host_ref
