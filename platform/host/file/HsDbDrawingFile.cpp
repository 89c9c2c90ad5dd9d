#include "platform/host/file/HsDbDrawingFile.h"

#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbDictionary.h"
#include "platform/host/db/HsDbIdEntry.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbProxyObject.h"
#include "platform/host/db/HsDbTextStyleTable.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutFormat.h"
#include "platform/host/ut/HsutUtf8.h"

#include <sqlite3.h>

#include <atomic>
#include <cstdint>
#include <fcntl.h>
#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <unistd.h>
#include <vector>

namespace {

namespace fs = std::filesystem;

// "ZYRD": tells a drawing file from any other SQLite file.
constexpr int kApplicationId = 0x5A595244;

struct Failure {
    Hsys::ErrorStatus status;
    std::wstring reason;
};
using Outcome = std::optional<Failure>;

Hsys::ErrorStatus report(const Outcome& failure, std::wstring* reason) {
    if (!failure)
        return Hsys::eSuccess;
    if (reason != nullptr)
        *reason = failure->reason;
    return failure->status;
}

struct ConnectionCloser {
    void operator()(sqlite3* connection) const { sqlite3_close_v2(connection); }
};
struct StatementFinalizer {
    void operator()(sqlite3_stmt* statement) const { sqlite3_finalize(statement); }
};
using Connection = std::unique_ptr<sqlite3, ConnectionCloser>;
using Statement = std::unique_ptr<sqlite3_stmt, StatementFinalizer>;

std::wstring sqliteMessage(sqlite3* connection) {
    return hsutFromUtf8(connection != nullptr ? sqlite3_errmsg(connection) : "out of memory");
}

Outcome openConnection(const fs::path& path, int flags, Hsys::ErrorStatus failure,
                       Connection& connection) {
    sqlite3* opened = nullptr;
    const int rc = sqlite3_open_v2(path.c_str(), &opened, flags, nullptr);
    connection.reset(opened);
    if (rc != SQLITE_OK)
        return Failure{failure, L"cannot open " + hsutFromUtf8(path.string()) + L": " +
                                    sqliteMessage(opened)};
    return std::nullopt;
}

Outcome prepare(sqlite3* connection, const char* sql, Hsys::ErrorStatus failure,
                Statement& statement) {
    sqlite3_stmt* prepared = nullptr;
    const int rc = sqlite3_prepare_v2(connection, sql, -1, &prepared, nullptr);
    statement.reset(prepared);
    if (rc != SQLITE_OK)
        return Failure{failure, sqliteMessage(connection)};
    return std::nullopt;
}

Outcome execute(sqlite3* connection, const char* sql) {
    if (sqlite3_exec(connection, sql, nullptr, nullptr, nullptr) != SQLITE_OK)
        return Failure{Hsys::eFileAccessError, sqliteMessage(connection)};
    return std::nullopt;
}

fs::path toPath(const wchar_t* fileName) {
    return fs::path(hsutToUtf8(fileName));
}

// ---- what is saved ----

struct Row {
    std::int64_t handle = 0;
    std::string className;
    bool erased = false;
    std::vector<std::uint8_t> data;
};

using Header = std::map<std::string, std::int64_t>;

std::int64_t handleOf(const HsDbObjectId& id) {
    return static_cast<std::int64_t>(id.handle());
}

Outcome fileObject(HsDbDatabase* database, const HsDbObjectId& id, Row& row) {
    HsDbObject* object = nullptr;
    if (const Hsys::ErrorStatus status = hsdbOpenObject(object, id, HsDb::kForRead, true);
        status != Hsys::eSuccess)
        return Failure{status, hsutFormat(L"object %llu cannot be opened for read",
                                          static_cast<unsigned long long>(id.handle()))};
    HsDbBdfFiler filer(database, HsDb::kFileFiler);
    const Hsys::ErrorStatus status = object->bdfOut(&filer);
    const HsDbProxyObject* proxy = HsDbProxyObject::cast(object);
    row.handle = handleOf(id);
    row.className =
        hsutToUtf8(proxy != nullptr ? proxy->originalClassName() : object->isA()->name());
    row.erased = id.isErased();
    row.data = filer.bytes();
    const std::wstring name = object->describe();
    object->close();
    if (status != Hsys::eSuccess)
        return Failure{status, name + L" cannot be filed"};
    return std::nullopt;
}

// ---- writing ----

Outcome insertHeader(sqlite3* connection, const Header& header) {
    Statement insert;
    if (Outcome failed = prepare(connection, "INSERT INTO header(key, value) VALUES(?, ?)",
                                 Hsys::eFileAccessError, insert))
        return failed;
    for (const auto& [key, value] : header) {
        sqlite3_bind_text(insert.get(), 1, key.c_str(), -1, SQLITE_TRANSIENT);
        sqlite3_bind_int64(insert.get(), 2, value);
        if (sqlite3_step(insert.get()) != SQLITE_DONE)
            return Failure{Hsys::eFileAccessError, sqliteMessage(connection)};
        sqlite3_reset(insert.get());
    }
    return std::nullopt;
}

Outcome insertRows(sqlite3* connection, const std::vector<Row>& rows) {
    Statement insert;
    if (Outcome failed = prepare(
            connection, "INSERT INTO objects(handle, class, erased, data) VALUES(?, ?, ?, ?)",
            Hsys::eFileAccessError, insert))
        return failed;
    for (const Row& row : rows) {
        sqlite3_bind_int64(insert.get(), 1, row.handle);
        sqlite3_bind_text(insert.get(), 2, row.className.c_str(), -1, SQLITE_TRANSIENT);
        sqlite3_bind_int(insert.get(), 3, row.erased ? 1 : 0);
        sqlite3_bind_blob64(insert.get(), 4, row.data.data(), row.data.size(), SQLITE_STATIC);
        if (sqlite3_step(insert.get()) != SQLITE_DONE)
            return Failure{Hsys::eFileAccessError, sqliteMessage(connection)};
        sqlite3_reset(insert.get());
    }
    return std::nullopt;
}

Outcome writeFile(const fs::path& path, const Header& header, const std::vector<Row>& rows) {
    Connection connection;
    if (Outcome failed = openConnection(path, SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE,
                                        Hsys::eFileAccessError, connection))
        return failed;
    // The file is new and private until it is renamed: a journal would protect nothing.
    const std::string setup =
        "PRAGMA journal_mode=OFF; PRAGMA synchronous=FULL; "
        "PRAGMA application_id=" +
        std::to_string(kApplicationId) +
        ";"
        "BEGIN;"
        "CREATE TABLE header(key TEXT PRIMARY KEY NOT NULL, value INTEGER NOT NULL);"
        "CREATE TABLE objects(handle INTEGER PRIMARY KEY NOT NULL, "
        "class TEXT NOT NULL, erased INTEGER NOT NULL, data BLOB NOT NULL);";
    if (Outcome failed = execute(connection.get(), setup.c_str()))
        return failed;
    if (Outcome failed = insertHeader(connection.get(), header))
        return failed;
    if (Outcome failed = insertRows(connection.get(), rows))
        return failed;
    if (Outcome failed = execute(connection.get(), "COMMIT;"))
        return failed;
    if (sqlite3_close(connection.release()) != SQLITE_OK)
        return Failure{Hsys::eFileAccessError, L"cannot close " + hsutFromUtf8(path.string())};
    return std::nullopt;
}

// Waits until the file's bytes (or a directory's entries) are on disk.
bool syncToDisk(const fs::path& path, int flags) {
    const int descriptor = ::open(path.c_str(), flags);
    if (descriptor < 0)
        return false;
    const bool synced = ::fsync(descriptor) == 0;
    ::close(descriptor);
    return synced;
}

// A name beside the target that no other save of this process or of another one uses.
fs::path temporaryPathFor(const fs::path& target) {
    static std::atomic<unsigned> counter{0};
    fs::path temporary = target;
    temporary += ".saving-" + std::to_string(::getpid()) + "-" + std::to_string(counter++);
    return temporary;
}

Outcome replaceAtomically(const fs::path& target, const Header& header,
                          const std::vector<Row>& rows) {
    const fs::path temporary = temporaryPathFor(target);
    Outcome failed = writeFile(temporary, header, rows);
    if (!failed && !syncToDisk(temporary, O_RDONLY))
        failed =
            Failure{Hsys::eFileAccessError, L"cannot flush " + hsutFromUtf8(temporary.string())};
    std::error_code error;
    if (!failed) {
        fs::rename(temporary, target, error);
        if (error)
            failed =
                Failure{Hsys::eFileAccessError, L"cannot replace " + hsutFromUtf8(target.string()) +
                                                    L": " + hsutFromUtf8(error.message())};
    }
    if (failed) {
        fs::remove(temporary, error);
        return failed;
    }
    const fs::path directory = target.has_parent_path() ? target.parent_path() : fs::path(".");
    syncToDisk(directory, O_RDONLY | O_DIRECTORY);
    return std::nullopt;
}

// ---- reading ----

Outcome bad(const std::wstring& why) {
    return Failure{Hsys::eBadDrawingFile, why};
}

Outcome headerValue(const Header& header, const char* key, std::int64_t& value) {
    auto found = header.find(key);
    if (found == header.end())
        return bad(L"the header lacks \"" + hsutFromUtf8(key) + L"\"");
    value = found->second;
    return std::nullopt;
}

Outcome checkApplicationId(sqlite3* connection) {
    Statement query;
    if (Outcome failed = prepare(connection, "PRAGMA application_id", Hsys::eBadDrawingFile, query))
        return bad(L"not a drawing file: " + failed->reason);
    if (sqlite3_step(query.get()) != SQLITE_ROW)
        return bad(L"not a drawing file: " + sqliteMessage(connection));
    if (sqlite3_column_int(query.get(), 0) != kApplicationId)
        return bad(L"not a drawing file: a database of another application");
    return std::nullopt;
}

Outcome readHeader(sqlite3* connection, Header& header) {
    Statement query;
    if (Outcome failed =
            prepare(connection, "SELECT key, value FROM header", Hsys::eBadDrawingFile, query))
        return bad(L"no header: " + failed->reason);
    int rc = SQLITE_ROW;
    while ((rc = sqlite3_step(query.get())) == SQLITE_ROW) {
        if (sqlite3_column_type(query.get(), 0) != SQLITE_TEXT ||
            sqlite3_column_type(query.get(), 1) != SQLITE_INTEGER)
            return bad(L"a header row that is no name with a number");
        const auto* key = reinterpret_cast<const char*>(sqlite3_column_text(query.get(), 0));
        header[key] = sqlite3_column_int64(query.get(), 1);
    }
    if (rc != SQLITE_DONE)
        return bad(L"the header cannot be read: " + sqliteMessage(connection));
    std::int64_t format = 0;
    if (Outcome failed = headerValue(header, "format", format))
        return failed;
    if (format > HsDbDrawingFile::kFormatVersion)
        return Failure{Hsys::eNewerVersion,
                       hsutFormat(L"format %lld is of a later version than %d",
                                  static_cast<long long>(format), HsDbDrawingFile::kFormatVersion)};
    if (format < 1)
        return bad(L"the header names no format");
    return std::nullopt;
}

Outcome readRows(sqlite3* connection, std::vector<Row>& rows) {
    Statement query;
    if (Outcome failed =
            prepare(connection, "SELECT handle, class, erased, data FROM objects ORDER BY handle",
                    Hsys::eBadDrawingFile, query))
        return bad(L"no objects: " + failed->reason);
    int rc = SQLITE_ROW;
    while ((rc = sqlite3_step(query.get())) == SQLITE_ROW) {
        sqlite3_stmt* row = query.get();
        if (sqlite3_column_type(row, 0) != SQLITE_INTEGER || sqlite3_column_int64(row, 0) < 1 ||
            sqlite3_column_type(row, 1) != SQLITE_TEXT || sqlite3_column_bytes(row, 1) == 0 ||
            sqlite3_column_type(row, 2) != SQLITE_INTEGER ||
            (sqlite3_column_int64(row, 2) != 0 && sqlite3_column_int64(row, 2) != 1) ||
            sqlite3_column_type(row, 3) != SQLITE_BLOB)
            return bad(L"an object row that is not a handle, a class, a flag and bytes");
        Row read;
        read.handle = sqlite3_column_int64(row, 0);
        read.className = reinterpret_cast<const char*>(sqlite3_column_text(row, 1));
        // A proxy gives its class name back as it was given, which only UTF-8 can promise.
        if (hsutToUtf8(hsutFromUtf8(read.className)) != read.className)
            return bad(L"a class name that is not UTF-8");
        read.erased = sqlite3_column_int64(row, 2) == 1;
        const auto* data = static_cast<const std::uint8_t*>(sqlite3_column_blob(row, 3));
        read.data.assign(data, data + sqlite3_column_bytes(row, 3));
        rows.push_back(std::move(read));
    }
    if (rc != SQLITE_DONE)
        return bad(L"the objects cannot be read: " + sqliteMessage(connection));
    return std::nullopt;
}

// A new object of the row's class, or a proxy when the class is unknown or is no database class.
HsDbObject* makeObject(const std::wstring& className) {
    const HsRxClass* cls = hsrxFindHsRxClass(className.c_str());
    HsRxObject* made = cls != nullptr ? cls->create() : nullptr;
    if (HsDbObject* object = HsDbObject::cast(made))
        return object;
    delete made;
    return new HsDbProxyObject(className);
}

} // namespace

