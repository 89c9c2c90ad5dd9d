// The text filer: a sequence of group-code items, read and written one at a time.
#pragma once

#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/ut/HsysErrorStatus.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <variant>
#include <vector>

// One item: a group code that says what the value means, and the value, which is an integer, a
// real, a text or an object id. Readers ask for the type they expect and get eWrongType for
// another, so that a hostile item never passes as a value of the wrong type.
class HsDbTdfItem {
public:
    enum Kind { kInteger = 0, kReal = 1, kText = 2, kObjectId = 3 };

    HsDbTdfItem() = default;
    HsDbTdfItem(int groupCode, std::int32_t value) : m_groupCode(groupCode), m_value(value) {}
    HsDbTdfItem(int groupCode, double value) : m_groupCode(groupCode), m_value(value) {}
    HsDbTdfItem(int groupCode, std::wstring value)
        : m_groupCode(groupCode), m_value(std::move(value)) {}
    HsDbTdfItem(int groupCode, const wchar_t* value)
        : m_groupCode(groupCode), m_value(std::wstring(value != nullptr ? value : L"")) {}
    HsDbTdfItem(int groupCode, const HsDbObjectId& value)
        : m_groupCode(groupCode), m_value(value) {}

    int groupCode() const { return m_groupCode; }
    Kind kind() const { return static_cast<Kind>(m_value.index()); }

    Hsys::ErrorStatus getInteger(std::int32_t& value) const { return get(value); }
    Hsys::ErrorStatus getReal(double& value) const { return get(value); }
    Hsys::ErrorStatus getText(std::wstring& value) const { return get(value); }
    Hsys::ErrorStatus getObjectId(HsDbObjectId& value) const { return get(value); }

    friend bool operator==(const HsDbTdfItem&, const HsDbTdfItem&) = default;

private:
    template <class T> Hsys::ErrorStatus get(T& value) const {
        const T* held = std::get_if<T>(&m_value);
        if (held == nullptr)
            return Hsys::eWrongType;
        value = *held;
        return Hsys::eSuccess;
    }

    int m_groupCode = 0;
    std::variant<std::int32_t, double, std::wstring, HsDbObjectId> m_value;
};

// Items are written at the end and read from a cursor; the last item read can be pushed back once,
// for a reader that met a group code it does not know. The first failure, set by a reader with its
// message, stays until reset.
class HsDbTdfFiler {
public:
    // modifiesInPlace: the filer changes objects that exist (a property edit, an undo), rather
    // than making them from a text drawing file.
    explicit HsDbTdfFiler(HsDb::FilerType type = HsDb::kFileFiler, bool modifiesInPlace = false);
    HsDbTdfFiler(std::vector<HsDbTdfItem> items, HsDb::FilerType type, bool modifiesInPlace);

    HsDb::FilerType filerType() const { return m_type; }
    bool isModifyingExistingObject() const { return m_modifiesInPlace; }

    // The next item: eSuccess, eEndOfInput after the last one, or the filer's failure.
    Hsys::ErrorStatus readItem(HsDbTdfItem& item);
    // Appends an item; refused with the filer's failure once it has failed.
    Hsys::ErrorStatus writeItem(const HsDbTdfItem& item);
    // Puts the last item read back, so that the next readItem gives it again. eDoesNotApply when
    // nothing was read since the last push back.
    Hsys::ErrorStatus pushBackItem();
    // An optional id item: when the next item has the group code, its id goes to id. Any other
    // item is pushed back and the end of input is no failure; both leave id as it was. An item of
    // the code that holds no id fails the filer with eBadTdfSequence. The filer's status.
    Hsys::ErrorStatus readObjectIdItem(int groupCode, HsDbObjectId& id);

    Hsys::ErrorStatus filerStatus() const { return m_status; }
    const std::wstring& errorMessage() const { return m_message; }
    // Records a failure with its message; a failure already recorded stays.
    void setError(Hsys::ErrorStatus status, const wchar_t* message);
    void resetFilerStatus();

    const std::vector<HsDbTdfItem>& items() const { return m_items; }
    std::size_t position() const { return m_position; }

private:
    std::vector<HsDbTdfItem> m_items;
    std::size_t m_position = 0;
    bool m_canPushBack = false;
    HsDb::FilerType m_type;
    bool m_modifiesInPlace;
    Hsys::ErrorStatus m_status = Hsys::eSuccess;
    std::wstring m_message;
};
