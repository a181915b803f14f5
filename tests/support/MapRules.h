// SPDX-License-Identifier: Apache-2.0
// The rules that every map family keeps, in its public and in its internal form alike.
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "support/Elements.h"
#include "support/FailAlloc.h"
#include "support/Text.h"

namespace zelvo_test {

// One form of the calls of a map family under common names. The node-level calls are internal.
#define ZELVO_MAP_CALLS(PREFIX, MEMBER)                                                            \
    using Container = MEMBER;                                                                      \
    using Node = MEMBER##Node;                                                                     \
    static constexpr auto alloc = PREFIX##Alloc##MEMBER;                                           \
    static constexpr auto copy = PREFIX##Copy##MEMBER;                                             \
    static constexpr auto free = PREFIX##Free##MEMBER;                                             \
    static constexpr auto put = PREFIX##MEMBER##Put;                                               \
    static constexpr auto get = PREFIX##MEMBER##Get;                                               \
    static constexpr auto rem = PREFIX##MEMBER##Rem;                                               \
    static constexpr auto hasKey = PREFIX##MEMBER##HasKey;                                         \
    static constexpr auto iterator = PREFIX##MEMBER##Iterator;                                     \
    static constexpr auto hasNext = PREFIX##MEMBER##IterHasNext;                                   \
    static constexpr auto getKey = PREFIX##MEMBER##IterGetKey;                                     \
    static constexpr auto getVal = PREFIX##MEMBER##IterGetVal;                                     \
    static constexpr auto next = PREFIX##MEMBER##IterNext;                                         \
    [[maybe_unused]] static constexpr auto getNode = zlvIntl##MEMBER##GetNode;                     \
    [[maybe_unused]] static constexpr auto remNode = zlvIntl##MEMBER##RemNode;

template <class F>
class MapFixture : public testing::Test {
protected:
    using Node = typename F::Node;
    using Container = typename F::Container;

    ~MapFixture() override { F::free(map); }

    auto *give(char letter) { return family.give(letter); }
    void put(const char *key, char letter) { EXPECT_EQ(F::put(map, key, give(letter)), 1); }
    /// The entries k=a, l=b, m=c.
    void putThree()
    {
        put("k", 'a');
        put("l", 'b');
        put("m", 'c');
    }

    /// The letter of a value that the test got, of which it lets go; '-' for none.
    template <class Value>
    char took(Value *value)
    {
        if (value == nullptr)
            return '-';
        char letter = family.letter(value);
        family.letGo(value);
        return letter;
    }

    /// The entries of OTHER in order, as key, '=', letter and ' '; checks every link on the way.
    std::string contents(const Container *other)
    {
        std::string entries;
        const Node *previous = nullptr;
        for (const Node *node = other->first; node != nullptr; node = node->next) {
            EXPECT_EQ(node->prev, previous);
            EXPECT_EQ(node->map, other);
            entries += peeked(node->key).value_or("(null)") + '=' + letterOf(node) + ' ';
            previous = node;
        }
        EXPECT_EQ(other->last, previous);
        return entries;
    }
    std::string contents() { return contents(map); }

    typename F::Scope scope;
    F family;
    Container *map = F::alloc();

private:
    char letterOf(const Node *node)
    {
        return node->value == nullptr ? '-' : family.letter(node->value);
    }
};

template <class F>
class MapRules : public MapFixture<F> {
};
TYPED_TEST_SUITE_P(MapRules);

TYPED_TEST_P(MapRules, ANewMapIsEmpty)
{
    EXPECT_EQ(this->map->first, nullptr);
    EXPECT_EQ(this->map->last, nullptr);
}

TYPED_TEST_P(MapRules, AllocWithoutMemoryIsNull)
{
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::alloc(), nullptr);
}

