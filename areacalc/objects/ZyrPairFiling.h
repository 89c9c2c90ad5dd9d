// The filing steps that every class level of a public/implementation pair shares: the order of a
// level's read and write, and the refusal of text drawing files.
#pragma once

#include "platform/base/obj/ZyrConvertLegacyExtendData.h"
#include "platform/base/obj/ZyrRegisterRelgraph.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"

namespace Zyr {

// The message of a text filer that would make an object from a text drawing file: the module's
// objects are filed in drawing files only, in their binary form.
const wchar_t* tdfNotSupportedMessage();

// One level's read, in the order every level keeps: the load guards (the relationship graph's
// first, so that it is destroyed last), the base's fields, the level's version word, its own
// fields. The first failure is returned as it is; otherwise the filer's status.
template <class ReadBase, class ReadVersion, class ReadOwn>
Hsys::ErrorStatus bdfInLevel(HsDbBdfFiler* filer, const HsRxObject* object, const HsRxClass* cls,
                             ReadBase readBase, ReadVersion readVersion, ReadOwn readOwn) {
    ZyrRegisterRelgraph relgraph(filer, object, cls);
    ZyrConvertLegacyExtendData legacy(filer, object, cls);
    if (const Hsys::ErrorStatus status = readBase(); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = readVersion(); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = readOwn(); status != Hsys::eSuccess)
        return status;
    return filer->filerStatus();
}

// One level's write: the base's fields, the version word, the level's own fields.
template <class WriteBase, class WriteVersion, class WriteOwn>
Hsys::ErrorStatus bdfOutLevel(HsDbBdfFiler* filer, WriteBase writeBase, WriteVersion writeVersion,
                              WriteOwn writeOwn) {
    if (const Hsys::ErrorStatus status = writeBase(); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = writeVersion(); status != Hsys::eSuccess)
        return status;
    if (const Hsys::ErrorStatus status = writeOwn(); status != Hsys::eSuccess)
        return status;
    return filer->filerStatus();
}

// A text filer may change an object that exists (a property edit); one that would make the object
// from a text drawing file is refused with eBadTdfSequence and tdfNotSupportedMessage().
template <class ReadBase>
Hsys::ErrorStatus tdfInUnlessFromFile(HsDbTdfFiler* filer, ReadBase readBase) {
    if (!filer->isModifyingExistingObject()) {
        filer->setError(Hsys::eBadTdfSequence, tdfNotSupportedMessage());
        return Hsys::eBadTdfSequence;
    }
    return readBase();
}

// Writing to a text drawing file is not implemented; every other text filer gets the base's items.
template <class WriteBase>
Hsys::ErrorStatus tdfOutUnlessToFile(HsDbTdfFiler* filer, WriteBase writeBase) {
    if (filer->filerType() == HsDb::kFileFiler)
        return Hsys::eNotImplemented;
    return writeBase();
}

} // namespace Zyr
