// The schedule system's service: the registries of query classes and of component descriptions
// that modules enter their classes in.
#pragma once

#include "platform/base/query/ZyrCompSpecFactory.h"
#include "platform/base/query/ZyrQueryFactory.h"
#include "platform/host/rx/HsRxService.h"

// A host that offers schedules enters one instance in the service dictionary under kServiceName
// (through the dynamic linker), and takes it out and deletes it after its modules have unloaded.
// Without one, modules skip their query and component registrations.
class ZyrScheduleDataServices : public HsRxService {
    HSRX_DECLARE_MEMBERS(ZyrScheduleDataServices)

public:
    static constexpr const wchar_t* kServiceName = L"ZyrScheduleDataServices";

    // The service in the service dictionary, or null.
    static ZyrScheduleDataServices* service();

    ZyrQueryFactory* queryFactory() { return &m_queries; }
    ZyrCompSpecFactory* compSpecFactory() { return &m_compSpecs; }

private:
    ZyrQueryFactory m_queries;
    ZyrCompSpecFactory m_compSpecs;
};
