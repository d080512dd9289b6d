#include "host/workloads.h"

namespace host {

Workload BandwidthBaseline(const Workload &w) {
    Workload base;
    base.bytesMoved = w.bytesMoved;
    base.writeOnly = w.writeOnly;
    if (w.writeOnly) {
        const size_t n = size_t(w.bytesMoved);
        auto dst = detail::RandomBytes(n);
        base.storage = {dst};
        base.run = [dst, n] { std::memset(dst->data(), 0x5A, n); };
    } else {
        const size_t n = size_t(w.bytesMoved / 2);
        auto src = detail::RandomBytes(n), dst = detail::RandomBytes(n);
        base.storage = {src, dst};
        base.run = [src, dst, n] { std::memcpy(dst->data(), src->data(), n); };
    }
    return base;
}

}  // namespace host
