#include "platform/base/relgraph/ZyrAuditUtilities.h"

#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbEntity.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutFormat.h"

#include <string>

namespace {

const wchar_t* whatIsWrong(ZyrReferenceVerdict verdict) {
    switch (verdict) {
    case kGoodReference:
        return L"is good";
    case kNullReference:
        return L"is null";
    case kForeignReference:
        return L"is of another drawing";
    case kMissingReference:
        return L"has no object";
    case kErasedReference:
        return L"is erased";
    case kWrongClassReference:
        return L"is of another class";
    }
    return L"is bad";
}

// "ZyrDbAreaStyle 12": what the id should be, and its handle.
std::wstring describeId(const HsDbObjectId& id, const HsRxClass* cls) {
    return hsutFormat(L"%s %llu", cls != nullptr ? cls->name() : L"object",
                      static_cast<unsigned long long>(id.handle()));
}

ZyrReferenceVerdict printIfBad(HsDbAuditInfo* info, const HsDbObject* object,
                               const HsDbObjectId& id, const HsRxClass* cls,
                               ZyrReferenceVerdict verdict, const wchar_t* outcome) {
    if (verdict != kGoodReference && info != nullptr)
        info->printError(object, describeId(id, cls).c_str(), whatIsWrong(verdict), outcome);
    return verdict;
}

const wchar_t* fixOutcome(const HsDbAuditInfo* info) {
    return info != nullptr && info->fixErrors() ? L"fixed" : L"not fixed";
}

} // namespace

const char* toString(ZyrReferenceVerdict verdict) {
    switch (verdict) {
    case kGoodReference:
        return "kGoodReference (0)";
    case kNullReference:
        return "kNullReference (1)";
    case kForeignReference:
        return "kForeignReference (2)";
    case kMissingReference:
        return "kMissingReference (3)";
    case kErasedReference:
        return "kErasedReference (4)";
    case kWrongClassReference:
        return "kWrongClassReference (5)";
    }
    return "unknown verdict";
}

namespace Zyr {

ZyrReferenceVerdict verifySymbolReference(const HsDbObject* object, const HsDbObjectId& id,
                                          const HsRxClass* cls, int allowNull, int allowErased) {
    if (id.isNull())
        return allowNull != 0 ? kGoodReference : kNullReference;
    if (object != nullptr && object->database() != nullptr && id.database() != object->database())
        return kForeignReference;
    if (!id.isValid())
        return kMissingReference;
    if (id.isErased() && allowErased == 0)
        return kErasedReference;
    if (cls != nullptr && !id.objectClass()->isDerivedFrom(cls))
        return kWrongClassReference;
    return kGoodReference;
}

} // namespace Zyr

ZyrReferenceVerdict ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(
    HsDbAuditInfo* info, const HsDbObject* object, const HsDbObjectId& id, const HsRxClass* cls) {
    return printIfBad(info, object, id, cls, Zyr::verifySymbolReference(object, id, cls, 0, 0),
                      fixOutcome(info));
}

ZyrReferenceVerdict ZyrAuditUtilities::verifyEntityReferenceAndPrintAuditError(
    HsDbAuditInfo* info, const HsDbEntity* entity, const HsDbObjectId& id, const HsRxClass* cls) {
    ZyrReferenceVerdict verdict = Zyr::verifySymbolReference(entity, id, cls, 0, 0);
    if (verdict == kGoodReference && !id.objectClass()->isDerivedFrom(HsDbEntity::desc()))
        verdict = kWrongClassReference;
    return printIfBad(info, entity, id, cls, verdict, fixOutcome(info));
}

int ZyrAuditUtilities::verifySymbolReferences(const HsDbObject* object,
                                              std::vector<HsDbObjectId>& ids, const HsRxClass* cls,
                                              int allowNull, int allowErased, bool fix) {
    // The lines go to the console the way an audit prints them; there is no audit to keep them.
    HsDbAuditInfo lines(fix);
    std::vector<HsDbObjectId> kept;
    int bad = 0;
    for (const HsDbObjectId& id : ids) {
        const ZyrReferenceVerdict verdict =
            Zyr::verifySymbolReference(object, id, cls, allowNull, allowErased);
        if (printIfBad(&lines, object, id, cls, verdict, fix ? L"removed" : L"kept") ==
            kGoodReference)
            kept.push_back(id);
        else
            ++bad;
    }
    if (fix && bad > 0)
        ids = std::move(kept);
    return bad;
}
