// The group handler on a tree of area groups and areas: the rules of adding and removing, the
// answers over the whole tree, erased members, the way back through the relationship graph before
// and after a drawing file, the handler's copy and filing, and the labels of ownership modes.
#include "tests/areacalc/ZyrAreaDrawing.h"

#include "areacalc/objects/ZyrGroupHandlerFunctional.h"
#include "areacalc/objects/ZyrGroupNodeTypes.h"
#include "areacalc/objects/ZyrWriteToRead.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <tuple>

// A group of a class derived from the group class, without display texts. It is registered with
// the module's classes, after its parent: registered at load time it would find no parent yet.
class ZyrDbTestSubGroup : public ZyrDbAreaGroup {
    ZYR_AREACALC_DECLARE_MEMBERS(ZyrDbTestSubGroup)
};
ZYR_AREACALC_DEFINE_MEMBERS(ZyrDbTestSubGroup, ZyrDbAreaGroup, 0,
                            hsrxInstantiateClass<ZyrDbTestSubGroup>, ZyrRxClassDecorator::kNoText,
                            ZyrRxClassDecorator::kNoText)

namespace {

// R holds A, B and l1; A holds C and l2; B may hold leafs only and holds l4; C holds l3 and l1
// again. S, of the derived class, holds l5.
struct Tree {
    HsDbObjectId R, A, B, C, S, l1, l2, l3, l4, l5;
};

// The drawing with the relationship graph (the way back from members) running.
class ZyrGroupHandlerTree : public ZyrAreaDrawing {
protected:
    void SetUp() override {
        ZyrAreaDrawing::SetUp();
        ASSERT_EQ(ZyrBaseServices::registerService(&ZyrAreaCalculationTestModule::client()),
                  Hsys::eSuccess);
    }
    void TearDown() override {
        EXPECT_EQ(ZyrBaseServices::unRegisterService(&ZyrAreaCalculationTestModule::client()),
                  Hsys::eSuccess);
    }

