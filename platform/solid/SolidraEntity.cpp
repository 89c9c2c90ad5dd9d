// Allocation of modeler entities, counted.
#include "platform/solid/SolidraEntity.h"

#include <atomic>
#include <new>

namespace Solidra {

namespace {

std::atomic<std::size_t> gLiveEntities{0};

} // namespace

void* Entity::operator new(std::size_t size) {
    void* memory = ::operator new(size);
    gLiveEntities.fetch_add(1, std::memory_order_relaxed);
    return memory;
}

void Entity::operator delete(void* memory) noexcept {
    if (memory == nullptr)
        return;
    gLiveEntities.fetch_sub(1, std::memory_order_relaxed);
    ::operator delete(memory);
}

std::size_t Entity::liveCount() noexcept {
    return gLiveEntities.load(std::memory_order_relaxed);
}

} // namespace Solidra
