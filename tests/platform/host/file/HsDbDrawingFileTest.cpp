// Drawing files: a database saved and read back whole, proxies written back byte for byte,
// damaged and foreign files refused with nothing left behind, and saves that are atomic.
#include "platform/host/file/HsDbDrawingFile.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbProxyObject.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>

#include <sqlite3.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <map>
#include <sys/wait.h>
#include <tuple>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;
using Bytes = std::vector<std::uint8_t>;

// The rows of a drawing file as they lie on disk: handle to class name and bytes.
std::map<std::int64_t, std::pair<std::string, Bytes>> rowsOf(const fs::path& path) {
    std::map<std::int64_t, std::pair<std::string, Bytes>> rows;
    sqlite3* db = nullptr;
    sqlite3_open_v2(path.c_str(), &db, SQLITE_OPEN_READONLY, nullptr);
    sqlite3_stmt* query = nullptr;
    sqlite3_prepare_v2(db, "SELECT handle, class, data FROM objects", -1, &query, nullptr);
    while (sqlite3_step(query) == SQLITE_ROW) {
        const auto* data = static_cast<const std::uint8_t*>(sqlite3_column_blob(query, 2));
        rows[sqlite3_column_int64(query, 0)] = {
            reinterpret_cast<const char*>(sqlite3_column_text(query, 1)),
            Bytes(data, data + sqlite3_column_bytes(query, 2))};
    }
    sqlite3_finalize(query);
    sqlite3_close(db);
    return rows;
}

void executeSql(const fs::path& path, const std::string& sql) {
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &db), SQLITE_OK);
    EXPECT_EQ(sqlite3_exec(db, sql.c_str(), nullptr, nullptr, nullptr), SQLITE_OK)
        << sqlite3_errmsg(db);
    sqlite3_close(db);
}

class HsDbDrawingFileTest : public testing::Test {
protected:
    void SetUp() override {
        directory = fs::temp_directory_path() /
                    ("hsdb-drawing-" + std::to_string(::getpid()) + "-" +
                     testing::UnitTest::GetInstance()->current_test_info()->name());
        fs::remove_all(directory);
        fs::create_directories(directory);
        path = directory / "plan.zyr";
    }
    void TearDown() override { fs::remove_all(directory); }

    Hsys::ErrorStatus save(HsDbDatabase& db) { return db.saveAs(path.wstring().c_str()); }
    Hsys::ErrorStatus load(HsDbDatabase& db, std::wstring* reason = nullptr) {
        return db.readDrawingFile(path.wstring().c_str(), reason);
    }
    // The id that an object saved under the given id has in the loaded database.
    static HsDbObjectId sameIn(HsDbDatabase& loaded, const HsDbObjectId& saved) {
        HsDbObjectId found;
        EXPECT_EQ(loaded.getHsDbObjectId(found, false, saved.handle()), Hsys::eSuccess);
        return found;
    }

    fs::path directory;
    fs::path path;
};

// What the bytes cannot show: ids that resolve into the loaded database, erasures, the header.
// That every object reads and writes back its bytes is shown by the resave below.
TEST_F(HsDbDrawingFileTest, aSavedDatabaseLoadsWithTheSameObjectsAndReferences) {
    HsDbDatabase original;
    original.setDrawingUnits(HsDb::kUnitsCentimeters);
    ASSERT_EQ(original.setDisplayPrecision(3), Hsys::eSuccess);
    const HsDbObjectId kitchen = addGadget(original, L"K\u00fcche");
    const HsDbObjectId hall = addGadget(original, L"Flur");
    const HsDbObjectId storeroom = addGadget(original, L"Abstellraum");
    {
        HsDbObjectPointer<TestGadget> gadget(kitchen, HsDb::kForWrite);
        gadget->partner = hall;
        gadget->neighbours = {hall, storeroom, HsDbObjectId()};
        HsDbObjectPointer<TestGadget>(storeroom, HsDb::kForWrite)->erase();
    }
    ASSERT_EQ(save(original), Hsys::eSuccess);

    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    std::wstring reason;
    ASSERT_EQ(load(loaded, &reason), Hsys::eSuccess) << reason;
    const wchar_t* fileName = nullptr;
    loaded.getFilename(fileName);
    EXPECT_EQ(fs::path(fileName), path);
    EXPECT_EQ(loaded.drawingUnits(), HsDb::kUnitsCentimeters);
    EXPECT_EQ(loaded.displayPrecision(), 3);
    const auto idIn = [&loaded](const HsDbObjectId& saved) { return sameIn(loaded, saved); };
    HsDbObjectPointer<HsDbBlockTableRecord> space(loaded.modelSpaceId(), HsDb::kForRead);
    ASSERT_EQ(space.openStatus(), Hsys::eSuccess);
    EXPECT_EQ(space->entityIds(),
              (std::vector<HsDbObjectId>{idIn(kitchen), idIn(hall), idIn(storeroom)}));
    EXPECT_TRUE(idIn(storeroom).isErased());
    HsDbObjectPointer<TestGadget> gadget(idIn(kitchen), HsDb::kForRead);
    ASSERT_EQ(gadget.openStatus(), Hsys::eSuccess);
    EXPECT_EQ(gadget->partner, idIn(hall));
    EXPECT_EQ(gadget->neighbours,
              (std::vector<HsDbObjectId>{idIn(hall), idIn(storeroom), HsDbObjectId()}));
    EXPECT_EQ(gadget->layerId(), loaded.currentLayerId());

    HsDbObjectId added;
    ASSERT_EQ(loaded.addHsDbObject(added, new TestGadget), Hsys::eSuccess);
    EXPECT_GT(added.handle(), storeroom.handle()) << "new handles never reuse loaded ones";
    HsDbObjectPointer<HsDbObject>(added, HsDb::kForRead);
}

