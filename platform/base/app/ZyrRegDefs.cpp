#include "platform/base/app/ZyrRegDefs.h"

#include "platform/base/app/ZyrAppHdx.h"
#include "platform/host/db/HsDb.h"
#include "platform/host/db/HsDbDatabase.h"

#include <map>
#include <tuple>

namespace {

constexpr double kMillimetersPerMeter = 1000.0;
constexpr double kMillimetersPerInch = 25.4;

// Application, key and name of one setting.
using SettingKey = std::tuple<std::wstring, std::wstring, std::wstring>;

std::map<SettingKey, double>& settings() {
    static std::map<SettingKey, double> store;
    return store;
}

bool isName(const wchar_t* name) {
    return name != nullptr && *name != L'\0';
}

} // namespace

ZyrRegDefs::ZyrRegDefs(HsDbDatabase* database, std::wstring appName, const wchar_t* key,
                       bool writable)
    : m_database(database), m_appName(std::move(appName)), m_key(key != nullptr ? key : L""),
      m_writable(writable) {}

bool ZyrRegDefs::isImperial() const {
    if (m_database == nullptr)
        return false;
    const HsDb::UnitsValue units = m_database->drawingUnits();
    return units == HsDb::kUnitsInches || units == HsDb::kUnitsFeet;
}

double ZyrRegDefs::getDouble(const wchar_t* name, double defaultValue) const {
    if (!isName(name))
        return defaultValue;
    const auto found = settings().find({m_appName, m_key, name});
    return found != settings().end() ? found->second : defaultValue;
}

bool ZyrRegDefs::has(const wchar_t* name) const {
    return isName(name) && settings().contains({m_appName, m_key, name});
}

Hsys::ErrorStatus ZyrRegDefs::setDouble(const wchar_t* name, double value) {
    if (!isName(name))
        return Hsys::eNullPointer;
    if (!m_writable)
        return Hsys::eNotOpenForWrite;
    settings()[{m_appName, m_key, name}] = value;
    return Hsys::eSuccess;
}

Hsys::ErrorStatus ZyrRegDefs::remove(const wchar_t* name) {
    if (!isName(name))
        return Hsys::eNullPointer;
    if (!m_writable)
        return Hsys::eNotOpenForWrite;
    return settings().erase({m_appName, m_key, name}) == 1 ? Hsys::eSuccess : Hsys::eNameNotFound;
}

bool ZyrRegDefs::convertsLengths() const {
    return m_database != nullptr && m_database->drawingUnits() != HsDb::kUnitsUnitless;
}

double ZyrRegDefs::millimetersPerDrawingUnit() const {
    if (!convertsLengths())
        return 1.0;
    return HsDb::metersPerUnit(m_database->drawingUnits()) * kMillimetersPerMeter;
}

double ZyrRegDefs::getUnitDependentDouble(const wchar_t* name, double defaultValue,
                                          bool defaultInSystemUnit) const {
    const double perDrawingUnit = millimetersPerDrawingUnit();
    if (has(name))
        return getDouble(name, defaultValue) / perDrawingUnit;
    if (!defaultInSystemUnit || !convertsLengths())
        return defaultValue;
    const double systemUnit = isImperial() ? kMillimetersPerInch : 1.0;
    return defaultValue * systemUnit / perDrawingUnit;
}

Hsys::ErrorStatus ZyrRegDefs::setUnitDependentDouble(const wchar_t* name, double length) {
    return setDouble(name, length * millimetersPerDrawingUnit());
}

ZyrRegDefsStandardObj::ZyrRegDefsStandardObj(HsDbDatabase* database, ZyrAppHdx* app,
                                             const wchar_t* key, bool writable)
    : ZyrRegDefs(database, app != nullptr ? app->appName().str() : std::wstring(), key, writable) {}