namespace {

Outcome rootOf(HsDbDatabase* database, const Header& header, const char* key, HsRxClass* rootClass,
               HsDbObjectId& id) {
    std::int64_t handle = 0;
    if (Outcome failed = headerValue(header, key, handle))
        return failed;
    HsDbObjectId found;
    if (handle < 1 ||
        database->getHsDbObjectId(found, false, static_cast<std::uint64_t>(handle)) !=
            Hsys::eSuccess ||
        found.objectClass() == nullptr || !found.objectClass()->isDerivedFrom(rootClass))
        return bad(L"the header's \"" + hsutFromUtf8(key) + L"\" names no " + rootClass->name());
    id = found;
    return std::nullopt;
}

Outcome unitsOf(const Header& header, const char* key, HsDb::UnitsValue& units) {
    std::int64_t value = 0;
    if (Outcome failed = headerValue(header, key, value))
        return failed;
    if (value < 0 || value > HsDb::kUnitsFeet)
        return bad(L"the header's \"" + hsutFromUtf8(key) + L"\" names no unit");
    units = static_cast<HsDb::UnitsValue>(value);
    return std::nullopt;
}

Outcome readSource(const fs::path& path, Header& header, std::vector<Row>& rows) {
    std::error_code error;
    if (!fs::is_regular_file(path, error))
        return Failure{Hsys::eFileNotFound, L"no file " + hsutFromUtf8(path.string())};
    Connection connection;
    Outcome failed = openConnection(path, SQLITE_OPEN_READONLY, Hsys::eFileAccessError, connection);
    if (!failed)
        failed = checkApplicationId(connection.get());
    if (!failed)
        failed = readHeader(connection.get(), header);
    if (!failed)
        failed = readRows(connection.get(), rows);
    return failed;
}

} // namespace

