// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/line_reader.h"

#include <gtest/gtest.h>

#include <sstream>
#include <vector>

namespace pelloric {

namespace {

std::vector<std::string> linesOf(const std::string& bytes)
{
    std::istringstream stream(bytes);
    LineReader reader(stream);
    std::vector<std::string> lines;
    for (std::string_view line; reader.next(line);)
        lines.emplace_back(line);
    return lines;
}

using Lines = std::vector<std::string>;

} // namespace

TEST(LineReader, EndsLinesAtCrLfAtLfAndAtCr)
{
    EXPECT_EQ(linesOf("a\r\nb\nc\rd"), (Lines { "a", "b", "c", "d" }));
    EXPECT_EQ(linesOf("a\r\n"), (Lines { "a" }));
    EXPECT_EQ(linesOf("a\r"), (Lines { "a" }));
    EXPECT_EQ(linesOf("\r\n\r\n"), (Lines { "", "" }));
    EXPECT_EQ(linesOf("\n\r\r\n"), (Lines { "", "", "" }));
    EXPECT_EQ(linesOf("\n"), (Lines { "" }));
    EXPECT_EQ(linesOf(""), (Lines {}));
}

TEST(LineReader, KeepsEveryOtherByte)
{
    const std::string line("\0 \t\x1A\x80\xFF ", 7);
    EXPECT_EQ(linesOf(line + "\r\nb"), (Lines { line, "b" }));
}

TEST(LineReader, DoesNotMindWhereAPieceOfTheStreamEnds)
{
    constexpr std::size_t piece = 1U << 18U;
    for (const char* end : { "\r\n", "\n", "\r" }) {
        for (std::size_t length = piece - 3; length <= piece + 1; ++length) {
            const std::string first(length, 'x');
            EXPECT_EQ(linesOf(first + end + "b" + end), (Lines { first, "b" })) << length;
        }
    }
}

TEST(LineReader, TakesLinesOfAnyLength)
{
    const std::string line(3U << 20U, 'x');
    EXPECT_EQ(linesOf(line + "\r\n" + line), (Lines { line, line }));
}

} // namespace pelloric
