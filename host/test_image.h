// Twin copies of a host image with identical random contents, each in its own
// guarded allocation: one for the host's routine, one for the plug-in's.
// After both ran, the whole allocations are compared, so a write into the gap
// between rows or past the rectangle counts as a difference.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <random>
#include <string>

#include "host/guarded_buffer.h"

namespace host {

using Rng = std::mt19937;

// Bytes spanned by rows x columns elements at the given element strides, and
// the offset of element (0, 0) within them.
struct Layout {
    size_t bytes;
    size_t origin;
};

inline Layout StridedLayout(int rows, int columns, long rowStride, long step, size_t elemSize) {
    if (rows <= 0 || columns <= 0) return {64, 0};  // nothing may be touched
    const long lastRow = long(rows - 1) * rowStride, lastCol = long(columns - 1) * step;
    const long lo = std::min(0L, lastRow) + std::min(0L, lastCol);
    const long hi = std::max(0L, lastRow) + std::max(0L, lastCol);
    return {size_t(hi - lo + 1) * elemSize, size_t(-lo) * elemSize};
}

template <typename T>
Layout PlaneLayout(int rows, int columns, int rowBytes) {
    constexpr int shift = sizeof(T) == 1 ? 0 : sizeof(T) == 2 ? 1 : 2;
    return StridedLayout(rows, columns, rowBytes >> shift, 1, sizeof(T));
}

template <typename T>
class ImagePair {
public:
    ImagePair(Layout layout, GuardedBuffer::Align align, Rng &rng)
        : layout_(layout),
          ref_(std::make_unique<GuardedBuffer>(layout.bytes, align)),
          cand_(std::make_unique<GuardedBuffer>(layout.bytes, align)) {
        for (size_t i = 0; i < layout.bytes; ++i) ref_->data()[i] = uint8_t(rng());
        std::memcpy(cand_->data(), ref_->data(), layout.bytes);
    }

    T *ref() const { return reinterpret_cast<T *>(ref_->data() + layout_.origin); }
    T *cand() const { return reinterpret_cast<T *>(cand_->data() + layout_.origin); }

    // Empty when both copies are byte-for-byte equal, else where they first differ.
    std::string difference(const char *role) const {
        const uint8_t *a = ref_->data(), *b = cand_->data();
        if (std::memcmp(a, b, layout_.bytes) == 0) return {};
        size_t i = 0;
        while (a[i] == b[i]) ++i;
        const long offset = long(i) - long(layout_.origin);
        return std::string(role) + " differs at byte offset " + std::to_string(offset) +
               " (host " + std::to_string(a[i]) + ", plug-in " + std::to_string(b[i]) + ")";
    }

private:
    Layout layout_;
    std::unique_ptr<GuardedBuffer> ref_, cand_;
};

}  // namespace host