TEST_F(HsDbDrawingFileTest, unknownClassesAndLaterVersionsComeBackByteForByte) {
    HsDbDatabase original;
    const HsDbObjectId later = addGadget(original, L"morgen");
    const HsDbObjectId foreign = addGadget(original, L"fremd");
    {
        HsDbObjectPointer<HsDbDictionary> named(original.namedObjectsDictionaryId(),
                                                HsDb::kForWrite);
        HsDbObjectPointer<HsDbDictionary> styles(new HsDbDictionary);
        HsDbObjectId id;
        ASSERT_EQ(named->setAt(L"ZYR_AREA_STYLES", styles.object(), id), Hsys::eSuccess);
    }
    // Written as a later version would write it, and with a class this build never had.
    TestGadget::versionToWrite = 81;
    const Hsys::ErrorStatus saved = save(original);
    TestGadget::versionToWrite = TestGadget::kCurrentVersion;
    ASSERT_EQ(saved, Hsys::eSuccess);
    executeSql(path, "UPDATE objects SET class = 'ZyrDbFromTheFuture' WHERE handle = " +
                         std::to_string(foreign.handle()));
    const auto before = rowsOf(path);

    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    std::wstring reason;
    ASSERT_EQ(load(loaded, &reason), Hsys::eSuccess) << reason;
    {
        // A later version of a known class is kept as a proxy, like an unknown class.
        HsDbObjectPointer<HsDbProxyObject> proxy(sameIn(loaded, later), HsDb::kForRead);
        EXPECT_EQ(proxy.openStatus(), Hsys::eSuccess);
        proxy.open(sameIn(loaded, foreign), HsDb::kForRead);
        ASSERT_EQ(proxy.openStatus(), Hsys::eSuccess);
        EXPECT_EQ(proxy->originalClassName(), L"ZyrDbFromTheFuture");
        EXPECT_EQ(proxy->ownerId(), loaded.modelSpaceId());
    }
    fs::remove(path);
    ASSERT_EQ(save(loaded), Hsys::eSuccess);
    EXPECT_EQ(rowsOf(path), before) << "every row, proxies included, as it was read";
}

TEST_F(HsDbDrawingFileTest, damagedAndForeignFilesAreRefusedAndLeaveTheDatabaseEmpty) {
    HsDbDatabase original;
    const HsDbObjectId gadget = addGadget(original, L"Bad");
    ASSERT_EQ(save(original), Hsys::eSuccess);
    const fs::path good = directory / "good.zyr";
    fs::copy_file(path, good);

    const std::string row = " WHERE handle = " + std::to_string(gadget.handle());
    // The damage, the status, and a part of the reason given.
    const std::tuple<std::string, Hsys::ErrorStatus, const wchar_t*> cases[] = {
        {"UPDATE objects SET data = substr(data, 1, 12)" + row, Hsys::eBadDrawingFile,
         L"cannot be read (eFilerError)"},
        {"UPDATE objects SET data = CAST(data || x'00' AS BLOB)" + row, Hsys::eBadDrawingFile,
         L"cannot be read (eFilerError)"},
        {"UPDATE objects SET data = 'text'" + row, Hsys::eBadDrawingFile, L"a flag and bytes"},
        {"UPDATE objects SET handle = -5" + row, Hsys::eBadDrawingFile, L"a flag and bytes"},
        {"UPDATE objects SET class = CAST(x'C0AF' AS TEXT)" + row, Hsys::eBadDrawingFile,
         L"not UTF-8"},
        {"ALTER TABLE objects RENAME TO old; CREATE TABLE objects(handle, class, erased, data);"
         "INSERT INTO objects SELECT * FROM old; INSERT INTO objects SELECT * FROM old" +
             row + "; DROP TABLE old",
         Hsys::eBadDrawingFile, L"used twice"},
        {"UPDATE header SET value = 999 WHERE key = 'modelSpace'", Hsys::eBadDrawingFile,
         L"\"modelSpace\" names no HsDbBlockTableRecord"},
        {"UPDATE header SET value = 77 WHERE key = 'drawingUnits'", Hsys::eBadDrawingFile,
         L"names no unit"},
        {"DELETE FROM header WHERE key = 'layerTable'", Hsys::eBadDrawingFile,
         L"lacks \"layerTable\""},
        {"UPDATE header SET value = 2 WHERE key = 'format'", Hsys::eNewerVersion, L"later version"},
        {"PRAGMA application_id = 1", Hsys::eBadDrawingFile, L"another application"},
        {"DROP TABLE objects", Hsys::eBadDrawingFile, L"no objects"},
    };
    for (const auto& [sql, expected, because] : cases) {
        SCOPED_TRACE(sql);
        fs::copy_file(good, path, fs::copy_options::overwrite_existing);
        executeSql(path, sql);
        HsDbDatabase loaded(HsDb::kEmptyDatabase);
        std::wstring reason;
        EXPECT_EQ(load(loaded, &reason), expected);
        EXPECT_NE(reason.find(because), std::wstring::npos);
        EXPECT_TRUE(loaded.objectIds().empty());
        EXPECT_TRUE(loaded.modelSpaceId().isNull());
    }

    std::ofstream(path, std::ios::trunc) << "plain text, no drawing";
    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    EXPECT_EQ(load(loaded), Hsys::eBadDrawingFile);
    fs::remove(path);
    EXPECT_EQ(load(loaded), Hsys::eFileNotFound);
    EXPECT_EQ(original.readDrawingFile(good.wstring().c_str()), Hsys::eDoesNotApply)
        << "only an empty database is read into";
    EXPECT_TRUE(loaded.objectIds().empty());
}

