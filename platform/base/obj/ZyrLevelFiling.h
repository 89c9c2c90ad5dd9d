// The order in which every class level of an object, public or implementation, files itself:
// written once here, and used by the bases of this layer and by every module class alike.
#pragma once

#include "platform/base/obj/ZyrConvertLegacyExtendData.h"
#include "platform/base/obj/ZyrRegisterRelgraph.h"
#include "platform/host/filer/HsDbBdfFiler.h"

namespace Zyr {

// The own fields of a level that has none.
inline Hsys::ErrorStatus noOwnFields() {
    return Hsys::eSuccess;
}

// One level's read: the load guards (the relationship graph's first, so that it is destroyed
// last, also when an exception passes), the base's fields, the level's version word, its own
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

} // namespace Zyr
