#include "platform/base/obj/ZyrFiling.h"

#include "platform/base/obj/ZyrClassIdManager.h"
#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

#include <memory>
#include <string>

namespace {

// The kinds of a nested object's head; filed, so the numbers stay.
enum NestedKind : std::uint16_t { kNoObject = 0, kClassNumber = 1, kClassName = 2 };

// Version words are compared as signed, as every level reads them.
bool isNewer(unsigned short version) {
    return static_cast<std::int16_t>(version) > Zyr::kCurrentVersion;
}

void writeClassOf(HsDbBdfFiler* filer, const ZyrImpObj* object) {
    HsRxClass* cls = object->isA();
    unsigned short number = 0;
    if (ZyrClassIdManager::classId(cls, number)) {
        filer->writeUInt16(kClassNumber);
        filer->writeUInt16(number);
        return;
    }
    filer->writeUInt16(kClassName);
    filer->writeString(cls->name());
}

// The class named by the head of a nested object. Null with eSuccess for "no object"; a failure
// for a stream that cannot say.
Hsys::ErrorStatus readClassOf(HsDbBdfFiler* filer, const HsRxClass*& cls) {
    cls = nullptr;
    std::uint16_t kind = 0;
    if (filer->readUInt16(kind) != Hsys::eSuccess)
        return filer->filerStatus();
    switch (kind) {
    case kNoObject:
        return Hsys::eSuccess;
    case kClassNumber: {
        std::uint16_t number = 0;
        if (filer->readUInt16(number) != Hsys::eSuccess)
            return filer->filerStatus();
        cls = ZyrClassIdManager::classFor(number);
        return cls != nullptr ? Hsys::eSuccess : Hsys::eNewerVersion;
    }
    case kClassName: {
        std::wstring name;
        if (filer->readString(name) != Hsys::eSuccess)
            return filer->filerStatus();
        cls = hsrxFindHsRxClass(name.c_str());
        return cls != nullptr ? Hsys::eSuccess : Hsys::eNewerVersion;
    }
    }
    filer->setFilerStatus(Hsys::eFilerError);
    return Hsys::eFilerError;
}

// Reads into a new object whose parent is owner (either kind of parent) and swaps it in only
// when it was read whole.
template <class Owner>
Hsys::ErrorStatus readNested(HsDbBdfFiler* filer, Owner* owner, const HsRxClass* required,
                             ZyrImpObj*& object, unsigned short version) {
    if (isNewer(version))
        return Hsys::eNewerVersion;
    const HsRxClass* cls = nullptr;
    if (const Hsys::ErrorStatus status = readClassOf(filer, cls); status != Hsys::eSuccess)
        return status;
    std::unique_ptr<ZyrImpObj> read;
    if (cls != nullptr) {
        if (cls->isDerivedFrom(required))
            read.reset(Zyr::newImpObject(cls));
        if (read == nullptr) {
            filer->setFilerStatus(Hsys::eFilerError);
            return Hsys::eWrongClass;
        }
        if (owner != nullptr)
            read->setParent(owner);
        if (const Hsys::ErrorStatus status = read->bdfInFields(filer); status != Hsys::eSuccess)
            return status;
        if (filer->filerStatus() != Hsys::eSuccess)
            return filer->filerStatus();
    }
    delete object;
    object = read.release();
    return Hsys::eSuccess;
}

} // namespace

namespace Zyr {

ZyrImpObj* newImpObject(const HsRxClass* cls) {
    if (cls == nullptr || !cls->isDerivedFrom(ZyrImpObj::desc()))
        return nullptr;
    std::unique_ptr<HsRxObject> made(cls->create());
    if (ZyrImpObj::cast(made.get()) == nullptr)
        return nullptr;
    return static_cast<ZyrImpObj*>(made.release());
}

Hsys::ErrorStatus bdfWriteVersion(HsDbBdfFiler* filer) {
    filer->writeInt16(kCurrentVersion);
    return filer->filerStatus();
}

Hsys::ErrorStatus bdfReadVersion(HsDbBdfFiler* filer, std::int16_t& version) {
    std::int16_t read = 0;
    if (filer->readInt16(read) != Hsys::eSuccess)
        return filer->filerStatus();
    version = read;
    if (read > kCurrentVersion)
        return Hsys::eNewerVersion;
    if (read >= kFirstVersionWithDroppedBool && read <= kLastVersionWithDroppedBool) {
        bool dropped = false;
        filer->readBool(dropped);
    }
    return filer->filerStatus();
}

Hsys::ErrorStatus bdfWriteItem(HsDbBdfFiler* filer, const ZyrRmCString& text) {
    filer->writeString(text.str());
    return filer->filerStatus();
}

Hsys::ErrorStatus bdfReadItem(HsDbBdfFiler* filer, ZyrRmCString& text) {
    std::wstring read;
    if (filer->readString(read) == Hsys::eSuccess)
        text = ZyrRmCString(std::move(read));
    return filer->filerStatus();
}

Hsys::ErrorStatus writeObject(HsDbBdfFiler* filer, const ZyrImpObj* object,
                              unsigned short version) {
    if (isNewer(version))
        return Hsys::eBadArgument;
    if (object == nullptr) {
        filer->writeUInt16(kNoObject);
        return filer->filerStatus();
    }
    writeClassOf(filer, object);
    if (const Hsys::ErrorStatus status = object->bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    return filer->filerStatus();
}

Hsys::ErrorStatus readObject(HsDbBdfFiler* filer, ZyrImpObj* owner, ZyrImpObj*& object,
                             unsigned short version) {
    return readNested(filer, owner, ZyrImpObj::desc(), object, version);
}

Hsys::ErrorStatus readObject(HsDbBdfFiler* filer, HsDbObject* owner, ZyrImpObj*& object,
                             unsigned short version) {
    return readNested(filer, owner, ZyrImpObj::desc(), object, version);
}

Hsys::ErrorStatus readObjectOfClass(HsDbBdfFiler* filer, ZyrImpObj* owner, const HsRxClass* cls,
                                    ZyrImpObj*& object, unsigned short version) {
    return readNested(filer, owner, cls, object, version);
}

Hsys::ErrorStatus readObjectOfClass(HsDbBdfFiler* filer, HsDbObject* owner, const HsRxClass* cls,
                                    ZyrImpObj*& object, unsigned short version) {
    return readNested(filer, owner, cls, object, version);
}

} // namespace Zyr
