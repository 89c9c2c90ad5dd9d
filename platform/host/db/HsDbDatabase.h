// A drawing database: it owns its objects, hands out their ids and keeps the standard records.
#pragma once

#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/rx/HsRxObject.h"

#include <cstdint>
#include <map>
#include <memory>
#include <string>
#include <vector>

class HsDbAuditInfo;
class HsDbDatabaseReactor;
class HsDbObject;
class HsDbTransactionManager;
struct HsDbIdEntry;

// The standard records are the named object dictionary, the block table with its model space, the
// layer table with layer "0" and the text style table with "Standard". A database made empty holds
// none of them until a drawing file is read into it.
class HsDbDatabase : public HsRxObject {
    HSRX_DECLARE_MEMBERS(HsDbDatabase)

public:
    explicit HsDbDatabase(HsDb::DrawingSetup setup = HsDb::kStandardRecords,
                          HsDb::TransactionSupport transactions = HsDb::kWithTransactions);
    HsDbDatabase(const HsDbDatabase&) = delete;
    HsDbDatabase& operator=(const HsDbDatabase&) = delete;
    // Deletes every object, open or not; ids into the database are dead afterwards.
    ~HsDbDatabase() override;

    // Takes ownership of an object in no database, gives it the next handle, fills its defaults
    // through subSetDatabaseDefaults and leaves it open for write: the caller closes it.
    // eNullPointer for null, eAlreadyPresent for an object that a database holds already.
    Hsys::ErrorStatus addHsDbObject(HsDbObjectId& id, HsDbObject* object);

    // The id of a handle. With createIfNotFound an unknown handle gets an entry without an object,
    // as a reference read before its object; otherwise it gives eKeyNotFound. Handle 0 is the null
    // id and gives eNullId.
    Hsys::ErrorStatus getHsDbObjectId(HsDbObjectId& id, bool createIfNotFound,
                                      std::uint64_t handle);
    // Every id with an object, erased ones too, in the order of their handles.
    std::vector<HsDbObjectId> objectIds() const;

    HsDbObjectId namedObjectsDictionaryId() const { return m_roots.namedObjects; }
    HsDbObjectId blockTableId() const { return m_roots.blockTable; }
    HsDbObjectId layerTableId() const { return m_roots.layerTable; }
    HsDbObjectId textStyleTableId() const { return m_roots.textStyleTable; }
    HsDbObjectId modelSpaceId() const { return m_roots.modelSpace; }
    // The layer and text style that new entities and texts take.
    HsDbObjectId currentLayerId() const { return m_roots.currentLayer; }
    HsDbObjectId currentTextStyleId() const { return m_roots.currentTextStyle; }
    // eWrongClass unless the id is a layer (text style) record of this database.
    Hsys::ErrorStatus setCurrentLayerId(const HsDbObjectId& layerId);
    Hsys::ErrorStatus setCurrentTextStyleId(const HsDbObjectId& textStyleId);

    // The length unit of the drawing; areas are in its square.
    HsDb::UnitsValue drawingUnits() const { return m_units.drawing; }
    void setDrawingUnits(HsDb::UnitsValue units) { m_units.drawing = units; }
    // The length unit in which values are shown, and the decimals shown (0 to 8).
    HsDb::UnitsValue displayUnits() const { return m_units.display; }
    void setDisplayUnits(HsDb::UnitsValue units) { m_units.display = units; }
    int displayPrecision() const { return m_units.precision; }
    // eBadArgument outside 0 to 8.
    Hsys::ErrorStatus setDisplayPrecision(int decimals);
    // A value in drawing units (square drawing units) in display units (their square). Nothing is
    // converted when either unit is unitless.
    double lengthInDisplayUnits(double length) const;
    double areaInDisplayUnits(double area) const;

    // Null for a drawing of its own; the block of the host drawing that references it otherwise.
    HsDbObjectId xrefBlockId() const { return m_xrefBlockId; }
    void setXrefBlockId(const HsDbObjectId& blockId) { m_xrefBlockId = blockId; }

    // The file last saved to or read from; empty for a new drawing.
    Hsys::ErrorStatus getFilename(const wchar_t*& fileName) const;

    // Null for a database made without transactions.
    HsDbTransactionManager* transactionManager() const { return m_transactions.get(); }

    // Writes the whole drawing to one file, atomically: on any failure the file that was there
    // stays as it was. Every object is opened for read on the way, so none may be open for write.
    Hsys::ErrorStatus saveAs(const wchar_t* fileName, std::wstring* reason = nullptr);
    // Reads a drawing into a database made empty. On failure it stays empty and reason, when
    // given, says what was wrong. eDoesNotApply for a database that holds objects already.
    Hsys::ErrorStatus readDrawingFile(const wchar_t* fileName, std::wstring* reason = nullptr);

    // Audits every object that is not erased: open for write when the audit may fix, for read
    // otherwise. Objects that cannot be opened are skipped and counted as errors.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info);

    // Reactors hear of objects that enter the database, of its emptying and of its end. Not owned;
    // adding one twice keeps one, removing one that is not registered does nothing.
    void addReactor(HsDbDatabaseReactor* reactor);
    void removeReactor(HsDbDatabaseReactor* reactor);

private:
    friend class HsDbDrawingFile;
    friend class HsDbObject;

    // The ids that name the standard records; all are filed in a drawing file's header.
    struct Roots {
        HsDbObjectId namedObjects;
        HsDbObjectId blockTable;
        HsDbObjectId layerTable;
        HsDbObjectId textStyleTable;
        HsDbObjectId modelSpace;
        HsDbObjectId currentLayer;
        HsDbObjectId currentTextStyle;
    };
    struct Units {
        HsDb::UnitsValue drawing = HsDb::kUnitsMeters;
        HsDb::UnitsValue display = HsDb::kUnitsMeters;
        int precision = 2;
    };

    void makeStandardRecords();
    HsDbIdEntry* newEntry(std::uint64_t handle);
    // Puts an object under an entry, without defaults and without opening it.
    void adopt(HsDbIdEntry* entry, HsDbObject* object);
    // Takes the object out of its entry and gives it back: it is in no database any more.
    HsDbObject* disown(HsDbIdEntry* entry);
    // Deletes every object and entry and forgets the roots: the database is empty again.
    void clear();
    double displayFactor() const;
    // Tells every reactor that is registered when its turn comes.
    void notifyReactors(void (HsDbDatabaseReactor::*report)(HsDbDatabase*));
    void notifyAppended(HsDbObject* object);

    std::map<std::uint64_t, std::unique_ptr<HsDbIdEntry>> m_entries;
    std::uint64_t m_nextHandle = 1;
    Roots m_roots;
    Units m_units;
    HsDbObjectId m_xrefBlockId;
    std::wstring m_fileName;
    std::unique_ptr<HsDbTransactionManager> m_transactions;
    std::vector<HsDbDatabaseReactor*> m_reactors;
};
