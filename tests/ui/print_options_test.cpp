// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/print_options.h"

#include "controls/messages.h"
#include "fakes/fake_printer.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(PrintOptions, EnablesTheRangeBoxForARange)
{
    PrintChoices choices;
    EXPECT_FALSE(choices.rangeEnabled);
    choices.chooseRange();
    choices.pageList = u"1,2";
    EXPECT_TRUE(choices.rangeEnabled);
    EXPECT_FALSE(choices.allPages);
    choices.chooseAll();
    EXPECT_FALSE(choices.rangeEnabled);
    EXPECT_TRUE(choices.allPages);
    EXPECT_EQ(choices.pageList, u"");
}

TEST(PrintOptions, MakesThePrinterOfATrimmedNameTheCurrentOne)
{
    FakePrinterSystem printers;
    printers.names = { u"One", u" Two " };
    printers.current = u"One";
    choosePrinter(printers, u"Two");
    EXPECT_EQ(printers.current, u" Two ");
    choosePrinter(printers, u"Three");
    EXPECT_EQ(printers.current, u" Two ");
}

TEST(PrintOptions, StepsAndFiltersCopies)
{
    EXPECT_EQ(filteredCopies(u"a1-2"), u"12");
    EXPECT_EQ(steppedCopies(u"1", true), u"2");
    EXPECT_EQ(steppedCopies(u"1", false), u"0");
    EXPECT_EQ(steppedCopies(u"0", false), u"0");
}

TEST(PrintOptions, TellsWhyItCannotPrint)
{
    FakePrinterSystem printers;
    EXPECT_EQ(std::get<Message>(pressPrint(printers, {})), messageOf(Notice::NoPrinter));
    printers.names = { u"One" };
    printers.current = u"One";
    printers.closed = { u"One" };
    EXPECT_EQ(std::get<Message>(pressPrint(printers, {})).text, u"One打印机没有正常工作，不能打印");
    printers.closed.clear();
    EXPECT_EQ(std::get<PrintArguments>(pressPrint(printers, { false, u" 1,3,5-7 ", u"" })),
        (PrintArguments { false, u"1,3,5,6,7", 1 }));
}

TEST(PrintDoubts, AreRaisedByARangeThatNamesNoPage)
{
    struct Case {
        TextView range;
        PrintDoubt doubt;
    };
    const Case cases[] = {
        { u"", PrintDoubt::EmptyRange },
        { u"  ", PrintDoubt::EmptyRange },
        { u"3", PrintDoubt::None },
        { u"9,3", PrintDoubt::None },
        { u"6", PrintDoubt::NoPageOfRange },
        { u"0", PrintDoubt::NoPageOfRange },
        { u"x,,", PrintDoubt::NoPageOfRange },
        { u"6-9", PrintDoubt::NoPageOfRange },
        { u"5-9", PrintDoubt::None },
    };
    for (const Case& row : cases)
        EXPECT_EQ(
            rangeDoubt({ .allPages = false, .range = Text(row.range), .copies = {} }, 5), row.doubt)
            << toUtf8(row.range);
    EXPECT_EQ(rangeDoubt({ .allPages = true, .range = u"6", .copies = {} }, 5), PrintDoubt::None);
    EXPECT_EQ(
        rangeDoubt({ .allPages = false, .range = u"30000", .copies = {} }, 0), PrintDoubt::None);
    EXPECT_EQ(copiesDoubt(u""), PrintDoubt::None);
    EXPECT_EQ(copiesDoubt(u"2"), PrintDoubt::None);
    EXPECT_EQ(copiesDoubt(u"0"), PrintDoubt::NoCopy);
    EXPECT_EQ(copiesDoubt(u"0.4"), PrintDoubt::NoCopy);
    EXPECT_EQ(copiesDoubt(u"32768"), PrintDoubt::ManyCopies);
}

} // namespace pelloric
