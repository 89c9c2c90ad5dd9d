// Binary filing helpers shared by every level of every object: version words, system strings and
// nested implementation objects.
#pragma once

#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

class HsDbObject;
class HsRxClass;
class ZyrImpObj;
class ZyrRmCString;

namespace Zyr {

// Every level of every class of this release writes kCurrentVersion; kBirthVersion is the oldest
// stream a class of this layer ever wrote. The bases of this layer use the release's numbers too,
// so a whole object nests one version word per level, all 80 when this build wrote it.
inline constexpr std::int16_t kBirthVersion = 30;
inline constexpr std::int16_t kCurrentVersion = 80;
// Streams of versions 20 to 29 carried one bool after each level's version word, read and dropped.
inline constexpr std::int16_t kFirstVersionWithDroppedBool = 20;
inline constexpr std::int16_t kLastVersionWithDroppedBool = 29;

// The fewest bytes a nested object takes in a stream (its kind word): a reader checks a count of
// nested objects against it before reserving anything.
inline constexpr std::size_t kMinNestedObjectSize = 2;

// Writes a level's version word: int16 kCurrentVersion. The filer's status.
Hsys::ErrorStatus bdfWriteVersion(HsDbBdfFiler* filer);
// Reads a level's version word into version, then gates it: eNewerVersion for a version above
// kCurrentVersion (taken as signed), with nothing further read; for versions 20 to 29 reads and
// drops one bool. Otherwise the filer's status; version stays as it was when no word could be read.
Hsys::ErrorStatus bdfReadVersion(HsDbBdfFiler* filer, std::int16_t& version);

// A system string as a wide string of the filer. The reader leaves text as it was on failure.
Hsys::ErrorStatus bdfWriteItem(HsDbBdfFiler* filer, const ZyrRmCString& text);
Hsys::ErrorStatus bdfReadItem(HsDbBdfFiler* filer, ZyrRmCString& text);

// A new implementation object of the class, owned by the caller; null for a class that is no
// implementation class or that makes no objects.
ZyrImpObj* newImpObject(const HsRxClass* cls);

// A nested implementation object with its class, so that a reader can make the right object:
//
//   uint16 kind      0 no object, 1 a class number, 2 a class name
//   uint16 number    kind 1: the class's ZyrClassIdManager number
//   string name      kind 2: the class's registered name (classes without a number)
//   fields           kinds 1 and 2: the object's bdfOutFields
//
// version is the version word of the stream the object is nested in. Every version up to the
// current one files this layout; writeObject refuses a version above it with eBadArgument.
Hsys::ErrorStatus writeObject(HsDbBdfFiler* filer, const ZyrImpObj* object, unsigned short version);
// Reads a nested object into a new object of the filed class whose parent is owner, and on success
// puts it in place of object, deleting the object held before (null for kind 0). On failure object
// stays as it was and the new one is deleted. Statuses: the filer's for a short stream or a kind
// that is no kind (eFilerError); eNewerVersion for a version above the current one and for a class
// this build does not know, which comes from a build that knows more: the host keeps the object
// that holds it as a proxy; eWrongClass, with the filer failed, for a class that is no
// implementation class; otherwise the status of the object's bdfInFields.
Hsys::ErrorStatus readObject(HsDbBdfFiler* filer, ZyrImpObj* owner, ZyrImpObj*& object,
                             unsigned short version);
// The same for an object whose owner is a public object (the implementation object of a pair).
Hsys::ErrorStatus readObject(HsDbBdfFiler* filer, HsDbObject* owner, ZyrImpObj*& object,
                             unsigned short version);
// The same for a place that holds objects of cls only: a filed class not derived from it is
// refused before its fields are read, with eWrongClass and the filer failed.
Hsys::ErrorStatus readObjectOfClass(HsDbBdfFiler* filer, ZyrImpObj* owner, const HsRxClass* cls,
                                    ZyrImpObj*& object, unsigned short version);
Hsys::ErrorStatus readObjectOfClass(HsDbBdfFiler* filer, HsDbObject* owner, const HsRxClass* cls,
                                    ZyrImpObj*& object, unsigned short version);

// The typed form, for a field of a class of its own (a profile): only a T is taken.
template <class T, class Owner>
Hsys::ErrorStatus readObject(HsDbBdfFiler* filer, Owner* owner, T*& object,
                             unsigned short version) {
    ZyrImpObj* held = object;
    const Hsys::ErrorStatus status = readObjectOfClass(filer, owner, T::desc(), held, version);
    object = static_cast<T*>(held);
    return status;
}

// A list of nested objects of class T: uint32 count, then each object as readObject reads it.
// The objects are appended to read in order. A count the rest of the stream cannot hold and an
// empty place (kind 0) fail the filer with eFilerError; a failing object gives its status. On
// any failure read holds what came before, for the caller to drop: the list it replaces stays
// as it was.
template <class T, class Owner>
Hsys::ErrorStatus readObjectList(HsDbBdfFiler* filer, Owner* owner, unsigned short version,
                                 std::vector<std::unique_ptr<T>>& read) {
    std::uint32_t count = 0;
    if (filer->readUInt32(count) != Hsys::eSuccess)
        return filer->filerStatus();
    if (count > filer->remaining() / kMinNestedObjectSize) {
        filer->setFilerStatus(Hsys::eFilerError);
        return Hsys::eFilerError;
    }
    read.reserve(read.size() + count);
    for (std::uint32_t i = 0; i < count; ++i) {
        T* object = nullptr;
        if (const Hsys::ErrorStatus status = readObject(filer, owner, object, version);
            status != Hsys::eSuccess)
            return status;
        if (object == nullptr) {
            filer->setFilerStatus(Hsys::eFilerError);
            return Hsys::eFilerError;
        }
        read.emplace_back(object);
    }
    return Hsys::eSuccess;
}

} // namespace Zyr
