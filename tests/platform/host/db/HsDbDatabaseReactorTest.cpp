// Database reactors: told of objects that enter a database (added, loaded, handed over), of a
// drawing that is dropped, and of the database's end; safe to remove while being told.
#include "platform/host/db/HsDbDatabaseReactor.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutUtf8.h"
#include "tests/platform/host/db/HsDbTestGadget.h"

#include <gtest/gtest.h>
#include <sqlite3.h>

#include <filesystem>
#include <string>
#include <unistd.h>
#include <vector>

namespace {

namespace fs = std::filesystem;

// Logs what it is told: "appended TestGadget 5 label=...", "cleared", "goodbye".
class Recorder : public HsDbDatabaseReactor {
public:
    void objectAppended(HsDbDatabase*, HsDbObject* object) override {
        std::string line = "appended " + hsutToUtf8(object->isA()->name()) + " " +
                           std::to_string(object->objectId().handle());
        if (const TestGadget* gadget = TestGadget::cast(object))
            line += " label=" + hsutToUtf8(gadget->label) +
                    (gadget->layerId().isNull() ? " no layer" : " layer");
        log.push_back(line);
    }
    void databaseCleared(HsDbDatabase*) override { log.push_back("cleared"); }
    void goodbye(HsDbDatabase*) override { log.push_back("goodbye"); }

    std::vector<std::string> log;
};

// Takes itself and a victim out at the first thing it is told.
class Remover : public Recorder {
public:
    void goodbye(HsDbDatabase* database) override {
        Recorder::goodbye(database);
        database->removeReactor(this);
        database->removeReactor(victim);
    }
    Recorder* victim = nullptr;
};

class HsDbDatabaseReactorTest : public testing::Test {
protected:
    void TearDown() override {
        std::error_code ignored;
        fs::remove(path, ignored);
    }

    // A drawing of one gadget labelled "saved", as file.
    std::wstring savedDrawing(std::uint64_t& handle) {
        HsDbDatabase source;
        auto* gadget = new TestGadget;
        gadget->label = L"saved";
        HsDbObjectId id;
        EXPECT_EQ(source.addHsDbObject(id, gadget), Hsys::eSuccess);
        gadget->close();
        handle = id.handle();
        path = fs::temp_directory_path() / ("hsdb-reactor-" + std::to_string(::getpid()) + ".zyrd");
        const std::wstring file = hsutFromUtf8(path.string());
        EXPECT_EQ(source.saveAs(file.c_str()), Hsys::eSuccess);
        return file;
    }

    fs::path path;
};

TEST_F(HsDbDatabaseReactorTest, anAddedObjectIsToldAfterItsDefaults) {
    HsDbDatabase database;
    Recorder recorder;
    database.addReactor(&recorder);
    database.addReactor(&recorder);
    auto* gadget = new TestGadget;
    HsDbObjectId id;
    ASSERT_EQ(database.addHsDbObject(id, gadget), Hsys::eSuccess);
    gadget->close();
    EXPECT_EQ(recorder.log,
              (std::vector<std::string>{"appended TestGadget " + std::to_string(id.handle()) +
                                        " label= layer"}))
        << "told once, with the current layer already set";
    database.removeReactor(&recorder);
    database.removeReactor(&recorder);
}

TEST_F(HsDbDatabaseReactorTest, aLoadedObjectIsToldBeforeItsFieldsAreRead) {
    std::uint64_t handle = 0;
    const std::wstring file = savedDrawing(handle);
    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    Recorder recorder;
    loaded.addReactor(&recorder);
    ASSERT_EQ(loaded.readDrawingFile(file.c_str()), Hsys::eSuccess);
    const std::string gadgetLine =
        "appended TestGadget " + std::to_string(handle) + " label= no layer";
    EXPECT_EQ(std::count(recorder.log.begin(), recorder.log.end(), gadgetLine), 1);
    EXPECT_EQ(recorder.log.size(), loaded.objectIds().size());
    loaded.removeReactor(&recorder);
}

TEST_F(HsDbDatabaseReactorTest, aDrawingThatFailsToLoadIsToldAsCleared) {
    std::uint64_t handle = 0;
    const std::wstring file = savedDrawing(handle);
    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db, "UPDATE objects SET data = x'0000' WHERE class = 'TestGadget'",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);
    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    Recorder recorder;
    loaded.addReactor(&recorder);
    EXPECT_EQ(loaded.readDrawingFile(file.c_str()), Hsys::eBadDrawingFile);
    ASSERT_FALSE(recorder.log.empty());
    EXPECT_EQ(recorder.log.back(), "cleared");
    recorder.log.clear();
    EXPECT_EQ(loaded.readDrawingFile(L"/nonexistent/drawing.zyrd"), Hsys::eFileNotFound);
    EXPECT_TRUE(recorder.log.empty()) << "nothing was there to clear";
    loaded.removeReactor(&recorder);
}

TEST_F(HsDbDatabaseReactorTest, aHandOverIsToldWithTheNewObject) {
    HsDbDatabase database;
    auto* old = new TestGadget;
    HsDbObjectId id;
    ASSERT_EQ(database.addHsDbObject(id, old), Hsys::eSuccess);
    Recorder recorder;
    database.addReactor(&recorder);
    auto* successor = new TestGadget;
    successor->label = L"new";
    ASSERT_EQ(old->handOverTo(successor), Hsys::eSuccess);
    delete old;
    successor->close();
    EXPECT_EQ(recorder.log,
              (std::vector<std::string>{"appended TestGadget " + std::to_string(id.handle()) +
                                        " label=new no layer"}));
    database.removeReactor(&recorder);
}

TEST_F(HsDbDatabaseReactorTest, goodbyeReachesOnlyReactorsStillRegistered) {
    Recorder victim;
    Remover remover;
    Recorder last;
    remover.victim = &victim;
    {
        HsDbDatabase database;
        database.addReactor(&remover);
        database.addReactor(&victim);
        database.addReactor(&last);
    }
    EXPECT_EQ(remover.log, std::vector<std::string>{"goodbye"});
    EXPECT_TRUE(victim.log.empty());
    EXPECT_EQ(last.log, std::vector<std::string>{"goodbye"})
        << "and no cleared after it: the database forgets its reactors";
}

} // namespace
