#include "platform/base/summary/ZyrDesc.h"

#include "platform/base/dict/ZyrDict.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/summary/ZyrDisplayFormat.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsutFormat.h"

namespace {

ZyrRmCString recordText(const HsDbObjectId* id, int flags) {
    if (id == nullptr || id->isNull())
        return ZyrDesc::kNoRecord;
    ZyrRmCString name;
    if (ZyrDict::recordName(*id, name) != Hsys::eSuccess)
        return ZyrDesc::kInvalidRecord;
    if ((flags & ZyrDesc::kWithRecordClass) == 0)
        return name;
    ZyrRmCString className;
    Zyr::classTypeToDisplayName(id->objectClass(), className);
    return hsutFormat(L"%s (%s)", name.GetString(), className.GetString());
}

} // namespace

void ZyrDesc::add(RowKind kind, const wchar_t* label, ZyrRmCString value) {
    m_rows.push_back(Row{kind, ZyrRmCString(label), std::move(value)});
}

void ZyrDesc::addText(const wchar_t* label, const wchar_t* text) {
    add(RowKind::kText, label, ZyrRmCString(text));
}

void ZyrDesc::addDistance(const wchar_t* label, int unit, int precision, double value) {
    ZyrRmCString text;
    Zyr::formatDistanceForDisplay(m_database, value, text, unit, precision);
    add(RowKind::kDistance, label, std::move(text));
}

void ZyrDesc::addCount(const wchar_t* label, long long value) {
    add(RowKind::kCount, label, hsutFormat(L"%lld", value));
}

void ZyrDesc::addRecordName(const wchar_t* label, const HsDbObjectId* id, int flags) {
    add(RowKind::kRecordName, label, recordText(id, flags));
}

std::vector<ZyrRmCString> ZyrDesc::lines() const {
    std::vector<ZyrRmCString> result;
    result.reserve(m_rows.size());
    for (const Row& row : m_rows)
        result.push_back(row.label.IsEmpty() ? row.value : row.label + L": " + row.value);
    return result;
}

ZyrRmCString ZyrDesc::text() const {
    ZyrRmCString result;
    for (const ZyrRmCString& line : lines()) {
        result += line;
        result += L'\n';
    }
    return result;
}