    HsDbObjectId leaf() { return add(new ZyrDbArea); }
    HsDbObjectId group(unsigned short mode = 3, ZyrDbAreaGroup* made = new ZyrDbAreaGroup) {
        EXPECT_EQ(made->groupHandler()->setNodeOwnership(mode), Hsys::eSuccess);
        return add(made);
    }
    template <class Change> static auto change(const HsDbObjectId& id, Change change) {
        HsDbObjectPointer<ZyrDbAreaGroup> group(id, HsDb::kForWrite);
        return change(*group->groupHandler());
    }
    template <class Question> static auto ask(const HsDbObjectId& id, Question question) {
        HsDbObjectPointer<ZyrDbAreaGroup> group(id, HsDb::kForRead);
        return question(*std::as_const(*group.object()).groupHandler());
    }
    static Hsys::ErrorStatus addNode(const HsDbObjectId& to, const HsDbObjectId& id) {
        return change(to, [&](ZyrGroupHandler& h) { return h.addNode(id); });
    }
    static Hsys::ErrorStatus addLeaf(const HsDbObjectId& to, const HsDbObjectId& id) {
        return change(to, [&](ZyrGroupHandler& h) { return h.addLeaf(id); });
    }
    static Ids below(const HsDbObjectId& id,
                     Hsys::ErrorStatus (ZyrGroupHandler::*walk)(Ids&) const) {
        Ids out;
        EXPECT_EQ(ask(id, [&](const ZyrGroupHandler& h) { return (h.*walk)(out); }),
                  Hsys::eSuccess);
        return out;
    }
    template <class Group = ZyrDbAreaGroup> static Ids owners(const HsDbObjectId& id) {
        Ids out;
        EXPECT_EQ(ZyrGroupHandlerFunctional::ownerGroups<Group>(id, out), Hsys::eSuccess);
        return out;
    }
    void fill(const HsDbObjectId& group, const Ids& nodes, const Ids& leafs) {
        for (const HsDbObjectId& node : nodes)
            EXPECT_EQ(addNode(group, node), Hsys::eSuccess);
        for (const HsDbObjectId& leaf : leafs)
            EXPECT_EQ(addLeaf(group, leaf), Hsys::eSuccess);
    }
    Tree tree() {
        Tree t{group(), group(), group(2), group(), group(3, new ZyrDbTestSubGroup),
               leaf(),  leaf(),  leaf(),   leaf(),  leaf()};
        fill(t.R, {t.A, t.B}, {t.l1});
        fill(t.A, {t.C}, {t.l2});
        fill(t.B, {}, {t.l4});
        fill(t.C, {}, {t.l3, t.l1});
        fill(t.S, {}, {t.l5});
        return t;
    }
};

TEST_F(ZyrGroupHandlerTree, answersOverTheWholeTreeDepthFirst) {
    const Tree t = tree();
    EXPECT_EQ(below(t.R, &ZyrGroupHandler::nodes), (Ids{t.A, t.B, t.C}));
    EXPECT_EQ(below(t.R, &ZyrGroupHandler::leafs), (Ids{t.l1, t.l2, t.l3, t.l1, t.l4}));
    EXPECT_EQ(below(t.A, &ZyrGroupHandler::childs), (Ids{t.C, t.l2, t.l3, t.l1}));
    // Each group with the ids below it as nodes and as leafs; any other id is in neither.
    const std::tuple<HsDbObjectId, Ids, Ids> cases[] = {
        {t.R, {t.A, t.B, t.C}, {t.l1, t.l2, t.l3, t.l4}},
        {t.A, {t.C}, {t.l1, t.l2, t.l3}},
        {t.C, {}, {t.l1, t.l3}}};
    const Ids all{t.R, t.A, t.B, t.C, t.S, t.l1, t.l2, t.l3, t.l4, t.l5};
    for (const auto& [group, nodes, leafs] : cases)
        for (const HsDbObjectId& id : all) {
            const bool node = std::ranges::count(nodes, id) > 0;
            const bool leaf = std::ranges::count(leafs, id) > 0;
            EXPECT_EQ(ask(group,
                          [&id](const ZyrGroupHandler& h) {
                              return std::tuple(h.hasNode(id), h.hasLeaf(id), h.has(id));
                          }),
                      std::tuple(node, leaf, node || leaf))
                << group << " asked for " << id;
        }
}

TEST_F(ZyrGroupHandlerTree, refusesEachAddWithTheStatusOfItsFirstBrokenRule) {
    const Tree t = tree();
    const HsDbObjectId nodesOnly = group(1);
    const std::tuple<HsDbObjectId, bool, HsDbObjectId, Hsys::ErrorStatus> cases[] = {
        {t.R, true, t.R, Hsys::eSelfReference},    {t.B, true, t.B, Hsys::eNullPointer},
        {t.R, true, t.A, Hsys::eAlreadyPresent},   {t.A, true, t.R, Hsys::eDoesNotApply},
        {t.C, true, t.R, Hsys::eDoesNotApply},     {t.C, true, t.A, Hsys::eDoesNotApply},
        {t.R, true, t.l1, Hsys::eNullPointer},     {t.R, true, t.S, Hsys::eNullPointer},
        {t.R, true, {}, Hsys::eNullPointer},       {t.B, true, t.C, Hsys::eNullPointer},
        {t.R, false, t.A, Hsys::eDoesNotApply},    {t.R, false, t.S, Hsys::eDoesNotApply},
        {t.R, false, t.l1, Hsys::eAlreadyPresent}, {nodesOnly, false, t.l1, Hsys::eDoesNotApply},
    };
    for (const auto& [to, node, id, expected] : cases)
        EXPECT_EQ(node ? addNode(to, id) : addLeaf(to, id), expected)
            << to << (node ? " node " : " leaf ") << id;
    EXPECT_EQ(below(t.R, &ZyrGroupHandler::childs),
              (Ids{t.A, t.B, t.C, t.l1, t.l2, t.l3, t.l1, t.l4}));
    EXPECT_EQ(owners(t.R), Ids{}) << "no refused link reached the graph";
    EXPECT_EQ(addLeaf(t.B, t.l1), Hsys::eSuccess) << "an area may stand in several groups";
    EXPECT_EQ(owners(t.l1), (Ids{t.R, t.B, t.C}));

    for (const auto& step : {std::pair{4, Hsys::eDoesNotApply}, {0, Hsys::eSuccess}})
        EXPECT_EQ(change(t.A, [&](ZyrGroupHandler& h) { return h.setNodeOwnership(step.first); }),
                  step.second);
    EXPECT_EQ(below(t.A, &ZyrGroupHandler::childs), (Ids{t.C, t.l2, t.l3, t.l1}));
    EXPECT_EQ(addNode(t.A, t.B), Hsys::eNullPointer) << "members stay, new ones are refused";
    EXPECT_EQ(addLeaf(t.A, t.l4), Hsys::eDoesNotApply);
}

TEST_F(ZyrGroupHandlerTree, addsAndRemovesInBulkAndTheGraphFollows) {
    const Tree t = tree();
    const HsDbObjectId l6 = leaf();
    const auto run = [&](Hsys::ErrorStatus (ZyrGroupHandler::*op)(const Ids&), const Ids& ids) {
        return change(t.B, [&](ZyrGroupHandler& h) { return (h.*op)(ids); });
    };
    EXPECT_EQ(owners(l6), Ids{}) << "the graph is built before the changes";
    EXPECT_EQ(run(&ZyrGroupHandler::addLeafs, {}), Hsys::eDoesNotApply);
    EXPECT_EQ(run(&ZyrGroupHandler::addLeafs, {t.A, t.l4}), Hsys::eDoesNotApply);
    EXPECT_EQ(run(&ZyrGroupHandler::addLeafs, {t.A, t.l1, t.l4, l6}), Hsys::eSuccess);
    EXPECT_EQ(owners(l6), Ids{t.B}) << "a bulk add is recorded once, at its end";
    EXPECT_EQ(run(&ZyrGroupHandler::removeLeafs, {t.l2, t.l3}), Hsys::eDoesNotApply);
    EXPECT_EQ(run(&ZyrGroupHandler::removeLeafs, {t.l1, t.l2}), Hsys::eSuccess);
    EXPECT_EQ(ask(t.B, [](const ZyrGroupHandler& h) { return h.leafs(); }), (Ids{t.l4, l6}));
    EXPECT_EQ(owners(t.l1), (Ids{t.R, t.C}));
    EXPECT_EQ(change(t.C, [&](ZyrGroupHandler& h) { return h.removeLeaf(t.l2); }),
              Hsys::eDoesNotApply);
    EXPECT_EQ(change(t.A, [&](ZyrGroupHandler& h) { return h.removeNode(t.C); }), Hsys::eSuccess);
    EXPECT_EQ(owners(t.C), Ids{});
    EXPECT_EQ(addNode(t.C, t.R), Hsys::eSuccess) << "no cycle once the link is gone";

    HsDbObjectPointer<ZyrDbAreaGroup> readOnly(t.A, HsDb::kForWrite);
    ZyrGroupHandler& handler = *readOnly->groupHandler();
    ASSERT_EQ(readOnly->downgradeOpen(), Hsys::eSuccess);
    EXPECT_EQ(handler.addNode(t.B), Hsys::eDoesNotApply) << "the write assertion is stopped";
    EXPECT_THROW(handler.addLeaf(t.l3), HsAssertionViolation) << "but not for a leaf";
    EXPECT_EQ(handler.nodes(), Ids{});
}

TEST_F(ZyrGroupHandlerTree, skipsErasedGroupsOnEveryWalkButListsThem) {
    const Tree t = tree();
    erase(t.A);
    erase(t.l4);
    EXPECT_EQ(below(t.R, &ZyrGroupHandler::childs), (Ids{t.A, t.B, t.l1, t.l4}));
    EXPECT_EQ(ask(t.R,
                  [&](const ZyrGroupHandler& h) {
                      return std::tuple(h.hasNode(t.C), h.hasLeaf(t.l2), h.hasLeaf(t.l4));
                  }),
              std::tuple(false, false, true));
    for (const HsDbObjectId& member : {t.C, t.l2, t.l4})
        EXPECT_EQ(owners(member), Ids{}) << member;
    EXPECT_EQ(owners(t.l1), (Ids{t.R, t.C})) << "C itself lives on";
}

TEST_F(ZyrGroupHandlerTree, findsOwnersAndObjectsThroughTheGraphBeforeAndAfterADrawingFile) {
    const Tree t = tree();
    EXPECT_EQ(owners(t.l5), Ids{t.S}) << "a group of a derived class is a group";
    EXPECT_EQ(owners<ZyrDbTestSubGroup>(t.l1), Ids{});
    EXPECT_EQ(owners(leaf()), Ids{});
    Ids objects{t.l1};
    const auto query = [&](HsRxClass* cls, HsDbDatabase* in) {
        return ZyrGroupHandlerOperations::queryObjects(objects, cls, in);
    };
    EXPECT_EQ(query(ZyrImpAreaGroup::desc(), &database), Hsys::eNothingFound);
    EXPECT_EQ(objects, Ids{t.l1});
    erase(t.S);
    EXPECT_EQ(query(ZyrDbTestSubGroup::desc(), nullptr), Hsys::eNullPointer)
        << "no working drawing";
    EXPECT_EQ(query(ZyrDbTestSubGroup::desc(), &database), Hsys::eNullId);
    EXPECT_EQ(query(ZyrDbAreaGroup::desc(), &database), Hsys::eSuccess);
    EXPECT_EQ(objects, (Ids{t.R, t.A, t.B, t.C}));

    const std::unique_ptr<HsDbDatabase> loaded = reloaded();
    const auto there = [&](const Ids& ids) { return ZyrAreaDrawing::there(*loaded, ids); };
    EXPECT_EQ(below(there({t.R})[0], &ZyrGroupHandler::childs),
              there({t.A, t.B, t.C, t.l1, t.l2, t.l3, t.l1, t.l4}));
    EXPECT_EQ(owners(there({t.l1})[0]), there({t.R, t.C}));
    EXPECT_EQ(owners(there({t.C})[0]), there({t.A}));
    EXPECT_EQ(addNode(there({t.C})[0], there({t.R})[0]), Hsys::eDoesNotApply);
}

TEST_F(ZyrGroupHandlerTree, listsLeafsThenNodesWithTheirCloneRoles) {
    const Tree t = tree();
    for (const int context : {0, 3}) {
        ZyrObjReferenceMap map(context);
        ask(t.R, [&](const ZyrGroupHandler& h) { return h.imp().getReferencedObjects(map); });
        std::vector<std::tuple<HsDbObjectId, int, int, int>> rows;
        for (int i = 0; i < map.count(); ++i)
            rows.emplace_back(map.at(i)->id(), map.at(i)->relationType(),
                              map.at(i)->copyCloneType(), map.at(i)->exportCloneType());
        EXPECT_EQ(rows,
                  (decltype(rows){{t.l1, 1, 0, context == 3}, {t.A, 1, 1, 1}, {t.B, 1, 1, 1}}));
    }
}

TEST_F(ZyrGroupHandlerTree, copiesAndFilesItsListsAndModeAndRefusesEveryTruncation) {
    const Tree t = tree();
    HsDbBdfFiler writer(&database);
    ASSERT_EQ(ask(t.R, [&](const ZyrGroupHandler& h) { return h.imp().bdfOutFields(&writer); }),
              Hsys::eSuccess);
    std::vector<std::uint8_t> bytes = writer.bytes();
    ASSERT_EQ(bytes.size(), 4u + 8 + 4 + 2 * 8 + 2);
    // The mode, a little-endian uint16, becomes 7: it is stored as read, with no range check.
    bytes[bytes.size() - 2] = 7;

    ZyrImpAreaGroup::Handler read(nullptr);
    using OtherLeafs =
        ZyrStandardGroupHandlerImp<ZyrImpAreaGroup, ZyrDbAreaGroup, ZyrDbTestSubGroup>;
    using OtherNodes = ZyrStandardGroupHandlerImp<ZyrImpAreaGroup, ZyrDbTestSubGroup, ZyrDbArea>;
    EXPECT_EQ(read.copyFrom(OtherLeafs(nullptr)), Hsys::eDoesNotApply);
    EXPECT_EQ(read.copyFrom(OtherNodes(nullptr)), Hsys::eDoesNotApply);
    ask(t.B, [&](const ZyrGroupHandler& h) { return read.copyFrom(h.imp()); });
    Ids out{t.R};
    EXPECT_EQ(read.leafs(out), Hsys::eSuccess) << "a handler of no group in a database";
    EXPECT_EQ(out, Ids{t.R});
    for (std::size_t length = 0; length < bytes.size(); ++length) {
        HsDbBdfFiler truncated(std::vector<std::uint8_t>(bytes.begin(), bytes.begin() + length),
                               &database);
        EXPECT_NE(read.bdfInFields(&truncated), Hsys::eSuccess) << length;
        EXPECT_EQ(std::tuple(read.leafs(), read.nodeOwnership()), std::tuple(Ids{t.l4}, 2))
            << length;
    }
    HsDbBdfFiler whole(bytes, &database);
    ASSERT_EQ(read.bdfInFields(&whole), Hsys::eSuccess);
    EXPECT_EQ(std::tuple(read.leafs(), read.nodes(), read.nodeOwnership()),
              std::tuple(Ids{t.l1}, Ids{t.A, t.B}, 7));
    EXPECT_EQ(read.setNodeOwnership(7), Hsys::eDoesNotApply);
}

TEST_F(ZyrGroupHandlerTree, downgradesForTheScopeOnlyWhatWasOpenForWrite) {
    ZyrDbAreaGroup outside;
    EXPECT_EQ(ZyrWriteToRead(nullptr).status(), Hsys::eNullPointer);
    EXPECT_EQ(ZyrWriteToRead(&outside).status(), Hsys::eNotOpenForWrite);
    for (const HsDb::OpenMode mode : {HsDb::kForRead, HsDb::kForWrite}) {
        HsDbObjectPointer<HsDbObject> object(database.modelSpaceId(), mode);
        EXPECT_EQ(ZyrWriteToRead(object.object()).status(), Hsys::eSuccess);
        {
            const ZyrWriteToRead guard(object.object());
            EXPECT_FALSE(object->isWriteEnabled());
        }
        EXPECT_EQ(object->isWriteEnabled(), mode == HsDb::kForWrite);
    }
}

TEST_F(ZyrGroupHandlerTree, aWalkIntoAGroupThatCannotBeOpenedEndsTheProcess) {
    const Tree t = tree();
    HsDbObjectPointer<ZyrDbAreaGroup> heldForWrite(t.A, HsDb::kForWrite);
    EXPECT_DEATH(ask(t.R, [&](const ZyrGroupHandler& h) { return h.hasLeaf(t.l3); }), "");
}

// The group and area classes are named by their decorators, which give the very wordings that stand
// for a missing class; a class without display texts shows that the decorator is asked.
TEST_F(ZyrGroupHandlerTree, labelsAModeWithTheNamesOfTheClassesItMayHold) {
    HsRxClass* const group = ZyrDbAreaGroup::desc();
    HsRxClass* const area = ZyrDbArea::desc();
    HsRxClass* const untitled = ZyrDbTestSubGroup::desc();
    const std::tuple<unsigned short, HsRxClass*, HsRxClass*, const wchar_t*> cases[] = {
        {0, group, area, L"No members"},
        {1, group, area, L"Area Group"},
        {2, group, area, L"Area"},
        {3, group, area, L"Area Group, Area"},
        {3, nullptr, nullptr, L"Area Group, Area"},
        {3, group, untitled, L"Area Group, "},
        {3, untitled, area, L"Area"},
        {1, untitled, area, L""},
        {4, group, area, L"kept"}};
    for (const auto& [mode, nodeClass, leafClass, expected] : cases) {
        ZyrRmCString out = L"kept";
        ZyrGroupNodeTypes::displayName(mode, nodeClass, leafClass, out);
        EXPECT_EQ(out.str(), expected) << mode;
    }
}

} // namespace
