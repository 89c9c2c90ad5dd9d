// Sample classes built on the object bases the way the module builds its own: a record pair, an
// entity pair with members and a nested profile, and an override that lists records; the public
// classes add no fields and file no level of their own. Also the helpers that store them. Included
// by one test file per executable, which registers the classes on first use.
#pragma once

#include "platform/base/geom/ZyrGeProfile.h"
#include "platform/base/obj/ZyrDbDictRecord.h"
#include "platform/base/obj/ZyrDbGeo.h"
#include "platform/base/obj/ZyrFiling.h"
#include "platform/base/obj/ZyrImpDictRecord.h"
#include "platform/base/obj/ZyrImpGeo.h"
#include "platform/base/obj/ZyrLevelFiling.h"
#include "platform/base/obj/ZyrOverride.h"
#include "platform/base/relgraph/ZyrAuditUtilities.h"
#include "platform/base/relgraph/ZyrObjReferenceInfo.h"
#include "platform/base/relgraph/ZyrObjReferenceMap.h"
#include "platform/base/summary/ZyrDesc.h"
#include "platform/host/db/HsDbAuditInfo.h"
#include "platform/host/db/HsDbDatabase.h"
#include "platform/host/filer/HsDbBdfFiler.h"
#include "platform/host/filer/HsDbFilerSupport.h"
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/ut/HsutUtf8.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <unistd.h>
#include <vector>

class ZyrImpSampleRecord : public ZyrImpDictRecord {
    HSRX_DECLARE_MEMBERS(ZyrImpSampleRecord)

public:
    static constexpr int kWidthParameter = 0;

    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override {
        if (const Hsys::ErrorStatus status = ZyrImpDictRecord::copyFrom(other);
            status != Hsys::eSuccess)
            return status;
        const ZyrImpSampleRecord* source = ZyrImpSampleRecord::cast(other);
        if (source == nullptr)
            return Hsys::eBadArgument;
        assertParentWriteEnabled();
        m_width = source->m_width;
        m_styleId = source->m_styleId;
        recordParentReferencesModified();
        return Hsys::eSuccess;
    }

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        return Zyr::bdfInLevel(
            filer, this, desc(), [&] { return ZyrImpDictRecord::bdfInFields(filer); },
            [&] { return bdfInVersion(filer); },
            [&] {
                filer->readDouble(m_width);
                filer->readHardPointerId(m_styleId);
                return Hsys::eSuccess;
            });
    }
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        return Zyr::bdfOutLevel(
            filer, [&] { return ZyrImpDictRecord::bdfOutFields(filer); },
            [&] { return bdfOutVersion(filer); },
            [&] {
                filer->writeDouble(m_width);
                filer->writeHardPointerId(m_styleId);
                return Hsys::eSuccess;
            });
    }

    // A bad style is counted; with fix it is cleared, which a sample may do.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override {
        ZyrImpDictRecord::audit(info);
        HsDbObject* parent = dbParent();
        if (parent == nullptr || m_styleId.isNull() ||
            ZyrAuditUtilities::verifySymbolReferenceAndPrintAuditError(info, parent, m_styleId,
                                                                       nullptr) == kGoodReference)
            return Hsys::eSuccess;
        info->errorsFound(1);
        if (info->fixErrors()) {
            assertParentWriteEnabled();
            m_styleId.setNull();
            recordParentReferencesModified();
            info->errorsFixed(1);
        }
        return Hsys::eSuccess;
    }

    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override {
        ZyrImpDictRecord::getReferencedObjects(map);
        return map.addRecordReference(m_styleId);
    }

    void summaryInfo(ZyrDesc* desc) const override {
        ZyrImpDictRecord::summaryInfo(desc);
        desc->addText(L"Name", name());
        desc->addCount(L"Width", static_cast<long long>(m_width));
    }

    double width() const { return m_width; }
    Hsys::ErrorStatus setWidth(double width) {
        if (width == m_width)
            return Hsys::eSuccess;
        assertParentWriteEnabled();
        recordParameterChanged(kWidthParameter, desc(), ZyrParamChangeFlag::kAll, this);
        m_width = width;
        return Hsys::eSuccess;
    }
    Hsys::ErrorStatus setStyleId(const HsDbObjectId& id) {
        if (id == m_styleId)
            return Hsys::eSuccess;
        assertParentWriteEnabled();
        m_styleId = id;
        recordParentReferencesModified();
        return Hsys::eSuccess;
    }

