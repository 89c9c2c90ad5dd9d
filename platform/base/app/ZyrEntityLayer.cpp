#include "platform/base/app/ZyrEntityLayer.h"

#include "platform/base/obj/ZyrDbEntity.h"
#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbHostApplicationServices.h"
#include "platform/host/db/HsDbLayerTable.h"
#include "platform/host/db/HsDbObjectPointer.h"

namespace {

HsDbDatabase* databaseFor(const HsDbEntity* entity, HsDbDatabase* database) {
    if (entity->database() != nullptr)
        return entity->database();
    return database != nullptr ? database : hsdbHostApplicationServices()->workingDatabase();
}

Hsys::ErrorStatus addLayer(HsDbLayerTable* table, const wchar_t* name, HsDbObjectId& layerId) {
    HsDbObjectPointer<HsDbLayerTableRecord> layer(new HsDbLayerTableRecord);
    if (const Hsys::ErrorStatus status = layer->setName(name); status != Hsys::eSuccess)
        return status;
    return table->add(layerId, layer.object());
}

Hsys::ErrorStatus findOrAddLayer(HsDbDatabase* database, const wchar_t* name,
                                 HsDbObjectId& layerId) {
    HsDbObjectPointer<HsDbLayerTable> table(database->layerTableId(), HsDb::kForRead);
    if (!table)
        return table.openStatus();
    if (table->getAt(name, layerId) == Hsys::eSuccess)
        return Hsys::eSuccess;
    if (const Hsys::ErrorStatus status = table->upgradeOpen(); status != Hsys::eSuccess)
        return status;
    return addLayer(table.object(), name, layerId);
}

} // namespace

namespace Zyr {

Hsys::ErrorStatus setLayer(ZyrDbEntity* entity, HsDbDatabase* database) {
    if (entity == nullptr)
        return Hsys::eNullPointer;
    ZyrRmCString key;
    entity->getLayerKey(key);
    return setLayer(entity, key.GetString(), database);
}

Hsys::ErrorStatus setLayer(HsDbEntity* entity, const wchar_t* layerKey, HsDbDatabase* database) {
    if (entity == nullptr)
        return Hsys::eNullPointer;
    if (layerKey == nullptr || *layerKey == L'\0')
        return Hsys::eSuccess;
    if (!entity->isWriteEnabled())
        return Hsys::eNotOpenForWrite;
    HsDbDatabase* layerDatabase = databaseFor(entity, database);
    if (layerDatabase == nullptr)
        return Hsys::eNoDatabase;
    HsDbObjectId layerId;
    if (const Hsys::ErrorStatus status = findOrAddLayer(layerDatabase, layerKey, layerId);
        status != Hsys::eSuccess)
        return status;
    return entity->setLayer(layerId);
}

} // namespace Zyr
