// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/file_kinds.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(FileKinds, SaysOfFilesThatAreNoTablesWhatTheyAreAndWhatToDo)
{
    const std::pair<std::string_view, TextView> cases[] = {
        { "%PDF-1.7\n",
            u"this is a PDF file; take the file that it was made from, or save its table as CSV" },
        { "\x89PNG\r\n", u"this is a picture, not a table" },
        { "\x1F\x8B\x08",
            u"this is a packed file; unpack it first, for example with: gunzip -c FILE" },
        { std::string_view("ARROW1\0\0", 8), u"this is an Arrow file; save its table as CSV" },
        { "PK\x03\x04", u"this is a ZIP archive; unpack it first" },
        { "\n <!DOCTYPE html>",
            u"this is an HTML or XML document, not a table; save its table as CSV" },
        { "<?XML version", u"this is an HTML or XML document, not a table; save its table as CSV" },
    };
    for (const auto& [start, what] : cases)
        EXPECT_EQ(notATable(start), what) << start;
}

TEST(FileKinds, LeavesEveryBeginningOfATableAlone)
{
    for (const std::string_view start : { "", "\n", "a,b\n", "<5,>5\n1,2", "GIF8,PNG", "PK,Name",
             "%,n", "BZh,Amt", "PAR1,PAR2", "ARROW1,b", "{a},b", "<html" })
        EXPECT_EQ(notATable(start).empty(), start != "<html") << start;
}

} // namespace pelloric
