// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/page_document.h"

#include "support/errors.h"
#include "support/recorded_pages.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(PageSetup, StartsAsA4PortraitWithMarginsOfTwoCentimetres)
{
    const PageSetup setup;
    EXPECT_EQ(setup, (PageSetup { 1134, 1134, 1134, 1134, 16840, 11907 }));
}

TEST(PageSetup, TakesMarginsInCentimetresUpTo57)
{
    EXPECT_EQ(marginOfCentimetres(2), 1134);
    EXPECT_EQ(marginOfCentimetres(0), 0);
    EXPECT_EQ(marginOfCentimetres(57), 32319);
    EXPECT_EQ(marginOfCentimetres(-57), -32319);
    for (const auto centimetres : std::initializer_list<std::int16_t> { 58, -58, 32767, -32768 })
        EXPECT_EQ(errorOf([&] { marginOfCentimetres(centimetres); }), ErrorNumber::Overflow);
}

TEST(PageDocument, StartsWithOneEmptyPage)
{
    const PageDocument document;
    EXPECT_EQ(document.Totalpages, 1);
    EXPECT_EQ(document.currentPage, 0);
    EXPECT_EQ(document.pageCount(), 1);
    EXPECT_TRUE(document.lines(0).empty());
    EXPECT_TRUE(document.texts(0).empty());
    EXPECT_EQ(document.picture(0), nullptr);
}

TEST(PageDocument, RecordsStartWithTheStandardAttributes)
{
    EXPECT_EQ(LinePen(), (LinePen { 0, 0, 1, 1, 0xE0E0E0 }));
    EXPECT_EQ(Font(), (Font { u"宋体", 11, false, false, false, false }));
}

TEST(PageDocument, AppendsToTheCurrentPageInTheOrderRecorded)
{
    PageDocument document;
    addSampleRecords(document);
    document.newPage();
    addText(document, { 1, 2 }, u"second");
    EXPECT_EQ(document.Totalpages, 2);
    EXPECT_EQ(document.currentPage, 1);
    EXPECT_EQ(document.lines(0).size(), 2U);
    EXPECT_EQ(
        document.line(0, 1), (Lineobj { { 500, 0 }, { 700, 300 }, 1, 0, 2, SolidFill, 14737632 }));
    EXPECT_EQ(document.text(0, 0),
        (Textobj {
            { 500, 300 }, u"Page 2 of [Pages], [Pages]", { u"Arial", 10.5F, true }, 16711680 }));
    EXPECT_EQ(document.text(1, 0).Str, u"second");
    document.currentPage = 0;
    addText(document, { 3, 4 }, u"third");
    EXPECT_EQ(document.texts(0).size(), 2U);
}

TEST(PageDocument, DropsUnderlineAndStrikeThroughOfTexts)
{
    PageDocument document;
    addText(document, {}, u"x", { { .strikethrough = true, .underline = true }, 0 });
    EXPECT_EQ(document.text(0, 0).prnFont, Font());
    EXPECT_EQ(
        document.styleNumber({ Font(), 0 }), document.styleNumber({ { .underline = true }, 0 }));
    EXPECT_NE(document.styleNumber({ Font(), 0 }), document.styleNumber({ Font(), 1 }));
    EXPECT_NE(document.penNumber({}), document.penNumber({ .LineWidth = 2 }));
}

TEST(PageDocument, RefusesPagesAndRecordsThatDoNotExist)
{
    PageDocument document;
    for (const int page : { -1, 1, 32767 }) {
        EXPECT_EQ(errorOf([&] { document.lines(page); }), ErrorNumber::SubscriptOutOfRange);
        EXPECT_EQ(errorOf([&] { document.texts(page); }), ErrorNumber::SubscriptOutOfRange);
        EXPECT_EQ(
            errorOf([&] { document.placePicture(page, {}); }), ErrorNumber::SubscriptOutOfRange);
        EXPECT_EQ(errorOf([&] { document.removePicture(page); }), ErrorNumber::SubscriptOutOfRange);
        EXPECT_EQ(document.picture(page), nullptr);
    }
    EXPECT_EQ(errorOf([&] { document.line(0, 0); }), ErrorNumber::SubscriptOutOfRange);
    EXPECT_EQ(errorOf([&] { document.text(0, 0); }), ErrorNumber::SubscriptOutOfRange);
    for (const auto page : std::initializer_list<std::int16_t> { -1, 1 }) {
        document.currentPage = page;
        EXPECT_EQ(errorOf([&] { addLine(document, {}, {}); }), ErrorNumber::SubscriptOutOfRange);
        EXPECT_EQ(errorOf([&] { addText(document, {}, u""); }), ErrorNumber::SubscriptOutOfRange);
    }
}

