// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/text_copy.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(PutText, CopiesTextsOfEveryLengthAndTouchesNothingAround)
{
    Text source;
    for (char16_t unit = 1; unit <= 100; ++unit)
        source.push_back(unit);
    for (std::size_t length = 0; length <= source.size(); ++length) {
        Text room(length + 2, u'#');
        const char16_t* const end = putText(room.data() + 1, TextView(source).substr(0, length));
        EXPECT_EQ(end, room.data() + 1 + length);
        EXPECT_EQ(room, u"#" + source.substr(0, length) + u"#");
    }
}

TEST(PutText, BeginsWhereverTheTextDoes)
{
    const Text source = u"one two three four five six seven";
    for (std::size_t start = 0; start < source.size(); ++start) {
        Text room(source.size() - start, u'#');
        putText(room.data(), TextView(source).substr(start));
        EXPECT_EQ(room, source.substr(start));
    }
}

} // namespace pelloric
