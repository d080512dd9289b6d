// Bit-exactness cases, one family per host signature: each runs the host's
// routine and a plug-in routine of that signature on identical random inputs
// over the awkward shapes of its kind (1x1, 64x64, 65x65, 1000x3, 3x1000,
// padded, odd and negative row bytes, empty and negative sizes, both guard
// alignments) and compares every byte the two may have touched.
#pragma once

#include <algorithm>
#include <type_traits>
#include <string>
#include <vector>

#include "adapters/signatures.h"
#include "host/test_image.h"

namespace host {

struct Outcome {
    int runs = 0;
    int failures = 0;
    std::string firstFailure;

    void record(const std::string &shape, const std::string &difference) {
        ++runs;
        if (difference.empty()) return;
        if (failures++ == 0) firstFailure = shape + ": " + difference;
    }
};

struct RectSize {
    int rows, columns;
};

// Sizes every rectangle routine is checked at, the empty ones included.
const std::vector<RectSize> &RectSizes();
const std::vector<RectSize> &EmptyRectSizes();
// Run lengths for one-dimensional routines, around both vector widths.
const std::vector<int> &RunLengths();

// Row bytes variants for an image of `columns` elements of `elemSize` bytes:
// tight, padded by an odd number of bytes, padded by 64, and upward (negative).
std::vector<int> RowBytesVariants(int columns, int elemSize);

std::string Describe(const RectSize &s, const std::vector<int> &rowBytes);

const GuardedBuffer::Align kAligns[] = {GuardedBuffer::Align::End, GuardedBuffer::Align::Start};

template <typename T>
T RandomValue(Rng &rng) {
    if constexpr (std::is_same_v<T, float>) {
        return std::uniform_real_distribution<float>(0.f, 1.f)(rng);
    } else {
        return T(rng());
    }
}

// ---- one-dimensional fills: (dst, count, value)
template <typename P, typename V>
Outcome RunFillCases(void (*ref)(P *, int, V), void (*cand)(P *, int, V), Rng &rng, int ulps) {
    Outcome out;
    for (int count : RunLengths()) {
        for (auto align : kAligns) {
            ImagePair<V> dst(StridedLayout(1, count, 0, 1, sizeof(V)), align, rng);
            const V value = RandomValue<V>(rng);
            ref(dst.ref(), count, value);
            cand(dst.cand(), count, value);
            out.record("count " + std::to_string(count), dst.difference("dst", ulps));
        }
    }
    return out;
}

// ---- one-dimensional move: (src, dst, count)
template <typename T>
Outcome RunMoveCases(void (*ref)(const T *, T *, int), void (*cand)(const T *, T *, int), Rng &rng, int ulps) {
    Outcome out;
    for (int count : RunLengths()) {
        for (auto align : kAligns) {
            const Layout layout = StridedLayout(1, count, 0, 1, sizeof(T));
            ImagePair<T> src(layout, align, rng), dst(layout, align, rng);
            ref(src.ref(), dst.ref(), count);
            cand(src.cand(), dst.cand(), count);
            out.record("count " + std::to_string(count), src.difference("src", ulps) + dst.difference("dst", ulps));
        }
    }
    return out;
}

// ---- rectangle fill: (dst, rows, columns, rowBytes, value)
template <typename T>
Outcome RectFillCases(void (*ref)(T *, int, int, int, T), void (*cand)(T *, int, int, int, T),
                      Rng &rng, int ulps) {
    Outcome out;
    auto one = [&](const RectSize &s, int rowBytes, GuardedBuffer::Align align) {
        ImagePair<T> dst(PlaneLayout<T>(s.rows, s.columns, rowBytes), align, rng);
        const T value = RandomValue<T>(rng);
        ref(dst.ref(), s.rows, s.columns, rowBytes, value);
        cand(dst.cand(), s.rows, s.columns, rowBytes, value);
        out.record(Describe(s, {rowBytes}), dst.difference("dst", ulps));
    };
    for (const RectSize &s : RectSizes())
        for (int rb : RowBytesVariants(s.columns, sizeof(T)))
            for (auto align : kAligns) one(s, rb, align);
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, GuardedBuffer::Align::Start);
    return out;
}