TEST(PageDocument, Holds32767PagesAndNotOneMore)
{
    PageDocument document;
    addText(document, {}, u"first");
    addPages(document, 32766);
    EXPECT_EQ(document.Totalpages, 32767);
    EXPECT_EQ(document.pageCount(), 32767);
    EXPECT_EQ(document.currentPage, 32766);
    EXPECT_EQ(errorOf([&] { document.newPage(); }), ErrorNumber::Overflow);
    EXPECT_EQ(document.Totalpages, 32767);
    EXPECT_EQ(document.pageCount(), 32767);
    EXPECT_EQ(document.currentPage, 32766);
    EXPECT_EQ(document.text(0, 0).Str, u"first");
}

TEST(PageDocument, GrowsBehindTheNumberOfPagesThatAHostWrote)
{
    PageDocument document;
    addText(document, {}, u"first");
    document.Totalpages = 4;
    EXPECT_EQ(document.pageCount(), 1);
    document.newPage();
    EXPECT_EQ(document.Totalpages, 5);
    EXPECT_EQ(document.pageCount(), 5);
    EXPECT_EQ(document.currentPage, 4);
    EXPECT_EQ(document.text(0, 0).Str, u"first");
    document.Totalpages = -5;
    document.newPage();
    EXPECT_EQ(document.pageCount(), 0);
    EXPECT_EQ(errorOf([&] { addText(document, {}, u""); }), ErrorNumber::SubscriptOutOfRange);
    document.Totalpages = 0;
    document.newPage();
    EXPECT_EQ(document.pageCount(), 1);
    EXPECT_TRUE(document.texts(0).empty());
}

TEST(PageDocument, ClearsToOneEmptyPageAndLeavesThePicture)
{
    PageDocument document;
    addSampleRecords(document);
    const MapLocation picture { 1, 2, 3, 4, u"id", u"a.png" };
    document.placePicture(0, picture);
    document.newPage();
    document.placePicture(1, picture);
    document.clear();
    EXPECT_EQ(document.Totalpages, 1);
    EXPECT_EQ(document.currentPage, 0);
    EXPECT_EQ(document.pageCount(), 1);
    EXPECT_TRUE(document.lines(0).empty());
    EXPECT_TRUE(document.texts(0).empty());
    ASSERT_NE(document.picture(0), nullptr);
    EXPECT_EQ(*document.picture(0), picture);
    document.newPage();
    EXPECT_EQ(document.picture(1), nullptr);
    document.removePicture(0);
    EXPECT_EQ(document.picture(0), nullptr);
}

TEST(PageDocument, PlacesAPictureAfterAClearOfFewerPages)
{
    PageDocument document;
    document.clear();
    addPages(document, 2);
    MapLocation picture;
    picture.nLeft = 7;
    document.placePicture(2, picture);
    EXPECT_EQ(document.picture(2)->nLeft, 7);
    EXPECT_EQ(document.picture(0), nullptr);
}

TEST(PageDocument, KeepsTextsThatLiveInAStoreOfBefore)
{
    PageDocument document;
    addText(document, {}, u"before");
    auto shared = std::make_shared<TextStore>();
    document.shareStore(shared);
    addText(document, {}, u"behind");
    shared.reset();
    EXPECT_EQ(document.text(0, 0).Str, u"before");
    EXPECT_EQ(document.text(0, 1).Str, u"behind");
    EXPECT_GT(document.memoryBytes(), 0U);
}

TEST(PageDocument, FillsThePageCountIntoEveryToken)
{
    Text buffer;
    EXPECT_EQ(withPageCount(u"3 of [Pages]", 7, buffer), u"3 of 7");
    EXPECT_EQ(withPageCount(u"[Pages][Pages]", 12, buffer), u"1212");
    const TextView plain = u"[pages]";
    EXPECT_EQ(withPageCount(plain, 7, buffer).data(), plain.data());
}

} // namespace pelloric
