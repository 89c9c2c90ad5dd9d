// The schedule system's component descriptions: one instance of each registered class, found by
// the class of the object it serves.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <memory>
#include <utility>
#include <vector>

class HsDbObject;
class HsRxClass;
class ZyrCompSpec;

class ZyrCompSpecFactory {
public:
    ZyrCompSpecFactory();
    ~ZyrCompSpecFactory();
    ZyrCompSpecFactory(const ZyrCompSpecFactory&) = delete;
    ZyrCompSpecFactory& operator=(const ZyrCompSpecFactory&) = delete;

    // Makes the class's instance. eNullPointer for null, eAlreadyPresent for a class registered
    // already, eWrongClass when the class does not create a ZyrCompSpec.
    Hsys::ErrorStatus registerCompSpec(HsRxClass* compSpecClass);
    // Deletes the instance. eNullPointer for null, eNameNotFound for a class not registered.
    Hsys::ErrorStatus unRegisterCompSpec(const HsRxClass* compSpecClass);
    bool isRegistered(const HsRxClass* compSpecClass) const;
    int count() const { return static_cast<int>(m_entries.size()); }

    // The first instance, in the order of registration, whose worksWith() the object's class is
    // derived from; null for a null object or when none serves it.
    ZyrCompSpec* compSpecFor(const HsDbObject* object) const;

private:
    using Entry = std::pair<HsRxClass*, std::unique_ptr<ZyrCompSpec>>;

    std::vector<Entry>::const_iterator find(const HsRxClass* compSpecClass) const;

    std::vector<Entry> m_entries;
};
