// The database's standard records, dictionaries, symbol tables, units and audit.
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbTextStyleTable.h"
#include "platform/host/ut/HsutConsole.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>

#include <memory>
#include <tuple>

namespace {

class HsDbDatabaseTest : public testing::Test {
protected:
    // Adds an object under a name to a dictionary and closes both.
    HsDbObjectId enter(const HsDbObjectId& dictionaryId, const wchar_t* name, HsDbObject* object) {
        HsDbObjectPointer<HsDbDictionary> dictionary(dictionaryId, HsDb::kForWrite);
        HsDbObjectPointer<HsDbObject> entered(object);
        HsDbObjectId id;
        EXPECT_EQ(dictionary->setAt(name, object, id), Hsys::eSuccess) << name;
        return id;
    }

    HsDbDatabase db;
};

TEST_F(HsDbDatabaseTest, aNewDrawingHasTheStandardRecords) {
    const std::pair<HsDbObjectId, HsRxClass*> records[] = {
        {db.namedObjectsDictionaryId(), HsDbDictionary::desc()},
        {db.blockTableId(), HsDbBlockTable::desc()},
        {db.layerTableId(), HsDbLayerTable::desc()},
        {db.textStyleTableId(), HsDbTextStyleTable::desc()},
        {db.modelSpaceId(), HsDbBlockTableRecord::desc()},
        {db.currentLayerId(), HsDbLayerTableRecord::desc()},
        {db.currentTextStyleId(), HsDbTextStyleTableRecord::desc()},
    };
    for (const auto& [id, cls] : records)
        EXPECT_EQ(id.objectClass(), cls) << cls->name();

    HsDbObjectId found;
    EXPECT_EQ(HsDbObjectPointer<HsDbBlockTable>(db.blockTableId(), HsDb::kForRead)
                  ->getAt(L"*MODEL_SPACE", found),
              Hsys::eSuccess);
    EXPECT_EQ(found, db.modelSpaceId());
    HsDbObjectPointer<HsDbTextStyleTableRecord> standard(db.currentTextStyleId(), HsDb::kForRead);
    EXPECT_EQ(standard->name(), L"Standard");
    EXPECT_EQ(standard->textSize(), 2.5);
    EXPECT_EQ(standard->ownerId(), db.textStyleTableId());
    EXPECT_TRUE(HsDbDatabase(HsDb::kEmptyDatabase).objectIds().empty());
}

TEST_F(HsDbDatabaseTest, dictionariesNestAndFindNamesWithoutRegardToCase) {
    const HsDbObjectId styles =
        enter(db.namedObjectsDictionaryId(), L"ZYR_AREA_STYLES", new HsDbDictionary);
    const HsDbObjectId standard = enter(styles, L"Standard", new TestGadget);
    const HsDbObjectId office = enter(styles, L"B\u00fcro", new TestGadget);

    HsDbObjectPointer<HsDbDictionary> dictionary(styles, HsDb::kForWrite);
    HsDbObjectId id;
    EXPECT_EQ(dictionary->getAt(L"standard", id), Hsys::eSuccess);
    EXPECT_EQ(id, standard);
    EXPECT_EQ(dictionary->getAt(L"B\u00dcRO", id), Hsys::eKeyNotFound) << "only A-Z fold";
    EXPECT_EQ(dictionary->getAt(nullptr, id), Hsys::eNullPointer);
    TestGadget refused;
    EXPECT_EQ(dictionary->setAt(L"STANDARD", &refused, id), Hsys::eDuplicateName);
    EXPECT_TRUE(refused.objectId().isNull());
    EXPECT_EQ(dictionary->setAt(L"", nullptr, id), Hsys::eBadArgument);

    EXPECT_EQ(dictionary->setName(L"standard", L"B\u00fcro"), Hsys::eDuplicateName);
    EXPECT_EQ(dictionary->setName(L"standard", L"Normal"), Hsys::eSuccess);
    EXPECT_EQ(dictionary->entries(), (std::vector<std::pair<std::wstring, HsDbObjectId>>{
                                         {L"B\u00fcro", office}, {L"Normal", standard}}));

    ASSERT_EQ(HsDbObjectPointer<HsDbObject>(office, HsDb::kForWrite)->erase(), Hsys::eSuccess);
    EXPECT_FALSE(dictionary->has(L"B\u00fcro")) << "an erased entry is hidden";
    EXPECT_EQ(dictionary->numEntries(), 1);
    EXPECT_EQ(dictionary->remove(L"normal", id), Hsys::eSuccess);
    EXPECT_EQ(id, standard);
    EXPECT_EQ(dictionary->remove(L"normal"), Hsys::eKeyNotFound);
    EXPECT_TRUE(standard.isValid()) << "the object stays in the database";
}

TEST_F(HsDbDatabaseTest, symbolTablesKeepNamesUniqueAndRecordsOfTheirKind) {
    HsDbObjectPointer<HsDbLayerTable> layers(db.layerTableId(), HsDb::kForWrite);
    auto addLayer = [&layers](const wchar_t* name, HsDbSymbolTableRecord* record) {
        if (name != nullptr)
            record->setName(name);
        HsDbObjectPointer<HsDbSymbolTableRecord> made(record);
        HsDbObjectId id;
        return layers->add(id, record);
    };
    EXPECT_EQ(addLayer(L"Walls", new HsDbLayerTableRecord), Hsys::eSuccess);
    EXPECT_EQ(addLayer(L"WALLS", new HsDbLayerTableRecord), Hsys::eDuplicateName);
    EXPECT_EQ(addLayer(nullptr, new HsDbLayerTableRecord), Hsys::eBadArgument);
    EXPECT_EQ(addLayer(L"Bold", new HsDbTextStyleTableRecord), Hsys::eWrongClass);
    EXPECT_EQ(layers->recordIds().size(), 2u) << "layer 0 and Walls";

    HsDbObjectId walls;
    ASSERT_EQ(layers->getAt(L"walls", walls), Hsys::eSuccess);
    HsDbObjectPointer<HsDbLayerTableRecord> record(walls, HsDb::kForWrite);
    EXPECT_EQ(record->setName(L"0"), Hsys::eDuplicateName);
    EXPECT_EQ(record->setName(L"Walls"), Hsys::eSuccess) << "its own name, in another case";
    EXPECT_EQ(db.setCurrentLayerId(walls), Hsys::eSuccess);
    EXPECT_EQ(db.setCurrentLayerId(db.modelSpaceId()), Hsys::eWrongClass);

    TestGadget gadget;
    gadget.setDatabaseDefaults(&db);
    EXPECT_EQ(gadget.layerId(), walls) << "defaults take the current layer";
    EXPECT_EQ(gadget.setLayer(db.currentTextStyleId()), Hsys::eWrongClass);
    EXPECT_EQ(gadget.setLayer(HsDbObjectId()), Hsys::eNullId);
}

TEST_F(HsDbDatabaseTest, valuesConvertIntoTheDisplayUnits) {
    // Drawing and display units, and what one length and one area unit become.
    const std::tuple<HsDb::UnitsValue, HsDb::UnitsValue, double, double> cases[] = {
        {HsDb::kUnitsMillimeters, HsDb::kUnitsMeters, 0.001, 1e-6},
        {HsDb::kUnitsCentimeters, HsDb::kUnitsMeters, 0.01, 1e-4},
        {HsDb::kUnitsMeters, HsDb::kUnitsMillimeters, 1000.0, 1e6},
        {HsDb::kUnitsFeet, HsDb::kUnitsInches, 12.0, 144.0},
        {HsDb::kUnitsUnitless, HsDb::kUnitsMillimeters, 1.0, 1.0},
        {HsDb::kUnitsKilometers, HsDb::kUnitsUnitless, 1.0, 1.0},
    };
    for (const auto& [drawing, display, length, area] : cases) {
        SCOPED_TRACE(std::string(HsDb::toString(drawing)) + " to " + HsDb::toString(display));
        db.setDrawingUnits(drawing);
        db.setDisplayUnits(display);
        EXPECT_NEAR(db.lengthInDisplayUnits(1.0), length, length * 1e-12);
        EXPECT_NEAR(db.areaInDisplayUnits(1.0), area, area * 1e-12);
    }
    EXPECT_EQ(db.setDisplayPrecision(9), Hsys::eBadArgument);
    EXPECT_EQ(db.displayPrecision(), 2);
}

TEST_F(HsDbDatabaseTest, theWorkingDatabaseIsForgottenWhenItIsDestroyed) {
    auto other = std::make_unique<HsDbDatabase>();
    hsdbHostApplicationServices()->setWorkingDatabase(other.get());
    TestGadget gadget;
    gadget.setDatabaseDefaults();
    EXPECT_EQ(gadget.layerId(), other->currentLayerId());
    other.reset();
    EXPECT_EQ(hsdbHostApplicationServices()->workingDatabase(), nullptr);
}

TEST_F(HsDbDatabaseTest, anAuditReportsDanglingReferencesAndFixesThemWhenAllowed) {
    HsDbObjectId ghost;
    ASSERT_EQ(db.getHsDbObjectId(ghost, true, 5000), Hsys::eSuccess);
    {
        HsDbObjectPointer<TestGadget> gadget(addGadget(db), HsDb::kForWrite);
        gadget->setOwnerId(ghost);
        // A dictionary as a damaged drawing could hold it: its one entry names a lost handle.
        HsDbObjectPointer<HsDbDictionary> dictionary(db.namedObjectsDictionaryId(),
                                                     HsDb::kForWrite);
        HsDbBdfFiler edited(&db);
        edited.writeSoftPointerId(HsDbObjectId());
        edited.writeUInt32(1);
        edited.writeString(L"Lost");
        edited.writeHardOwnershipId(ghost);
        HsDbBdfFiler reader(edited.bytes(), &db);
        ASSERT_EQ(dictionary->bdfIn(&reader), Hsys::eSuccess);
    }

    HsutConsoleCapture console;
    HsDbAuditInfo look(false);
    ASSERT_EQ(db.audit(&look), Hsys::eSuccess);
    EXPECT_EQ(look.numErrors(), 2) << "the gadget's owner and the dictionary's entry";
    EXPECT_EQ(look.numFixes(), 0);
    ASSERT_EQ(look.lines().size(), 2u);
    EXPECT_EQ(look.lines()[0], L"HsDbDictionary(1)  Lost  names no object  kept");
    EXPECT_NE(console.text().find(L"owner 5000  has no object  kept"), std::wstring::npos);

    HsDbAuditInfo fix(true);
    ASSERT_EQ(db.audit(&fix), Hsys::eSuccess);
    EXPECT_EQ(fix.numErrors(), 2);
    EXPECT_EQ(fix.numFixes(), 2);
    HsDbAuditInfo again(true);
    ASSERT_EQ(db.audit(&again), Hsys::eSuccess);
    EXPECT_EQ(again.numErrors(), 0) << "fixed for good";
}

} // namespace
