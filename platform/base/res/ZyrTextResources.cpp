#include "platform/base/res/ZyrTextResources.h"

namespace {
std::map<std::wstring, ZyrTextResources::Table>& tables() {
    static std::map<std::wstring, ZyrTextResources::Table> registered;
    return registered;
}
} // namespace

void ZyrTextResources::registerTable(const std::wstring& appName, Table table) {
    tables()[appName] = std::move(table);
}

void ZyrTextResources::unregisterTable(const std::wstring& appName) { tables().erase(appName); }

bool ZyrTextResources::hasTable(const std::wstring& appName) { return tables().count(appName) != 0; }

const std::wstring* ZyrTextResources::find(const std::wstring& appName, unsigned int id) {
    auto table = tables().find(appName);
    if (table == tables().end())
        return nullptr;
    auto text = table->second.find(id);
    return text != table->second.end() ? &text->second : nullptr;
}

std::wstring ZyrTextResources::placeholder(const std::wstring& appName, unsigned int id) {
    return L"<missing text " + std::to_wstring(id) + L" of " + appName + L">";
}
