// Per-database packets: registration by application name, one packet per database made on first
// ask, and gone with the database, its emptying, or the packet type.
#include "platform/base/app/ZyrDatabaseData.h"
#include "platform/base/app/ZyrDatabaseDataMgrDictionary.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/rx/HsRxClass.h"

#include <gtest/gtest.h>

#include <sqlite3.h>
#include <unistd.h>

#include <filesystem>
#include <memory>
#include <string>

namespace {

// Counts the packets alive, so that a test sees each one die.
class CountedPacket : public ZyrDatabaseData {
    HSRX_DECLARE_MEMBERS(CountedPacket)

public:
    CountedPacket() { ++alive; }
    ~CountedPacket() override { --alive; }
    static inline int alive = 0;
};
HSRX_DEFINE_MEMBERS(CountedPacket, ZyrDatabaseData, 0, hsrxInstantiateClass<CountedPacket>)

class OtherPacket : public ZyrDatabaseData {
    HSRX_DECLARE_MEMBERS(OtherPacket)
};
HSRX_DEFINE_MEMBERS(OtherPacket, ZyrDatabaseData, 0, hsrxInstantiateClass<OtherPacket>)

constexpr const wchar_t* kApp = L"PacketTest80";

namespace fs = std::filesystem;

// Cuts every filed object short, so that reading the drawing fails after its objects came in.
void damageEveryObject(const fs::path& path) {
    sqlite3* file = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &file), SQLITE_OK);
    EXPECT_EQ(sqlite3_exec(file, "UPDATE objects SET data = substr(data, 1, 3)", nullptr, nullptr,
                           nullptr),
              SQLITE_OK);
    sqlite3_close(file);
}

class ZyrDatabaseDataTest : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_EQ(ZyrDatabaseDataMgrDictionary::registerPacketType(kApp, CountedPacket::desc()),
                  Hsys::eSuccess);
        mgr = ZyrDatabaseDataMgrDictionary::getMgr(kApp);
        ASSERT_NE(mgr, nullptr);
    }
    void TearDown() override {
        ZyrDatabaseDataMgrDictionary::unRegisterPacketType(kApp);
        EXPECT_EQ(CountedPacket::alive, 0);
    }

    ZyrDatabaseDataMgr* mgr = nullptr;
};

TEST_F(ZyrDatabaseDataTest, registrationRefusesWithItsStatuses) {
    const struct {
        const wchar_t* app;
        HsRxClass* cls;
        Hsys::ErrorStatus expected;
    } cases[] = {
        {L"", OtherPacket::desc(), Hsys::eNullPointer},
        {L"Other80", HsDbDatabase::desc(), Hsys::eWrongClass},
        {L"Other80", ZyrDatabaseData::desc(), Hsys::eWrongClass}, // no pseudo constructor
        {kApp, CountedPacket::desc(), Hsys::eAlreadyPresent},
        {kApp, OtherPacket::desc(), Hsys::eDuplicateName},
    };
    for (const auto& c : cases)
        EXPECT_EQ(ZyrDatabaseDataMgrDictionary::registerPacketType(c.app, c.cls), c.expected)
            << c.app;
    EXPECT_EQ(ZyrDatabaseDataMgrDictionary::getMgr(L"Other80"), nullptr);
    EXPECT_EQ(ZyrDatabaseDataMgrDictionary::unRegisterPacketType(L"Other80"), Hsys::eNameNotFound);
}

TEST_F(ZyrDatabaseDataTest, onePacketPerDatabaseMadeOnFirstAskAndGoneWithIt) {
    auto db = std::make_unique<HsDbDatabase>();
    HsDbDatabase kept;
    EXPECT_EQ(mgr->databaseData(nullptr), nullptr);
    EXPECT_FALSE(mgr->hasDatabaseData(&kept));
    ZyrDatabaseData* packet = mgr->databaseData(&kept);
    ASSERT_NE(packet, nullptr);
    EXPECT_EQ(packet->database(), &kept); // init ran
    EXPECT_EQ(mgr->databaseData(&kept), packet);
    EXPECT_NE(mgr->databaseData(db.get()), packet);
    EXPECT_EQ(CountedPacket::alive, 2);
    db.reset();
    EXPECT_EQ(CountedPacket::alive, 1);
    EXPECT_EQ(mgr->packetCount(), 1);
    EXPECT_TRUE(mgr->hasDatabaseData(&kept));

    // A load that fails after objects came in empties the database: the packet goes with them.
    const fs::path path =
        fs::temp_directory_path() / ("zyr-packet-" + std::to_string(::getpid()) + ".zyr");
    ASSERT_EQ(kept.saveAs(path.wstring().c_str()), Hsys::eSuccess);
    damageEveryObject(path);
    HsDbDatabase loading(HsDb::kEmptyDatabase);
    ASSERT_NE(mgr->databaseData(&loading), nullptr);
    EXPECT_EQ(loading.readDrawingFile(path.wstring().c_str()), Hsys::eBadDrawingFile);
    EXPECT_FALSE(mgr->hasDatabaseData(&loading));
    EXPECT_EQ(CountedPacket::alive, 1);
    fs::remove(path);
}

TEST_F(ZyrDatabaseDataTest, unregisteringTheTypeDeletesItsPacketsAndStopsWatching) {
    auto db = std::make_unique<HsDbDatabase>();
    ASSERT_NE(mgr->databaseData(db.get()), nullptr);
    ASSERT_EQ(ZyrDatabaseDataMgrDictionary::unRegisterPacketType(kApp), Hsys::eSuccess);
    EXPECT_EQ(CountedPacket::alive, 0);
    EXPECT_EQ(ZyrDatabaseDataMgrDictionary::getMgr(kApp), nullptr);
    db.reset(); // must not reach the deleted manager
    ASSERT_EQ(ZyrDatabaseDataMgrDictionary::registerPacketType(kApp, CountedPacket::desc()),
              Hsys::eSuccess);
}

} // namespace
