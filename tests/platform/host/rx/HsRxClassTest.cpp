// Run-time classes: derivation, creation, registration and its failures, the class dictionary.
#include "platform/host/rx/HsRxClass.h"
#include "platform/host/rx/HsRxDictionary.h"
#include "platform/host/rx/HsRxSysRegistry.h"

#include <gtest/gtest.h>

namespace {

class Animal : public HsRxObject {
    HSRX_DECLARE_MEMBERS(Animal)
};
class Dog : public Animal {
    HSRX_DECLARE_MEMBERS(Dog)

public:
    int barks = 0;
    Hsys::ErrorStatus copyFrom(const HsRxObject* other) override {
        const Dog* dog = Dog::cast(other);
        if (dog == nullptr)
            return Hsys::eBadArgument;
        barks = dog->barks;
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

TEST(HsRxClass, derivationFollowsParentsAcrossThreeLevels) {
    struct Case {
        HsRxClass* cls;
        HsRxClass* other;
        bool derived;
    };
    const Case cases[] = {
        {Puppy::desc(), Puppy::desc(), true},      {Puppy::desc(), Dog::desc(), true},
        {Puppy::desc(), Animal::desc(), true},     {Puppy::desc(), HsRxObject::desc(), true},
        {Dog::desc(), Puppy::desc(), false},       {Cat::desc(), Dog::desc(), false},
        {Animal::desc(), Cat::desc(), false},      {Puppy::desc(), nullptr, false},
    };
    for (const Case& c : cases)
        EXPECT_EQ(c.cls->isDerivedFrom(c.other), c.derived)
            << "class " << c.cls << " against " << (c.other ? c.other : nullptr);

    EXPECT_EQ(Puppy::desc()->myParent(), Dog::desc());
    EXPECT_EQ(Dog::desc()->myParent(), Animal::desc());
    EXPECT_EQ(HsRxObject::desc()->myParent(), nullptr);
    EXPECT_STREQ(Puppy::desc()->name(), L"Puppy");
}

TEST(HsRxClass, comparedToIsEqualOnlyForTheVeryClass) {
    EXPECT_EQ(Dog::desc()->comparedTo(Dog::desc()), HsRx::eEqual);
    EXPECT_EQ(Puppy::desc()->comparedTo(Dog::desc()), HsRx::eGreaterThan) << "a derived class differs";
    EXPECT_EQ(Dog::desc()->comparedTo(Puppy::desc()), HsRx::eLessThan);
    Dog dog;
    EXPECT_EQ(Dog::desc()->comparedTo(&dog), HsRx::eNotOrderable);
    EXPECT_EQ(Dog::desc()->comparedTo(nullptr), HsRx::eNotOrderable);
}

TEST(HsRxClass, castAnswersNullForNullAndForUnrelatedClasses) {
    Puppy puppy;
    Cat cat;
    EXPECT_EQ(Dog::cast(&puppy), &puppy);
    EXPECT_EQ(Animal::cast(&cat), &cat);
    EXPECT_EQ(Dog::cast(&cat), nullptr);
    EXPECT_EQ(Puppy::cast(static_cast<Dog*>(&puppy)), &puppy);
    EXPECT_EQ(Dog::cast(nullptr), nullptr);
    EXPECT_EQ(puppy.isA(), Puppy::desc());
    EXPECT_TRUE(puppy.isKindOf(Animal::desc()));
    EXPECT_EQ(puppy.queryX(Dog::desc()), &puppy);
    EXPECT_EQ(cat.queryX(Dog::desc()), nullptr);
}

TEST(HsRxClass, createGoesThroughThePseudoConstructorOrGivesNull) {
    EXPECT_EQ(Animal::desc()->create(), nullptr) << "a class without a pseudo constructor";

    HsRxObject* made = Puppy::desc()->create();
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(made->isA(), Puppy::desc());
    delete made;
}

TEST(HsRxClass, cloneCopiesThroughCopyFromAndRefusesWithoutIt) {
    Dog dog;
    dog.barks = 7;
    HsRxObject* copy = dog.clone();
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(Dog::cast(copy)->barks, 7);
    delete copy;

    Cat cat;
    EXPECT_EQ(cat.clone(), nullptr) << "HsRxObject::copyFrom refuses, so the clone is dropped";
    EXPECT_EQ(cat.copyFrom(&dog), Hsys::eNotImplemented);
}

void appData(const HsRxClass*, wchar_t*&, int) {}

TEST(HsRxClass, longFormKeepsVersionsRecordNameAndCallbackShortFormLeavesThemEmpty) {
    HsRxClass* filed = newHsRxClass(L"RxTestFiled", L"HsRxObject", 23, 3, 893,
                                    hsrxInstantiateClass<Cat>, L"RX_TEST_FILED", L"App|Desc", appData);
    ASSERT_NE(filed, nullptr);
    EXPECT_EQ(filed->drawingVersion(), 23);
    EXPECT_EQ(filed->maintenanceVersion(), 3);
    EXPECT_EQ(filed->proxyFlags(), 893);
    EXPECT_STREQ(filed->recordName(), L"RX_TEST_FILED");
    EXPECT_STREQ(filed->appDescription(), L"App|Desc");
    EXPECT_EQ(filed->appDataCallback(), &appData);
    EXPECT_EQ(filed->myParent(), HsRxObject::desc());
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestFiled"), filed);

    HsRxClass* plain = newHsRxClass(L"RxTestPlain", L"RxTestFiled", 80);
    ASSERT_NE(plain, nullptr);
    EXPECT_EQ(plain->drawingVersion(), 0);
    EXPECT_STREQ(plain->recordName(), L"");
    EXPECT_EQ(plain->appDataCallback(), nullptr);
    EXPECT_TRUE(plain->isDerivedFrom(filed));

    deleteHsRxClass(plain);
    deleteHsRxClass(filed);
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestFiled"), nullptr);
}

TEST(HsRxClass, registrationRefusesTakenNamesAndUnknownParents) {
    HsRxClass* first = newHsRxClass(L"RxTestTwice", L"HsRxObject", 80);
    ASSERT_NE(first, nullptr);
    EXPECT_EQ(newHsRxClass(L"RxTestTwice", L"HsRxObject", 0), nullptr);
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestTwice"), first) << "the first registration stays";
    EXPECT_EQ(newHsRxClass(L"RxTestOrphan", L"NoSuchParent", 0), nullptr);
    EXPECT_EQ(hsrxFindHsRxClass(L"RxTestOrphan"), nullptr);
    EXPECT_EQ(newHsRxClass(L"RxTestRoot", nullptr, 0), nullptr);
    deleteHsRxClass(first);
}

TEST(HsRxClass, aNameRegisteredAgainUnderAnotherDescriptorIsDetectable) {
    HsRxClass* mine = newHsRxClass(L"RxTestMismatch", L"HsRxObject", 80);
    ASSERT_NE(mine, nullptr);
    // Another module takes the name over after ours was unloaded from the dictionary.
    HsRxDictionary* classes = HsRxDictionary::cast(hsrxSysRegistry()->at(kHsRxClassDictionary));
    classes->remove(L"RxTestMismatch");
    HsRxClass* theirs = newHsRxClass(L"RxTestMismatch", L"HsRxObject", 0);
    ASSERT_NE(theirs, nullptr);
    EXPECT_NE(hsrxFindHsRxClass(L"RxTestMismatch"), mine);
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
    EXPECT_EQ(dictionary.at(L"b"), &felix);
    EXPECT_EQ(dictionary.at(L"missing"), nullptr);
    EXPECT_EQ(dictionary.at(nullptr), nullptr);
    EXPECT_EQ(dictionary.atPut(nullptr, &tom), nullptr);

    std::vector<std::wstring> keys;
    for (const auto& [key, object] : dictionary)
        keys.push_back(key);
    EXPECT_EQ(keys, (std::vector<std::wstring>{L"a", L"b"}));

    EXPECT_EQ(dictionary.remove(L"a"), &rex);
    EXPECT_EQ(dictionary.remove(L"a"), nullptr);
    EXPECT_FALSE(dictionary.has(L"a"));
    EXPECT_EQ(dictionary.numEntries(), 1u);
}

} // namespace
