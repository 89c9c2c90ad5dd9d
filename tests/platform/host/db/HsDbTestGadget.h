// A persistent entity for tests: one field of every filed type, references to other objects, and
// a version word that a test can set to what a later version would write. Include it in one
// source file of a program: it defines the class and the helper that puts one in model space.
#pragma once

#include "platform/host/db/HsDbBlockTable.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/db/HsDbEntity.h"
#include "platform/host/db/HsDbObjectPointer.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "platform/host/ge/HsGePoint2d.h"
#include "platform/host/ge/HsGePoint3d.h"
#include "platform/host/rx/HsRxClass.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

class TestGadget : public HsDbEntity {
    HSRX_DECLARE_MEMBERS(TestGadget)

public:
    static constexpr std::int16_t kCurrentVersion = 80;
    // What bdfOutFields writes as its version; a test sets 81 to write as a later version would.
    static inline std::int16_t versionToWrite = kCurrentVersion;

    void setCount(std::int16_t value) {
        assertWriteEnabled();
        count = value;
    }
    void setLabel(std::wstring value) {
        assertWriteEnabled();
        label = std::move(value);
    }

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        if (const Hsys::ErrorStatus status = HsDbEntity::bdfInFields(filer);
            status != Hsys::eSuccess)
            return status;
        std::int16_t version = 0;
        if (filer->readInt16(version) != Hsys::eSuccess)
            return filer->filerStatus();
        if (version > kCurrentVersion)
            return Hsys::eNewerVersion;
        filer->readInt16(count);
        filer->readUInt16(flags);
        filer->readInt32(offset);
        filer->readUInt32(serial);
        filer->readDouble(length);
        filer->readBool(visible);
        filer->readString(label);
        filer->readPoint2d(anchor);
        filer->readPoint3d(position);
        filer->readBytes(tag, sizeof tag);
        filer->readHardPointerId(partner);
        filer->readSoftOwnershipId(child);
        HsDbFilerSupport::bdfReadSoftPointerVector(filer, neighbours, true);
        HsDbFilerSupport::bdfReadVector(filer, names);
        return filer->filerStatus();
    }

    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        if (const Hsys::ErrorStatus status = HsDbEntity::bdfOutFields(filer);
            status != Hsys::eSuccess)
            return status;
        filer->writeInt16(versionToWrite);
        filer->writeInt16(count);
        filer->writeUInt16(flags);
        filer->writeInt32(offset);
        filer->writeUInt32(serial);
        filer->writeDouble(length);
        filer->writeBool(visible);
        filer->writeString(label);
        filer->writePoint2d(anchor);
        filer->writePoint3d(position);
        filer->writeBytes(tag, sizeof tag);
        filer->writeHardPointerId(partner);
        filer->writeSoftOwnershipId(child);
        HsDbFilerSupport::bdfWriteSoftPointerVector(filer, neighbours);
        HsDbFilerSupport::bdfWriteVector(filer, names);
        return filer->filerStatus();
    }

    std::int16_t count = 0;
    std::uint16_t flags = 0;
    std::int32_t offset = 0;
    std::uint32_t serial = 0;
    double length = 0.0;
    bool visible = false;
    std::wstring label;
    HsGePoint2d anchor;
    HsGePoint3d position;
    std::uint8_t tag[3] = {0, 0, 0};
    HsDbObjectId partner;
    HsDbObjectId child;
    std::vector<HsDbObjectId> neighbours;
    std::vector<std::wstring> names;
};

HSRX_DEFINE_MEMBERS(TestGadget, HsDbEntity, 0, hsrxInstantiateClass<TestGadget>)

// A gadget with a label appended to model space and closed, as the plan's next room.
inline HsDbObjectId addGadget(HsDbDatabase& db, const wchar_t* label = L"") {
    HsDbObjectPointer<HsDbBlockTableRecord> space(db.modelSpaceId(), HsDb::kForWrite);
    HsDbObjectPointer<TestGadget> gadget(new TestGadget);
    gadget->label = label;
    HsDbObjectId id;
    EXPECT_EQ(space->appendHsDbEntity(id, gadget.object()), Hsys::eSuccess);
    return id;
}
