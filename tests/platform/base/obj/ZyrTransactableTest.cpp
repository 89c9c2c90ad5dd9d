// Transactions of an in-memory object: the copy in force, commit, abort and nesting.
#include "platform/base/obj/ZyrTransactable.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

class Settings : public ZyrTransactable {
public:
    int value = 0;
    ZyrTransactable* clone() const override {
        auto* copy = new Settings;
        copy->value = value;
        return copy;
    }
    void copyFrom(const ZyrTransactable* other) override {
        if (const auto* settings = dynamic_cast<const Settings*>(other))
            value = settings->value;
    }
    // Writers work on whatever copy is in force, as forwarders of a transactable object do.
    void set(int v) { static_cast<Settings*>(instance())->value = v; }
    int get() const { return static_cast<const Settings*>(instance())->value; }
};

TEST(ZyrTransactable, endKeepsAndAbortDropsWhatTheTransactionChanged) {
    Settings settings;
    settings.set(1);
    settings.startTransaction();
    settings.set(2);
    EXPECT_EQ(settings.value, 1) << "the object itself is untouched while the copy is in force";
    EXPECT_EQ(settings.get(), 2);
    settings.abortTransaction();
    EXPECT_EQ(settings.get(), 1);
    settings.startTransaction();
    settings.set(3);
    settings.endTransaction();
    EXPECT_EQ(settings.value, 3);
    EXPECT_EQ(settings.transactionDepth(), 0);
}

TEST(ZyrTransactable, nestedTransactionsCommitIntoTheirOuterOne) {
    auto settings = std::make_unique<Settings>();
    settings->set(1);
    settings->startTransaction();
    settings->set(2);
    settings->startTransaction();
    EXPECT_EQ(settings->get(), 2) << "the inner copy starts from the outer one";
    settings->set(3);
    settings->endTransaction();
    EXPECT_EQ(settings->get(), 3) << "the inner commit lands in the outer copy";
    EXPECT_EQ(settings->value, 1);
    settings->abortTransaction();
    EXPECT_EQ(settings->get(), 1) << "aborting the outer one drops the inner commit too";
    settings->endTransaction();
    settings->abortTransaction();
    EXPECT_EQ(settings->get(), 1) << "ending or aborting without a transaction changes nothing";

    settings->startTransaction();
    settings->startTransaction();
    EXPECT_EQ(settings->transactionDepth(), 2);
    settings.reset(); // the sanitizer build reports a leak if the copies survive
}

} // namespace
