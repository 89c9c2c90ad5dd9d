#include "platform/host/db/HsDbAuditInfo.h"

#include "platform/host/db/HsDbObject.h"
#include "platform/host/ut/HsutConsole.h"
#include "platform/host/ut/HsutFormat.h"

namespace {

const wchar_t* orEmpty(const wchar_t* text) {
    return text != nullptr ? text : L"";
}

} // namespace

void HsDbAuditInfo::errorsFound(int count) {
    if (count > 0)
        m_numErrors += count;
}

void HsDbAuditInfo::errorsFixed(int count) {
    if (count > 0)
        m_numFixes += count;
}

void HsDbAuditInfo::printError(const HsDbObject* object, const wchar_t* value,
                               const wchar_t* validation, const wchar_t* defaultValue) {
    const std::wstring name = object != nullptr ? object->describe() : L"(no object)";
    printError(name.c_str(), value, validation, defaultValue);
}

void HsDbAuditInfo::printError(const wchar_t* name, const wchar_t* value, const wchar_t* validation,
                               const wchar_t* defaultValue) {
    print(hsutFormat(L"%s  %s  %s  %s", orEmpty(name), orEmpty(value), orEmpty(validation),
                     orEmpty(defaultValue)));
}

void HsDbAuditInfo::printInfo(const wchar_t* text) {
    print(orEmpty(text));
}

void HsDbAuditInfo::print(std::wstring line) {
    hsutPrintf(L"%s\n", line.c_str());
    m_lines.push_back(std::move(line));
}