TYPED_TEST_P(MapRules, PutAppendsNewKeysAtTheEnd)
{
    this->put("z", 'a');
    this->put("y", 'b');
    this->put("x", 'a');
    EXPECT_EQ(this->contents(), "z=a y=b x=a ");
}

TYPED_TEST_P(MapRules, PutOfAPresentKeyReplacesTheValueInItsPlace)
{
    this->put("a", 'a');
    this->put("b", 'b');
    this->put("a", 'c');
    EXPECT_EQ(this->contents(), "a=c b=b ");
}

TYPED_TEST_P(MapRules, PutKeepsACopyOfTheKey)
{
    char key[] = "key";
    this->put(key, 'a');
    key[0] = 'K';
    EXPECT_EQ(this->contents(), "key=a ");
}

TYPED_TEST_P(MapRules, PutRefusesANullMapOrKey)
{
    EXPECT_EQ(TypeParam::put(nullptr, "k", this->give('a')), 0);
    EXPECT_EQ(TypeParam::put(this->map, nullptr, this->give('a')), 0);
    EXPECT_EQ(this->contents(), "");
}

TYPED_TEST_P(MapRules, ANullValueIsAnEntry)
{
    EXPECT_EQ(TypeParam::put(this->map, "k", nullptr), 1);
    EXPECT_EQ(TypeParam::get(this->map, "k"), nullptr);
    EXPECT_EQ(TypeParam::hasKey(this->map, "k"), 1);
}

TYPED_TEST_P(MapRules, ANullValueCanReplaceAndBeReplaced)
{
    this->put("k", 'a');
    EXPECT_EQ(TypeParam::put(this->map, "k", nullptr), 1);
    EXPECT_EQ(this->contents(), "k=- ");
    this->put("k", 'b');
    EXPECT_EQ(this->contents(), "k=b ");
}

TYPED_TEST_P(MapRules, PutWithoutMemoryForTheNodeChangesNothing)
{
    this->put("k", 'a');
    FailAlloc fail(0);
    EXPECT_EQ(TypeParam::put(this->map, "l", this->give('b')), 0);
    EXPECT_EQ(this->contents(), "k=a ");
}

TYPED_TEST_P(MapRules, AKeyThatCannotBeCopiedIsLinkedAsNullAndNeverFound)
{
    FailAlloc fail(1, FailAlloc::Once);
    this->put("k", 'a');
    EXPECT_EQ(this->contents(), "(null)=a ");
    EXPECT_EQ(TypeParam::hasKey(this->map, "k"), 0);
}

TYPED_TEST_P(MapRules, KeysThatDifferInCaseAreDifferent)
{
    this->put("Name", 'a');
    this->put("name", 'b');
    EXPECT_EQ(this->contents(), "Name=a name=b ");
    EXPECT_EQ(this->took(TypeParam::get(this->map, "Name")), 'a');
    EXPECT_EQ(this->took(TypeParam::get(this->map, "name")), 'b');
}

TYPED_TEST_P(MapRules, TheEmptyTextIsAKey)
{
    this->put("", 'a');
    EXPECT_EQ(TypeParam::hasKey(this->map, ""), 1);
}

TYPED_TEST_P(MapRules, GetHandsOutTheValueEachTime)
{
    this->put("k", 'b');
    EXPECT_EQ(this->took(TypeParam::get(this->map, "k")), 'b');
    EXPECT_EQ(this->took(TypeParam::get(this->map, "k")), 'b');
    EXPECT_EQ(this->contents(), "k=b ");
}

TYPED_TEST_P(MapRules, GetOfAnAbsentKeyIsNull)
{
    this->put("k", 'a');
    EXPECT_EQ(TypeParam::get(this->map, "kk"), nullptr);
}

TYPED_TEST_P(MapRules, GetOfANullMapOrKeyIsNull)
{
    this->put("k", 'a');
    EXPECT_EQ(TypeParam::get(nullptr, "k"), nullptr);
    EXPECT_EQ(TypeParam::get(this->map, nullptr), nullptr);
}

