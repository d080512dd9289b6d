// Fills and moves.
#include <cstdint>

#include "host/reference/rows.h"
#include "host/reference_routines.h"

namespace {

using host_ref::Row;

template <typename T>
void FillRun(T *dst, int count, T value) {
    for (int i = 0; i < count; ++i) dst[i] = value;
}

template <typename T>
void FillRect(T *dst, int rows, int columns, int rowBytes, T value) {
    for (int y = 0; y < rows; ++y) {
        T *row = Row(dst, y, rowBytes);
        for (int x = 0; x < columns; ++x) row[x] = value;
    }
}

// Strides and steps count elements.
template <typename T>
void StepMove(const T *src, T *dst, int rows, int columns, int srcRowStride, int dstRowStride,
              int srcStep, int dstStep) {
    for (int y = 0; y < rows; ++y) {
        for (int x = 0; x < columns; ++x) {
            dst[intptr_t(y) * dstRowStride + intptr_t(x) * dstStep] =
                src[intptr_t(y) * srcRowStride + intptr_t(x) * srcStep];
        }
    }
}

}  // namespace

namespace host_ref {

void SetBytes(u8 *dst, int count, u8 value) { FillRun(dst, count, value); }
void SetShorts(u16 *dst, int count, u16 value) { FillRun(dst, count, value); }
void Set32Bit(void *dst, int count, u32 value) { FillRun(static_cast<u32 *>(dst), count, value); }

void BlockMove(const u8 *src, u8 *dst, int count) {
    for (int i = 0; i < count; ++i) dst[i] = src[i];
}

void SetRect(u8 *dst, int rows, int columns, int rowBytes, u8 value) {
    FillRect(dst, rows, columns, rowBytes, value);
}
void SetRectDeep(u16 *dst, int rows, int columns, int rowBytes, u16 value) {
    FillRect(dst, rows, columns, rowBytes, value);
}

void MoveRect(const u8 *src, u8 *dst, int rows, int columns, int srcRowBytes, int dstRowBytes) {
    for (int y = 0; y < rows; ++y) {
        const u8 *in = Row(src, y, srcRowBytes);
        u8 *out = Row(dst, y, dstRowBytes);
        for (int x = 0; x < columns; ++x) out[x] = in[x];
    }
}

void StepMoveRect(const u8 *src, u8 *dst, int rows, int columns, int srcRowStride,
                  int dstRowStride, int srcStep, int dstStep) {
    StepMove(src, dst, rows, columns, srcRowStride, dstRowStride, srcStep, dstStep);
}
void StepMoveRectDeep(const u16 *src, u16 *dst, int rows, int columns, int srcRowStride,
                      int dstRowStride, int srcStep, int dstStep) {
    StepMove(src, dst, rows, columns, srcRowStride, dstRowStride, srcStep, dstStep);
}
void StepMoveRectFloat(const float *src, float *dst, int rows, int columns, int srcRowStride,
                       int dstRowStride, int srcStep, int dstStep) {
    StepMove(src, dst, rows, columns, srcRowStride, dstRowStride, srcStep, dstStep);
}

}  // namespace host_ref
