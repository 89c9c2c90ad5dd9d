// The text style table and its records, each with the text size its texts take.
#pragma once

#include "platform/host/db/HsDbSymbolTable.h"

// The name of the text style every drawing has.
inline constexpr const wchar_t* kHsDbStandardTextStyle = L"Standard";

class HsDbTextStyleTableRecord : public HsDbSymbolTableRecord {
    HSRX_DECLARE_MEMBERS(HsDbTextStyleTableRecord)

public:
    // The size of the texts in drawing units; 0 leaves the size to each text.
    double textSize() const { return m_textSize; }
    // Needs write. eBadArgument for a size below 0 or not finite.
    Hsys::ErrorStatus setTextSize(double size);

    // A stored size below 0 or not finite fails the filer with eFilerError.
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    double m_textSize = 0.0;
};

class HsDbTextStyleTable : public HsDbSymbolTable {
    HSRX_DECLARE_MEMBERS(HsDbTextStyleTable)

public:
    HsRxClass* recordClass() const override;
};
