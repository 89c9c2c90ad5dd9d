// The public half of every persistent pair of the module: what the database stores, opens and
// files, owning the implementation object that holds the data.
#pragma once

#include "areacalc/module/ZyrAreaCalculationBaseApp.h"
#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "areacalc/objects/ZyrPairFiling.h"
#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/obj/ZyrDbEntity.h"
#include "platform/base/obj/ZyrFiling.h"
#include "platform/host/db/HsDbObject.h"
#include "platform/host/ut/HsGuid.h"

#include <cstdint>
#include <type_traits>

namespace Zyr {
// The tests an open makes before it opens: eNullId for the null id; eWrongClass, without opening,
// for an object that is neither of cls nor a proxy (which may stand for an object of cls).
Hsys::ErrorStatus checkOpenable(const HsDbObjectId& id, const HsRxClass* cls);
// Opens the object in the running transaction of the id's database: eBadArgument when the
// database has no transaction manager, else the manager's status.
Hsys::ErrorStatus openInTransaction(HsDbObject*& object, const HsDbObjectId& id,
                                    HsDb::OpenMode mode, bool openErased);
} // namespace Zyr

// Self is the public class, Base its public base (ZyrDbGeo or ZyrDbDictRecord), Imp its
// implementation class. Self declares ZYR_AREACALC_DECLARE_FILED_MEMBERS and a kClassIdWord, and
// its source file ZYR_AREACALC_DEFINE_FILED_MEMBERS.
//
// Binary filing: Base's fields, then int16 80; the data lie in the implementation object, which
// Base files nested in its own fields.
template <class Self, class Base, class Imp> class ZyrDbPair : public Base {
public:
    static constexpr bool kIsEntity = std::is_base_of_v<ZyrDbEntity, Base>;
    // The proxy flags of an entity class and of a filed class that is no entity.
    static constexpr int kProxyFlags = kIsEntity ? 893 : 129;
    static constexpr std::int16_t m_ZyrBirthVersion = Zyr::kBirthVersion;
    static constexpr std::int16_t m_ZyrCurrentVersion = Zyr::kCurrentVersion;

    // A new object with a new implementation object of its class.
    ZyrDbPair() : Base(false) { this->setImp(new Imp); }
    // Base's constructor with the flag and nothing more: whoever calls it sets the implementation.
    explicit ZyrDbPair(bool createImp) : Base(createImp) {}

    // Opens the object behind id as a Self; the caller closes it. out is null on every failure:
    // the statuses of Zyr::checkOpenable and hsdbOpenObject, and eWrongClass for a proxy, which is
    // closed again.
    static Hsys::ErrorStatus open(Self*& out, HsDbObjectId id, HsDb::OpenMode mode,
                                  bool openErased = false) {
        out = nullptr;
        if (const Hsys::ErrorStatus status = Zyr::checkOpenable(id, Self::desc());
            status != Hsys::eSuccess)
            return status;
        HsDbObject* object = nullptr;
        if (const Hsys::ErrorStatus status = hsdbOpenObject(object, id, mode, openErased);
            status != Hsys::eSuccess)
            return status;
        out = Self::cast(object);
        if (out != nullptr)
            return Hsys::eSuccess;
        object->close();
        return Hsys::eWrongClass;
    }

    // The same in the running transaction of the id's database, which owns the open: eBadArgument
    // for a database without transactions, the manager's status (no transaction runs, the open
    // failed), and eWrongClass for a proxy, which the transaction keeps open.
    static Hsys::ErrorStatus openTrans(Self*& out, HsDbObjectId id, HsDb::OpenMode mode,
                                       bool openErased = false) {
        out = nullptr;
        if (const Hsys::ErrorStatus status = Zyr::checkOpenable(id, Self::desc());
            status != Hsys::eSuccess)
            return status;
        HsDbObject* object = nullptr;
        if (const Hsys::ErrorStatus status = Zyr::openInTransaction(object, id, mode, openErased);
            status != Hsys::eSuccess)
            return status;
        out = Self::cast(object);
        return out != nullptr ? Hsys::eSuccess : Hsys::eWrongClass;
    }

    // A stream whose implementation object is not of Imp is refused (eWrongClass, the filer
    // failed): no object of the class is left without its data.
    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        return Zyr::bdfInLevel(
            filer, this, Self::desc(), [&] { return Base::bdfInFields(filer); },
            [&] { return this->bdfInVersion(filer); }, [&] { return checkImpClass(filer); });
    }
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        return Zyr::bdfOutLevel(
            filer, [&] { return Base::bdfOutFields(filer); },
            [&] { return this->bdfOutVersion(filer); }, [] { return Hsys::eSuccess; });
    }
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override {
        return Zyr::tdfInUnlessFromFile(filer, [&] { return Base::tdfInFields(filer); });
    }
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override {
        return Zyr::tdfOutUnlessToFile(filer, [&] { return Base::tdfOutFields(filer); });
    }

    // The id of the class-id word, derived once per class: Zyr::constructClassID, then the
    // entity or object form of the id. eNullPointer for a null id; a failure copies nothing.
    Hsys::ErrorStatus subGetClassID(_GUID* id) const override {
        static _GUID classId;
        if (id == nullptr)
            return Hsys::eNullPointer;
        if (classId.isNull()) {
            const ZyrRmCString text = Zyr::constructClassID(Self::kClassIdWord);
            const Hsys::ErrorStatus status = kIsEntity
                                                 ? Zyr::getEntityClassIdFromString(text, &classId)
                                                 : Zyr::getObjectClassIdFromString(text, &classId);
            if (status != Hsys::eSuccess)
                return status;
        }
        *id = classId;
        return Hsys::eSuccess;
    }

    std::int16_t ZyrBirthVersion() const override { return Self::m_ZyrBirthVersion; }
    std::int16_t ZyrCurrentVersion() const override { return Self::m_ZyrCurrentVersion; }

