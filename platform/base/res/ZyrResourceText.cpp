#include "platform/base/res/ZyrResourceText.h"

#include "platform/base/res/ZyrTextResources.h"

const ZyrRmCString& ZyrResourceText::text() const {
    const std::uint64_t current = ZyrTextResources::generation();
    if (m_generation != current) {
        m_text = ZyrRmCString(m_appName, m_id, false);
        m_generation = current;
    }
    return m_text;
}
