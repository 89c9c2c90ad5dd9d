// An owning array of implementation objects that files the class of each entry, so that a list
// of mixed classes (the children of a tree node) reads back without being told its classes.
#pragma once

#include "platform/base/obj/ZyrImpObj.h"
#include "platform/base/res/ZyrRmCString.h"

#include <vector>

// Each entry's parent is the array, so that an entry's dbParent() is that of the object holding
// the array (which makes itself the array's parent). An object stands at most once in an array:
// the array owns it and deletes it once.
//
// Binary filing after ZyrImpObj's: int16 80, a uint32 count, then each entry nested with its class
// (Zyr::writeObject). Text filing: an item of group 102 with the control string, one of group 90
// with the count, and per entry one of group 1 with its class name followed by its own items.
// Readers read every entry before they replace any, so a failed read leaves the array as it was.
class ZyrImpArray : public ZyrImpObj {
    HSRX_DECLARE_MEMBERS(ZyrImpArray)

public:
    static constexpr int kControlGroupCode = 102;
    static constexpr int kCountGroupCode = 90;
    static constexpr int kClassGroupCode = 1;

    ZyrImpArray();
    // Deletes every entry.
    ~ZyrImpArray() override;

    // Deep: a clone of every entry of another array, which replace the entries (deleted);
    // eBadArgument for an object that is no array, or an entry that cannot be cloned (nothing
    // changed then). The control string is the array's own and stays.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override;
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override;
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override;
    // A control string other than the array's fails the filer with eBadTdfSequence.
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override;
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override;
    // ZyrImpObj's operation, then each entry's in order; every entry runs, and the first status
    // that is not eSuccess is the answer (an audit's 120 or 122 included).
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override;
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override;
    Hsys::ErrorStatus verifyReferences(int& badCount, bool fix) override;
    Hsys::ErrorStatus subSetDatabaseDefaults(HsDbDatabase* database) override;
    Hsys::ErrorStatus setToStandard(HsDbDatabase* database) override;

    // The text that marks the array in text filing.
    void setTdfControlString(const wchar_t* controlString);
    const ZyrRmCString& tdfControlString() const { return m_controlString; }

    int length() const { return static_cast<int>(m_entries.size()); }
    // Null outside [0, length()).
    ZyrImpObj* at(int index) const;
    // Index of the entry, or -1.
    int find(const ZyrImpObj* object) const;

    // Takes ownership and inserts before index (length() appends), making the array the object's
    // parent. Asserts write on the parent. eNullPointer for null, eInvalidIndex outside
    // [0, length()], eAlreadyPresent for an entry of this array; on a refusal the caller keeps
    // the object.
    Hsys::ErrorStatus insertAt(int index, ZyrImpObj* object);
    Hsys::ErrorStatus append(ZyrImpObj* object);
    // Takes the entry out and hands it to the caller, without a parent; null outside the range.
    ZyrImpObj* removeAt(int index);
    // eInvalidIndex outside the range.
    Hsys::ErrorStatus deleteAt(int index);
    void deleteAll();

private:
    // This level's own fields, after its base's and its version word.
    Hsys::ErrorStatus bdfInOwnFields(HsDbBdfFiler* filer);
    Hsys::ErrorStatus bdfOutOwnFields(HsDbBdfFiler* filer) const;
    // Runs the operation on each entry; the first status that is not eSuccess.
    template <class Operation> Hsys::ErrorStatus forEachEntry(Operation operation) const;
    Hsys::ErrorStatus readTdfEntry(HsDbTdfFiler* filer, ZyrImpObj*& entry);
    // Deletes the entries and takes the new ones.
    void replaceEntries(std::vector<ZyrImpObj*> entries);

    std::vector<ZyrImpObj*> m_entries;
    ZyrRmCString m_controlString;
};
