// Run-time classes and services: derivation, creation, registration and its failures, the class
// and service dictionaries, dependency counting.
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxDynamicLinker.h"
#include "platform/host/rx/HsRxService.h"
#include "platform/host/rx/HsRxSysRegistry.h"

#include <gtest/gtest.h>

#include <memory>
#include <tuple>

namespace {

class Animal : public HsRxObject {
    HSRX_DECLARE_MEMBERS(Animal)
};
class Dog : public Animal {
    HSRX_DECLARE_MEMBERS(Dog)

public:
    int barks = 0;
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override {
        barks = Dog::cast(other)->barks;
        return Hsys::eSuccess;
    }
};
class Puppy : public Dog {
    HSRX_DECLARE_MEMBERS(Puppy)
};
class Cat : public Animal {
    HSRX_DECLARE_MEMBERS(Cat)
};

HSRX_DEFINE_MEMBERS(Animal, HsRxObject, 0, nullptr)
HSRX_DEFINE_MEMBERS(Dog, Animal, 80, hsrxInstantiateClass<Dog>)
HSRX_DEFINE_MEMBERS(Puppy, Dog, 80, hsrxInstantiateClass<Puppy>)
HSRX_DEFINE_MEMBERS(Cat, Animal, 80, hsrxInstantiateClass<Cat>)

TEST(HsRxClass, derivationCastAndOrderFollowParentsAcrossThreeLevels) {
    const std::tuple<HsRxClass*, HsRxClass*, bool, HsRx::Ordering> cases[] = {
        {Puppy::desc(), Puppy::desc(), true, HsRx::eEqual},
        {Puppy::desc(), Dog::desc(), true, HsRx::eGreaterThan},
        {Puppy::desc(), HsRxObject::desc(), true, HsRx::eGreaterThan},
        {Dog::desc(), Puppy::desc(), false, HsRx::eLessThan},
        {Cat::desc(), Dog::desc(), false, HsRx::eLessThan},
        {Puppy::desc(), nullptr, false, HsRx::eNotOrderable},
    };
    for (const auto& [cls, other, derived, order] : cases) {
        EXPECT_EQ(cls->isDerivedFrom(other), derived) << cls << " against " << other;
        EXPECT_EQ(cls->comparedTo(other), order) << cls << " against " << other;
    }
    EXPECT_EQ(HsRxObject::desc()->myParent(), nullptr);

    Puppy puppy;
    Cat cat;
    EXPECT_EQ(Dog::desc()->comparedTo(&puppy), HsRx::eNotOrderable) << "an object is no class";
    EXPECT_EQ(Dog::cast(&puppy), &puppy);
    EXPECT_EQ(Dog::cast(&cat), nullptr);
    EXPECT_EQ(Dog::cast(nullptr), nullptr);
    EXPECT_TRUE(puppy.isKindOf(Animal::desc()));
    EXPECT_EQ(puppy.queryX(Dog::desc()), &puppy);
    EXPECT_EQ(cat.queryX(Dog::desc()), nullptr);
}

TEST(HsRxClass, createAndCloneGoThroughThePseudoConstructorAndCopyFromOrGiveNull) {
    EXPECT_EQ(Animal::desc()->create(), nullptr) << "a class without a pseudo constructor";
    const std::unique_ptr<HsRxObject> made(Puppy::desc()->create());
    EXPECT_EQ(made->isA(), Puppy::desc());

    Dog dog;
    dog.barks = 7;
    const std::unique_ptr<HsRxObject> copy(dog.clone());
    EXPECT_EQ(Dog::cast(copy.get())->barks, 7);
    Cat cat;
    EXPECT_EQ(cat.clone(), nullptr) << "HsRxObject::copyFrom refuses, so the clone is dropped";
    EXPECT_EQ(cat.copyFrom(&dog), Hsys::eNotImplemented);
}

void appData(const HsRxClass*, wchar_t*&, int) {}

TEST(HsRxClass, registrationKeepsTheLongFormAndRefusesTakenNamesAndUnknownParents) {
    HsRxClass* filed =
        newHsRxClass(L"RxTestFiled", L"HsRxObject", 23, 3, 893, hsrxInstantiateClass<Cat>,
                     L"RX_TEST_FILED", L"App|Desc", appData);
    EXPECT_STREQ(filed->appDescription(), L"App|Desc");
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestFiled"), filed);
    HsRxClass* plain = newHsRxClass(L"RxTestPlain", L"RxTestFiled", 80);
    EXPECT_STREQ(plain->recordName(), L"");
    EXPECT_TRUE(plain->isDerivedFrom(filed));

    EXPECT_EQ(newHsRxClass(L"RxTestPlain", L"HsRxObject", 0), nullptr);
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestPlain"), plain) << "the first registration stays";
    EXPECT_EQ(newHsRxClass(L"RxTestOrphan", L"NoSuchParent", 0), nullptr);
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestOrphan"), nullptr);
    EXPECT_EQ(newHsRxClass(L"RxTestRoot", nullptr, 0), nullptr);
    deleteHsRxClass(plain);
    deleteHsRxClass(filed);
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestFiled"), nullptr);
}

TEST(HsRxClass, aNameRegisteredAgainUnderAnotherDescriptorIsDetectable) {
    HsRxClass* mine = newHsRxClass(L"RxTestMismatch", L"HsRxObject", 80);
    // Another module takes the name over after ours was unloaded from the dictionary.
    HsRxDictionary* classes = HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxClassDictionary));
    classes->remove(L"RxTestMismatch");
    HsRxClass* theirs = newHsRxClass(L"RxTestMismatch", L"HsRxObject", 0);
    deleteHsRxClass(mine); // no longer the registered one: only deleted
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestMismatch"), theirs);
    deleteHsRxClass(theirs);
}

