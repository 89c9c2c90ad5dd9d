#include "platform/host/filer/HsDbBdfFiler.h"

#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/ge/HsGePoint2d.h"
#include "platform/host/ge/HsGePoint3d.h"

#include <bit>
#include <cstring>
#include <type_traits>

namespace {

template <class Unsigned> void appendLittleEndian(std::vector<std::uint8_t>& out, Unsigned value) {
    static_assert(std::is_unsigned_v<Unsigned>);
    for (std::size_t i = 0; i < sizeof(Unsigned); ++i)
        out.push_back(static_cast<std::uint8_t>(value >> (8 * i)));
}

template <class Unsigned> Unsigned fromLittleEndian(const std::uint8_t* bytes) {
    Unsigned value = 0;
    for (std::size_t i = 0; i < sizeof(Unsigned); ++i)
        value |= static_cast<Unsigned>(static_cast<Unsigned>(bytes[i]) << (8 * i));
    return value;
}

} // namespace

HsDbBdfFiler::HsDbBdfFiler(HsDbDatabase* database, HsDb::FilerType type)
    : m_database(database), m_type(type) {}

HsDbBdfFiler::HsDbBdfFiler(std::vector<std::uint8_t> bytes, HsDbDatabase* database,
                           HsDb::FilerType type)
    : m_bytes(std::move(bytes)), m_database(database), m_type(type) {}

void HsDbBdfFiler::setFilerStatus(Hsys::ErrorStatus status) {
    if (m_status == Hsys::eSuccess)
        m_status = status;
}

void HsDbBdfFiler::writeBool(bool value) {
    m_bytes.push_back(value ? 1 : 0);
}

void HsDbBdfFiler::writeInt16(std::int16_t value) {
    appendLittleEndian(m_bytes, static_cast<std::uint16_t>(value));
}

void HsDbBdfFiler::writeUInt16(std::uint16_t value) {
    appendLittleEndian(m_bytes, value);
}

void HsDbBdfFiler::writeInt32(std::int32_t value) {
    appendLittleEndian(m_bytes, static_cast<std::uint32_t>(value));
}

void HsDbBdfFiler::writeUInt32(std::uint32_t value) {
    appendLittleEndian(m_bytes, value);
}

void HsDbBdfFiler::writeUInt64(std::uint64_t value) {
    appendLittleEndian(m_bytes, value);
}

void HsDbBdfFiler::writeDouble(double value) {
    writeUInt64(std::bit_cast<std::uint64_t>(value));
}

void HsDbBdfFiler::writeString(const wchar_t* text) {
    writeString(text != nullptr ? std::wstring_view(text) : std::wstring_view());
}

void HsDbBdfFiler::writeString(std::wstring_view text) {
    writeUInt32(static_cast<std::uint32_t>(text.size()));
    for (wchar_t c : text)
        writeUInt32(static_cast<std::uint32_t>(c));
}

void HsDbBdfFiler::writePoint2d(const HsGePoint2d& point) {
    writeDouble(point.x);
    writeDouble(point.y);
}

void HsDbBdfFiler::writePoint3d(const HsGePoint3d& point) {
    writeDouble(point.x);
    writeDouble(point.y);
    writeDouble(point.z);
}

void HsDbBdfFiler::writeBytes(const void* data, std::size_t count) {
    const auto* first = static_cast<const std::uint8_t*>(data);
    m_bytes.insert(m_bytes.end(), first, first + count);
}

void HsDbBdfFiler::writeId(const HsDbObjectId& id) {
    writeUInt64(id.handle());
}
void HsDbBdfFiler::writeHardPointerId(const HsDbObjectId& id) {
    writeId(id);
}
void HsDbBdfFiler::writeSoftPointerId(const HsDbObjectId& id) {
    writeId(id);
}
void HsDbBdfFiler::writeHardOwnershipId(const HsDbObjectId& id) {
    writeId(id);
}
void HsDbBdfFiler::writeSoftOwnershipId(const HsDbObjectId& id) {
    writeId(id);
}

Hsys::ErrorStatus HsDbBdfFiler::fail() {
    setFilerStatus(Hsys::eFilerError);
    return m_status;
}

bool HsDbBdfFiler::take(std::size_t count, const std::uint8_t*& first) {
    if (m_status != Hsys::eSuccess)
        return false;
    if (count > remaining()) {
        fail();
        return false;
    }
    first = m_bytes.data() + m_position;
    m_position += count;
    return true;
}

