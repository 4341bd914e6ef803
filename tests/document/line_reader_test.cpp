// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/line_reader.h"

#include "platform/run_time_error.h"

#include <gtest/gtest.h>

#include <functional>
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

std::string errorTextOf(const std::function<void()>& action)
{
    try {
        action();
    } catch (const RunTimeError& error) {
        return toUtf8(error.detail());
    }
    return {};
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

TEST(LineReader, RefusesALineThatGoesOnBehindItsLimit)
{
    constexpr std::size_t piece = 1U << 18U;
    const LineLimits limits { .line = piece };
    std::istringstream exact("a\n" + std::string(piece, 'x') + "\nb");
    LineReader reader(exact, limits);
    std::string_view line;
    for (const std::size_t length : { std::size_t { 1 }, piece, std::size_t { 1 } }) {
        ASSERT_TRUE(reader.next(line));
        EXPECT_EQ(line.size(), length);
    }
    std::istringstream endless("a\n" + std::string(3 * piece, 'x'));
    LineReader refusing(endless, limits);
    ASSERT_TRUE(refusing.next(line));
    EXPECT_EQ(errorTextOf([&] { refusing.next(line); }), "a line holds more than 262144 bytes");
}

TEST(LineReader, RefusesAStreamThatGoesOnBehindItsLimit)
{
    constexpr std::size_t piece = 1U << 18U;
    std::istringstream lines(std::string(3 * piece, '\n'));
    LineReader reader(lines, { .all = 2 * piece });
    std::string_view line;
    std::size_t count = 0;
    const auto readAll = [&] {
        while (reader.next(line))
            ++count;
    };
    EXPECT_TRUE(errorTextOf(readAll).starts_with("it goes on after 524288 bytes, "));
    EXPECT_EQ(count, 2 * piece);
}

} // namespace pelloric
