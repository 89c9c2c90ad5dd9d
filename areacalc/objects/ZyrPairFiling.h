// The filing steps that every class level of a public/implementation pair of the module shares
// beyond the common level order (ZyrLevelFiling.h): the refusal of text drawing files.
#pragma once

#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/host/filer/HsDbTdfFiler.h"

namespace Zyr {

// The message of a text filer that would make an object from a text drawing file: the module's
// objects are filed in drawing files only, in their binary form.
const wchar_t* tdfNotSupportedMessage();

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
