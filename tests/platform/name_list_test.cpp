// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/name_list.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(NameList, TakesAListApartAtItsCommas)
{
    struct Case {
        TextView list;
        std::vector<ListedName> names;
    };
    const Case cases[] = {
        { u"", { { .name = u"" } } },
        { u"a", { { .name = u"a" } } },
        { u" a b ,, c", { { .name = u"a b" }, {}, { .name = u"c" } } },
        { u"a,", { { .name = u"a" }, {} } },
        { u"\"Price, net\",b", { { .name = u"Price, net", .isQuoted = true }, { .name = u"b" } } },
        { u"a, \"say \"\"no\"\"\" ",
            { { .name = u"a" }, { .name = u"say \"no\"", .isQuoted = true } } },
        { u"\"\"", { { .isQuoted = true } } },
        { u"\"a,b\":desc,c:asc",
            { { .name = u"a,b", .after = u":desc", .isQuoted = true }, { .name = u"c:asc" } } },
        { u"sum:\"a,b\", mean: c",
            { { .before = u"sum:", .name = u"a,b", .isQuoted = true }, { .name = u"mean: c" } } },
        { u"5\", 6\"", { { .name = u"5\"" }, { .name = u"6\"" } } },
        { u"\"abc\" def,2", { { .name = u"\"abc\" def" }, { .name = u"2" } } },
        { u"\"open,b", { { .name = u"\"open" }, { .name = u"b" } } },
        { u"a,b:\"c", { { .name = u"a" }, { .name = u"b:\"c" } } },
    };
    for (const Case& row : cases)
        EXPECT_EQ(listedNames(row.list), row.names)
            << std::string(row.list.begin(), row.list.end());
}

TEST(NameList, GivesEveryNameBackFromTheListThatItMakes)
{
    const std::vector<Text> names { u"Name", u"Price, net", u"say \"no\"", u"\"quoted\"", u"5\"",
        u" blank ", u"a:\"b\"", u"a:b", u"单价，元" };
    EXPECT_EQ(namesOf(listOf(names)), names);
    EXPECT_EQ(
        listOf(std::vector<Text> { u"Name", u"Price, net", u"5\"" }), u"Name, \"Price, net\", 5\"");
    EXPECT_EQ(namesOf(u" a,, \"\" ,b"), (std::vector<Text> { u"a", u"b" }));
}

} // namespace pelloric
