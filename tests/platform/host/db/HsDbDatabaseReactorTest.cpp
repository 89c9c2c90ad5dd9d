// Database reactors: told of objects that enter a database (added, loaded, handed over), of a
// drawing that is dropped, and of the database's end; safe to remove while being told.
#include "platform/host/db/HsDbDatabaseReactor.h"
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
using Log = std::vector<std::string>;

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

    Log log;
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

std::string appended(std::uint64_t handle, const std::string& rest) {
    return "appended TestGadget " + std::to_string(handle) + " label=" + rest;
}

TEST(HsDbDatabaseReactor, anAddedObjectIsToldAfterItsDefaultsAndAHandOverWithTheNewObject) {
    HsDbDatabase database;
    Recorder recorder;
    database.addReactor(&recorder);
    database.addReactor(&recorder);
    auto* old = new TestGadget;
    HsDbObjectId id;
    ASSERT_EQ(database.addHsDbObject(id, old), Hsys::eSuccess);
    EXPECT_EQ(recorder.log, Log{appended(id.handle(), " layer")})
        << "told once, with the current layer already set";

    recorder.log.clear();
    auto* successor = new TestGadget;
    successor->label = L"new";
    ASSERT_EQ(old->handOverTo(successor), Hsys::eSuccess);
    delete old;
    successor->close();
    EXPECT_EQ(recorder.log, Log{appended(id.handle(), "new no layer")});
    database.removeReactor(&recorder);
    database.removeReactor(&recorder);
}

TEST(HsDbDatabaseReactor, loadedObjectsAreToldBeforeTheirFieldsAndAFailedLoadAsCleared) {
    const fs::path path =
        fs::temp_directory_path() / ("hsdb-reactor-" + std::to_string(::getpid()) + ".zyrd");
    const std::wstring file = hsutFromUtf8(path.string());
    std::uint64_t handle = 0;
    {
        HsDbDatabase source;
        handle = addGadget(source, L"saved").handle();
        ASSERT_EQ(source.saveAs(file.c_str()), Hsys::eSuccess);
    }
    HsDbDatabase loaded(HsDb::kEmptyDatabase);
    Recorder recorder;
    loaded.addReactor(&recorder);
    ASSERT_EQ(loaded.readDrawingFile(file.c_str()), Hsys::eSuccess);
    EXPECT_EQ(std::count(recorder.log.begin(), recorder.log.end(), appended(handle, " no layer")),
              1);
    EXPECT_EQ(recorder.log.size(), loaded.objectIds().size());
    loaded.removeReactor(&recorder);

    sqlite3* db = nullptr;
    ASSERT_EQ(sqlite3_open(path.c_str(), &db), SQLITE_OK);
    ASSERT_EQ(sqlite3_exec(db, "UPDATE objects SET data = x'0000' WHERE class = 'TestGadget'",
                           nullptr, nullptr, nullptr),
              SQLITE_OK);
    sqlite3_close(db);
    HsDbDatabase damaged(HsDb::kEmptyDatabase);
    recorder.log.clear();
    damaged.addReactor(&recorder);
    EXPECT_EQ(damaged.readDrawingFile(file.c_str()), Hsys::eBadDrawingFile);
    fs::remove(path);
    ASSERT_FALSE(recorder.log.empty());
    EXPECT_EQ(recorder.log.back(), "cleared");
    recorder.log.clear();
    EXPECT_EQ(damaged.readDrawingFile(L"/nonexistent/drawing.zyrd"), Hsys::eFileNotFound);
    EXPECT_TRUE(recorder.log.empty()) << "nothing was there to clear";
    damaged.removeReactor(&recorder);
}

TEST(HsDbDatabaseReactor, goodbyeReachesOnlyReactorsStillRegistered) {
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
    EXPECT_EQ(remover.log, Log{"goodbye"});
    EXPECT_TRUE(victim.log.empty());
    EXPECT_EQ(last.log, Log{"goodbye"})
        << "and no cleared after it: the database forgets its reactors";
}

} // namespace
