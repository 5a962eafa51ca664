#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "registry/registry_store.hpp"

namespace quabble {

// What every registry store has to do. A Place is where one kind of store keeps a registry, an empty one at
// first:
//
//   std::unique_ptr<RegistryStore> open();   as a run of the program does that begins
//   std::string content();                   all that is kept, however it is kept
//   static std::vector<std::pair<const char*, std::function<void(Place&)>>> damages();
//                                            what may have been put in the place of a sound registry
template <typename Place>
class RegistryStoreSuite : public testing::Test {
 protected:
    static constexpr std::string_view key = "Software\\Quabble\\1.0";

    static std::span<const std::byte> bytes(std::string_view text) { return std::as_bytes(std::span(text)); }

    bool keep(std::string_view name, std::string_view value, ValueType type = ValueType::Binary) {
        const auto transaction = store->begin(Access::Write);
        return transaction && transaction->createKey(key, "CLASS") &&
               transaction->set(key, name, type, bytes(value)) && transaction->commit();
    }
    // "none" when there is no such value, or no registry.
    std::string kept(std::string_view name, std::string_view ofKey = key) {
        const auto transaction = store->begin(Access::Read);
        const auto value = transaction ? transaction->query(ofKey, name) : std::nullopt;
        if (!value)
            return "none";
        return std::to_string(static_cast<int>(value->type)) + ":" +
               std::string(reinterpret_cast<const char*>(value->data.data()), value->data.size());
    }
    void startAgain() { store = place->open(); }

    std::unique_ptr<Place> place = std::make_unique<Place>();
    std::unique_ptr<RegistryStore> store = place->open();
};
TYPED_TEST_SUITE_P(RegistryStoreSuite);

TYPED_TEST_P(RegistryStoreSuite, KeepsValuesUnderNamesWithoutRegardToCase) {
    EXPECT_EQ(this->kept("name"), "none") << "there is none yet";
    EXPECT_TRUE(this->keep("name", "first"));
    EXPECT_TRUE(this->keep("NAME", "second", ValueType::String));
    EXPECT_TRUE(this->keep("other", std::string("a\0b", 3)));
    EXPECT_TRUE(this->keep("empty", ""));
    EXPECT_TRUE(this->keep("large", std::string(100'000, 'x')));
    this->startAgain();
    EXPECT_EQ(this->kept("Name"), "1:second");
    EXPECT_EQ(this->kept("name", "SOFTWARE\\quabble\\1.0"), "1:second");
    EXPECT_EQ(this->kept("other"), "3:" + std::string("a\0b", 3));
    EXPECT_EQ(this->kept("empty"), "3:");
    EXPECT_EQ(this->kept("large"), "3:" + std::string(100'000, 'x'));
    EXPECT_EQ(this->kept("name", "Software\\Quabble"), "none") << "in the key above";
    EXPECT_TRUE(this->keep("\xC9", "capital"));
    EXPECT_EQ(this->kept("\xE9"), "none") << "only ASCII letters are alike";
    const auto transaction = this->store->begin(Access::Write);
    EXPECT_TRUE(transaction->set("Software\\Quabble", "above", ValueType::Binary, this->bytes("x")));
    EXPECT_TRUE(transaction->commit());
    EXPECT_EQ(this->kept("above", "software\\QUABBLE"), "3:x") << "in a key that came with the one below";
}

TYPED_TEST_P(RegistryStoreSuite, KeepsAllThatIsCommittedAndNothingElse) {
    this->keep("name", "old");
    {
        const auto transaction = this->store->begin(Access::Write);
        transaction->createKey(this->key, "");
        transaction->set(this->key, "name", ValueType::Binary, this->bytes("new"));
        transaction->set(this->key, "another", ValueType::Binary, this->bytes("new"));
        EXPECT_EQ(this->kept("name"), "3:old") << "others do not see it yet";
    }
    EXPECT_EQ(this->kept("name"), "3:old");
    {
        const auto transaction = this->store->begin(Access::Write);
        transaction->set(this->key, "name", ValueType::Binary, this->bytes("new"));
        EXPECT_FALSE(transaction->set("No\\Such\\Key", "name", ValueType::Binary, this->bytes("new")));
        EXPECT_FALSE(transaction->set(this->key, "another", ValueType::Binary, this->bytes("new")));
        EXPECT_FALSE(transaction->commit()) << "half of what was meant would be worse";
    }
    EXPECT_EQ(this->kept("name"), "3:old");
    const auto transaction = this->store->begin(Access::Write);
    transaction->set(this->key, "name", ValueType::Binary, this->bytes("new"));
    EXPECT_TRUE(transaction->commit());
    EXPECT_FALSE(transaction->set(this->key, "name", ValueType::Binary, this->bytes("newer")));
    EXPECT_FALSE(transaction->commit()) << "it has ended";
    this->startAgain();
    EXPECT_EQ(this->kept("name"), "3:new");
}

TYPED_TEST_P(RegistryStoreSuite, ChangesNothingWhenItReads) {
    const std::string fresh = this->place->content();
    EXPECT_EQ(this->kept("name"), "none");
    EXPECT_EQ(this->place->content(), fresh);
    this->keep("name", "old");
    const auto transaction = this->store->begin(Access::Read);
    EXPECT_FALSE(transaction->createKey("Another", ""));
    EXPECT_FALSE(transaction->set(this->key, "name", ValueType::Binary, this->bytes("new")));
    EXPECT_FALSE(transaction->commit());
    EXPECT_EQ(this->kept("name"), "3:old");
}

TYPED_TEST_P(RegistryStoreSuite, IsReadWhileAnotherWritesAndWrittenByOneAtATime) {
    this->keep("name", "old");
    const auto reader = this->store->begin(Access::Read);
    EXPECT_TRUE(reader->query(this->key, "name"));
    const auto other = this->place->open();
    int committed = 0;
    {
        const auto first = other->begin(Access::Write);
        const auto second = this->store->begin(Access::Write);
        for (const auto& [writer, value] : {std::pair{first.get(), "first"}, {second.get(), "second"}}) {
            committed += writer != nullptr &&
                         writer->set(this->key, "name", ValueType::Binary, this->bytes(value)) &&
                         writer->commit();
        }
    }
    EXPECT_EQ(committed, 1);
    EXPECT_EQ(this->kept("name"), "3:first");
    EXPECT_TRUE(std::ranges::equal(reader->query(this->key, "name")->data, this->bytes("old")))
        << "it sees what was there when it began";
}

TYPED_TEST_P(RegistryStoreSuite, NeverTouchesWhatIsNoRegistryOfThisVersion) {
    for (const auto& [name, damage] : TypeParam::damages()) {
        this->place = std::make_unique<TypeParam>();
        this->startAgain();
        ASSERT_TRUE(this->keep("name", std::string(5000, 'x')));
        damage(*this->place);
        const std::string before = this->place->content();
        EXPECT_FALSE(this->store->begin(Access::Read)) << name;
        EXPECT_FALSE(this->store->begin(Access::Write)) << name;
        EXPECT_EQ(this->place->content(), before) << name;
    }
}

REGISTER_TYPED_TEST_SUITE_P(RegistryStoreSuite, KeepsValuesUnderNamesWithoutRegardToCase,
                            KeepsAllThatIsCommittedAndNothingElse, ChangesNothingWhenItReads,
                            IsReadWhileAnotherWritesAndWrittenByOneAtATime,
                            NeverTouchesWhatIsNoRegistryOfThisVersion);

}  // namespace quabble
