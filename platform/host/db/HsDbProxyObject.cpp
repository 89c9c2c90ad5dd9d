#include "platform/host/db/HsDbProxyObject.h"

#include "platform/host/db/HsDbRegistration.h"
#include "platform/host/filer/HsDbBdfFiler.h"

// Never made by name: a proxy is filed under the name of the class it stands for.
HSRX_DEFINE_MEMBERS(HsDbProxyObject, HsDbObject, 0, nullptr)
HSDB_REGISTER_AT_LOAD(HsDbProxyObject)

HsDbProxyObject::HsDbProxyObject(std::wstring originalClassName)
    : m_className(std::move(originalClassName)) {}

Hsys::ErrorStatus HsDbProxyObject::bdfInFields(HsDbBdfFiler* filer) {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfInFields(filer); status != Hsys::eSuccess)
        return status;
    std::vector<std::uint8_t> data(filer->remaining());
    if (filer->readBytes(data.data(), data.size()) != Hsys::eSuccess)
        return filer->filerStatus();
    m_data = std::move(data);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbProxyObject::bdfOutFields(HsDbBdfFiler* filer) const {
    if (const Hsys::ErrorStatus status = HsDbObject::bdfOutFields(filer); status != Hsys::eSuccess)
        return status;
    filer->writeBytes(m_data.data(), m_data.size());
    return filer->filerStatus();
}
