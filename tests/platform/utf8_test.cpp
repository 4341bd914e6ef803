// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/utf8.h"

#include "platform/text.h"

#include <gtest/gtest.h>

#include <string>

namespace pelloric {

namespace {

struct Utf8Case {
    std::string bytes;
    Text units;
};

const Utf8Case Cases[] = {
    { "", u"" },
    { "A-1 ~", u"A-1 ~" },
    { "\xDF\xBF\xE0\xA0\x80", u"\u07FF\u0800" },
    { "\xE5\xAE\x8B\xE4\xBD\x93.", u"宋体." },
    { "\xED\x9F\xBF\xEE\x80\x80\xEF\xBF\xBF", u"\uD7FF\uE000\uFFFF" },
    { "\xF0\x9F\x98\x80", u"\U0001F600" },
    { "\xE0\x9F\xBF", u"\uFFFD\uFFFD\uFFFD" }, // too long a form
    { "\xED\xA0\x80x", u"\uFFFD\uFFFD\uFFFDx" }, // half a pair
    { "\xE5\xAE", u"\uFFFD\uFFFD" }, // cut off
    { "\xE5\xAE\xE5\xAE\x8B", u"\uFFFD\uFFFD宋" },
    { "\xE5.\x8B", u"\uFFFD.\uFFFD" },
    { "\x80\xFF", u"\uFFFD\uFFFD" },
};

} // namespace

TEST(PutUtf8, PutsWholeCharactersAndMarksEveryByteThatIsNone)
{
    for (const Utf8Case& row : Cases) {
        Text room(row.bytes.size() + 1, u'#');
        const char16_t* const end = putUtf8(room.data(), row.bytes);
        const auto size = static_cast<std::size_t>(end - room.data());
        ASSERT_LE(size, row.bytes.size());
        EXPECT_EQ(room.substr(0, size), row.units);
        EXPECT_EQ(room[size], u'#') << "nothing is put behind the end";
    }
}

} // namespace pelloric