TYPED_TEST_P(MapRules, HasKeyFindsExactlyThePresentKeys)
{
    this->put("k", 'a');
    EXPECT_EQ(TypeParam::hasKey(this->map, "k"), 1);
    EXPECT_EQ(TypeParam::hasKey(this->map, "l"), 0);
}

TYPED_TEST_P(MapRules, HasKeyOfANullMapOrKeyIsFalse)
{
    this->put("k", 'a');
    EXPECT_EQ(TypeParam::hasKey(nullptr, "k"), 0);
    EXPECT_EQ(TypeParam::hasKey(this->map, nullptr), 0);
}

TYPED_TEST_P(MapRules, RemOfTheOnlyEntryLeavesAnEmptyMap)
{
    this->put("k", 'a');
    TypeParam::rem(this->map, "k");
    EXPECT_EQ(this->map->first, nullptr);
    EXPECT_EQ(this->map->last, nullptr);
}

TYPED_TEST_P(MapRules, RemOfTheFirstOfThreeLeavesTheOthers)
{
    this->putThree();
    TypeParam::rem(this->map, "k");
    EXPECT_EQ(this->contents(), "l=b m=c ");
}

TYPED_TEST_P(MapRules, RemOfTheMiddleOfThreeJoinsItsNeighbours)
{
    this->putThree();
    TypeParam::rem(this->map, "l");
    EXPECT_EQ(this->contents(), "k=a m=c ");
}

TYPED_TEST_P(MapRules, RemOfTheLastOfThreeLeavesTheOthers)
{
    this->putThree();
    TypeParam::rem(this->map, "m");
    EXPECT_EQ(this->contents(), "k=a l=b ");
}

TYPED_TEST_P(MapRules, RemOfAnAbsentKeyDoesNothing)
{
    this->put("k", 'a');
    TypeParam::rem(this->map, "l");
    EXPECT_EQ(this->contents(), "k=a ");
}

TYPED_TEST_P(MapRules, RemOfANullMapOrKeyDoesNothing)
{
    this->put("k", 'a');
    TypeParam::rem(nullptr, "k");
    TypeParam::rem(this->map, nullptr);
    EXPECT_EQ(this->contents(), "k=a ");
}

TYPED_TEST_P(MapRules, ARemovedKeyComesBackAtTheEnd)
{
    this->putThree();
    TypeParam::rem(this->map, "k");
    this->put("k", 'a');
    EXPECT_EQ(this->contents(), "l=b m=c k=a ");
}

REGISTER_TYPED_TEST_SUITE_P(
    MapRules, ANewMapIsEmpty, AllocWithoutMemoryIsNull, PutAppendsNewKeysAtTheEnd,
    PutOfAPresentKeyReplacesTheValueInItsPlace, PutKeepsACopyOfTheKey, PutRefusesANullMapOrKey,
    ANullValueIsAnEntry, ANullValueCanReplaceAndBeReplaced,
    PutWithoutMemoryForTheNodeChangesNothing, AKeyThatCannotBeCopiedIsLinkedAsNullAndNeverFound,
    KeysThatDifferInCaseAreDifferent, TheEmptyTextIsAKey, GetHandsOutTheValueEachTime,
    GetOfAnAbsentKeyIsNull, GetOfANullMapOrKeyIsNull, HasKeyFindsExactlyThePresentKeys,
    HasKeyOfANullMapOrKeyIsFalse, RemOfTheOnlyEntryLeavesAnEmptyMap,
    RemOfTheFirstOfThreeLeavesTheOthers, RemOfTheMiddleOfThreeJoinsItsNeighbours,
    RemOfTheLastOfThreeLeavesTheOthers, RemOfAnAbsentKeyDoesNothing, RemOfANullMapOrKeyDoesNothing,
    ARemovedKeyComesBackAtTheEnd);

} // namespace zelvo_test
