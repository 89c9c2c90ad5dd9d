// The relationship graph of a drawing: who refers to an object after changes, erases, undos,
// hand-overs and a save and load, the objects of a class, and the graph's life beside its database.
#include "tests/platform/base/obj/ZyrSampleObjects.h"

#include "platform/base/app/ZyrAppHdx.h"
#include "platform/base/app/ZyrBaseServices.h"
#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/db/HsDbTransactionManager.h"
#include "platform/host/ut/HsutUtf8.h"

#include <gtest/gtest.h>

namespace {

AFX_EXTENSION_MODULE gExtension;

// A record whose reader fails while gFailReads holds, so that a drawing stops loading at it.
bool gFailReads = false;

class ZyrDbUnreadable : public ZyrDbObject {
    HSRX_DECLARE_MEMBERS(ZyrDbUnreadable)

public:
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        const Hsys::ErrorStatus status = ZyrDbObject::bdfInFields(filer);
        return gFailReads ? Hsys::eFilerError : status;
    }
};

HSRX_DEFINE_MEMBERS(ZyrDbUnreadable, ZyrDbObject, 0, hsrxInstantiateClass<ZyrDbUnreadable>)

constexpr int kRecord = ZyrObjReferenceInfo::kRecordRelation;
constexpr int kMember = ZyrObjReferenceInfo::kMemberRelation;

// A referrer's handle and relation type.
using Referrers = std::vector<std::pair<std::uint64_t, int>>;
using Handles = std::vector<std::uint64_t>;

class ZyrObjRelGraphOf : public ::testing::Test {
protected:
    void SetUp() override { ASSERT_EQ(ZyrBaseServices::registerService(&app), Hsys::eSuccess); }
    void TearDown() override {
        EXPECT_EQ(ZyrBaseServices::unRegisterService(&app), Hsys::eSuccess);
    }

    static ZyrObjRelGraph* graphOf(HsDbDatabase& db) {
        return ZyrBaseServices::service()->objRelGraph(&db);
    }

    HsDbObjectId add(HsDbObject* object) { return addClosed(database, object); }
    HsDbObjectId addRecord(const HsDbObjectId& style = HsDbObjectId()) {
        auto* record = new ZyrDbSampleRecord;
        EXPECT_EQ(record->sampleImp()->setStyleId(style), Hsys::eSuccess);
        return add(record);
    }
    HsDbObjectId addShape(const std::vector<HsDbObjectId>& members,
                          const std::vector<HsDbObjectId>& records = {}) {
        return add(newSampleShape(members, records));
    }

    // Who refers to the object of handle in db.
    static Referrers referrersOf(HsDbDatabase& db, std::uint64_t handle,
                                 bool excludeErased = true) {
        HsDbObjectId id;
        EXPECT_EQ(db.getHsDbObjectId(id, false, handle), Hsys::eSuccess);
        HsDbObjectPointer<HsDbObject> object(id, HsDb::kForRead, true);
        HsArray<HsDbObjectId> ids;
        HsArray<int> types;
        EXPECT_EQ(graphOf(db)->getReferencesToMe(object.object(), ids, types, excludeErased),
                  Hsys::eSuccess);
        Referrers referrers;
        for (int i = 0; i < ids.length(); ++i)
            referrers.emplace_back(ids[i].handle(), types[i]);
        return referrers;
    }
    Referrers referrersOf(const HsDbObjectId& id, bool excludeErased = true) {
        return referrersOf(database, id.handle(), excludeErased);
    }

    static Handles objectsOf(HsDbDatabase& db, HsRxClass* cls, bool exact, bool erased) {
        HsArray<HsDbObjectId> ids;
        EXPECT_EQ(graphOf(db)->getObjectsOfType(cls, ids, exact, erased), Hsys::eSuccess);
        Handles handles;
        for (const HsDbObjectId& id : ids)
            handles.push_back(id.handle());
        return handles;
    }

    void setErased(const HsDbObjectId& id, bool erased) {
        ASSERT_EQ(HsDbObjectPointer<HsDbObject>(id, HsDb::kForWrite, true)->erase(erased),
                  Hsys::eSuccess);
    }

    ZyrAppHdx app{L"GraphTest80", nullptr, gExtension, L"GraphTest"};
    HsDbDatabase database;
    const ZyrScratchDrawing drawing;
};

TEST_F(ZyrObjRelGraphOf, answersWhoRefersInHandleOrderWithTheRelationType) {
    const HsDbObjectId style = addRecord();
    const HsDbObjectId member = addShape({});
    const HsDbObjectId usesStyle = addRecord(style);
    const HsDbObjectId holder = addShape({member, member}, {style, style});
    const HsDbObjectId both = addShape({style}, {style});
    EXPECT_EQ(referrersOf(style), (Referrers{{usesStyle.handle(), kRecord},
                                             {holder.handle(), kRecord},
                                             {both.handle(), kRecord},
                                             {both.handle(), kMember}}));
    EXPECT_EQ(referrersOf(member), (Referrers{{holder.handle(), kMember}}));
    EXPECT_TRUE(referrersOf(holder).empty());
}

