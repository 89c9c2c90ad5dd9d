// The schedule system's list of query classes: each answers the columns of one kind of object.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <vector>

class HsRxClass;

class ZyrQueryFactory {
public:
    // eNullPointer for null, eAlreadyPresent for a class registered already.
    Hsys::ErrorStatus registerQuery(HsRxClass* queryClass);
    // eNullPointer for null, eNameNotFound for a class that is not registered.
    Hsys::ErrorStatus unRegisterQuery(const HsRxClass* queryClass);
    bool isRegistered(const HsRxClass* queryClass) const;
    // In the order of registration.
    const std::vector<HsRxClass*>& queryClasses() const { return m_classes; }

private:
    std::vector<HsRxClass*> m_classes;
};