private:
    double m_width = 1.0;
    HsDbObjectId m_styleId;
};

HSRX_DEFINE_MEMBERS(ZyrImpSampleRecord, ZyrImpDictRecord, 0,
                    hsrxInstantiateClass<ZyrImpSampleRecord>)

class ZyrDbSampleRecord : public ZyrDbDictRecord {
    HSRX_DECLARE_MEMBERS(ZyrDbSampleRecord)

public:
    ZyrDbSampleRecord() : ZyrDbDictRecord(true) { setImp(new ZyrImpSampleRecord); }

    ZyrImpSampleRecord* sampleImp() { return ZyrImpSampleRecord::cast(imp()); }
};

HSRX_DEFINE_MEMBERS(ZyrDbSampleRecord, ZyrDbDictRecord, 0, hsrxInstantiateClass<ZyrDbSampleRecord>)

class ZyrImpSampleShape : public ZyrImpGeo {
    HSRX_DECLARE_MEMBERS(ZyrImpSampleShape)

public:
    ~ZyrImpSampleShape() override { delete m_profile; }

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        return Zyr::bdfInLevel(
            filer, this, desc(), [&] { return ZyrImpGeo::bdfInFields(filer); },
            [&] { return bdfInVersion(filer); },
            [&] {
                if (HsDbFilerSupport::bdfReadSoftPointerVector(filer, m_members, true) !=
                    Hsys::eSuccess)
                    return filer->filerStatus();
                return Zyr::readObject(filer, this, m_profile,
                                       static_cast<unsigned short>(filedVersion()));
            });
    }
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        return Zyr::bdfOutLevel(
            filer, [&] { return ZyrImpGeo::bdfOutFields(filer); },
            [&] { return bdfOutVersion(filer); },
            [&] {
                HsDbFilerSupport::bdfWriteSoftPointerVector(filer, m_members);
                return Zyr::writeObject(filer, m_profile, 80);
            });
    }

    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override {
        ZyrImpGeo::getReferencedObjects(map);
        for (const HsDbObjectId& member : m_members)
            map.addReferenceInfo(
                new ZyrObjReferenceInfo(member, ZyrObjReferenceInfo::kMemberRelation, 1, 1));
        return Hsys::eSuccess;
    }

    const std::vector<HsDbObjectId>& members() const { return m_members; }
    Hsys::ErrorStatus addMember(const HsDbObjectId& id) {
        assertParentWriteEnabled();
        m_members.push_back(id);
        recordParentReferencesModified();
        return Hsys::eSuccess;
    }
    Hsys::ErrorStatus removeMember(const HsDbObjectId& id) {
        assertParentWriteEnabled();
        std::erase(m_members, id);
        recordParentReferencesModified();
        return Hsys::eSuccess;
    }

    const ZyrGeProfile* profile() const { return m_profile; }
    void setProfile(ZyrGeProfile* profile) {
        assertParentWriteEnabled();
        delete m_profile;
        m_profile = profile;
        m_profile->setParent(this);
    }

private:
    std::vector<HsDbObjectId> m_members;
    ZyrGeProfile* m_profile = nullptr;
};

HSRX_DEFINE_MEMBERS(ZyrImpSampleShape, ZyrImpGeo, 0, hsrxInstantiateClass<ZyrImpSampleShape>)

class ZyrDbSampleShape : public ZyrDbGeo {
    HSRX_DECLARE_MEMBERS(ZyrDbSampleShape)

public:
    ZyrDbSampleShape() : ZyrDbGeo(true) { setImp(new ZyrImpSampleShape); }

    ZyrImpSampleShape* shapeImp() { return ZyrImpSampleShape::cast(imp()); }
};

HSRX_DEFINE_MEMBERS(ZyrDbSampleShape, ZyrDbGeo, 0, hsrxInstantiateClass<ZyrDbSampleShape>)

class ZyrSampleOverride : public ZyrOverride {
    HSRX_DECLARE_MEMBERS(ZyrSampleOverride)

public:
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override {
        if (const Hsys::ErrorStatus status = ZyrOverride::copyFrom(other); status != Hsys::eSuccess)
            return status;
        const ZyrSampleOverride* source = ZyrSampleOverride::cast(other);
        if (source == nullptr)
            return Hsys::eBadArgument;
        m_records = source->m_records;
        return Hsys::eSuccess;
    }

