// Transient data that an application keeps for each open drawing database: never filed, made on
// first need and gone with the database.
#pragma once

#include "platform/host/rx/HsRxObject.h"

class HsDbDatabase;

// An application derives its packet class from this one, gives it a pseudo constructor and
// registers it with ZyrDatabaseDataMgrDictionary under the application's name.
class ZyrDatabaseData : public HsRxObject {
    HSRX_DECLARE_MEMBERS(ZyrDatabaseData)

public:
    // The virtual operation after those of a runtime object.
    // Called once by the manager right after it made the packet, before anyone else sees it. A
    // class that overrides it calls this level first.
    virtual void init(HsDbDatabase* database);

    // The database the packet belongs to; null until init.
    HsDbDatabase* database() const { return m_database; }

private:
    HsDbDatabase* m_database = nullptr;
};
