// Buffer descriptions of host memory, built on the adapter's stack.
//
// A host image is a pointer, a row count, a column count and a signed row
// stride in bytes.  It becomes a Halide buffer with x = column (min 0,
// stride 1) and y = row (min 0, stride = row bytes shifted right by log2 of
// the element size; the shift is arithmetic so upward rows stay negative).
// With 0 rows the row dimension is left out.  Nothing here allocates.
#pragma once

#include <cstdint>
#include <type_traits>

#include "HalideRuntime.h"

namespace halideqk {

template <typename T>
constexpr halide_type_t ElementType() {
    using E = std::remove_const_t<T>;
    if constexpr (std::is_same_v<E, float>) {
        return halide_type_t(halide_type_float, 32);
    } else {
        static_assert(std::is_integral_v<E> && std::is_unsigned_v<E>, "unsigned samples");
        return halide_type_t(halide_type_uint, 8 * sizeof(E));
    }
}

template <typename T>
constexpr int ElementShift() {
    return sizeof(T) == 1 ? 0 : sizeof(T) == 2 ? 1 : 2;
}

// A descriptor with room for two dimensions.  raw() points the descriptor at
// its own dimension array, so a copied BufferDesc stays valid.
class BufferDesc {
public:
    halide_buffer_t *raw() {
        buf_.dim = dims_;
        return &buf_;
    }
    int dimensions() const { return buf_.dimensions; }
    const halide_dimension_t &dim(int i) const { return dims_[i]; }
    const void *host() const { return buf_.host; }

    // Image of `rows` x `columns` samples, `rowBytes` apart.
    template <typename T>
    static BufferDesc Plane(T *p, int rows, int columns, int32_t rowBytes) {
        BufferDesc d(p, ElementType<T>());
        d.dims_[0] = halide_dimension_t(0, columns, 1);
        d.dims_[1] = halide_dimension_t(0, rows, rowBytes >> ElementShift<T>());
        d.buf_.dimensions = rows == 0 ? 1 : 2;
        return d;
    }

    // Image whose row and column strides are given in elements.
    template <typename T>
    static BufferDesc Strided(T *p, int rows, int columns, int32_t rowStride, int32_t step) {
        BufferDesc d(p, ElementType<T>());
        d.dims_[0] = halide_dimension_t(0, columns, step);
        d.dims_[1] = halide_dimension_t(0, rows, rowStride);
        d.buf_.dimensions = rows == 0 ? 1 : 2;
        return d;
    }

    // One-dimensional run of `count` elements.
    template <typename T>
    static BufferDesc Run(T *p, int count) {
        BufferDesc d(p, ElementType<T>());
        d.dims_[0] = halide_dimension_t(0, count, 1);
        d.buf_.dimensions = 1;
        return d;
    }

    // Zero-dimensional buffer: one element, read at every position.
    template <typename T>
    static BufferDesc Scalar(const T *value) {
        BufferDesc d(value, ElementType<T>());
        d.buf_.dimensions = 0;
        return d;
    }

private:
    template <typename T>
    BufferDesc(T *p, halide_type_t type) {
        buf_.host = reinterpret_cast<uint8_t *>(const_cast<std::remove_const_t<T> *>(p));
        buf_.type = type;
    }

    halide_buffer_t buf_{};
    halide_dimension_t dims_[2]{};
};

// True when a rectangle has nothing to compute.  Adapters return at once for
// these: the pipelines would reject the one-dimensional or negative-extent
// buffers such sizes describe.
inline bool Empty(int rows, int columns) { return rows <= 0 || columns <= 0; }

}  // namespace halideqk
