// Filing of lists: object ids as hard or soft pointers, and wide strings.
#pragma once

#include "platform/host/db/HsDbObjectId.h"
#include "platform/host/filer/HsDbBdfFiler.h"

#include <cstdint>
#include <string>
#include <vector>

// A list is filed as a uint32 count and its items. A reader checks the count against the bytes that
// are left before it reserves anything, reads every item into a list of its own, and changes the
// caller's list only when all were read: on failure the list stays as it was and the filer's status
// says why.
class HsDbFilerSupport {
public:
    // replace true: the read ids replace the list; false: they are appended to it.
    static Hsys::ErrorStatus bdfWriteHardPointerVector(HsDbBdfFiler* filer,
                                                       const std::vector<HsDbObjectId>& ids);
    static Hsys::ErrorStatus bdfReadHardPointerVector(HsDbBdfFiler* filer,
                                                      std::vector<HsDbObjectId>& ids, bool replace);
    static Hsys::ErrorStatus bdfWriteSoftPointerVector(HsDbBdfFiler* filer,
                                                       const std::vector<HsDbObjectId>& ids);
    static Hsys::ErrorStatus bdfReadSoftPointerVector(HsDbBdfFiler* filer,
                                                      std::vector<HsDbObjectId>& ids, bool replace);

    // Texts of std::wstring or of a string type that converts to const wchar_t* and is made from a
    // std::wstring; the read texts replace the list.
    template <class String>
    static Hsys::ErrorStatus bdfWriteVector(HsDbBdfFiler* filer, const std::vector<String>& texts);
    template <class String>
    static Hsys::ErrorStatus bdfReadVector(HsDbBdfFiler* filer, std::vector<String>& texts);

private:
    using IdReader = Hsys::ErrorStatus (HsDbBdfFiler::*)(HsDbObjectId&);
    static Hsys::ErrorStatus writeIds(HsDbBdfFiler* filer, const std::vector<HsDbObjectId>& ids,
                                      void (HsDbBdfFiler::*writeId)(const HsDbObjectId&));
    static Hsys::ErrorStatus readIds(HsDbBdfFiler* filer, std::vector<HsDbObjectId>& ids,
                                     bool replace, IdReader readId);
    // The count of a list whose items take at least itemSize bytes, or a failure when the bytes
    // left cannot hold that many.
    static Hsys::ErrorStatus readCount(HsDbBdfFiler* filer, std::size_t itemSize,
                                       std::uint32_t& count);
};

template <class String>
Hsys::ErrorStatus HsDbFilerSupport::bdfWriteVector(HsDbBdfFiler* filer,
                                                   const std::vector<String>& texts) {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    filer->writeUInt32(static_cast<std::uint32_t>(texts.size()));
    for (const String& text : texts)
        filer->writeString(text);
    return filer->filerStatus();
}

template <class String>
Hsys::ErrorStatus HsDbFilerSupport::bdfReadVector(HsDbBdfFiler* filer, std::vector<String>& texts) {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    std::uint32_t count = 0;
    if (readCount(filer, HsDbBdfFiler::kMinStringSize, count) != Hsys::eSuccess)
        return filer->filerStatus();
    std::vector<String> read;
    read.reserve(count);
    for (std::uint32_t i = 0; i < count; ++i) {
        std::wstring text;
        if (filer->readString(text) != Hsys::eSuccess)
            return filer->filerStatus();
        read.emplace_back(std::move(text));
    }
    texts = std::move(read);
    return Hsys::eSuccess;
}
