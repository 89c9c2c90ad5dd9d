// Modifiers attached to entities: the override that lists them, filed in a drawing and audited,
// and the operations that change the list, name it, compare it and apply it to a value.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/modifiers/ZyrDbAreaModifierOperations.h"
#include "areacalc/modifiers/ZyrOverrideCalculationModifier.h"
#include "platform/base/app/ZyrUserMessages.h"
#include "platform/base/dict/ZyrStrObjIdList.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbAuditInfo.h"

#include <functional>

namespace {

using Ops = ZyrDbAreaModifierOperations;
using Status = Hsys::ErrorStatus;

class ZyrModifierAttachment : public ZyrAreaDrawing {
protected:
    void SetUp() override {
        ZyrAreaDrawing::SetUp();
        half = addModifier(L"Half", L"_AREA_VALUE_*0.5");
        balcony = addModifier(L"Balcony", L"_AREA_VALUE_*share", {{L"share", 0.25}});
        HsDbObjectPointer<ZyrDbAreaModifier> modifier(balcony, HsDb::kForWrite);
        ASSERT_EQ(modifier->removeAlgorithm(perimeterAlgorithm()), Hsys::eSuccess);
    }

    // A 4 by 3 room (area 12, perimeter 14) carrying the modifiers.
    HsDbObjectId addRoom(const Ids& modifiers = {}) {
        const HsDbObjectId room = addArea(L"Room", rectangle(4, 3));
        if (!modifiers.empty()) {
            HsDbObjectPointer<ZyrDbArea> area(room, HsDb::kForWrite);
            EXPECT_EQ(Ops::appendModifier(area.object(), modifiers), Hsys::eSuccess);
        }
        return room;
    }
    static Ids modifiersOf(const HsDbObjectId& entity) {
        Ids ids;
        HsDbObjectPointer<ZyrDbArea> area(entity, HsDb::kForRead);
        EXPECT_EQ(Ops::modifiersFor(area.object(), ids), Hsys::eSuccess);
        return ids;
    }
    static int overridesOf(const HsDbObjectId& entity) {
        return HsDbObjectPointer<ZyrDbArea>(entity, HsDb::kForRead)->overrideCount();
    }
    static double appliedTo(const HsDbObjectId& entity, HsRxClass* algorithm, double value,
                            Status expected = Hsys::eSuccess) {
        HsDbObjectPointer<ZyrDbArea> area(entity, HsDb::kForRead);
        EXPECT_EQ(Ops::applyTo(area.object(), algorithm, value), expected);
        return value;
    }

