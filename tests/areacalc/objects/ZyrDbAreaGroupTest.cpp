// Area groups in a drawing: a tree filed through a drawing file, old and current streams, the old
// text form, extents, copies, references, audits, summaries, redraws, and areas that leave their
// groups when another class takes their place.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/calc/ZyrAreaCalculationAlgorithm.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "platform/host/filer/HsDbTdfFiler.h"
#include "platform/host/ge/HsGeBoundBlock3d.h"

#include <set>
#include <tuple>

namespace {

// The drawing with the relationship graph (the way back from members) running.
class ZyrAreaGroups : public ZyrAreaDrawing {
protected:
    void SetUp() override {
        ZyrAreaDrawing::SetUp();
        ASSERT_EQ(ZyrBaseServices::registerService(&ZyrAreaCalculationTestModule::client()),
                  Hsys::eSuccess);
        ZyrAreaCalculationAlgorithm::getAvailableAlgorithm(available);
        ASSERT_EQ(available.size(), 2u);
    }
    void TearDown() override {
        EXPECT_EQ(ZyrBaseServices::unRegisterService(&ZyrAreaCalculationTestModule::client()),
                  Hsys::eSuccess);
    }

    HsDbObjectId area(const wchar_t* name, double x = 0, double y = 0) {
        const HsDbObjectId id = addArea(name, rectangle(2, 1));
        EXPECT_EQ(HsDbObjectPointer<ZyrDbArea>(id, HsDb::kForWrite)
                      ->setEcs(HsGeMatrix3d::translation({x, y, 0})),
                  Hsys::eSuccess);
        return id;
    }
    static Ids leafsOf(const HsDbObjectId& group) {
        HsDbObjectPointer<ZyrDbAreaGroup> opened(group, HsDb::kForRead);
        return std::as_const(*opened.object()).groupHandler()->leafs();
    }

