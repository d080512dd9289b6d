// Bit-exactness cases of the depth and layout conversions: every dither
// setting, samples across and beyond each depth's scale, and scale pairs
// that take each arithmetic path.
#pragma once

#include <climits>

#include "host/cases.h"

namespace host {

// Rows longer than the noise table, which wrap around it more than once.
inline const RectSize kWideRows[] = {{2, 8193}, {3, 9000}, {1, 20000}};

// Dither arguments: off, and two "on" values (any non-zero byte is on).
inline const u8 kDitherSettings[] = {0, 1, 0x80};

// ---- one plane to 8 bits: (src, dst, rows, columns, srcRowBytes, dstRowBytes, dither)
template <typename S>
Outcome DitherTo8Cases(void (*ref)(const S *, u8 *, int, int, int, int, u8),
                       void (*cand)(const S *, u8 *, int, int, int, int, u8), Rng &rng, int) {
    Outcome out;
    auto one = [&](const RectSize &s, int srb, int drb, GuardedBuffer::Align align, u8 dither,
                   Content content) {
        ImagePair<S> src(PlaneLayout<S>(s.rows, s.columns, srb), align, rng, content);
        ImagePair<u8> dst(PlaneLayout<u8>(s.rows, s.columns, drb), align, rng);
        ref(src.ref(), dst.ref(), s.rows, s.columns, srb, drb, dither);
        cand(src.cand(), dst.cand(), s.rows, s.columns, srb, drb, dither);
        out.record(Describe(s, {srb, drb}) + " dither " + std::to_string(dither),
                   src.difference("src") + dst.difference("dst"));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> sv = RowBytesVariants(s.columns, sizeof(S));
        const std::vector<int> dv = RowBytesVariants(s.columns, 1);
        for (size_t v = 0; v < sv.size(); ++v)
            for (u8 dither : kDitherSettings)
                one(s, sv[v], dv[(v + 1) % dv.size()], kAligns[v % 2], dither,
                    v % 2 ? Content::Samples : Content::Wide);
    }
    for (const RectSize &s : kWideRows)
        for (u8 dither : kDitherSettings)
            one(s, s.columns * int(sizeof(S)) + 6, s.columns, GuardedBuffer::Align::End, dither, Content::Wide);
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, 64, GuardedBuffer::Align::Start, 1, Content::Wide);
    return out;
}

// ---- three 16-bit planes to three 8-bit planes
inline Outcome ThreePlanesCases(halideqk::sig::RGB48toRGB24 *ref, halideqk::sig::RGB48toRGB24 *cand,
                                Rng &rng, int) {
    Outcome out;
    auto one = [&](const RectSize &s, int srb, int drb, GuardedBuffer::Align align, u8 dither) {
        const Layout in = PlaneLayout<u16>(s.rows, s.columns, srb);
        const Layout o = PlaneLayout<u8>(s.rows, s.columns, drb);
        ImagePair<u16> r(in, align, rng, Content::Wide), g(in, align, rng, Content::Samples),
            b(in, align, rng, Content::Wide);
        ImagePair<u8> ro(o, align, rng), go(o, align, rng), bo(o, align, rng);
        ref(r.ref(), g.ref(), b.ref(), ro.ref(), go.ref(), bo.ref(), s.rows, s.columns, srb, drb, dither);
        cand(r.cand(), g.cand(), b.cand(), ro.cand(), go.cand(), bo.cand(), s.rows, s.columns, srb, drb,
             dither);
        out.record(Describe(s, {srb, drb}) + " dither " + std::to_string(dither),
                   ro.difference("rOut") + go.difference("gOut") + bo.difference("bOut"));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> sv = RowBytesVariants(s.columns, 2);
        const std::vector<int> dv = RowBytesVariants(s.columns, 1);
        for (size_t v = 0; v < sv.size(); ++v)
            for (u8 dither : kDitherSettings) one(s, sv[v], dv[(v + 3) % dv.size()], kAligns[v % 2], dither);
    }
    for (const RectSize &s : kWideRows) one(s, 2 * s.columns, s.columns + 1, GuardedBuffer::Align::End, 1);
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, 64, GuardedBuffer::Align::Start, 1);
    return out;
}

// ---- in-place rescale: (data, sourceMax, targetMax, rows, columns, rowBytes)
inline Outcome RescaleCases(halideqk::sig::ScaledGray16 *ref, halideqk::sig::ScaledGray16 *cand, Rng &rng,
                            int) {
    struct Scale {
        int sourceMax, targetMax;
    };
    // The program's scales, then pairs for the exact path (large or negative
    // targets, 32-bit overflow) and maxima that describe no scale.
    const Scale scales[] = {{65535, 32768}, {32768, 255},  {255, 32768},   {1, 32768},
                            {32768, 32768}, {1000, 7},     {65535, 65535}, {2, 1},
                            {3, 1 << 22},   {65535, 1 << 20}, {100, -5},   {7, INT_MAX},
                            {0, 100},       {-5, 100}};
    Outcome out;
    auto one = [&](const RectSize &s, int rb, GuardedBuffer::Align align, const Scale &sc) {
        ImagePair<u16> data(PlaneLayout<u16>(s.rows, s.columns, rb), align, rng, Content::Wide);
        ref(data.ref(), sc.sourceMax, sc.targetMax, s.rows, s.columns, rb);
        cand(data.cand(), sc.sourceMax, sc.targetMax, s.rows, s.columns, rb);
        out.record(Describe(s, {rb}) + " scale " + std::to_string(sc.sourceMax) + "->" +
                       std::to_string(sc.targetMax),
                   data.difference("data"));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> v = RowBytesVariants(s.columns, 2);
        for (size_t i = 0; i < sizeof scales / sizeof scales[0]; ++i)
            one(s, v[i % v.size()], kAligns[i % 2], scales[i]);
    }
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, GuardedBuffer::Align::Start, scales[0]);
    return out;
}

// ---- four 8-bit planes to 32-bit pixels, every size and stride unsigned
inline Outcome InterleaveCases(halideqk::sig::Interleave4to4 *ref, halideqk::sig::Interleave4to4 *cand,
                               Rng &rng, int) {
    Outcome out;
    auto one = [&](const RectSize &s, int srb, int drb, GuardedBuffer::Align align) {
        const Layout in = PlaneLayout<u8>(s.rows, s.columns, srb);
        ImagePair<u8> p1(in, align, rng), p2(in, align, rng), p3(in, align, rng), p4(in, align, rng);
        ImagePair<u32> dst(PlaneLayout<u32>(s.rows, s.columns, drb), align, rng);
        ref(p1.ref(), p2.ref(), p3.ref(), p4.ref(), dst.ref(), u32(s.rows), u32(s.columns), u32(srb), u32(drb));
        cand(p1.cand(), p2.cand(), p3.cand(), p4.cand(), dst.cand(), u32(s.rows), u32(s.columns), u32(srb),
             u32(drb));
        out.record(Describe(s, {srb, drb}), dst.difference("dst"));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> sv = RowBytesVariants(s.columns, 1);
        const std::vector<int> dv = RowBytesVariants(s.columns, 4);
        for (size_t v = 0; v < sv.size(); ++v)
            for (auto align : kAligns) one(s, sv[v], dv[(v + 2) % dv.size()], align);
    }
    // Negative sizes arrive as values above INT_MAX.
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, 64, GuardedBuffer::Align::Start);
    return out;
}

}  // namespace host
