// The summary of an object as a user reads it: labelled rows of text, distances, counts and record
// names, each rendered to its text when it is added.
#pragma once

#include "platform/base/res/ZyrRmCString.h"

#include <vector>

class HsDbDatabase;
class HsDbObjectId;

class ZyrDesc {
public:
    enum class RowKind { kText, kDistance, kCount, kRecordName };

    struct Row {
        RowKind kind;
        ZyrRmCString label;
        ZyrRmCString value;
    };

    // Asks addRecordName to add the record's class after its name: "Standard (Area Style)".
    static constexpr int kWithRecordClass = 1;
    // What a record row shows for the null id, and for an id that does not open as a record.
    static constexpr const wchar_t* kNoRecord = L"(none)";
    static constexpr const wchar_t* kInvalidRecord = L"(invalid record)";

    // Distances are shown in the units of this database; null stands for the working database at
    // the time a row is added.
    explicit ZyrDesc(HsDbDatabase* database = nullptr) : m_database(database) {}

    void addText(const wchar_t* label, const wchar_t* text);
    // A length in drawing units, in the given unit and precision; -1 and -1 take the drawing's
    // display unit and precision.
    void addDistance(const wchar_t* label, int unit, int precision, double value);
    void addCount(const wchar_t* label, long long value);
    // The name of the dictionary record behind id, or kNoRecord or kInvalidRecord. flags is 0 or
    // kWithRecordClass.
    void addRecordName(const wchar_t* label, const HsDbObjectId* id, int flags);

    const std::vector<Row>& rows() const { return m_rows; }
    // One "label: value" line per row; a row without a label is its value alone.
    std::vector<ZyrRmCString> lines() const;
    // The lines, each ended by a line feed.
    ZyrRmCString text() const;

private:
    void add(RowKind kind, const wchar_t* label, ZyrRmCString value);

    HsDbDatabase* m_database;
    std::vector<Row> m_rows;
};
