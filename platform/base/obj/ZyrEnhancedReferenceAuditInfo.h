// The bad references an enhanced reference check found, each with the text that explains it.
#pragma once

#include "platform/base/res/ZyrRmCString.h"
#include "platform/host/db/HsDbObjectId.h"

#include <vector>

class ZyrEnhancedReferenceAuditInfo {
public:
    struct BadReference {
        HsDbObjectId id;
        ZyrRmCString message;
    };

    void add(const HsDbObjectId& id, const ZyrRmCString& message) {
        m_badReferences.push_back(BadReference{id, message});
    }
    // In the order they were found.
    const std::vector<BadReference>& badReferences() const { return m_badReferences; }

private:
    std::vector<BadReference> m_badReferences;
};
