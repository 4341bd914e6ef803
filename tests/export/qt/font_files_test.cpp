// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/font_files.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>

namespace pelloric::qt {

TEST(FontFiles, OfAFamilyAreFilesOfTheSystem)
{
    const std::vector<FontFile> files = fontFilesOf(QStringLiteral("AR PL UMing CN"));
    ASSERT_FALSE(files.empty());
    for (const FontFile& file : files)
        EXPECT_TRUE(std::filesystem::is_regular_file(file.path)) << file.path;
    const auto isCollection = [](const FontFile& file) { return file.path.ends_with(".ttc"); };
    EXPECT_TRUE(std::ranges::any_of(files, isCollection));
}

TEST(FontFiles, TellApartTheFontsOfACollection)
{
    const auto indexOf = [](const QString& family) {
        const std::vector<FontFile> files = fontFilesOf(family);
        return files.empty() ? -1 : static_cast<int>(files.front().index);
    };
    EXPECT_NE(indexOf(QStringLiteral("AR PL UMing CN")), indexOf(QStringLiteral("AR PL UMing TW")));
}

TEST(FontFiles, OfAFamilyThatIsNotInstalledAreNone)
{
    EXPECT_TRUE(fontFilesOf(QStringLiteral("no such family")).empty());
}

} // namespace pelloric::qt
