// Drawing files: a whole database in one SQLite file, saved atomically, read as hostile input.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <string>

class HsDbDatabase;

// A drawing file holds a table "header" of named integers (the format version, the next handle,
// the units and the handles of the standard records) and a table "objects" with one row per
// object: its handle, the name of its class, its erase flag and its filed bytes. The file's SQLite
// application id marks it as a drawing file.
//
// A save writes a new file beside the target and renames it over the target only when it is
// complete and on disk, so a crash or a failure at any point leaves the previous file as it was. A
// load checks every row; a row of a class this build does not know, or one that a later version
// wrote, becomes a proxy that is saved back byte for byte.
class HsDbDrawingFile {
public:
    static constexpr int kFormatVersion = 1;

    // eFileAccessError when the file cannot be written; the statuses of hsdbOpenObject when an
    // object cannot be opened for read; the object's failure when it cannot be filed.
    static Hsys::ErrorStatus save(HsDbDatabase* database, const wchar_t* fileName,
                                  std::wstring* reason);
    // Reads into an empty database. eFileNotFound, eFileAccessError, eNewerVersion for a format
    // of a later version, eBadDrawingFile for a file that is no drawing or is damaged. On failure
    // the database may hold part of the file: the caller empties it.
    static Hsys::ErrorStatus load(HsDbDatabase* database, const wchar_t* fileName,
                                  std::wstring* reason);

private:
    // Reaches into the database for the reader and the writer; defined beside them.
    struct Access;
};
