// Class ids: stable ids derived from class-id words, and the fixed numbers of nested classes.
#include "platform/base/obj/ZyrClassId.h"
#include "platform/base/obj/ZyrClassIdManager.h"
#include "platform/host/rx/HsRxClass.h"

#include <gtest/gtest.h>

namespace {

TEST(ZyrClassId, idsAreStableDistinctByKindAndRefuseEmptyText) {
    const ZyrRmCString text = Zyr::constructClassID(L"ZyrArea");
    EXPECT_EQ(text, L"Zyr.ZyrArea.ClassId");
    _GUID entity, object, other, untouched;
    ASSERT_EQ(Zyr::getEntityClassIdFromString(text, &entity), Hsys::eSuccess);
    ASSERT_EQ(Zyr::getObjectClassIdFromString(text, &object), Hsys::eSuccess);
    ASSERT_EQ(Zyr::getEntityClassIdFromString(Zyr::constructClassID(L"ZyrAreaGroup"), &other),
              Hsys::eSuccess);
    EXPECT_NE(entity, object);
    EXPECT_NE(entity, other);
    // The id is part of the file format: it must not change between builds. A name-derived id
    // carries version 8 and the standard variant bits.
    EXPECT_EQ(hsGuidToString(entity), L"{83134DB6-7166-8D10-81F3-95B801E50811}");
    EXPECT_EQ(Zyr::getObjectClassIdFromString(L"", &untouched), Hsys::eInvalidInput);
    EXPECT_EQ(Zyr::getObjectClassIdFromString(nullptr, &untouched), Hsys::eInvalidInput);
    EXPECT_TRUE(untouched.isNull());
}

TEST(ZyrClassId, displayNameFallsBackToTheRegisteredName) {
    ZyrRmCString name(L"stale");
    Zyr::classTypeToDisplayName(HsRxObject::desc(), name);
    EXPECT_EQ(name, L"HsRxObject");
    Zyr::classTypeToDisplayName(nullptr, name);
    EXPECT_TRUE(name.IsEmpty());
    EXPECT_EQ(Zyr::classNameToClass(L"HsRxObject"), HsRxObject::desc());
    EXPECT_EQ(Zyr::classNameToClass(L"NoSuchClass"), nullptr);
}

TEST(ZyrClassIdManager, tiesEachClassToOneNumberAndBack) {
    HsRxClass* a = newHsRxClass(L"IdTestA", L"HsRxObject", 80);
    HsRxClass* b = newHsRxClass(L"IdTestB", L"HsRxObject", 80);
    ASSERT_TRUE(ZyrClassIdManager::append(a, 5500));
    EXPECT_FALSE(ZyrClassIdManager::append(b, 5500)) << "a number is taken once";
    EXPECT_FALSE(ZyrClassIdManager::append(a, 5501)) << "a class has one number";
    EXPECT_FALSE(ZyrClassIdManager::append(nullptr, 5502));
    ASSERT_TRUE(ZyrClassIdManager::append(b, 5501));
    unsigned short id = 0;
    EXPECT_TRUE(ZyrClassIdManager::classId(b, id));
    EXPECT_EQ(id, 5501);
    EXPECT_EQ(ZyrClassIdManager::classFor(5500), a);
    EXPECT_TRUE(ZyrClassIdManager::remove(a));
    EXPECT_FALSE(ZyrClassIdManager::remove(a));
    EXPECT_EQ(ZyrClassIdManager::classFor(5500), nullptr);
    EXPECT_FALSE(ZyrClassIdManager::classId(a, id));
    EXPECT_TRUE(ZyrClassIdManager::append(a, 5500)) << "a freed number is free again";
    for (HsRxClass* cls : {a, b}) {
        ZyrClassIdManager::remove(cls);
        deleteHsRxClass(cls);
    }
}

} // namespace