protected:
    // The implementation object, or null when it is none of Imp (an object made with the bool
    // constructor, before its implementation was set).
    Imp* pairImp() { return Imp::cast(this->imp()); }
    const Imp* pairImp() const { return Imp::cast(this->imp()); }

private:
    Hsys::ErrorStatus checkImpClass(HsDbBdfFiler* filer) const {
        if (pairImp() != nullptr)
            return Hsys::eSuccess;
        filer->setFilerStatus(Hsys::eFilerError);
        return Hsys::eWrongClass;
    }
};

// The run-time class members of a public class, filed under its record name: those of
// ZYR_AREACALC_DECLARE_MEMBERS, and rxInit with the callback that supplies the class's
// application text on demand.
#define ZYR_AREACALC_DECLARE_FILED_MEMBERS(CLASS)                                                  \
    ZYR_AREACALC_DECLARE_MEMBERS(CLASS)                                                            \
    static HsRxClass* rxInit(HsRxClass::AppDataCallback appDataCallback);

// Registers with the long form of newHsRxClass: the record name, the pair's proxy flags, the
// module's class application description; NAME_ID and SECOND_ID are the decorator's text ids.
#define ZYR_AREACALC_DEFINE_FILED_MEMBERS(CLASS, PARENT, RECORD_NAME, NAME_ID, SECOND_ID)          \
    HsRxClass* CLASS::gpDesc = nullptr;                                                            \
    HsRxClass* CLASS::rxInit() {                                                                   \
        return rxInit(nullptr);                                                                    \
    }                                                                                              \
    HsRxClass* CLASS::rxInit(HsRxClass::AppDataCallback appDataCallback) {                         \
        return ZyrAreaCalculationClassRegistration::rxInit(                                        \
            gpDesc, L"" #CLASS, ZyrAreaCalculationClassRegistration::parentClass<PARENT>(),        \
            CLASS::kProxyFlags, hsrxInstantiateClass<CLASS>, RECORD_NAME,                          \
            ZyrAreaCalculationBaseApp::kClassAppDescription, appDataCallback);                     \
    }                                                                                              \
    ZYR_AREACALC_DEFINE_ISA_AND_DECORATOR(CLASS, PARENT, NAME_ID, SECOND_ID)
