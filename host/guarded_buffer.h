// Memory with an inaccessible page on each side, so that a routine reading or
// writing past either end of its data faults at once.
#pragma once

#include <cstddef>
#include <cstdint>

namespace host {

class GuardedBuffer {
public:
    enum class Align { End, Start };  // which end of the data touches its guard page

    explicit GuardedBuffer(size_t bytes, Align align = Align::End);
    ~GuardedBuffer();
    GuardedBuffer(const GuardedBuffer &) = delete;
    GuardedBuffer &operator=(const GuardedBuffer &) = delete;

    uint8_t *data() const { return data_; }
    size_t size() const { return bytes_; }

private:
    uint8_t *map_ = nullptr;
    size_t mapBytes_ = 0;
    uint8_t *data_ = nullptr;
    size_t bytes_ = 0;
};

}  // namespace host