// The reader's and the writer's way into the database: its entries, roots and units.
struct HsDbDrawingFile::Access {
    static Header headerOf(const HsDbDatabase* database) {
        const HsDbDatabase::Roots& roots = database->m_roots;
        return Header{
            {"format", kFormatVersion},
            {"nextHandle", static_cast<std::int64_t>(database->m_nextHandle)},
            {"drawingUnits", database->m_units.drawing},
            {"displayUnits", database->m_units.display},
            {"displayPrecision", database->m_units.precision},
            {"namedObjects", handleOf(roots.namedObjects)},
            {"blockTable", handleOf(roots.blockTable)},
            {"layerTable", handleOf(roots.layerTable)},
            {"textStyleTable", handleOf(roots.textStyleTable)},
            {"modelSpace", handleOf(roots.modelSpace)},
            {"currentLayer", handleOf(roots.currentLayer)},
            {"currentTextStyle", handleOf(roots.currentTextStyle)},
            {"xrefBlock", handleOf(database->m_xrefBlockId)},
        };
    }

    // Every handle first, so that references between the rows find their entries.
    static Outcome createEntries(HsDbDatabase* database, const std::vector<Row>& rows,
                                 std::vector<HsDbIdEntry*>& entries) {
        entries.reserve(rows.size());
        for (const Row& row : rows) {
            const auto handle = static_cast<std::uint64_t>(row.handle);
            if (database->m_entries.contains(handle))
                return bad(hsutFormat(L"handle %llu is used twice",
                                      static_cast<unsigned long long>(handle)));
            entries.push_back(database->newEntry(handle));
        }
        return std::nullopt;
    }

