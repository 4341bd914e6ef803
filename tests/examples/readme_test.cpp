// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "fakes/temp_folder.h"
#include "support/test_paths.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace pelloric {

namespace {

std::string fileOf(const char* path)
{
    return TempFolder::bytesOf(std::filesystem::path(PELLORIC_TESTS_DIR).parent_path() / path);
}

/// What stands between two marks; the text behind the first where the second is missing.
std::string between(const std::string& text, std::string_view first, std::string_view second)
{
    const std::size_t start = text.find(first);
    if (start == std::string::npos)
        return "(not found)";
    const std::string rest = text.substr(start + first.size());
    return rest.substr(0, rest.find(second));
}

/// The code of an example, without the lines of its licence.
std::string codeOf(const char* path)
{
    const std::string example = fileOf(path);
    return example.substr(example.find("#include"));
}

} // namespace

TEST(Readme, ShowsTheExampleLineForLine)
{
    const std::string code = between(fileOf("README.md"), "```cpp\n", "```");
    EXPECT_EQ(code, codeOf("examples/stock_list/main.cpp"));
}

TEST(Guides, StartWithTheExampleOfATableLineForLine)
{
    const std::string code = between(fileOf("docs/guide/quick_start.md"), "```cpp\n", "```");
    EXPECT_EQ(code, codeOf("examples/table/main.cpp"));
}

TEST(Examples, OfEachKindOfGridTakeThirtyLinesAtMost)
{
    for (const char* const example :
        { "examples/table/main.cpp", "examples/tree/main.cpp", "examples/sql/main.cpp" }) {
        const std::string code = fileOf(example);
        EXPECT_LE(std::ranges::count(code, '\n'), 30) << example;
    }
}

} // namespace pelloric
