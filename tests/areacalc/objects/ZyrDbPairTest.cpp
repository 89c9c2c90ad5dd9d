// What every public/implementation pair of the module offers: registration, the gates of open,
// the text filing refusals and the nest of version words in binary streams; the dictionaries of
// the records, a style's sample, and property sets of areas that lie on their styles.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaDbOperations.h"
#include "areacalc/objects/ZyrCompSpecTemplate.h"
#include "areacalc/objects/ZyrDictAreaGroupDef.h"
#include "areacalc/objects/ZyrDictAreaProposalNames.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/host/db/HsDbProxyObject.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbTdfFiler.h"

namespace {

using ZyrDbPairs = ZyrAreaDrawing;

TEST_F(ZyrDbPairs, classesRegisterAsTheClassTableHasThem) {
    const std::tuple<HsRxClass*, HsRxClass*, const wchar_t*, int, const wchar_t*> rows[] = {
        {ZyrDbArea::desc(), ZyrDbGeo::desc(), L"ZYR_AREA", 893, L"Area"},
        {ZyrImpArea::desc(), ZyrImpGeo::desc(), L"", 80, L""},
        {ZyrDbAreaGroup::desc(), ZyrDbGeo::desc(), L"ZYR_AREAGROUP", 893, L"Area Group"},
        {ZyrImpAreaGroup::desc(), ZyrImpGeo::desc(), L"", 80, L""},
        {ZyrDbAreaGroupStyle::desc(), nullptr, L"ZYR_ZYRDBAREAGROUPSTYLE", 129,
         L"Area Group Style"},
        {ZyrDictAreaStyle::desc(), nullptr, L"", 0, L"Area Styles"},
        {ZyrCompSpecArea::desc(), nullptr, L"", 80, L""},
    };
    for (const auto& [cls, parent, recordName, flags, displayName] : rows) {
        ASSERT_NE(cls, nullptr);
        EXPECT_STREQ(cls->recordName(), recordName);
        EXPECT_EQ(cls->proxyFlags(), flags) << cls->name();
        EXPECT_EQ(cls->drawingVersion(), *recordName != L'\0' ? 23 : 0);
        if (parent != nullptr) {
            EXPECT_EQ(cls->myParent(), parent) << cls->name();
        }
        ZyrRmCString shown;
        ZyrDecoratorManager::displayName(cls, shown);
        EXPECT_EQ(shown, displayName);
    }
    EXPECT_EQ(ZyrDictAreaStyle(&database).objectClass(), ZyrDbArea::desc());
    EXPECT_EQ(ZyrDictAreaGroupStyle(&database).objectClass(), ZyrDbAreaGroup::desc());
    std::unique_ptr<HsRxObject> made(ZyrCompSpecAreaGroup::desc()->create());
    ASSERT_EQ(made->isA(), ZyrCompSpecAreaGroup::desc());
    EXPECT_EQ(static_cast<ZyrCompSpecAreaGroup*>(made.get())->worksWith(), ZyrDbAreaGroup::desc());
}

TEST_F(ZyrDbPairs, openPassesItsGatesInOrder) {
    const HsDbObjectId area = addArea(L"Hall", rectangle(4, 3));
    const HsDbObjectId proxy = add(new HsDbProxyObject(L"ZyrDbArea"));
    // Held open for write: a gate that opened the style would meet this open instead.
    HsDbObjectPointer<ZyrDbAreaStyle> heldStyle(standardStyle, HsDb::kForWrite);
    const std::tuple<HsDbObjectId, Hsys::ErrorStatus, Hsys::ErrorStatus> cases[] = {
        {HsDbObjectId::kNull, Hsys::eNullId, Hsys::eNullId},
        {standardStyle, Hsys::eWrongClass, Hsys::eWrongClass},
        {proxy, Hsys::eWrongClass, Hsys::eNoTransaction},
        {area, Hsys::eSuccess, Hsys::eNoTransaction}};
    ZyrDbArea stale;
    for (const auto& [id, opened, openTrans] : cases) {
        ZyrDbArea* out = &stale;
        EXPECT_EQ(ZyrDbArea::open(out, id, HsDb::kForRead), opened) << id;
        EXPECT_EQ(out != nullptr, opened == Hsys::eSuccess) << id;
        if (out != nullptr)
            out->close();
        out = &stale;
        EXPECT_EQ(ZyrDbArea::openTrans(out, id, HsDb::kForRead), openTrans) << id;
        EXPECT_EQ(out, nullptr);
    }
    HsDbObjectPointer<HsDbObject> reopened(proxy, HsDb::kForWrite);
    EXPECT_TRUE(reopened) << "the proxy was closed again";
    reopened.close();

    HsDbDatabase withoutTransactions(HsDb::kStandardRecords, HsDb::kNoTransactions);
    HsDbObjectId lone;
    auto* loneArea = new ZyrDbArea;
    ASSERT_EQ(withoutTransactions.addHsDbObject(lone, loneArea), Hsys::eSuccess);
    loneArea->close();
    ZyrDbArea* out = nullptr;
    EXPECT_EQ(ZyrDbArea::openTrans(out, lone, HsDb::kForRead), Hsys::eBadArgument);
}

TEST_F(ZyrDbPairs, textFilingRefusesDrawingFilesOnly) {
    ZyrDbArea area;
    ZyrDbAreaStyle style;
    for (HsDbObject* object : std::initializer_list<HsDbObject*>{&area, &style}) {
        HsDbTdfFiler fromFile(HsDb::kFileFiler, false);
        EXPECT_EQ(object->tdfInFields(&fromFile), Hsys::eBadTdfSequence);
        EXPECT_EQ(fromFile.errorMessage(), Zyr::tdfNotSupportedMessage());
        HsDbTdfFiler edit(HsDb::kUndoFiler, true);
        EXPECT_EQ(object->tdfInFields(&edit), Hsys::eSuccess);
        HsDbTdfFiler toFile(HsDb::kFileFiler, false);
        EXPECT_EQ(object->tdfOutFields(&toFile), Hsys::eNotImplemented);
        HsDbTdfFiler copy(HsDb::kCopyFiler, false);
        EXPECT_EQ(object->tdfOutFields(&copy), Hsys::eSuccess);
        EXPECT_FALSE(copy.items().empty()) << "the base's items";
    }
}

// An area in no database, without a profile: every level's version word in the order of the
// levels, the implementation's nested inside the entity's.
TEST_F(ZyrDbPairs, areaStreamNestsTheVersionWordsOfEveryLevel) {
    ZyrDbArea area;
    ASSERT_EQ(area.setName(L"Hall"), Hsys::eSuccess);
    HsDbBdfFiler written;
    ASSERT_EQ(area.bdfOutFields(&written), Hsys::eSuccess);

    HsDbBdfFiler expected;
    expected.writeSoftPointerId(HsDbObjectId::kNull); // HsDbObject: owner
    expected.writeHardPointerId(HsDbObjectId::kNull); // HsDbEntity: layer
    expected.writeInt16(80);                          // ZyrDbEntity
    expected.writeUInt16(2);                          //   implementation object, by class name
    expected.writeString(L"ZyrImpArea");
    expected.writeInt16(80); //   ZyrImpObj
    expected.writeInt16(80); //   ZyrImpEnt
    expected.writeInt16(80); //   ZyrImpGeo, with its ECS
    for (int i = 0; i < 16; ++i)
        expected.writeDouble(i % 5 == 0 ? 1.0 : 0.0);
    expected.writeInt16(80);                          //   ZyrImpArea
    expected.writeHardPointerId(HsDbObjectId::kNull); //     style
    expected.writeUInt16(0);                          //     no profile
    expected.writeString(L"Hall");                    //     name
    expected.writeUInt32(0);                          // ZyrDbEntity: no overrides
    expected.writeInt16(80);                          // ZyrDbGeo
    expected.writeInt16(80);                          // ZyrDbArea
    EXPECT_EQ(written.bytes(), expected.bytes());
}

// A style record's every level by hand: versions 20 to 29 carry a dropped bool after each version
// word, in the public part and in the nested implementation part; 81 stops at the first word.
TEST_F(ZyrDbPairs, streamsOfEveryVersionAreReadWholeOrRefusedAtOnce) {
    for (const std::int16_t version : {29, 20, 19, 30, 80, 81}) {
        SCOPED_TRACE(version);
        HsDbBdfFiler stream(&database);
        const auto writeVersion = [&] {
            stream.writeInt16(version);
            if (version >= 20 && version <= 29)
                stream.writeBool(true);
        };
        stream.writeSoftPointerId(HsDbObjectId::kNull); // HsDbObject
        writeVersion();                                 // ZyrDbObject
        stream.writeUInt16(2);
        stream.writeString(L"ZyrImpAreaStyle");
        writeVersion(); // ZyrImpObj
        writeVersion(); // ZyrImpDictRecord
        stream.writeString(L"Office");
        stream.writeString(L"Rooms to work in");
        writeVersion(); // ZyrImpAreaStyle
        writeVersion(); // ZyrDbDictRecord
        writeVersion(); // ZyrDbAreaStyle

        HsDbBdfFiler reader(stream.bytes(), &database);
        ZyrDbAreaStyle style;
        if (version > 80) {
            EXPECT_EQ(style.bdfInFields(&reader), Hsys::eNewerVersion);
            EXPECT_EQ(reader.position(), HsDbBdfFiler::kIdSize + 2) << "nothing read further";
            continue;
        }
        ASSERT_EQ(style.bdfInFields(&reader), Hsys::eSuccess);
        EXPECT_EQ(reader.remaining(), 0u);
        EXPECT_EQ(style.areaStyleImp()->name(), L"Office");
        EXPECT_EQ(style.areaStyleImp()->filedVersion(), version);
    }
}

// The implementation object is swapped in only when it was read whole; the levels filed after it
// may still fail, so a failed read leaves the area new or whole, never half read.
TEST_F(ZyrDbPairs, everyTruncatedAreaStreamFailsWithoutAHalfReadArea) {
    std::unique_ptr<ZyrDbArea> sample(ZyrAreaDbOperations::sample(&database));
    ASSERT_EQ(sample->setName(L"Kitchen"), Hsys::eSuccess);
    HsDbBdfFiler written(&database);
    ASSERT_EQ(sample->bdfOutFields(&written), Hsys::eSuccess);
    const std::vector<std::uint8_t>& bytes = written.bytes();
    for (std::size_t length = 0; length <= bytes.size(); ++length) {
        HsDbBdfFiler reader({bytes.begin(), bytes.begin() + static_cast<long>(length)}, &database);
        ZyrDbArea area;
        const Hsys::ErrorStatus status = area.bdfInFields(&reader);
        ASSERT_EQ(status == Hsys::eSuccess, length == bytes.size()) << length;
        const bool isNew = area.name() == L"Area" && area.profile() == nullptr;
        const bool isWhole = area.name() == L"Kitchen" && area.area() == sample->area() &&
                             area.styleId() == standardStyle;
        ASSERT_TRUE(isNew || isWhole) << length;
    }

    HsDbBdfFiler geometry;
    ASSERT_EQ(ZyrDbGeo().bdfOutFields(&geometry), Hsys::eSuccess);
    geometry.writeInt16(80);
    HsDbBdfFiler reader(geometry.bytes(), &database);
    ZyrDbArea area;
    EXPECT_EQ(area.bdfInFields(&reader), Hsys::eWrongClass) << "an implementation of no area";
}

TEST_F(ZyrDbPairs, dictionariesKeepTheirPersistentNamesAndStandardRecords) {
    EXPECT_EQ(ZyrDictAreaStyle(&database).dictionaryName(), L"ZYR_AREA_STYLES");
    EXPECT_EQ(ZyrDictAreaGroupStyle(&database).dictionaryName(), L"ZYR_AREAGROUP_STYLES");
    EXPECT_EQ(ZyrDictAreaGroupDef(&database).dictionaryName(), L"ZYR_AREA_GROUP_DEFS");
    EXPECT_EQ(ZyrDictAreaProposalNames(&database).dictionaryName(), L"ZYR_AREA_PROPOSALNAMES");
    EXPECT_EQ(ZyrDictAreaModifiers(&database).dictionaryName(), L"ZYR_AREA_MODIFIERS");
    EXPECT_FALSE(ZyrDictAreaModifiers(&database).hasStandard());
    EXPECT_EQ(ZyrDictAreaGroupStyle::getStandardAreaGroupStyle(&database).objectClass(),
              ZyrDbAreaGroupStyle::desc());
    EXPECT_TRUE(ZyrDictAreaGroupDef::getStandardAreaGroupDef(&database).isNull());

    HsDbDatabase bare;
    EXPECT_TRUE(ZyrDictAreaStyle::getStandardAreaStyle(&bare).isNull());
    EXPECT_FALSE(ZyrDictAreaStyle(&bare).hsdbDictionaryExists()) << "the getter makes nothing";
}

TEST_F(ZyrDbPairs, propertySetsLieOnTheAreaAndItsStyleWhichGivesSamplesOfItself) {
    ZyrCompSpecArea compSpec;
    EXPECT_EQ(compSpec.worksWith(), ZyrDbArea::desc());
    HsArray<void*> extended;
    compSpec.extendedClasses(extended);
    ASSERT_EQ(extended.length(), 1);
    EXPECT_EQ(extended.at(0), ZyrDbAreaStyle::desc());

    const HsDbObjectId office = addAreaStyle(L"Office");
    const HsDbObjectId kitchen = addArea(L"Kitchen", rectangle(4, 3), office);
    std::unique_ptr<ZyrDbArea> sample(
        HsDbObjectPointer<ZyrDbAreaStyle>(office, HsDb::kForRead)->getSample());
    ASSERT_NE(sample, nullptr);
    EXPECT_EQ(sample->styleId(), office);
    const std::tuple<HsDbObjectId, std::vector<HsDbObjectId>> cases[] = {
        {kitchen, {kitchen, office}}, {office, {office}}};
    for (const auto& [entity, locations] : cases) {
        HsDbObjectPointer<HsDbObject> object(entity, HsDb::kForRead);
        HsArray<HsDbObjectId> ids;
        ZyrRmCStringArray names;
        EXPECT_EQ(compSpec.propSetLocations(object.object(), ids, names), Hsys::eSuccess);
        ASSERT_EQ(ids.length(), static_cast<int>(locations.size()));
        EXPECT_EQ(ids.at(ids.length() - 1), locations.back());
        EXPECT_EQ(names.back(), L"Office");
    }
}

} // namespace
