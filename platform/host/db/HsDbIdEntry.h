// The database's record behind an object id. Host use only: nothing outside the database keeps one.
#pragma once

#include <cstdint>

class HsDbDatabase;
class HsDbObject;

struct HsDbIdEntry {
    HsDbDatabase* database = nullptr;
    std::uint64_t handle = 0;
    // Null for a handle that was referred to but never given an object.
    HsDbObject* object = nullptr;
    bool erased = false;
};