TEST_F(ZyrObjRelGraphOf, followsEveryChangeOfAListAndErasesOnlyWhenAsked) {
    const HsDbObjectId member = addShape({});
    const HsDbObjectId group = addShape({});
    ASSERT_TRUE(referrersOf(member).empty()) << "the graph is built before the change";
    {
        HsDbObjectPointer<ZyrDbSampleShape> shape(group, HsDb::kForWrite);
        ASSERT_EQ(shape->shapeImp()->addMember(member), Hsys::eSuccess);
        EXPECT_EQ(referrersOf(member), (Referrers{{group.handle(), kMember}}))
            << "answered while the group is still open for write";
        ASSERT_EQ(shape->shapeImp()->removeMember(member), Hsys::eSuccess);
        auto* override = new ZyrSampleOverride;
        ASSERT_EQ(shape->appendOverride(override), Hsys::eSuccess);
        override->add(member);
    }
    EXPECT_EQ(referrersOf(member), (Referrers{{group.handle(), kRecord}}));
    ASSERT_EQ(HsDbObjectPointer<ZyrDbSampleShape>(group, HsDb::kForWrite)->deleteOverrideAt(0),
              Hsys::eSuccess);
    EXPECT_TRUE(referrersOf(member).empty());

    const HsDbObjectId first = addShape({member});
    const HsDbObjectId second = addShape({member});
    setErased(first, true);
    EXPECT_EQ(referrersOf(member), (Referrers{{second.handle(), kMember}}));
    EXPECT_EQ(referrersOf(member, false),
              (Referrers{{first.handle(), kMember}, {second.handle(), kMember}}));
    setErased(first, false);
    EXPECT_EQ(referrersOf(member).size(), 2u);
}

TEST_F(ZyrObjRelGraphOf, anAbortedTransactionTakesTheGraphBackWithTheObject) {
    const HsDbObjectId member = addShape({});
    const HsDbObjectId group = addShape({});
    HsDbTransactionManager* transactions = database.transactionManager();
    transactions->startTransaction();
    HsDbObject* opened = nullptr;
    ASSERT_EQ(transactions->getObject(opened, group, HsDb::kForWrite), Hsys::eSuccess);
    ASSERT_EQ(ZyrDbSampleShape::cast(opened)->shapeImp()->addMember(member), Hsys::eSuccess);
    const HsDbObjectId added = addShape({member});
    EXPECT_EQ(referrersOf(member).size(), 2u);
    ASSERT_EQ(transactions->abortTransaction(), Hsys::eSuccess);
    EXPECT_TRUE(referrersOf(member).empty());
    EXPECT_EQ(referrersOf(member, false), (Referrers{{added.handle(), kMember}}))
        << "an object added in the transaction stays, erased";
}

TEST_F(ZyrObjRelGraphOf, aSavedAndLoadedDrawingAnswersTheSame) {
    const HsDbObjectId style = addRecord();
    const HsDbObjectId member = addShape({});
    const HsDbObjectId group = addShape({member}, {style});
    const HsDbObjectId erased = addShape({member});
    setErased(erased, true);
    const std::wstring file = drawing.savedFrom(database);
    // One graph is made before the load and learns it as it happens; one after it.
    HsDbDatabase before(HsDb::kEmptyDatabase);
    ASSERT_NE(graphOf(before), nullptr);
    ASSERT_EQ(before.readDrawingFile(file.c_str()), Hsys::eSuccess);
    HsDbDatabase after(HsDb::kEmptyDatabase);
    ASSERT_EQ(after.readDrawingFile(file.c_str()), Hsys::eSuccess);
    for (HsDbDatabase* loaded : {&before, &after}) {
        EXPECT_EQ(referrersOf(*loaded, member.handle()), (Referrers{{group.handle(), kMember}}));
        EXPECT_EQ(referrersOf(*loaded, member.handle(), false),
                  (Referrers{{group.handle(), kMember}, {erased.handle(), kMember}}));
        EXPECT_EQ(referrersOf(*loaded, style.handle()), (Referrers{{group.handle(), kRecord}}));
        EXPECT_EQ(objectsOf(*loaded, ZyrDbSampleShape::desc(), true, false),
                  (Handles{member.handle(), group.handle()}));
    }
}

