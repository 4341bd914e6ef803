// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/page_export.h"

#include "document/ostl_writer.h"
#include "document/page_document.h"
#include "export/qt/export_parts.h"
#include "export/qt/page_workers.h"
#include "export/qt/pending_files.h"
#include "export/qt/png_bytes.h"
#include "export/qt/svg_page.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/qt/qt_drawing_surface.h"
#include "platform/qt/qt_files.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "platform/safe_file.h"
#include "platform/units.h"
#include "view/joined_lines.h"
#include "view/page_renderer.h"

#include <QImage>
#include <QPageLayout>
#include <QPainter>
#include <QPdfWriter>

#include <algorithm>
#include <cmath>
#include <memory>
#include <string>

namespace pelloric::qt {

namespace {

/// A cosmetic line of a PDF is one pixel of this resolution wide: fine, and seen everywhere.
constexpr int PdfResolution = 600;

constexpr double MostPixels = 1U << 28U;

constexpr std::size_t FewestDigits = 3; ///< of the page number in a file's name

/// The same, each page once.
std::vector<int> differentPagesOf(const PageDocument& document, const ExportOptions& options)
{
    std::vector<int> pages;
    std::vector<bool> isTaken(static_cast<std::size_t>(document.pageCount()));
    for (const int page : pagesOf(document, options)) {
        if (!isTaken[static_cast<std::size_t>(page)])
            pages.push_back(page);
        isTaken[static_cast<std::size_t>(page)] = true;
    }
    return pages;
}

/// Draws pages of a document on painters.
class PagePainter {
public:
    PagePainter(const PageDocument& document, const PageSetup& setup, QtFonts& fonts)
        : renderer_(document)
        , paper_(0, 0, setup.myWidth, setup.myHeight)
        , fonts_(fonts)
    {
    }

    /// @param resolution  of the device: pixels per inch
    /// @param isWhite     whether the paper is painted white first
    void paint(int page, QPainter& painter, double resolution, bool isWhite) const
    {
        painter.save();
        painter.scale(resolution / TwipsPerInch, resolution / TwipsPerInch);
        QtDrawingSurface surface(painter, fonts_, { .page = isWhite ? paper_ : QRectF() });
        JoinedLines joined(surface);
        renderer_.replay(page, {}, joined);
        joined.finish();
        painter.restore();
    }

private:
    PageRenderer renderer_;
    QRectF paper_;
    QtFonts& fonts_;
};

/// Makes pictures of pages, with fonts of its own.
class ImagePainter {
public:
    ImagePainter(const PageDocument& document, const PageSetup& setup, int dpi, QSize size)
        : pages_(document, setup, fonts_)
        , dpi_(dpi)
        , image_(size, QImage::Format_RGB32)
    {
        if (image_.isNull())
            throw RunTimeError(ErrorNumber::Overflow,
                phrase(u"there is no memory for an image of %1 by %2 pixels; choose a lower "
                       u"resolution",
                    { decimal(size.width()), decimal(size.height()) }));
        const int dotsPerMetre = roundToInt32(dpi * 1000 / MmPerInch);
        image_.setDotsPerMeterX(dotsPerMetre);
        image_.setDotsPerMeterY(dotsPerMetre);
    }

    /// The bytes of a page's PNG file; empty: there is no memory for them.
    QByteArray png(int page)
    {
        image_.fill(Qt::white);
        QPainter painter(&image_);
        pages_.paint(page, painter, dpi_, true);
        painter.end();
        return pngBytes(image_);
    }

private:
    QtFonts fonts_;
    PagePainter pages_;
    int dpi_;
    QImage image_;
};

/// The toolkit's pages measure whole points.
int wholePoints(Twips length) { return roundToInt32(std::ceil(length / TwipsPerPoint)); }

void setUpPdf(QPdfWriter& writer, const PageSetup& setup, const Text& title)
{
    const QSizeF points(wholePoints(setup.myWidth), wholePoints(setup.myHeight));
    const QPageSize size(points, QPageSize::Point, QStringLiteral("Paper"), QPageSize::ExactMatch);
    writer.setResolution(PdfResolution);
    writer.setPageLayout(QPageLayout(size, QPageLayout::Portrait, QMarginsF()));
    writer.setTitle(toQString(title));
    writer.setCreator(QStringLiteral("Pelloric"));
}

std::filesystem::path numberedPath(
    const std::filesystem::path& path, int page, const PageDocument& document)
{
    const std::size_t digits = std::max(FewestDigits, std::to_string(document.pageCount()).size());
    const std::string number = std::to_string(page + 1);
    std::filesystem::path name = path.stem();
    name += "-" + std::string(digits - number.size(), '0') + number;
    name += path.extension();
    return path.parent_path() / name;
}

using FileWriter = std::function<bool(int page, QFile& file)>;

/// Writes a file for each page and puts all into place at the end.
std::vector<std::filesystem::path> exportEach(const PageDocument& document,
    const ExportOptions& options, const std::filesystem::path& path, const FileWriter& write)
{
    const std::vector<int> pages = differentPagesOf(document, options);
    const std::vector<std::filesystem::path> paths = pageFilePaths(document, options, path);
    PendingFiles files;
    const std::int64_t total = std::ssize(pages);
    std::int64_t done = 0;
    for (std::size_t i = 0; i < pages.size(); ++i) {
        tell(options.progress, done++, total);
        files.write(paths[i], [&](QFile& file) { return write(pages[i], file); });
    }
    tell(options.progress, total, total);
    files.putInPlace();
    return paths;
}

QSize pixelsOf(const PageSetup& setup, int dpi)
{
    const double width = roundHalfEven(setup.myWidth / TwipsPerInch * dpi);
    const double height = roundHalfEven(setup.myHeight / TwipsPerInch * dpi);
    if (dpi < 1 || width < 1 || height < 1 || width * height > MostPixels)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"an image of %1 by %2 pixels (%3 per inch) cannot be made; it has 1 to %4, so "
                   u"choose another resolution",
                { formatNumber(width), formatNumber(height), decimal(dpi),
                    formatNumber(MostPixels) }));
    return QSize(roundToInt32(width), roundToInt32(height));
}

} // namespace

