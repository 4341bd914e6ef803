// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/collection.h"

#include "fakes/fake_object.h"
#include "support/errors.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// Three items, each of which says its place.
class Places final : public Collection {
public:
    using Collection::Collection;

private:
    int count() const override { return 3; }

    AutomationObject& itemAt(int place) override
    {
        item_ = {};
        item_.number(u"Place", place);
        return item_;
    }

    FakeObject item_;
};

double placeOf(Collection& places, double index)
{
    const Value indexes[] = { Value::ofNumber(index) };
    AutomationObject& item = places.get(memberOf(places, u"Item"), indexes).toObject();
    return getMember(item, u"Place").toNumber();
}

} // namespace

TEST(Collection, CountsItsItemsFromTheirFirstIndex)
{
    Places fromOne(1);
    EXPECT_EQ(getMember(fromOne, u"Count").toNumber(), 3);
    EXPECT_EQ(placeOf(fromOne, 1), 0);
    EXPECT_EQ(placeOf(fromOne, 3), 2);
    Places fromZero(0);
    EXPECT_EQ(placeOf(fromZero, 0), 0);
    EXPECT_EQ(placeOf(fromZero, 2), 2);
}

TEST(Collection, RefusesIndexesOutsideItAndEveryWrite)
{
    Places places(1);
    for (const double index : { 0.0, 4.0 })
        EXPECT_EQ(errorOf([&] { placeOf(places, index); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { getMember(places, u"Item"); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { places.put(memberOf(places, u"Count"), {}, Value::ofNumber(1)); }),
        ErrorNumber::NoSuchMember);
    EXPECT_EQ(places.findMember(u"count"), std::nullopt);
}

} // namespace pelloric