    Classes available;
};

// root holds K, L and the area a; K holds M and b; M holds c and a again; L holds d only.
TEST_F(ZyrAreaGroups, aDrawingFileGivesBackTheTreeWithItsMembersInOrder) {
    const HsDbObjectId a = area(L"a"), b = area(L"b"), c = area(L"c"), d = area(L"d");
    const HsDbObjectId M = addGroup(L"M", {}, {c, a}), K = addGroup(L"K", {M}, {b});
    const HsDbObjectId L = addGroup(L"L", {}, {d}), root = addGroup(L"root", {K, L}, {a});
    HsDbObjectPointer<ZyrDbAreaGroup>(L, HsDb::kForWrite)->groupHandler()->setNodeOwnership(2);
    const std::unique_ptr<HsDbDatabase> loaded = reloaded();
    const std::tuple<HsDbObjectId, Ids, Ids, Ids, unsigned short> groups[] = {
        {root, {K, L}, {a}, {a, b, c, a, d}, 3}, {L, {}, {d}, {d}, 2}};
    for (const auto& [id, nodes, leafs, allLeafs, mode] : groups) {
        HsDbObjectPointer<ZyrDbAreaGroup> group(there(*loaded, {id})[0], HsDb::kForRead);
        ASSERT_TRUE(group);
        const ZyrDbAreaGroup& loadedGroup = *group.object();
        const ZyrGroupHandler& handler = *loadedGroup.groupHandler();
        Ids leafsBelow;
        EXPECT_EQ(handler.leafs(leafsBelow), Hsys::eSuccess);
        EXPECT_EQ(std::tuple(handler.nodes(), handler.leafs(), leafsBelow, handler.nodeOwnership()),
                  std::tuple(there(*loaded, nodes), there(*loaded, leafs), there(*loaded, allLeafs),
                             mode));
        EXPECT_EQ(loadedGroup.algorithms().items(), available) << "the classes by their names";
        EXPECT_EQ(loadedGroup.styleId(),
                  there(*loaded, {ZyrDictAreaGroupStyle::getStandardAreaGroupStyle(&database)})[0])
            << "the standard group style, given when the group entered the drawing";
    }
}

// The same fields by hand in both layouts, after the levels of ZyrImpGeo: the old layout puts the
// name after the lists with a dropped word, and old names where the algorithms stand now.
TEST_F(ZyrAreaGroups, streamsBelowVersion31TakeTheOldLayoutAndKeepTheAlgorithms) {
    const HsDbObjectId a = area(L"a"), b = area(L"b"), child = addGroup(L"child");
    const HsDbObjectId names = addAreaStyle(L"stands for a list of names");
    HsRxClass* perimeter = available.back();
    for (const std::int16_t version : {29, 30, 31, 80, 81}) {
        SCOPED_TRACE(version);
        const bool old = version < 31;
        HsDbBdfFiler stream(&database);
        ASSERT_EQ(ZyrImpGeo().bdfOutFields(&stream), Hsys::eSuccess);
        stream.writeInt16(version);
        if (version <= 29)
            stream.writeBool(true);
        stream.writeHardPointerId(standardStyle);
        if (!old)
            stream.writeString(L"Ground floor");
        HsDbFilerSupport::bdfWriteSoftPointerVector(&stream, {a, b});
        HsDbFilerSupport::bdfWriteHardPointerVector(&stream, {child});
        if (old) {
            stream.writeString(L"Ground floor");
            stream.writeUInt16(99);
        }
        stream.writeUInt16(7);
        stream.writeHardPointerId(names);
        if (old)
            HsDbFilerSupport::bdfWriteVector<std::wstring>(&stream, {L"Hall", L"Store"});
        else
            HsDbFilerSupport::bdfWriteVector<std::wstring>(&stream,
                                                           {perimeter->name(), L"ZyrGone"});
        const std::vector<std::uint8_t>& bytes = stream.bytes();

        ZyrImpAreaGroup group;
        HsDbBdfFiler reader(bytes, &database);
        ASSERT_EQ(group.bdfInFields(&reader), version > 80 ? Hsys::eNewerVersion : Hsys::eSuccess);
        if (version > 80)
            continue;
        EXPECT_EQ(reader.remaining(), 0u);
        const ZyrGroupHandler& handler = *std::as_const(group).groupHandler();
        EXPECT_EQ(std::tuple(group.name().str(), group.styleId(), group.proposalNamesId(),
                             handler.leafs(), handler.nodes()),
                  std::tuple(L"Ground floor", standardStyle, names, Ids{a, b}, Ids{child}));
        // An old mode out of range is not taken; a current one is stored as it came, and then
        // both bits hold, yet no mode above 3 can be set anew.
        EXPECT_EQ(handler.nodeOwnership(), old ? 3 : 7);
        EXPECT_EQ(group.groupHandler()->setNodeOwnership(7), Hsys::eDoesNotApply);
        using OldNames = ZyrImpAreaGroup::OldNames;
        EXPECT_EQ(group.oldNames(), (old ? OldNames{L"Hall", L"Store"} : OldNames()));
        // The unknown name reads as a null class; the collection keeps its items by address.
        using Classes = std::set<HsRxClass*>;
        const std::vector<HsRxClass*>& algorithms = group.algorithms().items();
        EXPECT_EQ(
            Classes(algorithms.begin(), algorithms.end()),
            (old ? Classes(available.begin(), available.end()) : Classes{perimeter, nullptr}));

        // Written again in the current layout: the old names are gone, the algorithms stay.
        HsDbBdfFiler rewritten(&database);
        ASSERT_EQ(group.bdfOutFields(&rewritten), Hsys::eSuccess);
        ZyrImpAreaGroup again;
        HsDbBdfFiler rereader(rewritten.bytes(), &database);
        ASSERT_EQ(again.bdfInFields(&rereader), Hsys::eSuccess);
        EXPECT_EQ(again.algorithms(), group.algorithms());
        EXPECT_TRUE(again.oldNames().empty());

        for (std::size_t length = 0; length < bytes.size(); ++length) {
            HsDbBdfFiler cut({bytes.begin(), bytes.begin() + static_cast<long>(length)}, &database);
            ZyrImpAreaGroup truncated;
            ASSERT_NE(truncated.bdfInFields(&cut), Hsys::eSuccess) << length;
            ASSERT_EQ(std::pair(truncated.name().str(), truncated.groupHandler()->leafs().size()),
                      std::pair(std::wstring(L"Area Group"), std::size_t{0}))
                << length;
        }
    }
}

TEST_F(ZyrAreaGroups, theOldTextFormReplacesListsAndNameWhateverTheStatus) {
    const HsDbObjectId a = area(L"a"), child = addGroup(L"child"), names = addAreaStyle(L"N");
    const HsDbTdfItem known[] = {{1, L"Old hall"},       {3, L"Kitchen"}, {170, std::int32_t{5}},
                                 {171, std::int32_t{1}}, {330, a},        {340, child},
                                 {341, standardStyle},   {3, L"Bath"},    {342, names}};
    // Status, items read, name, mode, leafs, nodes, style, proposal names, old names.
    const auto read = [](std::vector<HsDbTdfItem> items) {
        ZyrImpAreaGroup group;
        HsDbTdfFiler filer(std::move(items), HsDb::kFileFiler, false);
        const Hsys::ErrorStatus status = group.tdfInFieldsQuillon(&filer);
        const ZyrGroupHandler& handler = *std::as_const(group).groupHandler();
        return std::tuple(status, filer.position(), group.name().str(), handler.nodeOwnership(),
                          handler.leafs(), handler.nodes(), group.styleId(),
                          group.proposalNamesId(), group.oldNames().size());
    };
    using Read = decltype(read({}));
    EXPECT_EQ(read({std::begin(known), std::end(known)}),
              Read(Hsys::eSuccess, 9, L"Old hall", 1, {a}, {child}, standardStyle, names, 2));
    // An unknown code is pushed back; a mode above 3 is not taken; no name empties it.
    EXPECT_EQ(read({{171, std::int32_t{9}}, {3, L"Bath"}, {999, std::int32_t{0}}, {1, L"x"}}),
              Read(Hsys::eSuccess, 2, L"", 3, {}, {}, {}, {}, 1));
    // What was read before a failure still replaces the lists.
    EXPECT_EQ(read({{330, a}, {340, L"not an id"}, {1, L"x"}}),
              Read(Hsys::eBadTdfSequence, 2, L"", 3, {a}, {}, {}, {}, 0));
}

TEST_F(ZyrAreaGroups, extentsTakeTheLiveDirectAreasOnly) {
    const HsDbObjectId near = area(L"near", 1, 2), far = area(L"far", 10, -3);
    const HsDbObjectId gone = area(L"gone", 100, 100), deep = area(L"deep", -50, -50);
    const HsDbObjectId outer =
        addGroup(L"outer", {addGroup(L"inner", {}, {deep})}, {near, far, gone});
    erase(gone);
    HsDbObjectPointer<ZyrDbAreaGroup> group(outer, HsDb::kForRead);
    HsGeBoundBlock3d block;
    EXPECT_EQ(group->areaGroupImp()->getLocalExtents(block), Hsys::eNotImplemented);
    ASSERT_EQ(group->areaGroupImp()->getWorldExtents(block), Hsys::eSuccess);
    HsGePoint3d lowest, highest;
    block.getMinMaxPoints(lowest, highest);
    EXPECT_EQ(std::pair(lowest, highest), std::pair(HsGePoint3d(1, -3, 0), HsGePoint3d(12, 3, 1)));
}

TEST_F(ZyrAreaGroups, copiesReferencesAndSamples) {
    const HsDbObjectId a = area(L"a"), child = addGroup(L"child"), names = addAreaStyle(L"N");
    const HsDbObjectId office = addRecord<ZyrDictAreaGroupStyle, ZyrDbAreaGroupStyle>(L"Office");
    HsDbObjectPointer<ZyrDbAreaGroup> source(addGroup(L"source", {child}, {a}), HsDb::kForWrite);
    ASSERT_EQ(source->setStyleId(office), Hsys::eSuccess);
    EXPECT_EQ(source->setStyleId(HsDbObjectId::kNull), Hsys::eNullId);
    ASSERT_EQ(source->setProposalNamesId(names), Hsys::eSuccess);
    source->algorithms().clear();
    ASSERT_EQ(source->algorithms().add(available.front()), Hsys::eSuccess);

    ZyrImpAreaGroup copy;
    ASSERT_EQ(copy.copyFrom(source->areaGroupImp()), Hsys::eSuccess);
    const ZyrGroupHandler& handler = *std::as_const(copy).groupHandler();
    EXPECT_EQ(std::tuple(copy.name().str(), copy.styleId(), copy.proposalNamesId(),
                         copy.algorithms().items(), handler.nodes(), handler.leafs()),
              std::tuple(L"source", office, names, Classes{available.front()}, Ids{child}, Ids{a}));
    ZyrImpArea notAGroup;
    EXPECT_EQ(copy.copyFrom(&notAGroup), Hsys::eBadArgument);
    ASSERT_EQ(copy.copyFrom(&copy), Hsys::eSuccess);
    EXPECT_EQ(copy.algorithms().count(), 0) << "emptied before it was added to itself";

    ZyrObjReferenceMap references;
    ASSERT_EQ(source->areaGroupImp()->getReferencedObjects(references), Hsys::eSuccess);
    Ids referenced;
    for (int i = 0; i < references.count(); ++i)
        referenced.push_back(references.at(i)->id());
    EXPECT_EQ(referenced, (Ids{office, a, child, names}));

    std::unique_ptr<ZyrDbAreaGroup> sample(
        HsDbObjectPointer<ZyrDbAreaGroupStyle>(office, HsDb::kForRead)->getSample());
    ASSERT_NE(sample, nullptr);
    EXPECT_EQ(sample->styleId(), office) << "whichever drawing the record is in";
    ZyrRmCString key;
    sample->getLayerKey(key);
    EXPECT_EQ(key, L"AREAGRP");
}

// Counts run in from earlier objects of the same audit: the group adds its running total plus
// one, where an area adds one.
TEST_F(ZyrAreaGroups, anAuditCountsBadProposalNamesByTheRunningTotal) {
    const HsDbObjectId names = addAreaStyle(L"N");
    const HsDbObjectId groupStyle = addRecord<ZyrDictAreaGroupStyle, ZyrDbAreaGroupStyle>(L"G");
    const HsDbObjectId group = addGroup(L"g");
    {
        HsDbObjectPointer<ZyrDbAreaGroup> opened(group, HsDb::kForWrite);
        ASSERT_EQ(opened->setProposalNamesId(names), Hsys::eSuccess);
        ASSERT_EQ(opened->setStyleId(groupStyle), Hsys::eSuccess);
    }
    erase(names);
    erase(groupStyle);
    const HsDbObjectId good = area(L"good"), gone = area(L"gone");
    erase(gone);
    for (const bool fix : {false, true}) {
        HsDbObjectPointer<ZyrDbAreaGroup> opened(group, fix ? HsDb::kForWrite : HsDb::kForRead);
        HsDbAuditInfo info(fix);
        info.errorsFound(2);
        EXPECT_EQ(opened->audit(&info), Hsys::eSuccess);
        EXPECT_EQ(info.numErrors(), 5) << "the bad style is printed, not counted";
        EXPECT_EQ(info.numFixes(), 0) << "no standard proposal names to take";
        EXPECT_EQ(opened->proposalNamesId(), fix ? HsDbObjectId::kNull : names);
        EXPECT_EQ(opened->styleId(), groupStyle) << "a bad group style is not repaired";

        Ids ids{good, gone, group};
        HsDbAuditInfo members(fix);
        members.errorsFound(1);
        members.errorsFixed(1);
        opened->areaGroupImp()->auditObjectIds(opened.object(), &members, ids, ZyrDbArea::desc());
        EXPECT_EQ(members.numErrors(), 1 + 2 + 4) << "1, then 1 + 2, then 3 + 4";
        EXPECT_EQ(members.numFixes(), fix ? 1 + 3 : 1);
        EXPECT_EQ(ids, fix ? Ids{good} : (Ids{good, gone, group}));
    }
}

TEST_F(ZyrAreaGroups, theSummaryCountsLiveMembersDirectAndBelow) {
    const HsDbObjectId a = area(L"a"), b = area(L"b"), c = area(L"c"), gone = area(L"gone");
    const HsDbObjectId inner = addGroup(L"inner", {}, {c, gone});
    const HsDbObjectId erasedGroup = addGroup(L"erased", {}, {b});
    const HsDbObjectId outer = addGroup(L"Floor 1", {inner, erasedGroup}, {a, gone});
    erase(gone);
    erase(erasedGroup);
    HsDbObjectPointer<ZyrDbAreaGroup> group(outer, HsDb::kForRead);
    ZyrDesc desc(&database);
    group->areaGroupImp()->summaryInfo(&desc);
    EXPECT_EQ(desc.lines(),
              (std::vector<ZyrRmCString>{
                  L"Name: Floor 1", L"Area Group Style: Standard", L"Members: Area Group, Area",
                  L"Calculations: Area", L"Calculations: Perimeter", L"Proposal names: (none)",
                  L"Areas directly in the group: 1", L"Groups directly below: 1",
                  L"Areas at all levels below: 2", L"Groups at all levels below: 1",
                  // The live areas a and c; nothing is modified.
                  L"Area: 4.00 m\u00b2", L"Perimeter: 12.00 m", L"Net area: 4.00 m\u00b2",
                  L"Net perimeter: 12.00 m"}));
}

// An object is modified by the write that records a redraw; the open mode is put back, and
// another reader keeps it from an upgrade.
TEST_F(ZyrAreaGroups, aRedrawIsRecordedInTheOpenModeItFinds) {
    const HsDbObjectId group = addGroup(L"g"), erased = addGroup(L"erased");
    erase(erased);
    for (const auto& [id, mode, modified, readers] :
         {std::tuple(group, HsDb::kForRead, true, 1), std::tuple(group, HsDb::kForWrite, true, 1),
          std::tuple(erased, HsDb::kForRead, false, 1),
          std::tuple(group, HsDb::kForRead, false, 2)}) {
        HsDbObjectPointer<ZyrDbAreaGroup> opened(id, mode, true), other;
        if (readers == 2)
            other.open(id, HsDb::kForRead);
        opened->recordForRegen();
        EXPECT_EQ(std::pair(opened->isWriteEnabled(), opened->isModified()),
                  std::pair(mode == HsDb::kForWrite, modified))
            << id << " " << readers;
    }
}

TEST_F(ZyrAreaGroups, anAreaLeavesItsGroupsOnlyForAnotherClass) {
    for (const bool byArea : {true, false}) {
        const HsDbObjectId hall = area(L"hall"), kept = area(L"kept");
        const HsDbObjectId first = addGroup(L"first", {}, {hall, kept});
        const HsDbObjectId second = addGroup(L"second", {}, {kept, hall});
        HsDbObject* successor =
            byArea ? static_cast<HsDbObject*>(new ZyrDbArea) : new ZyrDbAreaGroupStyle;
        {
            // Out of the drawing after the hand-over, the old area is deleted by the pointer.
            HsDbObjectPointer<ZyrDbArea> old(hall, HsDb::kForWrite);
            ASSERT_EQ(old->handOverTo(successor), Hsys::eSuccess);
        }
        successor->close();
        EXPECT_EQ(leafsOf(first), byArea ? (Ids{hall, kept}) : Ids{kept}) << byArea;
        EXPECT_EQ(leafsOf(second), byArea ? (Ids{kept, hall}) : Ids{kept}) << byArea;
    }
}

} // namespace
