// Adapter implementations, one per argument layout.  Each takes the host's
// arguments, describes the memory as buffers on its own stack and makes one
// pipeline call; the pipeline's status has nowhere to go and is dropped.
// Pipeline is the address of an ahead-of-time pipeline of the set being built.
#pragma once

#include "adapters/buffer_desc.h"

namespace halideqk::adapters {

// (dst, count, value): dst[i] = value.  The element type is the value's.
template <auto Pipeline>
struct RunFill {
    template <typename P, typename V>
    static void run(P *dst, int count, V value) {
        if (count <= 0) return;
        BufferDesc out = BufferDesc::Run(static_cast<V *>(dst), count);
        Pipeline(value, out.raw());
    }
};

// (src, dst, count): dst[i] = src[i].
template <auto Pipeline>
struct RunMove {
    template <typename T>
    static void run(const T *src, T *dst, int count) {
        if (count <= 0) return;
        BufferDesc in = BufferDesc::Run(src, count);
        BufferDesc out = BufferDesc::Run(dst, count);
        Pipeline(in.raw(), out.raw());
    }
};

// (dst, rows, columns, rowBytes, value): every sample = value.
template <auto Pipeline>
struct RectFill {
    template <typename T>
    static void run(T *dst, int rows, int columns, int rowBytes, T value) {
        if (Empty(rows, columns)) return;
        BufferDesc out = BufferDesc::Plane(dst, rows, columns, rowBytes);
        Pipeline(value, out.raw());
    }
};

// (src, dst, rows, columns, srcRowBytes, dstRowBytes): dst = f(src), the two
// images of the same or of different depths.
template <auto Pipeline>
struct RectMove {
    template <typename S, typename D>
    static void run(const S *src, D *dst, int rows, int columns, int srcRowBytes, int dstRowBytes) {
        if (Empty(rows, columns)) return;
        BufferDesc in = BufferDesc::Plane(src, rows, columns, srcRowBytes);
        BufferDesc out = BufferDesc::Plane(dst, rows, columns, dstRowBytes);
        Pipeline(in.raw(), out.raw());
    }
};

// (src, dst, rows, columns, srcRowStride, dstRowStride, srcStep, dstStep):
// every stride counted in elements, not bytes.
template <auto Pipeline>
struct StepMove {
    template <typename T>
    static void run(const T *src, T *dst, int rows, int columns, int srcRowStride, int dstRowStride,
                    int srcStep, int dstStep) {
        if (Empty(rows, columns)) return;
        BufferDesc in = BufferDesc::Strided(src, rows, columns, srcRowStride, srcStep);
        BufferDesc out = BufferDesc::Strided(dst, rows, columns, dstRowStride, dstStep);
        Pipeline(in.raw(), srcStep, dstStep, out.raw());
    }
};

}  // namespace halideqk::adapters

#include "adapters/conversions.h"
#include "adapters/opaque_mask.h"
#include "tables/soft_light.h"

namespace halideqk::adapters {

// Constant tables handed to a pipeline after its image buffers.
struct DodgeDeltaTable {
    static BufferDesc describe() { return BufferDesc::Run(DodgeDelta(), 256); }
};
struct BurnDeltaTable {
    static BufferDesc describe() { return BufferDesc::Run(BurnDelta(), 256); }
};

// Runs a blend pipeline in place: "src", "dst", "mask", then any tables, and
// the destination again as the output.
template <auto Pipeline, typename... Tables>
void BlendInPlace(BufferDesc &s, BufferDesc &d, BufferDesc &m) {
    BufferDesc out = d;
    Pipeline(s.raw(), d.raw(), m.raw(), Tables::describe().raw()..., out.raw());
}

// (src, dst, mask, rows, columns, srcRowBytes, dstRowBytes, maskRowBytes),
// in place: the pipeline reads "src", "dst", "mask", then any tables, and
// writes the destination again.
template <auto Pipeline, typename... Tables>
struct MaskedBlend {
    template <typename T>
    static void run(const T *src, T *dst, const T *mask, int rows, int columns, int srcRowBytes,
                    int dstRowBytes, int maskRowBytes) {
        if (Empty(rows, columns)) return;
        BufferDesc s = BufferDesc::Plane(src, rows, columns, srcRowBytes);
        BufferDesc d = BufferDesc::Plane(dst, rows, columns, dstRowBytes);
        BufferDesc m = BufferDesc::Plane(mask, rows, columns, maskRowBytes);
        BlendInPlace<Pipeline, Tables...>(s, d, m);
    }
};

// (value, dst, mask, rows, columns, dstRowBytes, maskRowBytes): the low byte
// of the constant is the source at every position.
template <auto Pipeline, typename... Tables>
struct ConstBlend {
    static void run(i16 value, u8 *dst, const u8 *mask, int rows, int columns, int dstRowBytes,
                    int maskRowBytes) {
        if (Empty(rows, columns)) return;
        const u8 source = static_cast<u8>(value & 0xFF);
        BufferDesc s = BufferDesc::Scalar(&source);
        BufferDesc d = BufferDesc::Plane(dst, rows, columns, dstRowBytes);
        BufferDesc m = BufferDesc::Plane(mask, rows, columns, maskRowBytes);
        BlendInPlace<Pipeline, Tables...>(s, d, m);
    }
};

// (src, dst, rows, columns, srcRowBytes, dstRowBytes): no mask, so the
// pipeline sees the opaque value at every position.
template <auto Pipeline, typename... Tables>
struct SolidBlend {
    template <typename T>
    static void run(const T *src, T *dst, int rows, int columns, int srcRowBytes, int dstRowBytes) {
        if (Empty(rows, columns)) return;
        const T opaque = kOpaqueMask<T>;
        BufferDesc s = BufferDesc::Plane(src, rows, columns, srcRowBytes);
        BufferDesc d = BufferDesc::Plane(dst, rows, columns, dstRowBytes);
        BufferDesc m = BufferDesc::Scalar(&opaque);
        BlendInPlace<Pipeline, Tables...>(s, d, m);
    }
};

}  // namespace halideqk::adapters
