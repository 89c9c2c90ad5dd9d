// The group handler on a tree of sample groups and leafs: the rules of adding and removing, the
// answers over the whole tree, erased members, the way back through the relationship graph before
// and after a drawing file, the handler's copy and filing, and the labels of ownership modes.
#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/objects/ZyrGroupHandlerFunctional.h"
#include "areacalc/objects/ZyrStandardGroupHandlerImp.h"
#include "areacalc/objects/ZyrWriteToRead.h"
#include "platform/base/app/ZyrAppHdx.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/app/ZyrRxClassDecorator.h"
#include "platform/base/obj/ZyrDbGeo.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsAssertionViolation.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <tuple>
#include <unistd.h>

class ZyrDbTestGroup;

class ZyrDbTestLeaf : public ZyrDbGeo {
    HSRX_DECLARE_MEMBERS(ZyrDbTestLeaf)
};
HSRX_DEFINE_MEMBERS(ZyrDbTestLeaf, ZyrDbGeo, 0, hsrxInstantiateClass<ZyrDbTestLeaf>)

// Holds its handler as the module's group does, and files it after its version word.
class ZyrImpTestGroup : public ZyrImpGeo {
    HSRX_DECLARE_MEMBERS(ZyrImpTestGroup)

public:
    using Handler = ZyrStandardGroupHandlerImp<ZyrImpTestGroup, ZyrDbTestGroup, ZyrDbTestLeaf>;

    const ZyrGroupHandler* groupHandler() const { return &m_handler; }
    ZyrGroupHandler* groupHandler() { return &m_handler; }
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        if (const Hsys::ErrorStatus status = ZyrImpGeo::bdfInFields(filer);
            status != Hsys::eSuccess)
            return status;
        return bdfInVersion(filer) == Hsys::eSuccess ? m_handlerImp.bdfInFields(filer)
                                                     : filer->filerStatus();
    }
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        ZyrImpGeo::bdfOutFields(filer);
        bdfOutVersion(filer);
        return m_handlerImp.bdfOutFields(filer);
    }
    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override {
        ZyrImpGeo::getReferencedObjects(map);
        return m_handlerImp.getReferencedObjects(map);
    }

private:
    Handler m_handlerImp{this};
    ZyrGroupHandler m_handler{m_handlerImp};
};
HSRX_DEFINE_MEMBERS(ZyrImpTestGroup, ZyrImpGeo, 0, hsrxInstantiateClass<ZyrImpTestGroup>)

class ZyrDbTestGroup : public ZyrDbGeo {
    HSRX_DECLARE_MEMBERS(ZyrDbTestGroup)

public:
    ZyrDbTestGroup() : ZyrDbGeo(false) { setImp(new ZyrImpTestGroup); }
    const ZyrGroupHandler* groupHandler() const {
        return std::as_const(*ZyrImpTestGroup::cast(imp())).groupHandler();
    }
    ZyrGroupHandler* groupHandler() {
        assertWriteEnabled();
        return ZyrImpTestGroup::cast(imp())->groupHandler();
    }
};
HSRX_DEFINE_MEMBERS(ZyrDbTestGroup, ZyrDbGeo, 0, hsrxInstantiateClass<ZyrDbTestGroup>)

class ZyrDbTestSubGroup : public ZyrDbTestGroup {
    HSRX_DECLARE_MEMBERS(ZyrDbTestSubGroup)
};
HSRX_DEFINE_MEMBERS(ZyrDbTestSubGroup, ZyrDbTestGroup, 0, hsrxInstantiateClass<ZyrDbTestSubGroup>)

namespace {

using Ids = std::vector<HsDbObjectId>;

int gImage;
HsModuleHandle gTestModule = &gImage;
AFX_EXTENSION_MODULE gExtension;
constexpr int kGroupName = 28972;
constexpr int kLeafName = 29001;
const ZyrRxClassDecorator gGroupDecorator(typeid(ZyrDbTestGroup), typeid(ZyrDbGeo),
                                          &ZyrDbTestGroup::desc, &ZyrDbTestGroup::desc,
                                          &gTestModule, kGroupName, ZyrRxClassDecorator::kNoText);
const ZyrRxClassDecorator gLeafDecorator(typeid(ZyrDbTestLeaf), typeid(ZyrDbGeo),
                                         &ZyrDbTestLeaf::desc, &ZyrDbTestLeaf::desc, &gTestModule,
                                         kLeafName, ZyrRxClassDecorator::kNoText);

// R holds A, B and l1; A holds C and l2; B may hold leafs only and holds l4; C holds l3 and l1
// again. S, of a class derived from the group class, holds l5.
struct Tree {
    HsDbObjectId R, A, B, C, S, l1, l2, l3, l4, l5;
};

class ZyrGroupHandlerTree : public ::testing::Test {
protected:
    void SetUp() override { ASSERT_EQ(ZyrBaseServices::registerService(&app), Hsys::eSuccess); }
    void TearDown() override {
        EXPECT_EQ(ZyrBaseServices::unRegisterService(&app), Hsys::eSuccess);
    }

