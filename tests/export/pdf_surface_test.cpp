// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_surface.h"

#include "export/pdf_pictures.h"
#include "fakes/fake_glyph_faces.h"

#include <gtest/gtest.h>

namespace pelloric::pdf {

namespace {

/// The operators in front of everything: points into twips.
const std::string Scale = ".05 0 0 .05 0 0 cm\n";

class PdfSurfaceTest : public testing::Test {
protected:
    void SetUp() override
    {
        content_.begin();
        surface_.setPlace({ .height = 10000 });
        surface_.setFontSize(10);
    }

    void print(Tpoint point, TextView text)
    {
        surface_.setCurrentX(point.x);
        surface_.setCurrentY(point.y);
        surface_.print(text);
    }

    /// The operators so far, without the scale.
    std::string operators()
    {
        const std::string& all = content_.end();
        EXPECT_TRUE(all.starts_with(Scale));
        return all.substr(Scale.size());
    }

    StringSink sink_;
    NoDeflater deflater_;
    PdfFile file_ { sink_, deflater_ };
    FakeGlyphFaces faces_;
    FakePictures reader_;
    PdfFonts fonts_ { file_ };
    PdfPictures pictures_ { file_, reader_ };
    PdfContent content_ { fonts_ };
    PdfSurface surface_ { content_, faces_, fonts_, pictures_ };
};

/// The codes of the first letters that are used: 1, 2 and so on.
std::string codes(std::initializer_list<int> numbers)
{
    std::string bytes;
    for (const int number : numbers)
        bytes += static_cast<char>(number);
    return bytes;
}

/// The code of the first character that is used and no letter of an alphabet.
std::string firstOfMany() { return { "\x80\0", 2 }; }

} // namespace

TEST_F(PdfSurfaceTest, PutsTextsOfAFontIntoOneTextObjectAndMovesBetweenThem)
{
    print({ 100, 200 }, u"ab");
    print({ 400, 200 }, u"ba");
    // The baseline is 16 * 10 below the top: 10000 - 200 - 160.
    EXPECT_EQ(operators(),
        "BT\n/F1 200 Tf\n100 9640 Td(" + codes({ 1, 2 }) + ")Tj\n300 0 Td(" + codes({ 2, 1 })
            + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, TakesCharactersThatAFaceLacksFromAnother)
{
    print({ 0, 0 }, u"a北b");
    EXPECT_EQ(operators(),
        "BT\n/F1 200 Tf\n0 9840 Td(" + codes({ 1 }) + ")Tj\n/F2 200 Tf\n(" + firstOfMany()
            + ")Tj\n/F1 200 Tf\n(" + codes({ 2 }) + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, OutlinesAMadeUpBoldFaceInTheColourOfTheText)
{
    surface_.setFontBold(true);
    surface_.setForeColor(255);
    print({ 0, 0 }, u"a");
    surface_.setFontBold(false);
    print({ 0, 300 }, u"a");
    EXPECT_EQ(operators(),
        "BT\n1 0 0 rg\n/F1 200 Tf\n1 0 0 RG\n5 w\n2 J\n1 j\n2 Tr\n0 9840 Td(" + codes({ 1 })
            + ")Tj\n0 Tr\n0 -300 Td(" + codes({ 1 }) + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, SlantsAMadeUpItalicFaceButNotItsMoves)
{
    surface_.setFontItalic(true);
    print({ 100, 0 }, u"a");
    print({ 200, 300 }, u"a");
    surface_.setFontItalic(false);
    print({ 300, 600 }, u"a");
    print({ 400, 600 }, u"a");
    EXPECT_EQ(operators(),
        "BT\n/F1 200 Tf\n1 0 .2126 1 100 9840 Tm\n(" + codes({ 1 })
            + ")Tj\n1 0 .2126 1 200 9540 Tm\n(" + codes({ 1 }) + ")Tj\n1 0 0 1 300 9240 Tm\n("
            + codes({ 1 }) + ")Tj\n100 0 Td(" + codes({ 1 }) + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, PlacesACharacterOfAnotherSlantBehindThoseBefore)
{
    surface_.setFontItalic(true); // the font of Han characters leans by itself
    print({ 100, 0 }, u"aa北");
    EXPECT_EQ(operators(),
        "BT\n/F1 200 Tf\n1 0 .2126 1 100 9840 Tm\n(" + codes({ 1, 1 })
            + ")Tj\n/F2 200 Tf\n1 0 0 1 300 9840 Tm\n(" + firstOfMany() + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, SqueezesAShapedTextIntoItsMeasuredWidth)
{
    print({ 100, 0 }, u"אב"); // each 20 twips at size 1, drawn an em wide
    print({ 100, 300 }, u"a");
    EXPECT_EQ(operators(),
        "BT\n/F1 200 Tf\n100 9840 Td(" + codes({ 1 }) + ")Tj\n200 0 Td(" + codes({ 2 })
            + ")Tj\n-200 -300 Td(" + codes({ 3 }) + ")Tj\nET\n");
    content_.begin();
    print({ 100, 0 }, u"a\u0301"); // 30 twips at size 1, drawn 40 wide
    EXPECT_EQ(operators(),
        "BT\n/F1 200 Tf\n75 Tz\n100 9840 Td(" + codes({ 4 }) + ")Tj\n150 0 Td(" + codes({ 3 })
            + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, DrawsLinesOfOnePenAsOnePath)
{
    surface_.line({ 0, 0 }, { 100, 0 });
    surface_.line({ 0, 50 }, { 100, 50 });
    surface_.setForeColor(rgb(0, 0, 255));
    surface_.setDrawWidth(3);
    surface_.line({ 0, 60 }, { 100, 60 });
    EXPECT_EQ(operators(),
        "2.4 w\n2 J\n0 10000 m 100 10000 l\n0 9950 m 100 9950 l\nS\n0 0 1 RG\n7.2 w\n"
        "0 9940 m 100 9940 l\nS\n");
}

TEST_F(PdfSurfaceTest, MeasuresDashesInWidthsOfThePen)
{
    surface_.setDrawStyle(3);
    surface_.setDrawWidth(2);
    surface_.line({ 0, 0 }, { 100, 0 });
    surface_.setDrawStyle(6);
    surface_.line({ 0, 50 }, { 100, 50 });
    surface_.setDrawStyle(5);
    surface_.line({ 0, 60 }, { 100, 60 });
    EXPECT_EQ(operators(),
        "4.8 w\n[19.2 9.6 4.8 9.6 ]0 d\n0 J\n0 10000 m 100 10000 l\nS\n[]0 d\n2 J\n"
        "0 9950 m 100 9950 l\nS\n");
}

TEST_F(PdfSurfaceTest, DrawsADotForALineWithoutLength)
{
    surface_.setDrawStyle(1);
    surface_.line({ 100, 100 }, { 100, 100 });
    EXPECT_EQ(operators(), "2.4 w\n2 J\n100 9900 m 100 9899.99 l\nS\n");
}

TEST_F(PdfSurfaceTest, FillsARectangleAndOutlinesIt)
{
    surface_.setFillStyle(SolidFill);
    surface_.setFillColor(rgb(255, 0, 0));
    surface_.box({ 300, 200 }, { 100, 100 }, rgb(0, 255, 0));
    EXPECT_EQ(operators(), "0 1 0 RG\n2.4 w\n2 J\n1 0 0 rg\n100 9800 200 100 re B\n");
    EXPECT_FALSE(content_.hasHatches());
}

TEST_F(PdfSurfaceTest, HatchesARectangleInItsFillColour)
{
    surface_.setFillStyle(4);
    surface_.setFillColor(rgb(255, 0, 0));
    surface_.setDrawStyle(5);
    surface_.box({ 0, 0 }, { 100, 100 }, 0);
    surface_.setFillStyle(SolidFill);
    surface_.box({ 0, 0 }, { 100, 100 }, 0);
    EXPECT_EQ(operators(),
        "/Hatch cs 1 0 0 /H4 scn\n0 9900 100 100 re f\n1 0 0 rg\n0 9900 100 100 re f\n");
    EXPECT_TRUE(content_.hasHatches());
}

TEST_F(PdfSurfaceTest, OnlyOutlinesARectangleThatIsNotFilled)
{
    surface_.setFillStyle(TransparentFill);
    surface_.box({ 0, 0 }, { 100, 100 }, 0);
    EXPECT_EQ(operators(), "2.4 w\n2 J\n0 9900 100 100 re S\n");
}

TEST_F(PdfSurfaceTest, KeepsTheOrderOfLinesAndTexts)
{
    surface_.line({ 0, 0 }, { 100, 0 });
    print({ 0, 0 }, u"a");
    surface_.line({ 0, 50 }, { 100, 50 });
    EXPECT_EQ(operators(),
        "2.4 w\n2 J\n0 10000 m 100 10000 l\nS\nBT\n/F1 200 Tf\n0 9840 Td(" + codes({ 1 })
            + ")Tj\nET\n0 9950 m 100 9950 l\nS\n");
}

TEST_F(PdfSurfaceTest, WhitensWhatIsBehindATextThatIsNotTransparent)
{
    surface_.setFontTransparent(false);
    print({ 0, 0 }, u"ab");
    EXPECT_EQ(operators(),
        "1 1 1 rg\n0 9760 200 240 re f\nBT\n0 0 0 rg\n/F1 200 Tf\n0 9840 Td(" + codes({ 1, 2 })
            + ")Tj\nET\n");
}

TEST_F(PdfSurfaceTest, BreaksTheLineBehindAText)
{
    print({ 500, 100 }, u"a");
    surface_.print(u"a");
    EXPECT_NE(operators().find("-500 -240 Td"), std::string::npos);
}

TEST_F(PdfSurfaceTest, DrawsNothingForATextWithoutSize)
{
    surface_.setFontSize(0);
    print({ 0, 0 }, u"a");
    surface_.setFontSize(-3);
    print({ 0, 0 }, u"a");
    surface_.setFontSize(10);
    print({ 0, 0 }, u"");
    EXPECT_EQ(operators(), "");
}

TEST_F(PdfSurfaceTest, StandsWhereThePrintableAreaBegins)
{
    surface_.setPlace({ .height = 10000, .origin = { 360, 600 }, .pixel = 1 });
    surface_.line({ 0, 0 }, { 100, 0 });
    EXPECT_EQ(operators(), "1 w\n2 J\n360 9400 m 460 9400 l\nS\n");
}

TEST_F(PdfSurfaceTest, EmbedsAPictureOnceForAllPages)
{
    surface_.picture(u"half.png", { 100, 200 }, { 300, 400 });
    EXPECT_EQ(operators(), "q 300 0 0 400 100 9400 cm /P1 Do Q\n");
    content_.begin();
    surface_.picture(u"half.png", { 0, 0 }, { 300, 400 });
    surface_.picture(u"missing.png", { 0, 0 }, { 300, 400 });
    EXPECT_EQ(operators(), "q 300 0 0 400 0 9600 cm /P1 Do Q\n");
    EXPECT_EQ(reader_.asked, 2);
    EXPECT_EQ(pictures_.resources(), "/P1 1 0 R");
}

} // namespace pelloric::pdf
