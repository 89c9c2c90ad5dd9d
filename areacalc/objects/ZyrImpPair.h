// The implementation half of every persistent pair of the module: the class that holds the data.
#pragma once

#include "areacalc/module/ZyrAreaCalculationClassRegistration.h"
#include "areacalc/objects/ZyrPairFiling.h"
#include "platform/base/obj/ZyrFiling.h"

#include <cstdint>

// Self is the implementation class, Base its implementation base (ZyrImpGeo or ZyrImpDictRecord).
// Self declares ZYR_AREACALC_DECLARE_MEMBERS; its source file defines them with the flags 80 and
// its pseudo constructor.
//
// Binary filing: Base's fields, int16 80, then Self's own fields. A class with fields overrides
// bdfInFields and bdfOutFields with bdfInThisLevel and bdfOutThisLevel, giving its own fields.
template <class Self, class Base> class ZyrImpPair : public Base {
public:
    static constexpr int kProxyFlags = 80;
    static constexpr std::int16_t m_ZyrBirthVersion = Zyr::kBirthVersion;
    static constexpr std::int16_t m_ZyrCurrentVersion = Zyr::kCurrentVersion;

    // The base's part, whose failure is returned; then eBadArgument for a source of another class.
    // A class with fields of its own copies them in its own override.
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override {
        if (const Hsys::ErrorStatus status = Base::copyFrom(other); status != Hsys::eSuccess)
            return status;
        return Self::cast(other) != nullptr ? Hsys::eSuccess : Hsys::eBadArgument;
    }
    std::int16_t ZyrBirthVersion() const override { return Self::m_ZyrBirthVersion; }
    std::int16_t ZyrCurrentVersion() const override { return Self::m_ZyrCurrentVersion; }

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        return bdfInThisLevel(filer, [] { return Hsys::eSuccess; });
    }
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        return bdfOutThisLevel(filer, [] { return Hsys::eSuccess; });
    }
    Hsys::ErrorStatus tdfInFields(HsDbTdfFiler* filer) override {
        return Zyr::tdfInUnlessFromFile(filer, [&] { return Base::tdfInFields(filer); });
    }
    Hsys::ErrorStatus tdfOutFields(HsDbTdfFiler* filer) const override {
        return Zyr::tdfOutUnlessToFile(filer, [&] { return Base::tdfOutFields(filer); });
    }

protected:
    // readOwn reads the class's own fields once the version word let the stream through; it sees
    // the version in filedVersion().
    template <class ReadOwn>
    Hsys::ErrorStatus bdfInThisLevel(HsDbBdfFiler* filer, ReadOwn readOwn) {
        return Zyr::bdfInLevel(
            filer, this, Self::desc(), [&] { return Base::bdfInFields(filer); },
            [&] { return this->bdfInVersion(filer); }, readOwn);
    }
    template <class WriteOwn>
    Hsys::ErrorStatus bdfOutThisLevel(HsDbBdfFiler* filer, WriteOwn writeOwn) const {
        return Zyr::bdfOutLevel(
            filer, [&] { return Base::bdfOutFields(filer); },
            [&] { return this->bdfOutVersion(filer); }, writeOwn);
    }
};