    // Puts the object under the entry and opens it for write, as a reader needs it.
    static HsDbObject* adoptForReading(HsDbDatabase* database, HsDbIdEntry* entry,
                                       HsDbObject* object) {
        database->adopt(entry, object);
        HsDbObject* opened = nullptr;
        hsdbOpenObject(opened, HsDbObjectId(entry), HsDb::kForWrite, true);
        database->notifyAppended(object);
        return object;
    }

    // Reads a row's object under its handle: the class's own reader, or a proxy when the class
    // is unknown or the stream is of a later version. Bytes left over mean the row is damaged.
    static Outcome loadObject(HsDbDatabase* database, HsDbIdEntry* entry, const Row& row) {
        const std::wstring className = hsutFromUtf8(row.className);
        HsDbObject* object = adoptForReading(database, entry, makeObject(className));
        auto filer = std::make_unique<HsDbBdfFiler>(row.data, database, HsDb::kFileFiler);
        Hsys::ErrorStatus status = object->bdfIn(filer.get());
        if (status == Hsys::eNewerVersion && HsDbProxyObject::cast(object) == nullptr) {
            delete database->disown(entry);
            object = adoptForReading(database, entry, new HsDbProxyObject(className));
            filer = std::make_unique<HsDbBdfFiler>(row.data, database, HsDb::kFileFiler);
            status = object->bdfIn(filer.get());
        }
        if (status == Hsys::eSuccess && filer->remaining() != 0)
            status = Hsys::eFilerError;
        object->close();
        if (status != Hsys::eSuccess)
            return bad(hsutFormat(L"object %lld of class %s cannot be read (%S)",
                                  static_cast<long long>(row.handle), className.c_str(),
                                  Hsys::toString(status)));
        entry->erased = row.erased;
        return std::nullopt;
    }