TEST_F(HsDbDrawingFileTest, aFailedSaveLeavesThePreviousFileAsItWas) {
    HsDbDatabase db;
    const HsDbObjectId gadget = addGadget(db, L"alt");
    ASSERT_EQ(save(db), Hsys::eSuccess);
    const auto before = rowsOf(path);

    HsDbObjectPointer<TestGadget> open(gadget, HsDb::kForWrite);
    open->setLabel(L"neu");
    std::wstring reason;
    EXPECT_EQ(db.saveAs(path.wstring().c_str(), &reason), Hsys::eWasOpenForWrite);
    EXPECT_NE(reason.find(L"cannot be opened"), std::wstring::npos);
    open.close();
    EXPECT_EQ(db.saveAs((directory / "no-such-dir" / "plan.zyr").wstring().c_str()),
              Hsys::eFileAccessError);
    // A folder holds the name: the new file is written in full and then cannot take its place.
    const fs::path taken = directory / "taken.zyr";
    fs::create_directories(taken / "inside");
    EXPECT_EQ(db.saveAs(taken.wstring().c_str()), Hsys::eFileAccessError);
    EXPECT_EQ(rowsOf(path), before);
    std::vector<fs::path> left;
    for (const fs::directory_entry& entry : fs::directory_iterator(directory))
        left.push_back(entry.path().filename());
    std::sort(left.begin(), left.end());
    EXPECT_EQ(left, (std::vector<fs::path>{path.filename(), taken.filename()}))
        << "no temporary file is left behind";
}

TEST_F(HsDbDrawingFileTest, aSaveKilledAtAnyMomentLeavesTheOldOrTheNewDrawing) {
    HsDbDatabase small;
    addGadget(small, L"klein");
    ASSERT_EQ(save(small), Hsys::eSuccess);
    const std::size_t smallCount = small.objectIds().size();

    HsDbDatabase large;
    for (int i = 0; i < 3000; ++i)
        addGadget(large, L"Raum mit einem recht langen Namen, damit die Datei w\u00e4chst");
    const std::size_t largeCount = large.objectIds().size();
    // Kills spread over the time a whole save takes here, and one after it.
    const auto start = std::chrono::steady_clock::now();
    ASSERT_EQ(large.saveAs((directory / "timing.zyr").wstring().c_str()), Hsys::eSuccess);
    const auto saveTime = std::chrono::duration_cast<std::chrono::microseconds>(
        std::chrono::steady_clock::now() - start);

    for (int tenths = 0; tenths <= 12; tenths += 2) {
        const long delayMicroseconds = saveTime.count() * tenths / 10;
        const pid_t child = fork();
        ASSERT_GE(child, 0);
        if (child == 0) {
            large.saveAs(path.wstring().c_str());
            _exit(0);
        }
        usleep(static_cast<useconds_t>(delayMicroseconds));
        kill(child, SIGKILL);
        int status = 0;
        waitpid(child, &status, 0);

        HsDbDatabase loaded(HsDb::kEmptyDatabase);
        std::wstring reason;
        ASSERT_EQ(load(loaded, &reason), Hsys::eSuccess)
            << "killed after " << delayMicroseconds << " us: " << reason;
        const std::size_t count = loaded.objectIds().size();
        EXPECT_TRUE(count == smallCount || count == largeCount) << count << " objects";
    }
}

} // namespace
