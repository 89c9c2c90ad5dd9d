// A service: an object entered in the service dictionary, with a count of the modules using it.
#pragma once

#include "platform/host/rx/HsRxObject.h"

class HsRxService : public HsRxObject {
    HSRX_DECLARE_MEMBERS(HsRxService)

public:
    void addDependency() { ++m_dependencies; }
    // Never counts below zero: a stray release must not make a used service look unused later.
    void removeDependency() {
        if (m_dependencies > 0)
            --m_dependencies;
    }
    // True when no module depends on the service any more.
    bool unloadable() const { return m_dependencies == 0; }
    int dependencyCount() const { return m_dependencies; }

private:
    int m_dependencies = 0;
};
