// Twin copies of a host image with identical random contents, each in its own
// guarded allocation: one for the host's routine, one for the plug-in's.
// After both ran, the whole allocations are compared, so a write into the gap
// between rows or past the rectangle counts as a difference.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cmath>
#include <cstring>
#include <limits>
#include <memory>
#include <random>
#include <string>
#include <type_traits>

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

// What an image is filled with: any bytes at all, or samples of the depth's
// domain (0..255 with the extremes and the midpoint often; 0..32768 for 16-bit;
// 0..1.25 for float, so masks above 1 occur too), or samples beyond it (the
// whole 16-bit range with the scale's ends often; floats from -0.25 to 1.25
// mixed with NaN, infinities, negative zero, denormals and exact k/255).
enum class Content { Bytes, Samples, Wide };

template <typename T>
T WideSample(Rng &rng) {
    if constexpr (std::is_same_v<T, float>) {
        static const float specials[] = {
            std::numeric_limits<float>::quiet_NaN(), -std::numeric_limits<float>::quiet_NaN(),
            std::numeric_limits<float>::infinity(),  -std::numeric_limits<float>::infinity(),
            -0.0f, 0.0f, 1.0f, 0.5f, -0.2f, 1.5f, 1e-40f, -1e-40f, 1e30f, -1e30f,
            std::nextafter(1.0f, 0.0f), std::nextafter(0.0f, 1.0f)};
        switch (rng() % 8) {
            case 0: return specials[rng() % (sizeof specials / sizeof specials[0])];
            case 1: return float(rng() % 256) / 255.0f;
            default: return std::uniform_real_distribution<float>(-0.25f, 1.25f)(rng);
        }
    } else {
        switch (rng() % 8) {
            case 0: return T(32768 - (rng() & 1));
            case 1: return T(sizeof(T) == 1 ? 255 : 65535);
            case 2: return T(0);
            default: return T(rng());
        }
    }
}

template <typename T>
T RandomSample(Rng &rng) {
    if constexpr (std::is_same_v<T, float>) {
        return std::uniform_real_distribution<float>(0.f, 1.25f)(rng);
    } else {
        constexpr uint32_t top = sizeof(T) == 1 ? 255 : 32768;
        switch (rng() % 8) {
            case 0: return T(0);
            case 1: return T(top);
            case 2: return T((top + 1) / 2 - (rng() & 1));
            default: return T(rng() % (top + 1));
        }
    }
}

template <typename T>
class ImagePair {
public:
    ImagePair(Layout layout, GuardedBuffer::Align align, Rng &rng, Content content = Content::Bytes)
        : layout_(layout),
          ref_(std::make_unique<GuardedBuffer>(layout.bytes, align)),
          cand_(std::make_unique<GuardedBuffer>(layout.bytes, align)) {
        if (content == Content::Bytes || layout.bytes % sizeof(T) != 0) {
            for (size_t i = 0; i < layout.bytes; ++i) ref_->data()[i] = uint8_t(rng());
        } else {
            for (size_t i = 0; i < layout.bytes; i += sizeof(T)) {
                const T v = content == Content::Wide ? WideSample<T>(rng) : RandomSample<T>(rng);
                std::memcpy(ref_->data() + i, &v, sizeof(T));
            }
        }
        std::memcpy(cand_->data(), ref_->data(), layout.bytes);
    }

    T *ref() const { return reinterpret_cast<T *>(ref_->data() + layout_.origin); }
    T *cand() const { return reinterpret_cast<T *>(cand_->data() + layout_.origin); }

    // Empty when both copies are byte-for-byte equal, else where they first differ.
    // Float images may be allowed `ulps` units in the last place.
    std::string difference(const char *role, int ulps = 0) const {
        const uint8_t *a = ref_->data(), *b = cand_->data();
        if (std::memcmp(a, b, layout_.bytes) == 0) return {};
        if (std::is_same_v<T, float> && ulps > 0 && layout_.bytes % 4 == 0) {
            for (size_t i = 0; i < layout_.bytes; i += 4) {
                int32_t x, y;
                std::memcpy(&x, a + i, 4);
                std::memcpy(&y, b + i, 4);
                if (std::abs(int64_t(x) - int64_t(y)) > ulps) {
                    float fx, fy;
                    std::memcpy(&fx, &x, 4);
                    std::memcpy(&fy, &y, 4);
                    return std::string(role) + " differs by more than " + std::to_string(ulps) +
                           " ulp at byte offset " + std::to_string(long(i) - long(layout_.origin)) +
                           " (host " + std::to_string(fx) + ", plug-in " + std::to_string(fy) + ")";
                }
            }
            return {};
        }
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
