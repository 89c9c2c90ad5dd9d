#include "platform/base/app/ZyrHdxEquipment.h"

#include "platform/base/dict/ZyrDict.h"
#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/db/HsDbTextStyleTable.h"
#include "platform/host/rx/HsRxClass.h"

namespace {

// The record every drawing has in a table of that kind, or null for a kind without one.
const wchar_t* standardRecordName(const HsRxClass* recordClass) {
    if (recordClass->isDerivedFrom(HsDbLayerTableRecord::desc()))
        return kHsDbLayerZero;
    if (recordClass->isDerivedFrom(HsDbTextStyleTableRecord::desc()))
        return kHsDbStandardTextStyle;
    if (recordClass->isDerivedFrom(HsDbBlockTableRecord::desc()))
        return kHsDbModelSpace;
    return nullptr;
}

} // namespace

void ZyrHdxEquipment::multipleSubst(ZyrRmCString& text, const ZyrRmCString& from,
                                    const ZyrRmCString& to) {
    text.Replace(from, to);
}

Hsys::ErrorStatus ZyrHdxEquipment::setString(ZyrImpObj* imp, const ZyrRmCString& newText,
                                             ZyrRmCString& field) {
    if (imp == nullptr)
        return Hsys::eNullPointer;
    if (field == newText)
        return Hsys::eSuccess;
    imp->assertParentWriteEnabled(true, true);
    field = newText;
    return Hsys::eSuccess;
}

void ZyrHdxEquipment::summaryInfoStringVector(ZyrDesc* desc, const ZyrRmCString& title,
                                              const ZyrRmCStringArray& names) {
    if (desc == nullptr)
        return;
    for (const ZyrRmCString& name : names)
        desc->addText(title, name);
}

Hsys::ErrorStatus ZyrHdxEquipment::convertToDictRecNames(const std::vector<HsDbObjectId>& ids,
                                                         ZyrRmCStringArray& names) {
    Hsys::ErrorStatus firstFailure = Hsys::eSuccess;
    for (const HsDbObjectId& id : ids) {
        ZyrRmCString name;
        const Hsys::ErrorStatus status = ZyrDict::recordName(id, name);
        if (status != Hsys::eSuccess) {
            name = id.isNull() ? ZyrDesc::kNoRecord : ZyrDesc::kInvalidRecord;
            if (firstFailure == Hsys::eSuccess)
                firstFailure = status;
        }
        names.push_back(name);
    }
    return firstFailure;
}

bool ZyrHdxEquipment::isRegularDictionaryInitialized(const wchar_t* dictionaryName,
                                                     HsDbDatabase* database) {
    HsDbObjectId id;
    return ZyrDict::findDictionary(database, dictionaryName, id) == Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrHdxEquipment::standardRecordId(const HsRxClass* recordClass,
                                                    TableGetter tableGetter, HsDbDatabase* database,
                                                    HsDbObjectId& id) {
    if (recordClass == nullptr || tableGetter == nullptr || database == nullptr)
        return Hsys::eNullPointer;
    HsDbObjectPointer<HsDbSymbolTable> table((database->*tableGetter)(), HsDb::kForRead);
    if (!table)
        return table.openStatus();
    if (!recordClass->isDerivedFrom(table->recordClass()))
        return Hsys::eWrongClass;
    const wchar_t* name = standardRecordName(recordClass);
    if (name == nullptr)
        return Hsys::eDoesNotApply;
    return table->getAt(name, id) == Hsys::eSuccess ? Hsys::eSuccess : Hsys::eNameNotFound;
}
