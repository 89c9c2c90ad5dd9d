// Settings of an application: named numbers under a key ("AreaGroup"), kept for the life of the
// process. Lengths are stored in millimetres and read back in the units of a drawing.
#pragma once

#include "platform/host/ut/HsysErrorStatus.h"

#include <string>

class HsDbDatabase;
class ZyrAppHdx;

// A handle on the settings of one application and key, for one database: the database decides the
// unit system and the units a length is read in. A handle opened without write access only reads.
class ZyrRegDefs {
public:
    virtual ~ZyrRegDefs() = default;

    HsDbDatabase* database() const { return m_database; }
    const std::wstring& appName() const { return m_appName; }
    const std::wstring& key() const { return m_key; }
    bool isWritable() const { return m_writable; }

    // True when the database's drawing units are inches or feet; false without a database.
    bool isImperial() const;

    // The stored number, or the default when the name holds none.
    double getDouble(const wchar_t* name, double defaultValue) const;
    bool has(const wchar_t* name) const;
    // eNotOpenForWrite for a read-only handle, eNullPointer for a null or empty name.
    Hsys::ErrorStatus setDouble(const wchar_t* name, double value);
    Hsys::ErrorStatus remove(const wchar_t* name);

    // A stored length (millimetres) in the database's drawing units. When nothing is stored, the
    // default: with defaultInSystemUnit it is taken in the base unit of the database's unit system
    // (millimetres, or inches for an imperial drawing) and converted like a stored value; without,
    // it is already in drawing units and returned as it is. A unitless drawing, or none, converts
    // nothing.
    double getUnitDependentDouble(const wchar_t* name, double defaultValue,
                                  bool defaultInSystemUnit) const;
    // Stores a length given in the database's drawing units, as millimetres.
    Hsys::ErrorStatus setUnitDependentDouble(const wchar_t* name, double length);

protected:
    ZyrRegDefs(HsDbDatabase* database, std::wstring appName, const wchar_t* key, bool writable);

private:
    // False for a unitless drawing or none: lengths are then taken as they are.
    bool convertsLengths() const;
    // Millimetres in one drawing unit; 1 when nothing is to be converted.
    double millimetersPerDrawingUnit() const;

    HsDbDatabase* m_database;
    std::wstring m_appName;
    std::wstring m_key;
    bool m_writable;
};

// The standard settings of an application, named by the application object.
class ZyrRegDefsStandardObj : public ZyrRegDefs {
public:
    // The settings are those of the application's name. A null database stays null: callers that
    // mean the working database pass it.
    ZyrRegDefsStandardObj(HsDbDatabase* database, ZyrAppHdx* app, const wchar_t* key,
                          bool writable);
};
