// Identifies an object of a drawing database; the null id means unset.
#pragma once

#include <compare>
#include <cstdint>
#include <functional>
#include <iosfwd>

class HsDbDatabase;
class HsRxClass;
struct HsDbIdEntry;

// An id points at its database's entry for one handle and stays as long as the database lives.
// Ids of erased objects stay valid: lists keep them and walkers skip them with isErased().
class HsDbObjectId {
public:
    HsDbObjectId() = default;
    // Host use: the id of a database entry.
    explicit HsDbObjectId(HsDbIdEntry* entry) : m_entry(entry) {}

    static const HsDbObjectId kNull;

    bool isNull() const { return m_entry == nullptr; }
    void setNull() { m_entry = nullptr; }
    // True when an object stands behind the id, erased or not. A handle that a damaged file
    // referred to without holding its object gives an id that is not valid.
    bool isValid() const;
    bool isErased() const;
    // The class of the object behind the id, or null.
    HsRxClass* objectClass() const;
    HsDbDatabase* database() const;
    // The number the object keeps across saves and loads; 0 for the null id.
    std::uint64_t handle() const;

    HsDbIdEntry* entry() const { return m_entry; }

    friend bool operator==(const HsDbObjectId& a, const HsDbObjectId& b) = default;
    // By handle, so that sorted lists come out in the order of creation within a database.
    friend std::strong_ordering operator<=>(const HsDbObjectId& a, const HsDbObjectId& b);

private:
    HsDbIdEntry* m_entry = nullptr;
};

// Prints the handle, "0" for the null id.
std::ostream& operator<<(std::ostream& out, const HsDbObjectId& id);

template <> struct std::hash<HsDbObjectId> {
    std::size_t operator()(const HsDbObjectId& id) const noexcept {
        return std::hash<const HsDbIdEntry*>()(id.entry());
    }
};

namespace HsDb {
// How a stored id refers to its object. Owners keep what they own; pointers only refer.
enum ReferenceType {
    kSoftPointerRef = 0,
    kHardPointerRef = 1,
    kSoftOwnershipRef = 2,
    kHardOwnershipRef = 3
};
} // namespace HsDb

// An id that says in its type how a field refers to its object; it converts to and from a plain
// id freely, and files the same way.
template <HsDb::ReferenceType Type> class HsDbTypedObjectId : public HsDbObjectId {
public:
    HsDbTypedObjectId() = default;
    HsDbTypedObjectId(const HsDbObjectId& id) : HsDbObjectId(id) {}
    HsDbTypedObjectId& operator=(const HsDbObjectId& id) {
        HsDbObjectId::operator=(id);
        return *this;
    }
    static constexpr HsDb::ReferenceType kReferenceType = Type;
};

using HsDbSoftPointerId = HsDbTypedObjectId<HsDb::kSoftPointerRef>;
using HsDbHardPointerId = HsDbTypedObjectId<HsDb::kHardPointerRef>;
using HsDbSoftOwnershipId = HsDbTypedObjectId<HsDb::kSoftOwnershipRef>;
using HsDbHardOwnershipId = HsDbTypedObjectId<HsDb::kHardOwnershipRef>;
