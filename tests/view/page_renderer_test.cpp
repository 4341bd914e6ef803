// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/page_renderer.h"

#include "fakes/fake_surface.h"
#include "support/errors.h"
#include "support/recorded_pages.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

const std::string SampleStart = "clear\n"
                                "font name 宋体\n"
                                "font size 20\n";

const std::string SampleLines = "draw width 1\n"
                                "draw style 0\n"
                                "fore colour 255\n"
                                "fill style 1\n"
                                "line 0,0 500,0\n"
                                "draw width 2\n"
                                "draw style 1\n"
                                "fore colour 0\n"
                                "fill colour 14737632\n"
                                "fill style 0\n"
                                "box 500,0 700,300 14737632\n";

const std::string SampleText = "bold 1\n"
                               "italic 0\n"
                               "font name Arial\n"
                               "font size 10.5\n"
                               "fore colour 16711680\n"
                               "x 500\n"
                               "y 300\n";

std::string replayed(const PageDocument& document, int page, const ReplayOptions& options = {})
{
    FakeSurface surface;
    PageRenderer(document).replay(page, options, surface);
    return surface.log();
}

} // namespace

TEST(PageRenderer, DrawsLinesThenTextsInTheOrderRecorded)
{
    PageDocument document;
    addSampleRecords(document);
    addPages(document, 3);
    EXPECT_EQ(
        replayed(document, 0), SampleStart + SampleLines + SampleText + "print Page 2 of 4, 4\n");
}

TEST(PageRenderer, PutsReportPicturesBehindLinesBetweenLinesAndTextsAndAboveAll)
{
    PageDocument document;
    addSampleRecords(document);
    TextStore& store = document.store();
    document.addPicture(0, { PictureLayer::Above, { 1, 2 }, { 3, 4 }, store.add(u"seal") });
    document.addPicture(0, { PictureLayer::Cells, { 5, 6 }, { 7, 8 }, store.add(u"icon") });
    document.addPicture(0, { PictureLayer::Behind, { 0, 0 }, { 900, 900 }, store.add(u"mark") });
    const std::string behind = "picture mark 0,0 900,900\n";
    const std::string icon = "picture icon 5,6 7,8\n";
    const std::string above = "picture seal 1,2 3,4\n";
    EXPECT_EQ(replayed(document, 0),
        SampleStart + behind + SampleLines + icon + SampleText + "print Page 2 of 1, 1\n" + above);
    const std::string paper = [&] {
        FakeSurface surface;
        PageRenderer(document).replay(0, paperReplay({}), surface);
        return surface.log();
    }();
    for (const std::string& picture : { behind, icon, above })
        EXPECT_NE(paper.find(picture), std::string::npos) << "they are printed, too";
    const std::string part = replayed(document, 0, { .visible = PageRect { 100, 100, 200, 200 } });
    EXPECT_NE(part.find(behind), std::string::npos);
    EXPECT_EQ(part.find(icon), std::string::npos) << "what is not seen is left out";
}

TEST(PageRenderer, LeavesThePageCountTokenInAPageWindow)
{
    PageDocument document;
    addSampleRecords(document);
    EXPECT_EQ(replayed(document, 0, { .fillPageCount = false }),
        SampleStart + SampleLines + SampleText + "print Page 2 of [Pages], [Pages]\n");
}

TEST(PageRenderer, DividesFontSizesOnly)
{
    PageDocument document;
    addLine(document, { 10, 20 }, { 10, 20 }, { .LineWidth = 3 });
    addText(document, { 30, 40 }, u"x", { { .size = 10 }, 0 });
    const std::string log = replayed(document, 0, { .divisor = 2 });
    EXPECT_NE(log.find("font size 10\n"), std::string::npos);
    EXPECT_NE(log.find("font size 5\n"), std::string::npos);
    EXPECT_NE(log.find("draw width 3\n"), std::string::npos);
    EXPECT_NE(log.find("line 10,20 10,20\n"), std::string::npos);
    EXPECT_NE(log.find("x 30\ny 40\n"), std::string::npos);
}

TEST(PageRenderer, ClearsAPageWithoutRecords)
{
    const PageDocument document;
    EXPECT_EQ(replayed(document, 0, { .reportFontName = u"Arial", .reportFontSize = 8 }),
        "clear\nfont name Arial\nfont size 8\n");
}

TEST(PageRenderer, PaintsThePictureBeforeTheRecords)
{
    PageDocument document;
    document.placePicture(0, { 1, 2, 30, 40, u"id", u"map.png" });
    EXPECT_EQ(replayed(document, 0), SampleStart + "picture map.png 1,2 30,40\n");
}

TEST(PageRenderer, DrawsNothingOfAPageThatDoesNotExist)
{
    PageDocument document;
    document.Totalpages = 5;
    FakeSurface surface;
    for (const int page : { -1, 1, 4 }) {
        EXPECT_EQ(errorOf([&] { PageRenderer(document).replay(page, {}, surface); }),
            ErrorNumber::SubscriptOutOfRange);
    }
    EXPECT_EQ(surface.log(), "");
}

TEST(PageRenderer, LeavesOutOnlyWhatLiesOutsideTheVisiblePart)
{
    PageDocument document;
    addLine(document, { 0, 0 }, { 9000, 0 });
    addLine(document, { 0, 5000 }, { 9000, 5000 });
    addLine(document, { 4000, 0 }, { 4000, 16000 });
    addLine(document, { 9000, 0 }, { 9000, 16000 });
    addText(document, { 0, 100 }, u"above");
    addText(document, { 0, 100 }, u"a\n\n\n\n\n\ng");
    addText(document, { 0, 4990 }, u"seen");
    addText(document, { 9000, 5000 }, u"far right");
    addText(document, { 0, 9000 }, u"below");
    const std::string log
        = replayed(document, 0, { .visible = PageRect { 3000, 5000, 5000, 6000 } });
    std::string drawn;
    for (const char* call : { "line 0,0 ", "line 0,5000", "line 4000,0", "line 9000,0",
             "print above", "print a\n", "print seen", "print far right", "print below" })
        drawn += log.find(call) == std::string::npos ? '-' : '+';
    EXPECT_EQ(drawn, "-++--+++-");
}

TEST(PageRenderer, ShowsThickPensThatReachIntoTheVisiblePart)
{
    PageDocument document;
    addLine(document, { 0, 4900 }, { 9000, 4900 }, { .LineWidth = 20 });
    const std::string log
        = replayed(document, 0, { .visible = PageRect { 3000, 5000, 5000, 6000 } });
    EXPECT_NE(log.find("line 0,4900"), std::string::npos);
}

TEST(PageRenderer, OnPaperClearsNothingPaintsNoPictureAndResetsTheFill)
{
    PageDocument document;
    addSampleRecords(document);
    document.placePicture(0, { .nFJBH = {}, .strFilePath = u"a.png" });
    EXPECT_EQ(replayed(document, 0, paperReplay({ .name = u"Face", .size = 11 })),
        "font name Face\nfont size 11\n" + SampleLines + "fill style 1\ntransparent 1\n"
            + SampleText + "print Page 2 of 1, 1\n");
}

} // namespace pelloric