    HsDbObjectId add(HsDbObject* object) {
        HsDbObjectId id;
        EXPECT_EQ(database.addHsDbObject(id, object), Hsys::eSuccess);
        object->close();
        return id;
    }
    HsDbObjectId leaf() { return add(new ZyrDbTestLeaf); }
    HsDbObjectId group(unsigned short mode = 3, ZyrDbTestGroup* made = new ZyrDbTestGroup) {
        EXPECT_EQ(made->groupHandler()->setNodeOwnership(mode), Hsys::eSuccess);
        return add(made);
    }
    template <class Change> static auto change(const HsDbObjectId& id, Change change) {
        HsDbObjectPointer<ZyrDbTestGroup> group(id, HsDb::kForWrite);
        return change(*group->groupHandler());
    }
    template <class Question> static auto ask(const HsDbObjectId& id, Question question) {
        HsDbObjectPointer<ZyrDbTestGroup> group(id, HsDb::kForRead);
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
    template <class Group = ZyrDbTestGroup> static Ids owners(const HsDbObjectId& id) {
        Ids out;
        EXPECT_EQ(ZyrGroupHandlerFunctional::ownerGroups<Group>(id, out), Hsys::eSuccess);
        return out;
    }
    static void erase(const HsDbObjectId& id) {
        EXPECT_EQ(HsDbObjectPointer<HsDbObject>(id, HsDb::kForWrite)->erase(), Hsys::eSuccess);
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

    ZyrAppHdx app{L"GroupHandlerTest80", nullptr, gExtension, L"GroupHandlerTest"};
    HsDbDatabase database;
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

    HsDbObjectPointer<ZyrDbTestGroup> readOnly(t.A, HsDb::kForWrite);
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
    EXPECT_EQ(ZyrGroupHandlerOperations::queryObjects(objects, ZyrImpTestGroup::desc(), &database),
              Hsys::eNothingFound);
    EXPECT_EQ(objects, Ids{t.l1});
    erase(t.S);
    EXPECT_EQ(ZyrGroupHandlerOperations::queryObjects(objects, ZyrDbTestSubGroup::desc(), nullptr),
              Hsys::eNullPointer)
        << "no working database";
    EXPECT_EQ(
        ZyrGroupHandlerOperations::queryObjects(objects, ZyrDbTestSubGroup::desc(), &database),
        Hsys::eNullId);
    EXPECT_EQ(ZyrGroupHandlerOperations::queryObjects(objects, ZyrDbTestGroup::desc(), &database),
              Hsys::eSuccess);
    EXPECT_EQ(objects, (Ids{t.R, t.A, t.B, t.C}));

    const std::wstring path = (std::filesystem::temp_directory_path() /
                               ("ZyrGroupHandlerTest-" + std::to_string(getpid()) + ".drawing"))
                                  .wstring();
    ASSERT_EQ(database.saveAs(path.c_str()), Hsys::eSuccess);
    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    ASSERT_EQ(loaded.readDrawingFile(path.c_str()), Hsys::eSuccess);
    std::filesystem::remove(path);
    const auto there = [&](const Ids& ids) {
        Ids mapped;
        for (const HsDbObjectId& id : ids)
            EXPECT_EQ(loaded.getHsDbObjectId(mapped.emplace_back(), false, id.handle()),
                      Hsys::eSuccess);
        return mapped;
    };
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

    ZyrImpTestGroup::Handler read(nullptr);
    using OtherLeafs =
        ZyrStandardGroupHandlerImp<ZyrImpTestGroup, ZyrDbTestGroup, ZyrDbTestSubGroup>;
    using OtherNodes =
        ZyrStandardGroupHandlerImp<ZyrImpTestGroup, ZyrDbTestSubGroup, ZyrDbTestLeaf>;
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
    ZyrDbTestGroup outside;
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
    HsDbObjectPointer<ZyrDbTestGroup> heldForWrite(t.A, HsDb::kForWrite);
    EXPECT_DEATH(ask(t.R, [&](const ZyrGroupHandler& h) { return h.hasLeaf(t.l3); }), "");
}

TEST(ZyrGroupNodeTypes, labelsAModeWithTheNamesOfTheClassesItMayHold) {
    ZyrAreaCalculationBaseTexts::registerTexts();
    ZyrDecoratorManager::bindModule(gTestModule, ZyrAreaCalculationBaseApp::kAppName);
    const auto text = [](unsigned int id) {
        return ZyrAreaCalculationBaseApp::sStringFromResource(id, false);
    };
    HsRxClass* const group = ZyrDbTestGroup::desc();
    HsRxClass* const leaf = ZyrDbTestLeaf::desc();
    const std::tuple<unsigned short, HsRxClass*, HsRxClass*, ZyrRmCString> cases[] = {
        {0, group, leaf, text(29057)},
        {1, group, leaf, text(kGroupName)},
        {2, group, leaf, text(kLeafName)},
        {3, group, leaf, text(kGroupName) + L", " + text(kLeafName)},
        {3, nullptr, nullptr, text(28987) + L", " + text(29007)},
        {3, group, ZyrDbTestSubGroup::desc(), text(kGroupName) + L", "},
        {4, group, leaf, L"kept"},
    };
    for (const auto& [mode, nodeClass, leafClass, expected] : cases) {
        ZyrRmCString out = L"kept";
        ZyrGroupNodeTypes::displayName(mode, nodeClass, leafClass, out);
        EXPECT_EQ(out.str(), expected.str()) << mode;
    }
}

} // namespace
