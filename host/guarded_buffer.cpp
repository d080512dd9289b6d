#include "host/guarded_buffer.h"

#include <sys/mman.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>

namespace host {

GuardedBuffer::GuardedBuffer(size_t bytes, Align align) : bytes_(bytes) {
    const size_t page = static_cast<size_t>(sysconf(_SC_PAGESIZE));
    const size_t dataPages = (bytes + page - 1) / page;
    mapBytes_ = (dataPages + 2) * page;
    void *map = mmap(nullptr, mapBytes_, PROT_NONE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (map == MAP_FAILED) {
        std::perror("mmap");
        std::abort();
    }
    map_ = static_cast<uint8_t *>(map);
    if (dataPages > 0 && mprotect(map_ + page, dataPages * page, PROT_READ | PROT_WRITE) != 0) {
        std::perror("mprotect");
        std::abort();
    }
    uint8_t *first = map_ + page;
    data_ = align == Align::Start ? first : first + dataPages * page - bytes;
}

GuardedBuffer::~GuardedBuffer() { munmap(map_, mapBytes_); }

}  // namespace host
