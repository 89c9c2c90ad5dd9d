// Stands in for an object whose class this build does not know, or whose stream a later version
// wrote: it keeps the class name and the filed bytes, and writes them back as they were.
#pragma once

#include "platform/host/db/HsDbObject.h"

#include <cstdint>
#include <string>
#include <vector>

// The owner is read and written as every object's is; the rest of the stream is kept as bytes.
// Ids inside those bytes stay handles of the drawing, which keeps its handles from load to save,
// so a proxy comes out byte for byte as it came in.
class HsDbProxyObject : public HsDbObject {
    HSRX_DECLARE_MEMBERS(HsDbProxyObject)

public:
    explicit HsDbProxyObject(std::wstring originalClassName);

    // The name under which the object's row was filed.
    const std::wstring& originalClassName() const { return m_className; }
    // The filed bytes after the owner.
    const std::vector<std::uint8_t>& data() const { return m_data; }

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;

private:
    std::wstring m_className;
    std::vector<std::uint8_t> m_data;
};
