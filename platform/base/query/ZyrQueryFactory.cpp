#include "platform/base/query/ZyrQueryFactory.h"

#include <algorithm>

Hsys::ErrorStatus ZyrQueryFactory::registerQuery(HsRxClass* queryClass) {
    if (queryClass == nullptr)
        return Hsys::eNullPointer;
    if (isRegistered(queryClass))
        return Hsys::eAlreadyPresent;
    m_classes.push_back(queryClass);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrQueryFactory::unRegisterQuery(const HsRxClass* queryClass) {
    if (queryClass == nullptr)
        return Hsys::eNullPointer;
    const auto found = std::find(m_classes.begin(), m_classes.end(), queryClass);
    if (found == m_classes.end())
        return Hsys::eNameNotFound;
    m_classes.erase(found);
    return Hsys::eSuccess;
}

bool ZyrQueryFactory::isRegistered(const HsRxClass* queryClass) const {
    return std::find(m_classes.begin(), m_classes.end(), queryClass) != m_classes.end();
}
