#include "platform/host/filer/HsDbTdfFiler.h"

HsDbTdfFiler::HsDbTdfFiler(HsDb::FilerType type, bool modifiesInPlace)
    : m_type(type), m_modifiesInPlace(modifiesInPlace) {}

HsDbTdfFiler::HsDbTdfFiler(std::vector<HsDbTdfItem> items, HsDb::FilerType type,
                           bool modifiesInPlace)
    : m_items(std::move(items)), m_type(type), m_modifiesInPlace(modifiesInPlace) {}

Hsys::ErrorStatus HsDbTdfFiler::readItem(HsDbTdfItem& item) {
    if (m_status != Hsys::eSuccess)
        return m_status;
    if (m_position >= m_items.size())
        return Hsys::eEndOfInput;
    item = m_items[m_position++];
    m_canPushBack = true;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbTdfFiler::writeItem(const HsDbTdfItem& item) {
    if (m_status != Hsys::eSuccess)
        return m_status;
    m_items.push_back(item);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbTdfFiler::pushBackItem() {
    if (!m_canPushBack)
        return Hsys::eDoesNotApply;
    --m_position;
    m_canPushBack = false;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbTdfFiler::readObjectIdItem(int groupCode, HsDbObjectId& id) {
    HsDbTdfItem item;
    if (readItem(item) != Hsys::eSuccess)
        return m_status;
    if (item.groupCode() != groupCode)
        pushBackItem();
    else if (item.getObjectId(id) != Hsys::eSuccess)
        setError(Hsys::eBadTdfSequence, L"an item that must hold an object id holds another value");
    return m_status;
}

void HsDbTdfFiler::setError(Hsys::ErrorStatus status, const wchar_t* message) {
    if (m_status != Hsys::eSuccess || status == Hsys::eSuccess)
        return;
    m_status = status;
    m_message = message != nullptr ? message : L"";
}

void HsDbTdfFiler::resetFilerStatus() {
    m_status = Hsys::eSuccess;
    m_message.clear();
}
