// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any records on paper of any size, written in every format; what is written is whole.

#include "fuzz_application.h"
#include "fuzz_document.h"
#include "fuzz_platform.h"

#include "document/ostl_writer.h"
#include "export/qt/page_export.h"
#include "platform/qt/qt_platform.h"
#include "platform/run_time_error.h"

using namespace pelloric;

namespace {

struct Sheet {
    PageDocument document;
    PageSetup setup;
    qt::ExportOptions options;
};

struct Format {
    const char* name;
    void (*write)(qt::QtPlatform& platform, const Sheet& sheet, const std::filesystem::path& path);
    const char* begin; ///< of a whole file
    const char* end;
};

constexpr Format Formats[] = {
    { "f.pdf",
        [](qt::QtPlatform& platform, const Sheet& sheet, const std::filesystem::path& path) {
            qt::exportPdf(sheet.document, sheet.setup, platform.fonts(), sheet.options, path);
        },
        "%PDF-", "%%EOF\n" },
    { "t.pdf",
        [](qt::QtPlatform& platform, const Sheet& sheet, const std::filesystem::path& path) {
            qt::exportPdfByToolkit(
                sheet.document, sheet.setup, platform.fonts(), sheet.options, path);
        },
        "%PDF-", "%%EOF\n" },
    { "f.svg",
        [](qt::QtPlatform& platform, const Sheet& sheet, const std::filesystem::path& path) {
            qt::exportSvg(sheet.document, sheet.setup, platform.fonts(), sheet.options, path);
        },
        "<?xml", "</svg>\n" },
    { "f.png",
        [](qt::QtPlatform&, const Sheet& sheet, const std::filesystem::path& path) {
            qt::exportPngs(sheet.document, sheet.setup, sheet.options, path);
        },
        "\x89PNG", "IEND\xAE\x42\x60\x82" },
    { "f.ostl",
        [](qt::QtPlatform& platform, const Sheet& sheet, const std::filesystem::path& path) {
            qt::exportOstl(sheet.document, sheet.setup, { platform.record().codec, u'.' },
                sheet.options, path);
        },
        "\"\r\n##Release2004-10-23\r\n", "\"\r\n" },
};

Sheet sheetOf(fuzz::Bytes& bytes, TextMetrics& metrics)
{
    Sheet sheet;
    sheet.setup.myWidth = bytes.byte() < 230 ? 2000 : fuzz::twips(bytes);
    sheet.setup.myHeight = bytes.byte() < 230 ? 3000 : fuzz::twips(bytes);
    sheet.options.dpi = 1 + static_cast<int>(bytes.atMost(99));
    sheet.options.jobs = 1;
    sheet.options.title = bytes.text(8);
    sheet.options.isTagged = bytes.chance();
    sheet.options.isArchive = bytes.chance();
    try {
        fuzz::record(bytes, sheet.document, metrics);
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
    }
    sheet.options.pages = { 0 };
    return sheet;
}

bool isExpected(ErrorNumber number)
{
    return number == ErrorNumber::Overflow || number == ErrorNumber::InvalidCall;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    fuzz::application();
    static qt::QtPlatform platform;
    static const fuzz::ProcessFolder folder;
    if (size == 0 || size > 1U << 12U)
        return 0;
    fuzz::Bytes bytes(data, size);
    const Format& format = Formats[bytes.byte() % std::size(Formats)];
    const Sheet sheet = sheetOf(bytes, platform.record().metrics);
    const std::filesystem::path path = folder.systemDirectory() / format.name;
    std::filesystem::remove(path);
    try {
        format.write(platform, sheet, path);
        const std::string file = folder.read(format.name);
        fuzz::require(file.starts_with(format.begin) && file.ends_with(format.end));
    } catch (const RunTimeError& error) {
        fuzz::require(isExpected(error.number()) && !error.detail().empty());
        fuzz::require(!std::filesystem::exists(path));
    }
    return 0;
}
