// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text_codec.h"

#include <gtest/gtest.h>

namespace pelloric::qt {

namespace {

struct CodedText {
    TextView text;
    std::string_view bytes;
};

constexpr CodedText CodedTexts[] = {
    { u"plain, 123", "plain, 123" },
    { u"★", "\xA1\xEF" },
    { u"【", "\xA1\xBE" },
    { u"宋体", "\xCB\xCE\xCC\xE5" },
    { u"NO. 宋", "NO. \xCB\xCE" },
    { u"\U0001F600", "\x94\x39\xFC\x36" },
    { u"", "" },
};

std::string encoded(TextView text)
{
    std::string bytes;
    QtTextCodec().encode(text, bytes);
    return bytes;
}

} // namespace

TEST(QtTextCodec, EncodesTheCodePageOfFiles)
{
    for (const CodedText& coded : CodedTexts)
        EXPECT_EQ(encoded(coded.text), coded.bytes);
}

TEST(QtTextCodec, DecodesTheCodePageOfFiles)
{
    const QtTextCodec codec;
    for (const CodedText& coded : CodedTexts)
        EXPECT_EQ(codec.decode(coded.bytes), coded.text);
}

TEST(QtTextCodec, AppendsToTheBytes)
{
    const QtTextCodec codec;
    std::string bytes = "a";
    codec.encode(u"★", bytes);
    codec.encode(u"b", bytes);
    EXPECT_EQ(bytes,
        "a\xA1\xEF"
        "b");
}

TEST(QtTextCodec, KeepsEveryCharacterOfThePlane)
{
    const QtTextCodec codec;
    Text all;
    for (char32_t unit = 1; unit < 0x10000; ++unit) {
        if (unit < 0xD800 || unit >= 0xE000)
            all.push_back(static_cast<char16_t>(unit));
    }
    std::string bytes;
    codec.encode(all, bytes);
    EXPECT_EQ(codec.decode(bytes), all);
}

TEST(QtTextCodec, WritesAQuestionMarkForHalfAPair)
{
    EXPECT_EQ(encoded(TextView(u"a\xD800z", 3)), "a?z");
    EXPECT_EQ(encoded(TextView(u"宋\xD800", 2)), "\xCB\xCE?");
    EXPECT_EQ(encoded(TextView(u"\xDC00", 1)), "?");
}

TEST(QtTextCodec, ReadsBrokenBytesAsReplacementCharacters)
{
    const QtTextCodec codec;
    EXPECT_EQ(codec.decode("a\xFFz"), u"a\uFFFDz");
    EXPECT_EQ(codec.decode("a\xA1 b"), u"a\uFFFD b");
    EXPECT_EQ(codec.decode("\xA1\xEF\xA1"), u"★\uFFFD");
    EXPECT_EQ(codec.decode("\xA1\xEF"), u"★") << "nothing is left of the text before";
}

} // namespace pelloric::qt