    static Outcome readRoots(HsDbDatabase* database, const Header& header,
                             HsDbDatabase::Roots& roots) {
        using Roots = HsDbDatabase::Roots;
        const struct {
            const char* key;
            HsRxClass* rootClass;
            HsDbObjectId Roots::*field;
        } rootKeys[] = {
            {"namedObjects", HsDbDictionary::desc(), &Roots::namedObjects},
            {"blockTable", HsDbBlockTable::desc(), &Roots::blockTable},
            {"layerTable", HsDbLayerTable::desc(), &Roots::layerTable},
            {"textStyleTable", HsDbTextStyleTable::desc(), &Roots::textStyleTable},
            {"modelSpace", HsDbBlockTableRecord::desc(), &Roots::modelSpace},
            {"currentLayer", HsDbLayerTableRecord::desc(), &Roots::currentLayer},
            {"currentTextStyle", HsDbTextStyleTableRecord::desc(), &Roots::currentTextStyle},
        };
        for (const auto& root : rootKeys)
            if (Outcome failed =
                    rootOf(database, header, root.key, root.rootClass, roots.*root.field))
                return failed;
        return std::nullopt;
    }

    static Outcome readUnits(const Header& header, HsDbDatabase::Units& units) {
        if (Outcome failed = unitsOf(header, "drawingUnits", units.drawing))
            return failed;
        if (Outcome failed = unitsOf(header, "displayUnits", units.display))
            return failed;
        std::int64_t precision = 0;
        if (Outcome failed = headerValue(header, "displayPrecision", precision))
            return failed;
        if (precision < 0 || precision > 8)
            return bad(L"the header's display precision lies outside 0 to 8");
        units.precision = static_cast<int>(precision);
        return std::nullopt;
    }