Hsys::ErrorStatus HsDbBdfFiler::readBool(bool& value) {
    if (m_status == Hsys::eSuccess && remaining() >= 1 && m_bytes[m_position] > 1)
        return fail();
    const std::uint8_t* byte = nullptr;
    if (!take(1, byte))
        return m_status;
    value = *byte == 1;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readInt16(std::int16_t& value) {
    std::uint16_t bits = 0;
    if (readUInt16(bits) != Hsys::eSuccess)
        return m_status;
    value = static_cast<std::int16_t>(bits);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readUInt16(std::uint16_t& value) {
    const std::uint8_t* bytes = nullptr;
    if (!take(sizeof value, bytes))
        return m_status;
    value = fromLittleEndian<std::uint16_t>(bytes);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readInt32(std::int32_t& value) {
    std::uint32_t bits = 0;
    if (readUInt32(bits) != Hsys::eSuccess)
        return m_status;
    value = static_cast<std::int32_t>(bits);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readUInt32(std::uint32_t& value) {
    const std::uint8_t* bytes = nullptr;
    if (!take(sizeof value, bytes))
        return m_status;
    value = fromLittleEndian<std::uint32_t>(bytes);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readUInt64(std::uint64_t& value) {
    const std::uint8_t* bytes = nullptr;
    if (!take(sizeof value, bytes))
        return m_status;
    value = fromLittleEndian<std::uint64_t>(bytes);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readDouble(double& value) {
    std::uint64_t bits = 0;
    if (readUInt64(bits) != Hsys::eSuccess)
        return m_status;
    value = std::bit_cast<double>(bits);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readString(std::wstring& text) {
    const std::size_t start = m_position;
    std::uint32_t count = 0;
    if (readUInt32(count) != Hsys::eSuccess)
        return m_status;
    const std::uint8_t* units = nullptr;
    if (!take(std::size_t{count} * 4, units)) {
        m_position = start;
        return m_status;
    }
    std::wstring read(count, L'\0');
    for (std::uint32_t i = 0; i < count; ++i)
        read[i] = static_cast<wchar_t>(fromLittleEndian<std::uint32_t>(units + 4 * std::size_t{i}));
    text = std::move(read);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readPoint2d(HsGePoint2d& point) {
    const std::uint8_t* bytes = nullptr;
    if (!take(16, bytes))
        return m_status;
    point.x = std::bit_cast<double>(fromLittleEndian<std::uint64_t>(bytes));
    point.y = std::bit_cast<double>(fromLittleEndian<std::uint64_t>(bytes + 8));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readPoint3d(HsGePoint3d& point) {
    const std::uint8_t* bytes = nullptr;
    if (!take(24, bytes))
        return m_status;
    point.x = std::bit_cast<double>(fromLittleEndian<std::uint64_t>(bytes));
    point.y = std::bit_cast<double>(fromLittleEndian<std::uint64_t>(bytes + 8));
    point.z = std::bit_cast<double>(fromLittleEndian<std::uint64_t>(bytes + 16));
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readBytes(void* data, std::size_t count) {
    const std::uint8_t* bytes = nullptr;
    if (!take(count, bytes))
        return m_status;
    if (count > 0)
        std::memcpy(data, bytes, count);
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readId(HsDbObjectId& id) {
    if (m_status == Hsys::eSuccess && m_database == nullptr) {
        setFilerStatus(Hsys::eNoDatabase);
        return m_status;
    }
    std::uint64_t handle = 0;
    if (readUInt64(handle) != Hsys::eSuccess)
        return m_status;
    if (handle == 0) {
        id.setNull();
        return Hsys::eSuccess;
    }
    HsDbObjectId read;
    if (const Hsys::ErrorStatus status = m_database->getHsDbObjectId(read, true, handle);
        status != Hsys::eSuccess) {
        setFilerStatus(status);
        return m_status;
    }
    id = read;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbBdfFiler::readHardPointerId(HsDbObjectId& id) {
    return readId(id);
}
Hsys::ErrorStatus HsDbBdfFiler::readSoftPointerId(HsDbObjectId& id) {
    return readId(id);
}
Hsys::ErrorStatus HsDbBdfFiler::readHardOwnershipId(HsDbObjectId& id) {
    return readId(id);
}
Hsys::ErrorStatus HsDbBdfFiler::readSoftOwnershipId(HsDbObjectId& id) {
    return readId(id);
}