TEST(HsRxClassDeathTest, abortPrintsItsTextAndEndsTheProcess) {
    EXPECT_DEATH(hsrx_abort(L"Class mismatch"), "hsrx_abort: Class mismatch");
    EXPECT_DEATH(hsrx_abort(L"%s %d", L"code", 46), "code 46");
}

TEST(HsRxDictionary, entriesArePutReplacedRemovedAndIteratedByKey) {
    HsRxDictionary dictionary;
    Cat tom;
    Cat felix;
    Dog rex;
    EXPECT_EQ(dictionary.atPut(L"b", &tom), nullptr);
    EXPECT_EQ(dictionary.atPut(L"a", &rex), nullptr);
    EXPECT_EQ(dictionary.atPut(L"b", &felix), &tom) << "the replaced entry is handed back";
    EXPECT_EQ(dictionary.at(nullptr), nullptr);
    EXPECT_EQ(dictionary.atPut(nullptr, &tom), nullptr);

    std::vector<std::wstring> keys;
    for (const auto& [key, object] : dictionary)
        keys.push_back(key);
    EXPECT_EQ(keys, (std::vector<std::wstring>{L"a", L"b"}));

    EXPECT_EQ(dictionary.remove(L"a"), &rex);
    EXPECT_EQ(dictionary.remove(L"a"), nullptr);
}

TEST(HsRxService, countsDependenciesDownToUnloadableButNotBelow) {
    HsRxService service;
    service.addDependency();
    service.addDependency();
    service.removeDependency();
    EXPECT_FALSE(service.unloadable()) << "one client is left";
    service.removeDependency();
    EXPECT_TRUE(service.unloadable());
    service.removeDependency();
    service.addDependency();
    EXPECT_FALSE(service.unloadable()) << "a stray release must not drive the count below zero";
}

TEST(HsRxDynamicLinker, registersServicesInTheRegistrysServiceDictionary) {
    HsRxDictionary* services = HsRxDictionary::cast(hsrxSysRegistry()->at(L"ServiceDictionary"));
    auto* linker = HsRxDynamicLinker::cast(hsrxSysRegistry()->at(kHsRxDynamicLinker));
    ASSERT_NE(services, nullptr);
    ASSERT_NE(linker, nullptr);

    HsRxService service;
    HsRxService intruder;
    ASSERT_EQ(linker->registerService(L"TestService", &service), Hsys::eSuccess);
    EXPECT_EQ(services->at(L"TestService"), &service);
    EXPECT_EQ(linker->registerService(L"TestService", &intruder), Hsys::eDuplicateName);
    EXPECT_EQ(linker->getService(L"TestService"), &service);
    EXPECT_EQ(linker->registerService(nullptr, &service), Hsys::eNullPointer);
    EXPECT_EQ(linker->registerService(L"Other", nullptr), Hsys::eNullPointer);
    EXPECT_EQ(linker->unregisterService(L"TestService"), &service);
    EXPECT_EQ(linker->unregisterService(L"TestService"), nullptr);

    HsRxDictionary notAService;
    services->atPut(L"Foreign", &notAService);
    EXPECT_EQ(linker->getService(L"Foreign"), nullptr) << "a foreign object is no service";
    services->remove(L"Foreign");
}

} // namespace