// ---- rectangle source to destination: (src, dst, rows, columns, srcRowBytes, dstRowBytes)
template <typename S, typename D>
Outcome SrcDstCases(void (*ref)(const S *, D *, int, int, int, int),
                    void (*cand)(const S *, D *, int, int, int, int), Rng &rng, int ulps) {
    Outcome out;
    auto one = [&](const RectSize &s, int srb, int drb, GuardedBuffer::Align align) {
        ImagePair<S> src(PlaneLayout<S>(s.rows, s.columns, srb), align, rng, Content::Samples);
        ImagePair<D> dst(PlaneLayout<D>(s.rows, s.columns, drb), align, rng, Content::Samples);
        ref(src.ref(), dst.ref(), s.rows, s.columns, srb, drb);
        cand(src.cand(), dst.cand(), s.rows, s.columns, srb, drb);
        out.record(Describe(s, {srb, drb}), src.difference("src", ulps) + dst.difference("dst", ulps));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> sv = RowBytesVariants(s.columns, sizeof(S));
        const std::vector<int> dv = RowBytesVariants(s.columns, sizeof(D));
        for (size_t v = 0; v < sv.size(); ++v)
            for (auto align : kAligns) one(s, sv[v], dv[(v + 1) % dv.size()], align);
    }
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, 64, GuardedBuffer::Align::Start);
    return out;
}

// ---- stepped move: (src, dst, rows, columns, srcRowStride, dstRowStride, srcStep, dstStep)
template <typename T>
Outcome StepMoveCases(void (*ref)(const T *, T *, int, int, int, int, int, int),
                      void (*cand)(const T *, T *, int, int, int, int, int, int), Rng &rng, int ulps) {
    struct Step {
        int rows, columns, srcRowStride, dstRowStride, srcStep, dstStep;
    };
    const Step steps[] = {
        {1, 1, 1, 1, 1, 1},          {64, 64, 64, 64, 1, 1},       {65, 65, 65, 65, 1, 1},
        {65, 65, 70, 66, 1, 1},      {1000, 3, 3, 5, 1, 1},        {3, 1000, 1000, 1003, 1, 1},
        {5, 7, 40, 7, 4, 1},         {70, 100, 400, 100, 4, 1},    {100, 70, 100, 210, 1, 3},
        {66, 80, 100, 100, 1, 1},    {10, 12, -12, 12, 1, 1},      {9, 20, 20, 40, -1, 2},
        {4, 10, 10, 10, 0, 1},       {67, 67, -300, 67, 4, 1},     {0, 5, 5, 5, 1, 1},
        {5, 0, 5, 5, 1, 1},          {-1, 5, 5, 5, 1, 1},          {5, -4, 5, 5, 1, 1},
    };
    Outcome out;
    for (const Step &s : steps) {
        for (auto align : kAligns) {
            ImagePair<T> src(StridedLayout(s.rows, s.columns, s.srcRowStride, s.srcStep, sizeof(T)),
                             align, rng);
            ImagePair<T> dst(StridedLayout(s.rows, s.columns, s.dstRowStride, s.dstStep, sizeof(T)),
                             align, rng);
            ref(src.ref(), dst.ref(), s.rows, s.columns, s.srcRowStride, s.dstRowStride, s.srcStep,
                s.dstStep);
            cand(src.cand(), dst.cand(), s.rows, s.columns, s.srcRowStride, s.dstRowStride,
                 s.srcStep, s.dstStep);
            out.record(Describe({s.rows, s.columns}, {s.srcRowStride, s.dstRowStride, s.srcStep,
                                                      s.dstStep}),
                       src.difference("src", ulps) + dst.difference("dst", ulps));
        }
    }
    return out;
}

