#include "platform/base/app/ZyrBaseServices.h"

#include "platform/base/relgraph/ZyrObjRelGraph.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDynamicLinker.h"
#include "platform/host/rx/HsRxSysRegistry.h"
#include "platform/host/rx/HsRxDictionary.h"

HSRX_DEFINE_MEMBERS(ZyrBaseServices, HsRxService, 0, nullptr)

namespace {

ZyrBaseServices* gService = nullptr;

HsRxDynamicLinker* linker() {
    return HsRxDynamicLinker::cast(hsrxSysRegistry()->at(kHsRxDynamicLinker));
}

} // namespace

ZyrBaseServices::ZyrBaseServices() = default;

ZyrBaseServices::~ZyrBaseServices() {
    for (const auto& [database, graph] : m_graphs)
        database->removeReactor(this);
}

ZyrBaseServices* ZyrBaseServices::service() { return gService; }

ZyrObjRelGraph* ZyrBaseServices::objRelGraph(HsDbDatabase* database) {
    if (database == nullptr)
        return nullptr;
    std::unique_ptr<ZyrObjRelGraph>& graph = m_graphs[database];
    if (graph == nullptr) {
        database->addReactor(this);
        graph = std::make_unique<ZyrObjRelGraph>(database);
    }
    return graph.get();
}

ZyrObjRelGraph* ZyrBaseServices::findObjRelGraph(const HsDbDatabase* database) const {
    const auto found = m_graphs.find(database);
    return found != m_graphs.end() ? found->second.get() : nullptr;
}

void ZyrBaseServices::goodbye(HsDbDatabase* database) {
    database->removeReactor(this);
    m_graphs.erase(database);
}

Hsys::ErrorStatus ZyrBaseServices::registerService(ZyrAppHdx* app) {
    if (app == nullptr)
        return Hsys::eNullPointer;
    if (gService == nullptr) {
        auto* created = new ZyrBaseServices;
        const Hsys::ErrorStatus status = linker()->registerService(kServiceName, created);
        if (status != Hsys::eSuccess) {
            delete created;
            return status;
        }
        gService = created;
    }
    gService->addDependency();
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrBaseServices::unRegisterService(ZyrAppHdx* app) {
    if (app == nullptr)
        return Hsys::eNullPointer;
    if (gService == nullptr)
        return Hsys::eDoesNotApply;
    gService->removeDependency();
    if (!gService->unloadable())
        return Hsys::eSuccess;
    linker()->unregisterService(kServiceName);
    delete gService;
    gService = nullptr;
    return Hsys::eSuccess;
}
