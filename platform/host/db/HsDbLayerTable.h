// The layer table and its records; every entity lies on a layer.
#pragma once

#include "platform/host/db/HsDbSymbolTable.h"

// The name of the layer every drawing has.
inline constexpr const wchar_t* kHsDbLayerZero = L"0";

class HsDbLayerTableRecord : public HsDbSymbolTableRecord {
    HSRX_DECLARE_MEMBERS(HsDbLayerTableRecord)
};

class HsDbLayerTable : public HsDbSymbolTable {
    HSRX_DECLARE_MEMBERS(HsDbLayerTable)

public:
    HsRxClass* recordClass() const override;
};
