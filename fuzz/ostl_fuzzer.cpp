// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any bytes as a document file; what was read is written, and what is written reads back the same.

#include "fuzz_platform.h"

#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "document/page_document.h"
#include "platform/run_time_error.h"
#include "view/page_texts.h"

#include <sstream>

using namespace pelloric;

namespace {

const fuzz::Utf8Codec Codec;

bool read(const std::string& bytes, PageDocument& document, PageSetup& setup)
{
    std::istringstream stream(bytes);
    try {
        return readOstl(Codec, stream, document, setup) == OstlResult::Opened;
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
        return false;
    }
}

std::string written(const PageDocument& document, const PageSetup& setup)
{
    std::ostringstream stream;
    writeOstl(document, setup, { Codec, u'.' }, {}, stream);
    return stream.str();
}

/// Whether a record reads back as another: a text that is a line of the file's own structure ends
/// the list of texts early, and the name of a face that is no finite number comes back as "0".
bool changesOnReading(const TextRecord& record, const PageDocument& document)
{
    return contains(record.text(), u"##Release2004-10-23")
        || contains(document.style(record.style).font.name, u"Inf");
}

bool changesOnReading(const PageDocument& document)
{
    for (int page = 0; page < document.pageCount(); ++page) {
        for (const TextRecord record : document.texts(page)) {
            if (changesOnReading(record, document))
                return true;
        }
    }
    return false;
}

/// Where the texts of the pages stand.
void readTexts(const PageDocument& document)
{
    static fuzz::EvenMetrics metrics;
    try {
        for (int page = 0; page < document.pageCount(); ++page)
            asTable(placedTexts(document, page, metrics));
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    if (size > 1U << 16U)
        return 0;
    PageDocument first;
    PageSetup setup;
    const bool opened = read(std::string(reinterpret_cast<const char*>(data), size), first, setup);
    if (!opened) {
        written(first, setup);
        return 0;
    }
    readTexts(first);
    const std::string once = written(first, setup);
    PageDocument second;
    PageSetup again;
    fuzz::require(read(once, second, again));
    fuzz::require(again.myWidth == setup.myWidth && again.myHeight == setup.myHeight);
    const bool isCut = first.pageCount() > 131; // pages past the last one that a file holds
    if (!isCut && !changesOnReading(first))
        fuzz::require(written(second, again) == once);
    return 0;
}
