#pragma once

#include <atomic>
#include <memory>

namespace Vesk_Hdl {

/// The record of an object, made at the first call: most objects of the kind need none. Several
/// threads that only read the object may call at the same time. The record of the first one is
/// taken; the others drop theirs.
template <class Record> Record &OwnLazily(std::atomic<Record *> &record) {
    Record *own = record.load(std::memory_order_acquire);
    if (own)
        return *own;
    auto made = std::make_unique<Record>();
    if (record.compare_exchange_strong(own, made.get(), std::memory_order_acq_rel))
        own = made.release();
    return *own;
}

} // namespace Vesk_Hdl
