// Binary filing of a collection through a translator that turns each item into a filed value and
// back.
#pragma once

#include "platform/base/obj/ZyrClassId.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/rx/HsRxClass.h"

#include <cstdint>
#include <string>
#include <vector>

// Layout: a uint32 count, then each item as the translator files it.
class ZyrCollectionFiler {
public:
    // Classes filed by their registered names. A name that no longer names a class reads as a
    // null class, which stays in the collection; a null class is filed as the empty name.
    struct RxClassAsString {
        static constexpr std::size_t kMinFiledSize = HsDbBdfFiler::kMinStringSize;

        static void write(HsDbBdfFiler* filer, const HsRxClass* cls) {
            filer->writeString(cls != nullptr ? cls->name() : L"");
        }
        static Hsys::ErrorStatus read(HsDbBdfFiler* filer, HsRxClass*& cls) {
            std::wstring name;
            if (filer->readString(name) != Hsys::eSuccess)
                return filer->filerStatus();
            cls = Zyr::classNameToClass(name.c_str());
            return Hsys::eSuccess;
        }
    };

    template <class Collection, class Translator>
    static Hsys::ErrorStatus bdfWriteTranslated(HsDbBdfFiler* filer,
                                                const Translator& /*translator*/,
                                                const Collection& collection) {
        filer->writeUInt32(static_cast<std::uint32_t>(collection.count()));
        for (const auto& item : collection)
            Translator::write(filer, item);
        return filer->filerStatus();
    }

    // Replaces the collection's content with what was read, through its add of a list. A count
    // that the bytes left cannot hold, or any item that cannot be read, fails the filer and leaves
    // the collection as it was.
    template <class Collection, class Translator>
    static Hsys::ErrorStatus bdfReadTranslated(HsDbBdfFiler* filer,
                                               const Translator& /*translator*/,
                                               Collection& collection) {
        std::uint32_t count = 0;
        if (filer->readUInt32(count) != Hsys::eSuccess)
            return filer->filerStatus();
        if (count > filer->remaining() / Translator::kMinFiledSize) {
            filer->setFilerStatus(Hsys::eFilerError);
            return Hsys::eFilerError;
        }
        std::vector<typename Collection::value_type> items;
        items.reserve(count);
        for (std::uint32_t i = 0; i < count; ++i) {
            typename Collection::value_type item{};
            if (const Hsys::ErrorStatus status = Translator::read(filer, item);
                status != Hsys::eSuccess)
                return status;
            items.push_back(item);
        }
        collection.clear();
        return collection.add(items);
    }
};
