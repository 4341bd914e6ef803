// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/page_list.h"

#include "support/errors.h"

#include <gtest/gtest.h>

#include <vector>

namespace pelloric {

namespace {

std::vector<int> numbersOf(TextView list)
{
    const std::vector<std::int16_t> numbers = pageNumbersOf(list);
    return { numbers.begin(), numbers.end() };
}

} // namespace

TEST(PageList, ExpandsRuns)
{
    struct Case {
        TextView range;
        TextView list;
    };
    const Case cases[] = {
        { u"1,3,5-12", u"1,3,5,6,7,8,9,10,11,12" },
        { u"1-3,5", u"1,2,3,5" },
        { u"1-3-5", u"1,2,3,4,5" },
        { u"7", u"7" },
        { u"12-5", u"12,5" },
        { u"", u"" },
        { u"2-2", u"2" },
        { u"2-2,5", u"2,5" },
        { u"1,2-2", u"1,2" },
        { u"1-3-3-5", u"1,2,3,4,5" },
        { u"2 - 2", u"2 " },
        { u"1 - 3", u"1 ,2, 3" },
        { u"-3", u",1,2,3" },
        { u"3-", u"3," },
        { u"x-2", u"x,1,2" },
        { u"1.5-4.5", u"1.5,3,4.5" },
        { u"a,b", u"a,b" },
        { u"x-y", u"x,y" },
        { u"32766-40000", u"32766,32767,40000" },
        { u"32766-1e300", u"32766,32767,1e300" },
        { u"40000-50000", u"40000,50000" },
    };
    for (const Case& row : cases)
        EXPECT_EQ(toUtf8(pageListOf(row.range)), toUtf8(row.list)) << toUtf8(row.range);
}

TEST(PageList, EndsForARangeTextThatWouldFillTheMemory)
{
    Text range = u"0";
    for (int run = 0; run < 100000; ++run)
        range += u"-9e4-0";
    try {
        pageListOf(range);
        FAIL() << "it is taken";
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::Overflow);
        EXPECT_EQ(toUtf8(error.detail()), "the page list names too many pages; write fewer ranges");
    }
}

TEST(PageNumbers, TakesWholeItemsThatAreNumbers)
{
    using List = std::vector<int>;
    EXPECT_EQ(numbersOf(u"2,9,x,3"), (List { 2, 9, 3 }));
    EXPECT_EQ(numbersOf(u"1.,+2,3.0,2e0,1 2,3x,&H4,1e,.,-,4"), (List { 1, 2, 3, 2, 4 }));
    EXPECT_EQ(numbersOf(u" 5 ,, 0,-1,2.5,3.5"), (List { 5, 0, -1, 2, 4 }));
    EXPECT_EQ(numbersOf(u"32767,32768,-32768,-32769,1e400,7"), (List { 32767, -32768, 7 }));
    EXPECT_EQ(numbersOf(u""), List {});
    EXPECT_EQ(numbersOf(u",,,"), List {});
}

TEST(PageNumbers, ReadsAListOfAnyLength)
{
    Text list;
    for (int item = 0; item < 200000; ++item)
        list += u"1,x,";
    EXPECT_EQ(numbersOf(list).size(), 200000U);
}

TEST(Copies, AreTheLeadingNumberAndOneForNoText)
{
    EXPECT_EQ(copiesOf(u""), 1);
    EXPECT_EQ(copiesOf(u"3"), 3);
    EXPECT_EQ(copiesOf(u"0"), 0);
    EXPECT_EQ(copiesOf(u"2.5"), 2);
    EXPECT_EQ(copiesOf(u"1.2.3"), 1);
    EXPECT_EQ(copiesOf(u"."), 0);
    EXPECT_EQ(errorOf([] { copiesOf(u"40000"); }), ErrorNumber::Overflow);
}

} // namespace pelloric
