// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any text as a range of pages, as a page list and as a number of copies.

#include "fuzz_platform.h"

#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "print/page_list.h"

using namespace pelloric;

namespace {

void checkPageList(TextView range)
{
    try {
        const Text list = pageListOf(range);
        if (!contains(range, u"-"))
            fuzz::require(list == range);
        fuzz::require(!contains(list, u"-"));
        fuzz::require(pageNumbersOf(list).size() <= list.size());
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    if (size > 512)
        return 0;
    const Text text = fromUtf8({ reinterpret_cast<const char*>(data), size });
    checkPageList(trimmed(text));
    fuzz::require(pageNumbersOf(text).size() <= text.size() + 1);
    try {
        const std::int16_t copies = copiesOf(text);
        fuzz::require(!text.empty() || copies == 1);
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow);
    }
    return 0;
}
