// How adapters describe host memory to the pipelines.
#include <gtest/gtest.h>

#include "adapters/buffer_desc.h"
#include "adapters/routine_set.h"

namespace {

using halideqk::BufferDesc;

TEST(BufferDesc, PlaneStridesAreRowBytesShiftedArithmetically) {
    uint8_t b8[4];
    uint16_t b16[4];
    float bf[4];
    BufferDesc d8 = BufferDesc::Plane(b8, 7, 5, 37);
    EXPECT_EQ(d8.dimensions(), 2);
    EXPECT_EQ(d8.dim(0).min, 0);
    EXPECT_EQ(d8.dim(0).extent, 5);
    EXPECT_EQ(d8.dim(0).stride, 1);
    EXPECT_EQ(d8.dim(1).min, 0);
    EXPECT_EQ(d8.dim(1).extent, 7);
    EXPECT_EQ(d8.dim(1).stride, 37);
    EXPECT_EQ(d8.raw()->type, halide_type_t(halide_type_uint, 8));

    EXPECT_EQ(BufferDesc::Plane(b16, 3, 2, 41).dim(1).stride, 20);   // odd row bytes
    EXPECT_EQ(BufferDesc::Plane(b16, 3, 2, -41).dim(1).stride, -21);  // arithmetic shift
    EXPECT_EQ(BufferDesc::Plane(b8, 3, 2, -64).dim(1).stride, -64);
    EXPECT_EQ(BufferDesc::Plane(bf, 3, 2, 30).dim(1).stride, 7);
    EXPECT_EQ(BufferDesc::Plane(bf, 3, 2, -30).dim(1).stride, -8);
    EXPECT_EQ(BufferDesc::Plane(b16, 3, 2, 4).raw()->type, halide_type_t(halide_type_uint, 16));
    EXPECT_EQ(BufferDesc::Plane(bf, 3, 2, 8).raw()->type, halide_type_t(halide_type_float, 32));
}

TEST(BufferDesc, ZeroRowsDescribeOneDimension) {
    uint8_t b[4];
    BufferDesc d = BufferDesc::Plane(b, 0, 9, 16);
    EXPECT_EQ(d.dimensions(), 1);
    EXPECT_EQ(d.dim(0).extent, 9);
}

TEST(BufferDesc, ScalarsAreZeroDimensionalAndRawIsSelfContained) {
    const uint8_t value = 0x34;
    BufferDesc copy = BufferDesc::Scalar(&value);
    BufferDesc d = copy;  // a copy must not point at the original's dimensions
    halide_buffer_t *raw = d.raw();
    EXPECT_EQ(raw->dimensions, 0);
    EXPECT_EQ(raw->host, &value);
    uint8_t pixels[4];
    BufferDesc p = BufferDesc::Plane(pixels, 2, 2, 2);
    BufferDesc q = p;
    EXPECT_EQ(q.raw()->dim, reinterpret_cast<halide_buffer_t *>(&q)->dim);
}

TEST(BufferDesc, StridedUsesElementCounts) {
    uint16_t b[4];
    BufferDesc d = BufferDesc::Strided(b, 4, 3, 100, 4);
    EXPECT_EQ(d.dim(0).stride, 4);
    EXPECT_EQ(d.dim(1).stride, 100);
}

TEST(OpaqueMask, OneValuePerDepthInBothSets) {
    EXPECT_EQ(halide_sse41::OpaqueMaskValue<u8>(), 255);
    EXPECT_EQ(halide_sse41::OpaqueMaskValue<u16>(), 32768);
    EXPECT_EQ(halide_sse41::OpaqueMaskValue<float>(), 1.0f);
    EXPECT_EQ(halide_avx2::OpaqueMaskValue<u8>(), 255);
    EXPECT_EQ(halide_avx2::OpaqueMaskValue<u16>(), 32768);
    EXPECT_EQ(halide_avx2::OpaqueMaskValue<float>(), 1.0f);
}

}  // namespace
