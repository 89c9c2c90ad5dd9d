// A scope-bound pointer to a database object: it closes what it opened when the scope ends.
#pragma once

#include "platform/host/db/HsDbObject.h"

#include <utility>

// Holds an object opened by id, or one that a caller made and hands over. At the end of the scope
// an object with an id is closed, and an object that never got one, which nobody else owns, is
// deleted. An object handed over and then added to a database is therefore closed, not deleted.
template <class T> class HsDbObjectPointer {
public:
    HsDbObjectPointer() = default;
    HsDbObjectPointer(const HsDbObjectId& id, HsDb::OpenMode mode, bool openErased = false) {
        open(id, mode, openErased);
    }
    // Takes an object that the caller made or opened.
    explicit HsDbObjectPointer(T* object) : m_object(object) {}
    HsDbObjectPointer(const HsDbObjectPointer&) = delete;
    HsDbObjectPointer& operator=(const HsDbObjectPointer&) = delete;
    HsDbObjectPointer(HsDbObjectPointer&& other) noexcept
        : m_object(std::exchange(other.m_object, nullptr)), m_status(other.m_status) {}
    HsDbObjectPointer& operator=(HsDbObjectPointer&& other) noexcept {
        if (this != &other) {
            close();
            m_object = std::exchange(other.m_object, nullptr);
            m_status = other.m_status;
        }
        return *this;
    }
    ~HsDbObjectPointer() { close(); }

    // Lets go of what it holds, then opens; the status of the open.
    Hsys::ErrorStatus open(const HsDbObjectId& id, HsDb::OpenMode mode, bool openErased = false) {
        close();
        m_status = hsdbOpenObject(m_object, id, mode, openErased);
        return m_status;
    }
    // Closes or deletes the object now.
    void close() {
        T* object = std::exchange(m_object, nullptr);
        if (object == nullptr)
            return;
        if (object->objectId().isNull())
            delete object;
        else
            object->close();
    }
    // Hands the object to the caller, who closes or deletes it.
    T* release() { return std::exchange(m_object, nullptr); }

    // The status of the last open; eSuccess for a pointer that was given its object.
    Hsys::ErrorStatus openStatus() const { return m_status; }
    T* object() const { return m_object; }
    T* operator->() const { return m_object; }
    explicit operator bool() const { return m_object != nullptr; }

private:
    T* m_object = nullptr;
    Hsys::ErrorStatus m_status = Hsys::eSuccess;
};
