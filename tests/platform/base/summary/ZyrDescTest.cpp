// Summaries rendered as the user reads them: every kind of row, record names and their
// placeholders.
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbDatabase.h"
#include "tests/platform/base/dict/ZyrDictTestRecords.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrDesc, rowsRenderAsLabelColonValueInTheOrderAdded) {
    HsDbDatabase db;
    db.setDrawingUnits(HsDb::kUnitsMillimeters);
    db.setDisplayUnits(HsDb::kUnitsMeters);
    ASSERT_EQ(db.setDisplayPrecision(3), Hsys::eSuccess);
    ZyrTestStyleDict styles(&db);
    ASSERT_TRUE(styles.isValid(true, true));
    const HsDbObjectId standard = styles.standardRecord();
    const HsDbObjectId office = styles.add(L"Office");
    const HsDbObjectId erased = styles.add(L"Old");
    HsDbObjectPointer<ZyrDbDictRecord>(erased, HsDb::kForWrite)->erase();
    const HsDbObjectId null;
    const HsDbObjectId layerTable = db.layerTableId();

    ZyrDesc desc(&db);
    desc.addText(L"Name", L"Office 1.04");
    desc.addDistance(L"Perimeter", -1, -1, 18'250.0);
    desc.addDistance(L"Height", HsDb::kUnitsCentimeters, 1, 2'750.0);
    desc.addCount(L"Balance", -3);
    desc.addRecordName(L"Style", &office, 0);
    ASSERT_EQ(styles.renameRecord(office, L"Studio"), Hsys::eSuccess); // rows keep their text
    desc.addRecordName(L"Style", &standard, ZyrDesc::kWithRecordClass);
    for (const HsDbObjectId* id :
         {static_cast<const HsDbObjectId*>(nullptr), &null, &layerTable, &erased})
        desc.addRecordName(L"Style", id, 0);
    desc.addText(nullptr, L"a line without a label");
    desc.addText(L"Empty", L"");

    EXPECT_EQ(desc.text(), L"Name: Office 1.04\n"
                           L"Perimeter: 18.250 m\n"
                           L"Height: 275.0 cm\n"
                           L"Balance: -3\n"
                           L"Style: Office\n"
                           L"Style: Standard (ZyrTestStyle)\n"
                           L"Style: (none)\n"
                           L"Style: (none)\n"
                           L"Style: (invalid record)\n"
                           L"Style: (invalid record)\n"
                           L"a line without a label\n"
                           L"Empty: \n");
    ASSERT_EQ(desc.rows().size(), 12u);
    EXPECT_EQ(desc.rows()[2].kind, ZyrDesc::RowKind::kDistance);
    EXPECT_EQ(desc.rows()[3].kind, ZyrDesc::RowKind::kCount);
    EXPECT_EQ(desc.rows()[9].kind, ZyrDesc::RowKind::kRecordName);
    EXPECT_EQ(ZyrDesc().text(), L"");
}

} // namespace
