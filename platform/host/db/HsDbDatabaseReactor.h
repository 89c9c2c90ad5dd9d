// What a database tells those who watch it: objects that enter it, its emptying and its end.
#pragma once

class HsDbDatabase;
class HsDbObject;

// Registered with HsDbDatabase::addReactor; not owned by the database. A reactor may remove
// itself, or another one, while it is told something: the database tells only reactors that are
// still registered.
class HsDbDatabaseReactor {
public:
    virtual ~HsDbDatabaseReactor() = default;

    // An object now stands behind an id of the database: added (after its defaults were set), read
    // from a drawing file (before its fields are read) or handed over from another object. It is
    // open for write, and its maker may still change it.
    virtual void objectAppended(HsDbDatabase* database, HsDbObject* object);
    // Every object and id of the database is gone (a drawing that failed to load was dropped).
    virtual void databaseCleared(HsDbDatabase* database);
    // The database is being destroyed; it forgets its reactors afterwards.
    virtual void goodbye(HsDbDatabase* database);
};

inline void HsDbDatabaseReactor::objectAppended(HsDbDatabase*, HsDbObject*) {}
inline void HsDbDatabaseReactor::databaseCleared(HsDbDatabase*) {}
inline void HsDbDatabaseReactor::goodbye(HsDbDatabase*) {}
