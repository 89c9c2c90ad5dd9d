#include "platform/base/res/ZyrTextResources.h"

namespace {
// Looked up by a view of the name: texts are read once per calculation record, and building a
// string for every lookup would cost an allocation each time.
using Tables = std::map<std::wstring, std::map<unsigned int, ZyrRmCString>, std::less<>>;

Tables& tables() {
    static Tables registered;
    return registered;
}

std::uint64_t& currentGeneration() {
    static std::uint64_t generation = 1;
    return generation;
}
} // namespace

void ZyrTextResources::registerTable(const std::wstring& appName, Table table) {
    std::map<unsigned int, ZyrRmCString> texts;
    for (auto& [id, text] : table)
        texts.emplace(id, std::move(text));
    tables()[appName] = std::move(texts);
    ++currentGeneration();
}

void ZyrTextResources::unregisterTable(const std::wstring& appName) {
    tables().erase(appName);
    ++currentGeneration();
}

std::uint64_t ZyrTextResources::generation() { return currentGeneration(); }

bool ZyrTextResources::hasTable(const std::wstring& appName) { return tables().count(appName) != 0; }

const ZyrRmCString* ZyrTextResources::find(std::wstring_view appName, unsigned int id) {
    auto table = tables().find(appName);
    if (table == tables().end())
        return nullptr;
    auto text = table->second.find(id);
    return text != table->second.end() ? &text->second : nullptr;
}

std::wstring ZyrTextResources::placeholder(std::wstring_view appName, unsigned int id) {
    return L"<missing text " + std::to_wstring(id) + L" of " + std::wstring(appName) + L">";
}
