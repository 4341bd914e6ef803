// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "export/qt/page_export.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/qt/uming.h"
#include "platform/run_time_error.h"
#include "settings/default_settings.h"
#include "support/qt/run_program.h"
#include "support/qt/sample_grids.h"
#include "support/recorded_pages.h"
#include "support/test_paths.h"

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

class PdfTagsTest : public testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(loadUming());
        platform_.folders().setSystemDirectory(folder_.path());
        deployDefaultSettings(platform_.record());
    }

    QString write(const PageDocument& document, const ExportOptions& options)
    {
        const auto path = folder_.file("a.pdf");
        exportPdf(document, PageSetup(), platform_.fonts(), options, path);
        const QString name = QString::fromStdString(path.string());
        const ProgramResult check
            = runProgram(QStringLiteral("qpdf"), { QStringLiteral("--check"), name });
        EXPECT_EQ(check.status, 0) << check.output.toStdString() << check.errors.toStdString();
        return name;
    }

    /// What is wrong with the file, looked at object by object.
    static std::string faultsOf(const QString& kind, const QString& path)
    {
        const ProgramResult result = runProgram(QStringLiteral("/usr/bin/python3"),
            { QStringLiteral(PELLORIC_TESTS_DIR "/support/check_pdf.py"), kind, path });
        return result.status == 0 ? "" : (result.output + result.errors).toStdString();
    }

    /// The elements with their texts, as poppler reads them.
    static QString elementsOf(const QString& path)
    {
        return runProgram(QStringLiteral("pdfinfo"), { QStringLiteral("-struct-text"), path })
            .output;
    }

    /// The texts of the elements of a kind.
    static std::vector<Text> textsOf(const QString& elements, const QString& kind)
    {
        std::vector<Text> texts;
        bool isInside = false;
        for (const QString& line : elements.split(u'\n')) {
            const QString element = line.trimmed();
            if (element.startsWith(u'/'))
                continue; // an attribute
            if (!element.startsWith(u'"')) {
                isInside = element == kind || element.startsWith(kind + QLatin1Char(' '))
                    || element == kind + QLatin1Char(':');
                if (isInside)
                    texts.emplace_back();
            } else if (isInside) {
                texts.back() += toText(element.mid(1, element.size() - 2));
            }
        }
        return texts;
    }

    TempFolder folder_;
    QtPlatform platform_;
};

/// A report of a table.
class BuiltReport {
public:
    BuiltReport(QtPlatform& platform, TableGrid& grid)
        : services_(platform.record())
        , canvas_(services_)
    {
        canvas_.doPreview(grid);
    }

    const PageDocument& document() const { return canvas_.document(); }

private:
    Platform services_;
    Canvas canvas_;
};

std::vector<Text> withoutBlanks(std::vector<Text> texts)
{
    for (Text& text : texts)
        std::erase_if(text, [](char16_t unit) { return unit == u' ' || unit == u'\u00A0'; });
    return texts;
}

class TaggedSamples : public PdfTagsTest, public testing::WithParamInterface<Sample> { };

const ExportOptions Tagged { .title = u"总表", .language = u"zh-CN", .isTagged = true };

} // namespace

TEST_P(TaggedSamples, SayEveryCellOfEveryRowInTheOrderOfTheTable)
{
    constexpr Twips Narrow = 1300; // seven columns beside each other
    TableGrid grid = gridOf(GetParam(), Narrow);
    const BuiltReport report(platform_, grid);
    const QString path = write(report.document(), Tagged);
    EXPECT_EQ(faultsOf(QStringLiteral("tagged"), path), "");
    const QString elements = elementsOf(path);
    std::vector<Text> wanted;
    for (std::int64_t row = 0; row < grid.rowCount(); ++row) {
        for (int column = 0; column < grid.columnCount(); ++column)
            wanted.emplace_back(trimmed(grid.cell(row, column)));
    }
    std::vector<Text> told = withoutBlanks(textsOf(elements, QStringLiteral("TD")));
    wanted = withoutBlanks(std::move(wanted));
    ASSERT_EQ(told.size(), wanted.size());
    if (grid.columnCount() > 7) { // in bands: a table each
        std::sort(told.begin(), told.end());
        std::sort(wanted.begin(), wanted.end());
    }
    EXPECT_EQ(told, wanted);
    EXPECT_EQ(textsOf(elements, QStringLiteral("TH")).size(),
        static_cast<std::size_t>(grid.columnCount()));
}

INSTANTIATE_TEST_SUITE_P(Files, TaggedSamples,
    testing::Values(Sample { "countries-zh.csv", u',' }, Sample { "wine.csv", u',' },
        Sample { "time-zones.tsv", u'\t' }));

TEST_F(PdfTagsTest, PagesThatWereNotBuiltAreParagraphs)
{
    PageDocument document;
    addLine(document, { 0, 0 }, { 500, 0 });
    addText(
        document, { 500, 300 }, u"Page 2 of [Pages], [Pages]", { .font = { .name = Text(Uming) } });
    document.newPage();
    addText(document, { 1000, 1000 }, u"a missing \u0E00 character",
        { .font = { .name = Text(Uming) } });
    const QString path = write(document, Tagged);
    EXPECT_EQ(faultsOf(QStringLiteral("tagged"), path), "");
    const std::vector<Text> texts = textsOf(elementsOf(path), QStringLiteral("P"));
    ASSERT_EQ(texts.size(), 2U);
    EXPECT_EQ(texts[0], u"Page 2 of 2, 2");
    EXPECT_NE(texts[1].find(u"missing"), Text::npos);
    EXPECT_NE(texts[1].find(u"character"), Text::npos);
}

TEST_F(PdfTagsTest, BlankCellsKeepTheirPlaceInTheRow)
{
    TableGrid grid({ { u"A", 1600 }, { u"B", 1600 }, { u"C", 1600 } });
    grid.addRow(std::vector<TextView> { u"1", u"", u"3" });
    const BuiltReport report(platform_, grid);
    const QString path = write(report.document(), Tagged);
    EXPECT_EQ(faultsOf(QStringLiteral("tagged"), path), "");
    EXPECT_EQ(
        textsOf(elementsOf(path), QStringLiteral("TD")), (std::vector<Text> { u"1", u"", u"3" }));
}

TEST_F(PdfTagsTest, ChosenPagesAreAWholeTree)
{
    TableGrid grid = gridOf({ "countries-zh.csv", u',' });
    const BuiltReport report(platform_, grid);
    ExportOptions options = Tagged;
    options.pages = { 3, 1 };
    EXPECT_EQ(faultsOf(QStringLiteral("tagged"), write(report.document(), options)), "");
}

TEST_F(PdfTagsTest, AFileForArchivesSaysSoAndHoldsAllItNeeds)
{
    TableGrid grid = gridOf({ "countries-zh.csv", u',' });
    const BuiltReport report(platform_, grid);
    ExportOptions options = Tagged;
    options.isArchive = true;
    const QString path = write(report.document(), options);
    EXPECT_EQ(faultsOf(QStringLiteral("archive"), path), "");
    EXPECT_EQ(faultsOf(QStringLiteral("tagged"), path), "");
}

TEST_F(PdfTagsTest, ThePlainFileHasNoTree)
{
    PageDocument document;
    addText(document, { 500, 300 }, u"plain", { .font = { .name = Text(Uming) } });
    const QString path = write(document, {});
    EXPECT_FALSE(elementsOf(path).contains(QStringLiteral("Document")));
}

} // namespace pelloric::qt
