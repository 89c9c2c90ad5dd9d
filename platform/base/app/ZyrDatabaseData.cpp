#include "platform/base/app/ZyrDatabaseData.h"

#include "platform/host/rx/HsRxClass.h"

HSRX_DEFINE_MEMBERS(ZyrDatabaseData, HsRxObject, 0, nullptr)

void ZyrDatabaseData::init(HsDbDatabase* database) {
    m_database = database;
}