    HsDbObjectId half;
    HsDbObjectId balcony;
};

TEST_F(ZyrModifierAttachment, modifiersAndTheirOverrideComeBackFromADrawingFile) {
    const HsDbObjectId room = addRoom({half, balcony});
    EXPECT_EQ(appliedTo(room, areaAlgorithm(), 12), 1.5);
    EXPECT_EQ(appliedTo(room, perimeterAlgorithm(), 14), 7.0) << "the balcony acts on areas only";

    std::unique_ptr<HsDbDatabase> loaded = reloaded();
    const auto mapped = [&](const HsDbObjectId& id) { return there(*loaded, {id})[0]; };
    EXPECT_EQ(modifiersOf(mapped(room)), (Ids{mapped(half), mapped(balcony)}));
    EXPECT_EQ(appliedTo(mapped(room), areaAlgorithm(), 12), 1.5);
    EXPECT_EQ(appliedTo(mapped(room), perimeterAlgorithm(), 14), 7.0);
    const HsDbObjectPointer<ZyrDbAreaModifier> opened(mapped(balcony), HsDb::kForRead);
    ASSERT_TRUE(opened);
    const ZyrDbAreaModifier& modifier = *opened.object();
    EXPECT_EQ(std::tuple(modifier.expression().str(), modifier.parameterPairVector(),
                         modifier.algorithms().items()),
              std::tuple(std::wstring(L"_AREA_VALUE_*share"),
                         ZyrDbAreaModifier::ParameterPairVector{{L"share", 0.25}},
                         Classes{areaAlgorithm()}));
}

// Each case on a new room without modifiers, open for write unless it says otherwise.
TEST_F(ZyrModifierAttachment, missingEntitiesOverridesAndIdsHaveTheirStatuses) {
    using Operation = std::function<Status(ZyrDbArea*)>;
    const HsDbObjectId null;
    double value = 1;
    Ids ids;
    const std::tuple<const char*, HsDb::OpenMode, Operation, Status, int> cases[] = {
        {"append to no entity", HsDb::kForWrite,
         [&](ZyrDbArea*) { return Ops::appendModifier(nullptr, half); }, Hsys::eNotOpenForWrite, 0},
        {"append to a read entity", HsDb::kForRead,
         [&](ZyrDbArea* a) { return Ops::appendModifier(a, half); }, Hsys::eNotOpenForWrite, 0},
        {"append the null id", HsDb::kForWrite,
         [&](ZyrDbArea* a) { return Ops::appendModifier(a, null); }, Hsys::eNullId, 1},
        {"remove all without override", HsDb::kForWrite,
         [&](ZyrDbArea* a) { return Ops::removeModifier(a, null); }, Hsys::eNullPointer, 0},
        {"replace on no entity", HsDb::kForWrite,
         [&](ZyrDbArea*) { return Ops::replaceModifier(nullptr, Ids{half}); }, Hsys::eNullPointer,
         0},
        {"replace by nothing without override", HsDb::kForWrite,
         [&](ZyrDbArea* a) { return Ops::replaceModifier(a, Ids{}); }, Hsys::eSuccess, 0},
        {"list of no entity", HsDb::kForRead,
         [&](ZyrDbArea*) { return Ops::modifiersFor(nullptr, ids); }, Hsys::eNotOpenForRead, 0},
        {"apply for no algorithm", HsDb::kForRead,
         [&](ZyrDbArea* a) { return Ops::applyTo(a, nullptr, value); }, Hsys::eNullPointer, 0},
    };
    for (const auto& [what, mode, operation, status, overrides] : cases) {
        const HsDbObjectId room = addRoom();
        {
            HsDbObjectPointer<ZyrDbArea> area(room, mode);
            EXPECT_EQ(operation(area.object()), status) << what;
        }
        EXPECT_EQ(overridesOf(room), overrides) << what;
    }
}

TEST_F(ZyrModifierAttachment, removalTakesTheFirstOfEqualIdsAndNeverLeavesAnEmptyOverride) {
    const HsDbObjectId room = addRoom({half, balcony, half});
    EXPECT_EQ(appliedTo(room, areaAlgorithm(), 12), 0.75) << "an id that stands twice acts twice";
    const HsDbObjectId null;
    const std::tuple<HsDbObjectId, Status, Ids> steps[] = {
        {half, Hsys::eSuccess, {balcony, half}}, {half, Hsys::eSuccess, {balcony}},
        {half, Hsys::eNameNotFound, {balcony}},  {balcony, Hsys::eSuccess, {}},
        {balcony, Hsys::eNullPointer, {}},
    };
    for (const auto& [id, status, left] : steps) {
        {
            HsDbObjectPointer<ZyrDbArea> area(room, HsDb::kForWrite);
            EXPECT_EQ(Ops::removeModifier(area.object(), id), status);
        }
        EXPECT_EQ(modifiersOf(room), left);
        EXPECT_EQ(overridesOf(room), left.empty() ? 0 : 1);
    }

    HsDbObjectPointer<ZyrDbArea> area(room, HsDb::kForWrite);
    EXPECT_EQ(Ops::appendModifier(area.object(), null), Hsys::eNullId);
    EXPECT_EQ(area->overrideCount(), 1) << "an empty override";
    EXPECT_EQ(Ops::removeModifier(area.object(), half), Hsys::eNameNotFound);
    EXPECT_EQ(area->overrideCount(), 0) << "goes all the same";
    EXPECT_EQ(Ops::replaceModifier(area.object(), Ids{balcony, null, half}), Hsys::eSuccess);
    EXPECT_EQ(Ops::removeModifier(area.object(), null), Hsys::eSuccess);
    EXPECT_EQ(area->overrideCount(), 0) << "the null id takes all";
}

TEST_F(ZyrModifierAttachment, applyToGoesOnPastAFailureAndReportsTheLastEvaluation) {
    const HsDbObjectId failing = addModifier(L"Broken", L"_AREA_VALUE_/0");
    const HsDbObjectId perimeterOnly = addModifier(L"Fence", L"_AREA_VALUE_*10");
    {
        HsDbObjectPointer<ZyrDbAreaModifier> modifier(perimeterOnly, HsDb::kForWrite);
        ASSERT_EQ(modifier->removeAlgorithm(areaAlgorithm()), Hsys::eSuccess);
    }
    const HsDbObjectId gone = addModifier(L"Gone", L"_AREA_VALUE_*100");
    HsDbObjectPointer<ZyrDbAreaModifier>(gone, HsDb::kForWrite)->erase();
    const std::tuple<const char*, Ids, Status, double> cases[] = {
        {"failure first", {failing, half}, Hsys::eSuccess, 6},
        {"failure last", {half, failing}, Hsys::eInvalidInput, 6},
        {"not for this algorithm", {perimeterOnly}, Hsys::eSuccess, 12},
        {"an erased modifier is skipped", {gone, half}, Hsys::eSuccess, 6},
        {"none", {}, Hsys::eSuccess, 12},
    };
    for (const auto& [what, chain, status, value] : cases)
        EXPECT_EQ(appliedTo(addRoom(chain), areaAlgorithm(), 12, status), value) << what;
}

TEST_F(ZyrModifierAttachment, equalModifiersComparesInOrderWithTheFirstEntry) {
    const HsDbObjectId ab = addRoom({half, balcony});
    const HsDbObjectId alsoAb = addRoom({half, balcony});
    const HsDbObjectId ba = addRoom({balcony, half});
    const HsDbObjectId none = addRoom();
    const HsDbObjectId busy = addRoom({half, balcony});
    HsDbObjectPointer<ZyrDbArea> heldOpen(busy, HsDb::kForWrite);
    const std::tuple<const char*, Ids, bool, std::size_t> cases[] = {
        {"one entity", {ba}, true, 0},
        {"same lists", {ab, alsoAb}, true, 0},
        {"other order", {ab, ba}, false, 0},
        {"no modifiers", {none, ab}, false, 0},
        {"a record between", {ab, half, alsoAb}, true, 0},
        {"first fails to open", {busy, ab, alsoAb}, false, 1},
        {"later fails to open", {ab, busy, alsoAb}, true, 1},
    };
    for (const auto& [what, ids, equal, alerts] : cases) {
        HsArray<HsDbObjectId> entities;
        for (const HsDbObjectId& id : ids)
            entities.append(id);
        const ZyrUserMessageCapture capture;
        EXPECT_EQ(Ops::equalModifiers(entities), equal) << what;
        EXPECT_EQ(capture.entries().size(), alerts) << what;
    }
}

TEST_F(ZyrModifierAttachment, modifiersAreNamedByTheRecordsOfTheDrawing) {
    const HsDbObjectId room = addRoom({balcony, standardStyle, half});
    HsDbObjectPointer<ZyrDbArea> area(room, HsDb::kForRead);
    ZyrStrObjIdList list;
    EXPECT_EQ(Ops::modifiersFor(area.object(), list), Hsys::eSuccess);
    ZyrStrObjIdList expected;
    expected.add(L"Balcony", balcony);
    expected.add(L"Half", half);
    EXPECT_EQ(list, expected) << "the style has no name among modifiers";
    EXPECT_TRUE(Ops::hasModifiers(area.object()));

    ZyrDesc desc(&database);
    Ops::summaryModifiers(&desc, Ids{balcony, half});
    ASSERT_EQ(desc.rows().size(), 2u);
    EXPECT_EQ(desc.rows()[0].label, L"Modifiers");
    EXPECT_EQ(desc.rows()[1].value, L"Half");

    Ids kept{half};
    HsDbObjectPointer<ZyrDbArea> bare(addRoom(), HsDb::kForRead);
    EXPECT_EQ(Ops::modifiersFor(bare.object(), kept), Hsys::eSuccess);
    EXPECT_EQ(kept, Ids{half}) << "left as it came";
    EXPECT_FALSE(Ops::hasModifiers(bare.object()));

    HsDbDatabase other;
    ZyrDbArea* stranger = new ZyrDbArea;
    HsDbObjectId strangerId;
    ASSERT_EQ(other.addHsDbObject(strangerId, stranger), Hsys::eSuccess);
    ASSERT_EQ(Ops::appendModifier(stranger, half), Hsys::eSuccess);
    const ZyrUserMessageCapture capture;
    EXPECT_EQ(Ops::modifiersFor(stranger, list), Hsys::eInvalidDictionary);
    EXPECT_EQ(capture.entries().size(), 1u);
    stranger->close();
}

TEST_F(ZyrModifierAttachment, theAuditTakesOutErasedModifiersOnlyWhenItMayFix) {
    const HsDbObjectId room = addRoom({half, balcony});
    HsDbObjectPointer<ZyrDbAreaModifier>(balcony, HsDb::kForWrite)->erase();
    HsDbObjectPointer<ZyrDbArea> area(room, HsDb::kForWrite);
    auto* attached = ZyrOverrideCalculationModifier::cast(area->getOverrideAt(0));
    ASSERT_NE(attached, nullptr);
    ZyrObjReferenceMap references;
    EXPECT_EQ(attached->getReferencedObjects(references), Hsys::eSuccess);
    ASSERT_EQ(references.count(), 2);
    EXPECT_EQ(references.at(1)->id(), balcony);

    HsDbAuditInfo check(false);
    EXPECT_EQ(attached->audit(&check), Hsys::eAuditErrorsNotFixed);
    EXPECT_EQ(attached->modifiers(), (Ids{half, balcony}));
    HsDbAuditInfo fix(true);
    EXPECT_EQ(attached->audit(&fix), Hsys::eAuditFixedErrors);
    EXPECT_EQ(attached->modifiers(), Ids{half});
    EXPECT_EQ(attached->audit(&fix), Hsys::eSuccess);

    ZyrOverrideCalculationModifier loose;
    EXPECT_EQ(loose.audit(&fix), Hsys::eAuditNoParent);
    EXPECT_EQ(loose.copyFrom(attached), Hsys::eSuccess);
    EXPECT_EQ(loose.modifiers(), Ids{half});
    EXPECT_EQ(loose.copyFrom(area->imp()), Hsys::eBadArgument);
}

} // namespace
