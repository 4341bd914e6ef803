// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/member_names.h"

#include "fakes/fake_object.h"
#include "support/errors.h"

#include <gtest/gtest.h>

#include <array>

namespace pelloric {

TEST(MemberNames, AreFoundCaseToldApart)
{
    const TextView names[] = { u"Cols", u"Rows" };
    EXPECT_EQ(findMemberName(names, u"Rows"), 1);
    EXPECT_EQ(findMemberName(names, u"rows"), std::nullopt);
    EXPECT_EQ(errorOf([&] { refuseMember(names, 1); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { refuseMember(names, 7); }), ErrorNumber::NoSuchMember);
}

TEST(MemberNames, CheckTheIndexesOfACall)
{
    const std::array<Value, 2> arguments { Value::ofNumber(2.5), Value::ofText(u"3") };
    EXPECT_EQ(indexArgument(arguments, 0, 0, 5), 2);
    EXPECT_EQ(indexArgument(arguments, 1, 0, 5), 3);
    EXPECT_EQ(
        errorOf([&] { indexArgument(arguments, 0, 3, 5); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(
        errorOf([&] { indexArgument(arguments, 0, 0, -1); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { indexArgument(arguments, 2, 0, 5); }), ErrorNumber::NoSuchMember);
}

TEST(AutomationObject, IsReachedThroughTheNamesOfItsMembers)
{
    FakeObject object;
    object.number(u"Count", 3);
    EXPECT_EQ(getMember(object, u"Count").number(), 3);
    EXPECT_EQ(errorOf([&] { getMember(object, u"count"); }), ErrorNumber::NoSuchMember);
    EXPECT_EQ(errorOf([&] { object.put(memberOf(object, u"Count"), {}, Value()); }),
        ErrorNumber::NoSuchMember);
}

TEST(RunTimeError, TellsItsNumberAndWhatWentWrong)
{
    EXPECT_EQ(RunTimeError(ErrorNumber::Overflow).text(), u"Overflow");
    EXPECT_EQ(RunTimeError(ErrorNumber::Overflow, u"Top").text(), u"Overflow: Top");
    EXPECT_EQ(RunTimeError(ErrorNumber::FileNotFound, u"宋").number(), ErrorNumber::FileNotFound);
    EXPECT_STREQ(
        RunTimeError(ErrorNumber::InvalidCall).what(), "Invalid procedure call or argument");
    struct Row {
        ErrorNumber number;
        int value;
    };
    const Row rows[] = { { ErrorNumber::InvalidCall, 5 }, { ErrorNumber::Overflow, 6 },
        { ErrorNumber::SubscriptOutOfRange, 9 }, { ErrorNumber::DivisionByZero, 11 },
        { ErrorNumber::TypeMismatch, 13 }, { ErrorNumber::FileNotFound, 53 },
        { ErrorNumber::ObjectMissing, 91 }, { ErrorNumber::NoSuchMember, 438 },
        { ErrorNumber::Cancelled, 32755 } };
    for (const Row& row : rows) {
        EXPECT_EQ(static_cast<int>(row.number), row.value);
        EXPECT_NE(errorText(row.number), u"Error");
    }
}

} // namespace pelloric
