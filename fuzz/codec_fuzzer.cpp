// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any bytes in the system's code page: read as a document file and as settings by the real
// converter, lines longer than what a reader takes at once among them.

#include "fuzz_bytes.h"
#include "fuzz_platform.h"

#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "document/page_document.h"
#include "platform/qt/qt_text_codec.h"
#include "platform/run_time_error.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <sstream>

using namespace pelloric;

namespace {

constexpr std::size_t PieceBytes = 1U << 18U; ///< that a reader takes at once

/// A document file whose head ends just about where the first piece does.
std::string documentOf(std::string_view bytes, unsigned shift)
{
    std::string file;
    if (shift < 64) {
        file.assign(PieceBytes - shift, ' ');
        file += "\r\n";
    }
    file += "##Release2004-10-23\r\n##Release2004-10-23PageWidth=11907\r\n"
            "##Release2004-10-23PageHeight=16840\r\n##Release2004-10-23[0]\r\n"
            "##Release2004-10-23 PLine Begin\r\n##Release2004-10-23 PLine End\r\n"
            "##Release2004-10-23 Text Begin\r\n0\r\n0\r\n0\r\n9\r\n0\r\n10\r\n20\r\n";
    return file.append(bytes).append("\r\n##Release2004-10-23 Text End\r\n\"\r\n");
}

PageDocument read(const TextCodec& codec, const std::string& file)
{
    PageDocument document;
    PageSetup setup;
    std::istringstream stream(file);
    try {
        fuzz::require(readOstl(codec, stream, document, setup) == OstlResult::Opened);
        fuzz::require(setup.myWidth == 11907);
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
    }
    return document;
}

void checkDocument(const TextCodec& codec, std::string_view bytes, unsigned shift)
{
    const PageDocument document = read(codec, documentOf(bytes, shift));
    std::ostringstream stream;
    writeOstl(document, {}, { codec, u'.' }, {}, stream);
    const PageDocument again = read(codec, stream.str());
    const auto before = document.texts(0);
    const auto after = again.texts(0);
    if (before.size() != 1 || document.pageCount() != 1)
        return;
    // What the converter makes of a damaged text stays what it is from then on.
    fuzz::require(after.size() == 1);
    std::string once;
    std::string twice;
    codec.encode(before[0].text(), once);
    codec.encode(after[0].text(), twice);
    fuzz::require(once == twice);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static fuzz::FuzzPlatform plain;
    static qt::QtTextCodec codec;
    static const Platform services { plain.metrics, codec, plain.messages, plain.loop, plain.clock,
        plain.folders, plain.files, plain.printer, plain.printers, plain.library };
    if (size == 0 || size > 1U << 12U)
        return 0;
    const std::string_view bytes(reinterpret_cast<const char*>(data) + 1, size - 1);
    const Text text = codec.decode(bytes);
    fuzz::require(text.size() <= bytes.size());
    std::string encoded;
    codec.encode(text, encoded);
    checkDocument(codec, bytes, data[0]);
    plain.folders.write("OstlConfig.ini", bytes);
    const TextView key = settingsTable()[data[0] % settingsTable().size()].name;
    fuzz::require(readSetting(services, key) == SettingsSnapshot(services).value(key));
    fuzz::require(writeSetting(services, key, u"宋体") == SaveOutcome::Written);
    return 0;
}
