// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any text as a header or footer with fields, and as the text of a page with the page count in it.

#include "fuzz_platform.h"

#include "document/page_document.h"
#include "report/page_fields.h"

using namespace pelloric;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static const fuzz::FixedClock clock;
    if (size > 4096)
        return 0;
    const Text text = fromUtf8({ reinterpret_cast<const char*>(data), size });
    if (hasPageField(text)) {
        const Text expanded = expandPageField(text, 32767, clock);
        fuzz::require(expanded.size() <= text.size() + 64);
    }
    Text buffer;
    const TextView filled = withPageCount(text, 32767, buffer);
    fuzz::require(contains(text, PageCountToken) || filled == text);
    fuzz::require(filled.size() <= text.size());
    return 0;
}
