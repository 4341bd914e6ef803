// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/file_names.h"

#include <gtest/gtest.h>

#if defined(__unix__)

namespace pelloric::qt {

TEST(FileNames, KeepEveryByteOfAName)
{
    for (const std::string name : { "", "plain.csv", "北京/a 😀.csv", "\xFF", "a\xFE\xFF.csv",
             "\xE5\x8C", "\xE5\x8C/x", "\xED\xB2\x80", "\xC0\x80", "\xF0\x9F\x98", "😀\x98" }) {
        const QString text = fileNameOf(QByteArrayView(name.data(), std::ssize(name)));
        EXPECT_EQ(pathOf(text).string(), name);
    }
}

TEST(FileNames, LeaveTextsAsTheyAre)
{
    EXPECT_EQ(fileNameOf("北京 😀").toStdString(), "北京 😀");
    EXPECT_EQ(fileNameOf("a\xFF").size(), 2);
}

} // namespace pelloric::qt

#endif