std::vector<std::filesystem::path> pageFilePaths(
    const PageDocument& document, const ExportOptions& options, const std::filesystem::path& path)
{
    const std::vector<int> pages = differentPagesOf(document, options);
    if (pages.size() == 1)
        return { path };
    std::vector<std::filesystem::path> paths;
    paths.reserve(pages.size());
    for (const int page : pages)
        paths.push_back(numberedPath(path, page, document));
    return paths;
}

void exportPdfByToolkit(const PageDocument& document, const PageSetup& setup, QtFonts& fonts,
    const ExportOptions& options, const std::filesystem::path& path)
{
    checkPaper(setup);
    const std::vector<int> pages = pagesOf(document, options);
    const PagePainter pagePainter(document, setup, fonts);
    PendingFiles files;
    files.write(path, [&](QFile& file) {
        QPdfWriter writer(&file);
        setUpPdf(writer, setup, options.title);
        QPainter painter;
        const std::int64_t total = std::ssize(pages);
        std::int64_t done = 0;
        for (const int page : pages) {
            tell(options.progress, done, total);
            const bool isReady = done == 0 ? painter.begin(&writer) : writer.newPage();
            if (!isReady || file.error() != QFileDevice::NoError)
                return false;
            pagePainter.paint(page, painter, PdfResolution, false);
            ++done;
        }
        tell(options.progress, total, total);
        return painter.end();
    });
    files.putInPlace();
}

std::vector<std::filesystem::path> exportPngs(const PageDocument& document, const PageSetup& setup,
    const ExportOptions& options, const std::filesystem::path& path)
{
    checkPaper(setup);
    const QSize size = pixelsOf(setup, options.dpi);
    // A font belongs to the thread that uses it, so every thread finds its own.
    const auto makeMaker = [&] {
        return [painter = std::make_shared<ImagePainter>(document, setup, options.dpi, size)](
                   int page) { return painter->png(page); };
    };
    const int jobs = options.jobs > 0 ? options.jobs : defaultJobs();
    PageWorkers workers(differentPagesOf(document, options), jobs, makeMaker);
    return exportEach(document, options, path, [&](int, QFile& file) {
        const QByteArray bytes = workers.next();
        return !bytes.isEmpty() && file.write(bytes) == bytes.size();
    });
}

std::vector<std::filesystem::path> exportSvg(const PageDocument& document, const PageSetup& setup,
    QtFonts& fonts, const ExportOptions& options, const std::filesystem::path& path)
{
    checkPaper(setup);
    const PageRenderer renderer(document);
    return exportEach(document, options, path, [&](int page, QFile& file) {
        SvgPage svg({ setup.myWidth, setup.myHeight }, options.title, fonts);
        JoinedLines joined(svg);
        renderer.replay(page, {}, joined);
        joined.finish();
        const std::string bytes = svg.take();
        const auto size = static_cast<qint64>(bytes.size());
        return file.write(bytes.data(), size) == size;
    });
}

void exportOstl(const PageDocument& document, const PageSetup& setup, const OstlEncoding& encoding,
    const ExportOptions& options, const std::filesystem::path& path)
{
    QtFiles files;
    writeOstl(document, setup, encoding, options.progress, SafeFile(files, path));
}

} // namespace pelloric::qt
