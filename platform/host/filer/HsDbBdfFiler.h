// The binary filer: typed values in a byte buffer, read back with every length checked.
#pragma once

#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

class HsDbDatabase;
class HsGePoint2d;
class HsGePoint3d;

// Layout, little-endian, with no tags between values: integers in their width, a bool as one byte
// 0 or 1, a double as its IEEE-754 bits, a wide string as a uint32 count of code points and four
// bytes for each, a point as its doubles, an id as the uint64 handle of its object (0 for null).
//
// A reader never goes past the end. The first value that cannot be read whole, or is no value of
// its type (a bool byte of 2), sets the filer's status to eFilerError; from then on every read
// fails with that status and leaves its output as it was. Ids are read as ids of the filer's
// database; a handle it does not know yet becomes an id without an object.
class HsDbBdfFiler {
public:
    // A filer that writes into an empty buffer.
    explicit HsDbBdfFiler(HsDbDatabase* database = nullptr,
                          HsDb::FilerType type = HsDb::kFileFiler);
    // A filer that reads the given bytes from the start.
    HsDbBdfFiler(std::vector<std::uint8_t> bytes, HsDbDatabase* database,
                 HsDb::FilerType type = HsDb::kFileFiler);

    HsDb::FilerType filerType() const { return m_type; }
    HsDbDatabase* database() const { return m_database; }
    Hsys::ErrorStatus filerStatus() const { return m_status; }
    // Keeps the first failure: a later status does not replace it.
    void setFilerStatus(Hsys::ErrorStatus status);
    void resetFilerStatus() { m_status = Hsys::eSuccess; }

    const std::vector<std::uint8_t>& bytes() const { return m_bytes; }
    std::size_t position() const { return m_position; }
    std::size_t remaining() const { return m_bytes.size() - m_position; }

    void writeBool(bool value);
    void writeInt16(std::int16_t value);
    void writeUInt16(std::uint16_t value);
    void writeInt32(std::int32_t value);
    void writeUInt32(std::uint32_t value);
    void writeDouble(double value);
    // A null text is written as the empty one.
    void writeString(const wchar_t* text);
    void writeString(std::wstring_view text);
    void writePoint2d(const HsGePoint2d& point);
    void writePoint3d(const HsGePoint3d& point);
    // The bytes as they are, without a count.
    void writeBytes(const void* data, std::size_t count);
    void writeHardPointerId(const HsDbObjectId& id);
    void writeSoftPointerId(const HsDbObjectId& id);
    void writeHardOwnershipId(const HsDbObjectId& id);
    void writeSoftOwnershipId(const HsDbObjectId& id);

    Hsys::ErrorStatus readBool(bool& value);
    Hsys::ErrorStatus readInt16(std::int16_t& value);
    Hsys::ErrorStatus readUInt16(std::uint16_t& value);
    Hsys::ErrorStatus readInt32(std::int32_t& value);
    Hsys::ErrorStatus readUInt32(std::uint32_t& value);
    Hsys::ErrorStatus readDouble(double& value);
    Hsys::ErrorStatus readString(std::wstring& text);
    Hsys::ErrorStatus readPoint2d(HsGePoint2d& point);
    Hsys::ErrorStatus readPoint3d(HsGePoint3d& point);
    // Exactly count bytes, or nothing.
    Hsys::ErrorStatus readBytes(void* data, std::size_t count);
    Hsys::ErrorStatus readHardPointerId(HsDbObjectId& id);
    Hsys::ErrorStatus readSoftPointerId(HsDbObjectId& id);
    Hsys::ErrorStatus readHardOwnershipId(HsDbObjectId& id);
    Hsys::ErrorStatus readSoftOwnershipId(HsDbObjectId& id);

    // The bytes each item of a list takes at least; a count read from the stream is checked
    // against remaining() with it before anything is reserved.
    static constexpr std::size_t kIdSize = 8;
    static constexpr std::size_t kMinStringSize = 4;

private:
    void writeUInt64(std::uint64_t value);
    Hsys::ErrorStatus readUInt64(std::uint64_t& value);
    void writeId(const HsDbObjectId& id);
    Hsys::ErrorStatus readId(HsDbObjectId& id);
    // Moves past the next count bytes and points first at them; false, after marking the filer
    // failed, when fewer are left.
    bool take(std::size_t count, const std::uint8_t*& first);
    Hsys::ErrorStatus fail();

    std::vector<std::uint8_t> m_bytes;
    std::size_t m_position = 0;
    HsDbDatabase* m_database;
    HsDb::FilerType m_type;
    Hsys::ErrorStatus m_status = Hsys::eSuccess;
};