    Hsys::ErrorStatus bdfInFields(HsDbBdfFiler* filer) override {
        return Zyr::bdfInLevel(
            filer, this, desc(), [&] { return ZyrOverride::bdfInFields(filer); },
            [&] { return bdfInVersion(filer); },
            [&] {
                HsDbFilerSupport::bdfReadHardPointerVector(filer, m_records, true);
                return Hsys::eSuccess;
            });
    }
    Hsys::ErrorStatus bdfOutFields(HsDbBdfFiler* filer) const override {
        return Zyr::bdfOutLevel(
            filer, [&] { return ZyrOverride::bdfOutFields(filer); },
            [&] { return bdfOutVersion(filer); },
            [&] { return HsDbFilerSupport::bdfWriteHardPointerVector(filer, m_records); });
    }

    Hsys::ErrorStatus getReferencedObjects(ZyrObjReferenceMap& map) const override {
        Hsys::ErrorStatus status = ZyrOverride::getReferencedObjects(map);
        for (const HsDbObjectId& id : m_records)
            status = map.addRecordReference(id);
        return status;
    }

    // As an attached list of modifiers audits itself: bad records are counted, and taken out
    // when the audit may fix.
    Hsys::ErrorStatus audit(HsDbAuditInfo* info) override {
        const Hsys::ErrorStatus kept = ZyrOverride::audit(info);
        const HsDbObject* parent = dbParent();
        if (parent == nullptr)
            return Hsys::eAuditNoParent;
        if (info->fixErrors())
            assertParentWriteEnabled();
        const int bad = ZyrAuditUtilities::verifySymbolReferences(
            parent, m_records, ZyrDbSampleRecord::desc(), 0, 0, info->fixErrors());
        if (bad == 0)
            return kept;
        info->errorsFound(bad);
        if (!info->fixErrors())
            return Hsys::eAuditErrorsNotFixed;
        info->errorsFixed(bad);
        recordParentReferencesModified();
        return Hsys::eAuditFixedErrors;
    }

    const std::vector<HsDbObjectId>& records() const { return m_records; }
    void add(const HsDbObjectId& id) {
        assertParentWriteEnabled();
        m_records.push_back(id);
        recordParentReferencesModified();
    }

private:
    std::vector<HsDbObjectId> m_records;
};

HSRX_DEFINE_MEMBERS(ZyrSampleOverride, ZyrOverride, 0, hsrxInstantiateClass<ZyrSampleOverride>)

// Stores object in db and closes it, as a command does once it has built an object.
inline HsDbObjectId addClosed(HsDbDatabase& db, HsDbObject* object) {
    HsDbObjectId id;
    EXPECT_EQ(db.addHsDbObject(id, object), Hsys::eSuccess);
    object->close();
    return id;
}

// A shape holding members and, when there are records, one override that lists them.
inline ZyrDbSampleShape* newSampleShape(const std::vector<HsDbObjectId>& members,
                                        const std::vector<HsDbObjectId>& records) {
    auto* shape = new ZyrDbSampleShape;
    for (const HsDbObjectId& member : members)
        EXPECT_EQ(shape->shapeImp()->addMember(member), Hsys::eSuccess);
    if (records.empty())
        return shape;
    auto* override = new ZyrSampleOverride;
    for (const HsDbObjectId& record : records)
        override->add(record);
    EXPECT_EQ(shape->appendOverride(override), Hsys::eSuccess);
    return shape;
}

// A drawing file named after the running test, so that test executables run side by side; it
// goes when the test ends.
class ZyrScratchDrawing {
public:
    ZyrScratchDrawing()
        : m_path(std::filesystem::temp_directory_path() /
                 ("zyr-" + std::to_string(::getpid()) + "-" +
                  ::testing::UnitTest::GetInstance()->current_test_info()->name() + ".zyrd")) {}
    ~ZyrScratchDrawing() {
        std::error_code ignored;
        std::filesystem::remove(m_path, ignored);
    }
    ZyrScratchDrawing(const ZyrScratchDrawing&) = delete;
    ZyrScratchDrawing& operator=(const ZyrScratchDrawing&) = delete;

    std::wstring savedFrom(HsDbDatabase& database) const {
        const std::wstring file = hsutFromUtf8(m_path.string());
        EXPECT_EQ(database.saveAs(file.c_str()), Hsys::eSuccess);
        return file;
    }

private:
    std::filesystem::path m_path;
};
