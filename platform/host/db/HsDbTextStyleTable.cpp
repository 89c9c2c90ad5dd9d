#include "platform/host/db/HsDbTextStyleTable.h"

#include "platform/host/db/HsDbRegistration.h"
#include "platform/host/filer/HsDbBdfFiler.h"

#include <cmath>

HSRX_DEFINE_MEMBERS(HsDbTextStyleTableRecord, HsDbSymbolTableRecord, 0,
                    hsrxInstantiateClass<HsDbTextStyleTableRecord>)
HSRX_DEFINE_MEMBERS(HsDbTextStyleTable, HsDbSymbolTable, 0,
                    hsrxInstantiateClass<HsDbTextStyleTable>)
HSDB_REGISTER_AT_LOAD(HsDbTextStyleTableRecord)
HSDB_REGISTER_AT_LOAD(HsDbTextStyleTable)

namespace {

bool isTextSize(double size) {
    return std::isfinite(size) && size >= 0.0;
}

} // namespace

HsRxClass* HsDbTextStyleTable::recordClass() const {
    return HsDbTextStyleTableRecord::desc();
}

Hsys::ErrorStatus HsDbTextStyleTableRecord::setTextSize(double size) {
    if (!isTextSize(size))
        return Hsys::eBadArgument;
    assertWriteEnabled();
    m_textSize = size;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbTextStyleTableRecord::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbSymbolTableRecord::bdfInFields(filer);
        status != Hsys::eSuccess)
        return status;
    double size = 0.0;
    if (filer->readDouble(size) != Hsys::eSuccess)
        return filer->filerStatus();
    if (!isTextSize(size)) {
        filer->setFilerStatus(Hsys::eFilerError);
        return filer->filerStatus();
    }
    m_textSize = size;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbTextStyleTableRecord::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbSymbolTableRecord::bdfOutFields(filer);
        status != Hsys::eSuccess)
        return status;
    filer->writeDouble(m_textSize);
    return filer->filerStatus();
}