// ---- masked blend: (src, dst, mask, rows, columns, srcRowBytes, dstRowBytes, maskRowBytes)
template <typename T>
Outcome MaskedBlendCases(void (*ref)(const T *, T *, const T *, int, int, int, int, int),
                         void (*cand)(const T *, T *, const T *, int, int, int, int, int), Rng &rng,
                         int ulps) {
    Outcome out;
    auto one = [&](const RectSize &s, int srb, int drb, int mrb, GuardedBuffer::Align align) {
        ImagePair<T> src(PlaneLayout<T>(s.rows, s.columns, srb), align, rng, Content::Samples);
        ImagePair<T> dst(PlaneLayout<T>(s.rows, s.columns, drb), align, rng, Content::Samples);
        ImagePair<T> mask(PlaneLayout<T>(s.rows, s.columns, mrb), align, rng, Content::Samples);
        ref(src.ref(), dst.ref(), mask.ref(), s.rows, s.columns, srb, drb, mrb);
        cand(src.cand(), dst.cand(), mask.cand(), s.rows, s.columns, srb, drb, mrb);
        out.record(Describe(s, {srb, drb, mrb}),
                   src.difference("src") + mask.difference("mask") + dst.difference("dst", ulps));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> v = RowBytesVariants(s.columns, sizeof(T));
        for (size_t i = 0; i < v.size(); ++i)
            for (auto align : kAligns) one(s, v[i], v[(i + 1) % v.size()], v[(i + 2) % v.size()], align);
    }
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, 64, 64, GuardedBuffer::Align::Start);
    return out;
}

// ---- constant source: (value, dst, mask, rows, columns, dstRowBytes, maskRowBytes)
inline Outcome ConstBlendCases(halideqk::sig::ConstDstMask8 *ref, halideqk::sig::ConstDstMask8 *cand,
                               Rng &rng, int) {
    Outcome out;
    auto one = [&](const RectSize &s, int drb, int mrb, GuardedBuffer::Align align) {
        ImagePair<u8> dst(PlaneLayout<u8>(s.rows, s.columns, drb), align, rng, Content::Samples);
        ImagePair<u8> mask(PlaneLayout<u8>(s.rows, s.columns, mrb), align, rng, Content::Samples);
        // Any 16-bit value: only its low byte is the source.
        const i16 value = i16(rng());
        ref(value, dst.ref(), mask.ref(), s.rows, s.columns, drb, mrb);
        cand(value, dst.cand(), mask.cand(), s.rows, s.columns, drb, mrb);
        out.record(Describe(s, {drb, mrb}) + " value " + std::to_string(value),
                   mask.difference("mask") + dst.difference("dst"));
    };
    for (const RectSize &s : RectSizes()) {
        const std::vector<int> v = RowBytesVariants(s.columns, 1);
        for (size_t i = 0; i < v.size(); ++i)
            for (auto align : kAligns) one(s, v[i], v[(i + 1) % v.size()], align);
    }
    for (const RectSize &s : EmptyRectSizes()) one(s, 64, 64, GuardedBuffer::Align::Start);
    return out;
}

}  // namespace host

#include "host/conversion_cases.h"

namespace host {

// The case family of each host signature.  A signature without one fails to
// compile where it is checked, so every built routine gets checked.
template <typename Sig>
struct CasesFor;

#define QK_CASES(SigName, Runner)                                                        \
    template <>                                                                          \
    struct CasesFor<halideqk::sig::SigName> {                                            \
        static Outcome run(halideqk::sig::SigName *ref, halideqk::sig::SigName *cand,    \
                           Rng &rng, int ulps) {                                 \
            return Runner(ref, cand, rng, ulps);                                         \
        }                                                                                \
    };
QK_CASES(SetBytes, RunFillCases)
QK_CASES(SetShorts, RunFillCases)
QK_CASES(Set32Bit, RunFillCases)
QK_CASES(BlockMove, RunMoveCases)
QK_CASES(SetRect, RectFillCases)
QK_CASES(SetRectDeep, RectFillCases)
QK_CASES(SrcDst8, SrcDstCases)
QK_CASES(StepMove8, StepMoveCases)
QK_CASES(StepMove16, StepMoveCases)
QK_CASES(StepMoveF, StepMoveCases)
QK_CASES(SrcDstMask8, MaskedBlendCases)
QK_CASES(SrcDstMask16, MaskedBlendCases)
QK_CASES(SrcDstMaskF, MaskedBlendCases)
QK_CASES(ConstDstMask8, ConstBlendCases)
QK_CASES(Gray8toGray16, SrcDstCases)
QK_CASES(Gray16toGray8, DitherTo8Cases)
QK_CASES(Gray32toGray8, DitherTo8Cases)
QK_CASES(RGB48toRGB24, ThreePlanesCases)
QK_CASES(ScaledGray16, RescaleCases)
QK_CASES(Interleave4to4, InterleaveCases)
#undef QK_CASES

}  // namespace host
