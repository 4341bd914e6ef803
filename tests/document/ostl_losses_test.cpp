// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_losses.h"

#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "support/report_world.h"
#include "support/show_document.h"

#include <gtest/gtest.h>

#include <sstream>

namespace pelloric {

namespace {

/// A code page of one byte for each character.
class OneByteCodec final : public TextCodec {
public:
    Text decode(std::string_view bytes) const override { return { bytes.begin(), bytes.end() }; }

    void encode(TextView text, std::string& bytes) const override
    {
        for (const char16_t unit : text)
            bytes.push_back(unit < 0x80 ? static_cast<char>(unit) : '?');
    }
};

class OstlLossesTest : public testing::Test, protected ReportWorld {
protected:
    OstlLossesTest() { canvas.m_PrintObj = PrintObjKind::MSFlexGrid; }

    OstlLosses lossesOf(const ReportOptions& options, int rows = 3)
    {
        TableGrid grid = gridOf({ { u"A", 2000 }, { u"B", 2000 } }, numberedRows(rows, 2));
        canvas.options = options;
        canvas.doPreview(grid);
        return ostlLosses(canvas.document(), codec);
    }
};

} // namespace

TEST_F(OstlLossesTest, AreThePicturesOfAReport)
{
    EXPECT_FALSE(lossesOf({}).any());
    ReportOptions options;
    options.watermark.text = u"Draft";
    EXPECT_EQ(lossesOf(options), (OstlLosses { .pictures = true }));
    options = {};
    options.logo.imageFile = u"logo.png";
    EXPECT_EQ(lossesOf(options), (OstlLosses { .pictures = true }));
    canvas.document().addPicture(0, { PictureLayer::Cells, {}, { 200, 200 }, u"icon.png" });
    EXPECT_EQ(
        ostlLosses(canvas.document(), codec), (OstlLosses { .pictures = true, .icons = true }));
}

TEST_F(OstlLossesTest, AreNotTotalsGroupsAndKeyColumnsWhichComeBack)
{
    ReportOptions options;
    options.groupColumns = { u"A" };
    options.totals = { { u"B", AggregateFunction::Count } };
    options.keyColumns = 1;
    EXPECT_FALSE(lossesOf(options).any());
    std::stringstream file;
    writeOstl(canvas.document(), canvas.page, { codec }, {}, file);
    PageDocument read;
    PageSetup setup;
    ASSERT_EQ(readOstl(codec, file, read, setup), OstlResult::Opened);
    EXPECT_EQ(textsOf(read, 0), textsOf(canvas.document(), 0));
    ASSERT_EQ(read.lines(0).size(), canvas.document().lines(0).size());
    for (std::size_t line = 0; line < read.lines(0).size(); ++line)
        EXPECT_EQ(read.line(0, line), canvas.document().line(0, line));
}

TEST_F(OstlLossesTest, AreThePagesBehindTheLastAndCharactersWithoutACode)
{
    EXPECT_EQ(lossesOf({}, 6000).pages, 20);
    EXPECT_EQ(canvas.Totalpages(), 151);
    TableGrid grid = gridOf({ { u"A", 2000 } }, { { u"plain" }, { u"café" }, { u"中" } });
    canvas.doPreview(grid);
    EXPECT_EQ(ostlLosses(canvas.document(), OneByteCodec()), (OstlLosses { .texts = 2 }));
    EXPECT_FALSE(ostlLosses(canvas.document(), codec).any());
}

} // namespace pelloric
