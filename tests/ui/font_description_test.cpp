// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/font_description.h"

#include "document/records.h"

#include <gtest/gtest.h>

namespace pelloric {

TEST(FontDescription, NamesSizeFaceAndStyles)
{
    EXPECT_EQ(fontDescription({ .name = u"宋体", .size = 9 }), u"9 pt. 宋体");
    EXPECT_EQ(fontDescription({ .name = u"Arial", .size = 10.5F, .underline = true }),
        u"10.5 pt. Arial [ Underline ]");
    EXPECT_EQ(fontDescription({ .name = u"宋体", .size = 9, .bold = true, .italic = true }),
        u"9 pt. 宋体 [ Bold Italic ]");
    EXPECT_EQ(fontDescription({ u"A", 8, true, true, true, true }),
        u"8 pt. A [ Bold Italic StrikeOut Underline ]");
}

} // namespace pelloric
