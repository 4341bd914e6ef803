// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "export/qt/page_export.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/qt/uming.h"
#include "settings/default_settings.h"
#include "support/qt/font_copies.h"
#include "support/qt/pictures.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <string_view>

namespace pelloric::qt {

/// The part of all pixels in which the pages of the two writers may differ: another antialiasing.
inline constexpr double SameInk = 0.0015;

/// Italics that are made up lean by 12 degrees, as on screen, and by 17 in the toolkit's: tangents
/// as they stand in the pages, the second one as long as the first.
inline constexpr std::string_view OwnSlant = "1 0 .2126 1 ";
inline constexpr std::string_view ToolkitsSlant = "1 0 .3    1 ";
static_assert(OwnSlant.size() == ToolkitsSlant.size());

/// The toolkit rounds pages up to whole points: pixels.
inline constexpr int OnePoint = 3;

/// How far the edges of all ink may lie apart: pixels.
inline constexpr int SameEdge = 2;

/// Ink of one picture is no lighter than this in the other, by another antialiasing.
inline constexpr int FaintShade = 240;

/// How far the ink of a picture stands out of that of another: pixels, 0 when it does not.
inline int standingOut(const QImage& one, const QImage& other)
{
    const QRect ink = inkOf(one);
    const QRect all = inkOf(other, FaintShade);
    return ink.isEmpty() ? 0 : farthestEdge(all, all.united(ink));
}

inline QString nameOf(const std::filesystem::path& path)
{
    return QString::fromStdString(path.string());
}

/// Compares the pages of the house's PDF writer with those of the toolkit's.
class PdfEqualsToolkit : public testing::Test {
protected:
    void SetUp() override
    {
        ASSERT_TRUE(loadUming());
        ASSERT_TRUE(loadCffFont());
    }

    /// Writes a document by both writers and compares their pages.
    void expectEqual(const PageDocument& document, const PageSetup& setup)
    {
        const ExportOptions options { .title = u"both" };
        const PdfExport made = exportPdf(document, setup, fonts_, options, own());
        EXPECT_EQ(toUtf8(made.byToolkitBecause), "");
        exportPdfByToolkit(document, setup, fonts_, options, toolkits());
        expectClean();
        EXPECT_EQ(textOf(own()).toStdString(), textOf(toolkits()).toStdString());
        leanAsToolkits();
        for (int page = 1; page <= document.pageCount(); ++page)
            expectSamePicture(page);
    }

    /// Lays a grid out as a preview does and compares the pages.
    /// @param pages  at least so many are compared
    void expectEqualReport(AutomationObject& grid, const ReportOptions& reportOptions, int pages,
        PrintObjKind kind = PrintObjKind::MSFlexGrid)
    {
        QtPlatform platform;
        platform.folders().setSystemDirectory(folder_.path());
        deployDefaultSettings(platform.record());
        Platform services = platform.record();
        Canvas canvas(services);
        canvas.options = reportOptions;
        canvas.m_PrintObj = kind;
        canvas.doPreview(grid);
        ASSERT_GE(canvas.document().pageCount(), pages);
        expectEqual(canvas.document(), canvas.page);
        RecordProperty("greatestDifferencePpm", static_cast<int>(greatest_ * 1e6));
    }

    void expectSamePicture(int page)
    {
        const QString folder = nameOf(folder_.path());
        const QImage one = paperPicture(nameOf(leaning()), folder, page);
        const QImage whole = paperPicture(nameOf(toolkits()), folder, page);
        const QSize more = whole.size() - one.size();
        ASSERT_TRUE(more.width() >= 0 && more.width() <= OnePoint) << more.width();
        ASSERT_TRUE(more.height() >= 0 && more.height() <= OnePoint) << more.height();
        const QImage other = whole.copy(one.rect());
        const double difference = differenceOf(one, other);
        greatest_ = std::max(greatest_, difference);
        EXPECT_LT(difference, SameInk) << "page " << page;
        EXPECT_LE(standingOut(one, other), SameEdge) << "page " << page;
        EXPECT_LE(standingOut(other, one), SameEdge) << "page " << page;
    }

    /// What a check of the file's structure says.
    void expectClean()
    {
        const ProgramResult check
            = runProgram(QStringLiteral("qpdf"), { QStringLiteral("--check"), nameOf(own()) });
        EXPECT_EQ(check.status, 0) << check.output.toStdString() << check.errors.toStdString();
    }

    /// Leaves another slant out of the comparison of pictures: copies the file with that of the
    /// toolkit in its pages.
    void leanAsToolkits()
    {
        const ProgramResult unpacked = runProgram(QStringLiteral("qpdf"),
            { QStringLiteral("--stream-data=uncompress"), nameOf(own()), nameOf(leaning()) });
        ASSERT_EQ(unpacked.status, 0) << unpacked.errors.toStdString();
        std::string bytes = TempFolder::bytesOf(leaning());
        for (std::size_t at = bytes.find(OwnSlant); at != std::string::npos;
             at = bytes.find(OwnSlant, at))
            bytes.replace(at, OwnSlant.size(), ToolkitsSlant);
        folder_.write(LeaningName, bytes);
    }

    QString textOf(const std::filesystem::path& path)
    {
        return runProgram(QStringLiteral("pdftotext"),
            { QStringLiteral("-raw"), nameOf(path), QStringLiteral("-") })
            .output;
    }

    std::filesystem::path own() const { return folder_.file("own.pdf"); }
    std::filesystem::path toolkits() const { return folder_.file("toolkit.pdf"); }
    std::filesystem::path leaning() const { return folder_.file(LeaningName); }

    static constexpr std::string_view LeaningName = "leaning.pdf";

    TempFolder folder_;
    QtFonts fonts_;
    double greatest_ = 0; ///< difference seen so far
};

} // namespace pelloric::qt
