// The base of everything the modeler allocates by itself (faces, bodies): its own allocation, so
// that what a caller gets from the modeler goes back through the modeler and can be counted.
#pragma once

#include <cstddef>

namespace Solidra {

class Entity {
public:
    // Virtual, so that deleting through any base pointer frees through the modeler.
    virtual ~Entity() = default;

    Entity(const Entity&) = delete;
    Entity& operator=(const Entity&) = delete;

    static void* operator new(std::size_t size);
    static void operator delete(void* memory) noexcept;

    // Entities allocated with new and not yet deleted, in the whole process: a leak shows here.
    static std::size_t liveCount() noexcept;

protected:
    Entity() = default;
};

} // namespace Solidra