    // The drawing's objects and settings; the database is left as it stands on failure, for the
    // caller to empty.
    static Outcome fill(HsDbDatabase* database, const Header& header,
                        const std::vector<Row>& rows) {
        std::vector<HsDbIdEntry*> entries;
        if (Outcome failed = createEntries(database, rows, entries))
            return failed;
        for (std::size_t i = 0; i < rows.size(); ++i)
            if (Outcome failed = loadObject(database, entries[i], rows[i]))
                return failed;
        HsDbDatabase::Roots roots;
        HsDbDatabase::Units units;
        HsDbObjectId xrefBlock;
        std::int64_t xrefHandle = 0;
        std::int64_t nextHandle = 0;
        Outcome failed = readRoots(database, header, roots);
        if (!failed)
            failed = readUnits(header, units);
        if (!failed)
            failed = headerValue(header, "xrefBlock", xrefHandle);
        if (!failed && xrefHandle != 0)
            failed = rootOf(database, header, "xrefBlock", HsDbBlockTableRecord::desc(), xrefBlock);
        if (!failed)
            failed = headerValue(header, "nextHandle", nextHandle);
        if (failed)
            return failed;
        database->m_roots = roots;
        database->m_units = units;
        database->m_xrefBlockId = xrefBlock;
        if (nextHandle > 0 && static_cast<std::uint64_t>(nextHandle) > database->m_nextHandle)
            database->m_nextHandle = static_cast<std::uint64_t>(nextHandle);
        return std::nullopt;
    }
};

Hsys::ErrorStatus HsDbDrawingFile::save(HsDbDatabase* database, const wchar_t* fileName,
                                        std::wstring* reason) {
    if (database == nullptr || fileName == nullptr)
        return Hsys::eNullPointer;
    std::vector<Row> rows;
    for (const HsDbObjectId& id : database->objectIds()) {
        Row row;
        if (Outcome failed = fileObject(database, id, row))
            return report(failed, reason);
        rows.push_back(std::move(row));
    }
    return report(replaceAtomically(toPath(fileName), Access::headerOf(database), rows), reason);
}

Hsys::ErrorStatus HsDbDrawingFile::load(HsDbDatabase* database, const wchar_t* fileName,
                                        std::wstring* reason) {
    if (database == nullptr || fileName == nullptr)
        return Hsys::eNullPointer;
    Header header;
    std::vector<Row> rows;
    if (Outcome failed = readSource(toPath(fileName), header, rows))
        return report(failed, reason);
    return report(Access::fill(database, header, rows), reason);
}
