// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/paper_names.h"

#include "document/page_document.h"
#include "support/errors.h"

#include <gtest/gtest.h>

#include <limits>

namespace pelloric {

TEST(PaperNames, SetTheirSizesLessTheEdge)
{
    struct Case {
        TextView name;
        Twips height;
        Twips width;
    };
    const Case cases[] = {
        { u"8k", 21713, 14909 },
        { u"16k", 15079, 10770 },
        { u"A3", 23414, 16440 },
        { u"A4", 16440, 11507 },
        { u"B5", 10940, 8105 },
    };
    for (const Case& row : cases) {
        PageSetup portrait;
        PageSetup landscape;
        EXPECT_TRUE(applyPaperName(row.name, portrait, true));
        EXPECT_TRUE(applyPaperName(row.name, landscape, false));
        EXPECT_EQ(portrait, (PageSetup { .myHeight = row.height, .myWidth = row.width }));
        EXPECT_EQ(landscape, (PageSetup { .myHeight = row.width, .myWidth = row.height }));
    }
}

TEST(PaperNames, B4KeepsTheSizeButLosesTheEdgeAndTurnsInLandscape)
{
    PageSetup setup { .myHeight = 9000, .myWidth = 5000 };
    EXPECT_TRUE(applyPaperName(u"B4", setup, true));
    EXPECT_EQ(setup, (PageSetup { .myHeight = 8600, .myWidth = 4600 }));
    EXPECT_TRUE(applyPaperName(u"B4", setup, false));
    EXPECT_EQ(setup, (PageSetup { .myHeight = 4200, .myWidth = 8200 }));
}

TEST(PaperNames, CompareExactly)
{
    for (const TextView name : { u"Letter", u"a4", u"A4 ", u"" }) {
        PageSetup setup;
        EXPECT_FALSE(applyPaperName(name, setup, true));
        EXPECT_EQ(setup, PageSetup {});
    }
}

TEST(PaperNames, ChangeNothingWhenASizeLeavesItsRange)
{
    PageSetup setup { .myHeight = 9000, .myWidth = std::numeric_limits<Twips>::min() };
    const PageSetup before = setup;
    EXPECT_EQ(errorOf([&] { applyPaperName(u"B4", setup, true); }), ErrorNumber::Overflow);
    EXPECT_EQ(setup, before);
}

TEST(StandardPaperForms, StandInTheOrderOfTheirCodes)
{
    const std::vector<PaperForm> forms = standardPaperForms();
    EXPECT_EQ(forms.at(0).name, u"Letter");
    EXPECT_EQ(forms.at(4).name, u"Legal");
    EXPECT_EQ(forms.at(7), (PaperForm { u"A3", 297, 420 }));
    EXPECT_EQ(forms.at(8), (PaperForm { u"A4", 210, 297 }));
    EXPECT_EQ(forms.at(10), (PaperForm { u"A5", 148, 210 }));
    EXPECT_EQ(forms.at(26), (PaperForm { u"Envelope DL", 110, 220 }));
    for (const PaperForm& form : forms) {
        EXPECT_FALSE(form.name.empty());
        EXPECT_GT(form.widthMm, 0);
        EXPECT_GT(form.heightMm, 0);
    }
}

} // namespace pelloric
