// Styles, their dictionaries and the component description that puts property sets of areas on
// their styles.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/objects/ZyrCompSpecTemplate.h"
#include "areacalc/objects/ZyrDictAreaGroupDef.h"
#include "areacalc/objects/ZyrDictAreaModifiers.h"
#include "areacalc/objects/ZyrDictAreaProposalNames.h"

namespace {

using ZyrAreaStyles = ZyrAreaDrawing;

TEST_F(ZyrAreaStyles, dictionariesKeepTheirPersistentNamesAndStandardRecords) {
    EXPECT_EQ(ZyrDictAreaStyle(&database).dictionaryName(), L"ZYR_AREA_STYLES");
    EXPECT_EQ(ZyrDictAreaStyle(&database).objectClass(), ZyrDbArea::desc());
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

TEST_F(ZyrAreaStyles, aSampleShowsTheStyleItWasAskedOf) {
    const HsDbObjectId office = addAreaStyle(L"Office");
    std::unique_ptr<ZyrDbArea> sample(
        HsDbObjectPointer<ZyrDbAreaStyle>(office, HsDb::kForRead)->getSample());
    ASSERT_NE(sample, nullptr);
    EXPECT_EQ(sample->styleId(), office);
    ZyrImpAreaGroupStyle groupStyle;
    EXPECT_EQ(ZyrImpAreaStyle().copyFrom(&groupStyle), Hsys::eBadArgument);
}

TEST_F(ZyrAreaStyles, propertySetsOfAnAreaLieOnTheAreaAndItsStyle) {
    ZyrCompSpecArea compSpec;
    EXPECT_EQ(compSpec.worksWith(), ZyrDbArea::desc());
    HsArray<void*> extended;
    compSpec.extendedClasses(extended);
    ASSERT_EQ(extended.length(), 1);
    EXPECT_EQ(extended.at(0), ZyrDbAreaStyle::desc());

    const HsDbObjectId office = addAreaStyle(L"Office");
    const HsDbObjectId kitchen = addArea(L"Kitchen", rectangle(4, 3), office);
    const struct {
        HsDbObjectId object;
        std::vector<HsDbObjectId> locations;
    } cases[] = {{kitchen, {kitchen, office}}, {office, {office}}};
    for (const auto& c : cases) {
        HsDbObjectPointer<HsDbObject> object(c.object, HsDb::kForRead);
        HsArray<HsDbObjectId> ids;
        ZyrRmCStringArray names;
        EXPECT_EQ(compSpec.propSetLocations(object.object(), ids, names), Hsys::eSuccess);
        ASSERT_EQ(ids.length(), static_cast<int>(c.locations.size()));
        EXPECT_EQ(ids.at(ids.length() - 1), c.locations.back());
        EXPECT_EQ(names.back(), L"Office");
    }
}

} // namespace
