#include "platform/host/db/HsDbLayerTable.h"

#include "platform/host/db/HsDbRegistration.h"

HSRX_DEFINE_MEMBERS(HsDbLayerTableRecord, HsDbSymbolTableRecord, 0,
                    hsrxInstantiateClass<HsDbLayerTableRecord>)
HSRX_DEFINE_MEMBERS(HsDbLayerTable, HsDbSymbolTable, 0, hsrxInstantiateClass<HsDbLayerTable>)
HSDB_REGISTER_AT_LOAD(HsDbLayerTableRecord)
HSDB_REGISTER_AT_LOAD(HsDbLayerTable)

HsRxClass* HsDbLayerTable::recordClass() const {
    return HsDbLayerTableRecord::desc();
}
