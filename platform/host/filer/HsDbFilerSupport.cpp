#include "platform/host/filer/HsDbFilerSupport.h"

Hsys::ErrorStatus
HsDbFilerSupport::bdfWriteHardPointerVector(HsDbBdfFiler* filer,
                                            const std::vector<HsDbObjectId>& ids) {
    return writeIds(filer, ids, &HsDbBdfFiler::writeHardPointerId);
}

Hsys::ErrorStatus HsDbFilerSupport::bdfReadHardPointerVector(HsDbBdfFiler* filer,
                                                             std::vector<HsDbObjectId>& ids,
                                                             bool replace) {
    return readIds(filer, ids, replace, &HsDbBdfFiler::readHardPointerId);
}

Hsys::ErrorStatus
HsDbFilerSupport::bdfWriteSoftPointerVector(HsDbBdfFiler* filer,
                                            const std::vector<HsDbObjectId>& ids) {
    return writeIds(filer, ids, &HsDbBdfFiler::writeSoftPointerId);
}

Hsys::ErrorStatus HsDbFilerSupport::bdfReadSoftPointerVector(HsDbBdfFiler* filer,
                                                             std::vector<HsDbObjectId>& ids,
                                                             bool replace) {
    return readIds(filer, ids, replace, &HsDbBdfFiler::readSoftPointerId);
}

Hsys::ErrorStatus HsDbFilerSupport::writeIds(HsDbBdfFiler* filer,
                                             const std::vector<HsDbObjectId>& ids,
                                             void (HsDbBdfFiler::*writeId)(const HsDbObjectId&)) {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    filer->writeUInt32(static_cast<std::uint32_t>(ids.size()));
    for (const HsDbObjectId& id : ids)
        (filer->*writeId)(id);
    return filer->filerStatus();
}

Hsys::ErrorStatus HsDbFilerSupport::readIds(HsDbBdfFiler* filer, std::vector<HsDbObjectId>& ids,
                                            bool replace, IdReader readId) {
    if (filer == nullptr)
        return Hsys::eNullPointer;
    std::uint32_t count = 0;
    if (readCount(filer, HsDbBdfFiler::kIdSize, count) != Hsys::eSuccess)
        return filer->filerStatus();
    std::vector<HsDbObjectId> read;
    read.reserve(count);
    for (std::uint32_t i = 0; i < count; ++i) {
        HsDbObjectId id;
        if ((filer->*readId)(id) != Hsys::eSuccess)
            return filer->filerStatus();
        read.push_back(id);
    }
    if (replace)
        ids = std::move(read);
    else
        ids.insert(ids.end(), read.begin(), read.end());
    return Hsys::eSuccess;
}

Hsys::ErrorStatus HsDbFilerSupport::readCount(HsDbBdfFiler* filer, std::size_t itemSize,
                                              std::uint32_t& count) {
    std::uint32_t read = 0;
    if (filer->readUInt32(read) != Hsys::eSuccess)
        return filer->filerStatus();
    if (std::size_t{read} > filer->remaining() / itemSize) {
        filer->setFilerStatus(Hsys::eFilerError);
        return filer->filerStatus();
    }
    count = read;
    return Hsys::eSuccess;
}