TEST_F(ZyrObjRelGraphOf, objectsOfAClassComeInHandleOrderAfterWhatTheListHeld) {
    const std::uint64_t shape = addShape({}).handle();
    const std::uint64_t record = addRecord().handle();
    const std::uint64_t geo = add(new ZyrDbGeo).handle();
    const HsDbObjectId erased = addShape({});
    setErased(erased, true);
    const struct {
        HsRxClass* cls;
        bool exact;
        bool erased;
        Handles handles;
    } cases[] = {
        {ZyrDbSampleShape::desc(), true, true, {shape, erased.handle()}},
        {ZyrDbGeo::desc(), true, false, {geo}},
        {ZyrDbGeo::desc(), false, false, {shape, geo}},
        {ZyrDbGeo::desc(), false, true, {shape, geo, erased.handle()}},
        {ZyrDbObject::desc(), false, false, {record}},
        {ZyrDbDictRecord::desc(), true, false, {}},
    };
    for (const auto& c : cases)
        EXPECT_EQ(objectsOf(database, c.cls, c.exact, c.erased), c.handles)
            << hsutToUtf8(c.cls->name()) << " exact " << c.exact << " erased " << c.erased;
    HsArray<HsDbObjectId> ids{HsDbObjectId()};
    ASSERT_EQ(graphOf(database)->getObjectsOfType(ZyrDbSampleRecord::desc(), ids, true, false),
              Hsys::eSuccess);
    EXPECT_EQ(ids.length(), 2) << "appended, not cleared";
    EXPECT_EQ(graphOf(database)->getObjectsOfType(nullptr, ids, true, false), Hsys::eNullPointer);
}

TEST_F(ZyrObjRelGraphOf, aHandOverGivesTheIdTheNewObjectsClassAndReferences) {
    const HsDbObjectId style = addRecord();
    const HsDbObjectId member = addShape({});
    const HsDbObjectId id = addShape({member});
    ASSERT_EQ(objectsOf(database, ZyrDbSampleShape::desc(), true, false).size(), 2u);
    auto* successor = new ZyrDbSampleRecord;
    ASSERT_EQ(successor->sampleImp()->setStyleId(style), Hsys::eSuccess);
    {
        HsDbObjectPointer<HsDbObject> old(id, HsDb::kForWrite);
        ASSERT_EQ(old->handOverTo(successor), Hsys::eSuccess);
        successor->close();
        delete old.release();
    }
    EXPECT_EQ(objectsOf(database, ZyrDbSampleShape::desc(), true, false), Handles{member.handle()});
    EXPECT_TRUE(referrersOf(member).empty());
    EXPECT_EQ(referrersOf(style), (Referrers{{id.handle(), kRecord}}));
}

TEST_F(ZyrObjRelGraphOf, referencesIntoAnotherDrawingAreNoEdges) {
    HsDbDatabase other;
    const HsDbObjectId foreign = addClosed(other, new ZyrDbSampleRecord);
    addShape({foreign});
    EXPECT_TRUE(referrersOf(other, foreign.handle()).empty());
    HsDbObjectPointer<HsDbObject> object(foreign, HsDb::kForRead);
    HsArray<HsDbObjectId> ids;
    HsArray<int> types;
    EXPECT_EQ(graphOf(database)->getReferencesToMe(object.object(), ids, types, true),
              Hsys::eBadArgument);
    EXPECT_EQ(graphOf(database)->getReferencesToMe(nullptr, ids, types, true), Hsys::eNullPointer);
}

TEST_F(ZyrObjRelGraphOf, aGraphGoesWithItsDatabaseAndWithTheService) {
    EXPECT_EQ(ZyrBaseServices::service()->objRelGraph(nullptr), nullptr);
    auto doomed = std::make_unique<HsDbDatabase>();
    const HsDbDatabase* address = doomed.get();
    ZyrObjRelGraph* graph = graphOf(*doomed);
    EXPECT_EQ(graphOf(*doomed), graph) << "one graph per database";
    EXPECT_EQ(ZyrBaseServices::service()->findObjRelGraph(address), graph);
    doomed.reset();
    EXPECT_EQ(ZyrBaseServices::service()->findObjRelGraph(address), nullptr);

    // A drawing that fails at its last object is dropped whole, and its graph with it.
    addShape({addShape({})});
    add(new ZyrDbUnreadable);
    const std::wstring file = drawing.savedFrom(database);
    HsDbDatabase failing(HsDb::kEmptyDatabase);
    ZyrObjRelGraph* failingGraph = graphOf(failing);
    gFailReads = true;
    EXPECT_EQ(failing.readDrawingFile(file.c_str()), Hsys::eBadDrawingFile);
    gFailReads = false;
    EXPECT_TRUE(objectsOf(failing, HsDbObject::desc(), false, true).empty());
    EXPECT_EQ(graphOf(failing), failingGraph);
    ASSERT_EQ(failing.readDrawingFile(file.c_str()), Hsys::eSuccess);
    EXPECT_EQ(objectsOf(failing, ZyrDbSampleShape::desc(), true, true).size(), 2u);
}

} // namespace
