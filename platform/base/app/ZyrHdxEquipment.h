// Static helpers the sibling modules share for texts, records and summaries.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <vector>

class HsDbDatabase;
class HsDbObjectId;
class HsRxClass;
class ZyrDesc;
class ZyrImpObj;

class ZyrHdxEquipment {
public:
    // How a database names the id of one of its symbol tables (&HsDbDatabase::textStyleTableId).
    using TableGetter = HsDbObjectId (HsDbDatabase::*)() const;

    ZyrHdxEquipment() = delete;

    // Replaces every occurrence of `from` in `text` by `to`, from left to right. Inserted text is
    // not searched again, so `to` may contain `from`; an empty `from` changes nothing.
    static void multipleSubst(ZyrRmCString& text, const ZyrRmCString& from, const ZyrRmCString& to);

    // Stores newText in a text field of an implementation object. An equal text changes nothing;
    // otherwise write is asserted on the object's parent first (which throws when the parent is not
    // open for write). eNullPointer for a null object.
    static Hsys::ErrorStatus setString(ZyrImpObj* imp, const ZyrRmCString& newText,
                                       ZyrRmCString& field);

    // One text row per name, each labelled with the title; no names, no rows.
    static void summaryInfoStringVector(ZyrDesc* desc, const ZyrRmCString& title,
                                        const ZyrRmCStringArray& names);

    // Appends the name of each dictionary record, in order; an id that gives no record name
    // appends a placeholder in its place, so that names and ids stay parallel. The status is that
    // of the first id that failed, or eSuccess.
    static Hsys::ErrorStatus convertToDictRecNames(const std::vector<HsDbObjectId>& ids,
                                                   ZyrRmCStringArray& names);

    // True when the database's named object dictionary holds a dictionary under that name: the
    // facility that keeps its records there has been set up in the drawing. False for a null
    // database or name.
    static bool isRegularDictionaryInitialized(const wchar_t* dictionaryName,
                                               HsDbDatabase* database);

    // The standard record of a symbol table: layer "0", text style "Standard", model space for the
    // block table. recordClass names the kind, tableGetter the table. eNullPointer for a null
    // class, getter or database, eWrongClass when the table does not hold records of that class,
    // eDoesNotApply for a kind without a standard record, eNameNotFound when the drawing lacks it.
    static Hsys::ErrorStatus standardRecordId(const HsRxClass* recordClass, TableGetter tableGetter,
                                              HsDbDatabase* database, HsDbObjectId& id);
};
