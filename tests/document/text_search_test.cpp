// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/text_search.h"

#include "document/recorder.h"
#include "fakes/fake_metrics.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// A document with these texts on its pages.
struct Pages {
    explicit Pages(const std::vector<std::vector<TextView>>& pages)
    {
        for (std::size_t page = 0; page < pages.size(); ++page) {
            if (page > 0)
                document.newPage();
            Recorder recorder(document, metrics);
            for (const TextView text : pages[page])
                recorder.printText(text, true);
        }
    }

    TextSearch searchAll(TextView searched) const
    {
        TextSearch search(document, searched);
        while (search.searchPages(1)) { }
        return search;
    }

    FakeMetrics metrics;
    PageDocument document;
};

} // namespace

TEST(TextSearch, CountsEveryPlaceOnEveryPage)
{
    const Pages pages({ { u"banana", u"an" }, {}, { u"Ananas" } });
    const TextSearch search = pages.searchAll(u"an");
    EXPECT_EQ(search.count(), 5);
    EXPECT_EQ(search.countOn(0), 3);
    EXPECT_EQ(search.countOn(1), 0);
    EXPECT_EQ(search.countOn(2), 2);
    EXPECT_EQ(search.countBefore(2), 3);
    EXPECT_EQ(
        search.matches(0), (std::vector<TextMatch> { { 0, 1, 2 }, { 0, 3, 2 }, { 1, 0, 2 } }));
    EXPECT_EQ(search.matches(3), std::vector<TextMatch> {});
}

TEST(TextSearch, TakesCapitalsAndSmallLettersForTheSame)
{
    const Pages pages({ { u"GRÖSSE größe", u"ΑΘΗΝΑ", u"Москва", u"页码", u"ＡＢ", u"Žižek" } });
    for (const TextView searched : { u"Größe", u"αθηνα", u"МОСКВА", u"页码", u"ａｂ", u"žIŽ" }) {
        const TextSearch search = pages.searchAll(searched);
        EXPECT_EQ(search.count(), 1) << toUtf8(searched);
    }
    EXPECT_EQ(pages.searchAll(u"grösse").count(), 1);
}

TEST(TextSearch, FindsThePageCountAsItIsShown)
{
    const Pages pages({ { u"1 of [Pages]", u"[x]" }, { u"2 of [Pages]" } });
    EXPECT_EQ(pages.searchAll(u"of 2").count(), 2);
    EXPECT_EQ(pages.searchAll(u"[Pages]").count(), 0);
    EXPECT_EQ(pages.searchAll(u"[X]").count(), 1);
}

TEST(TextSearch, FindsNothingWhereThereIsNothingToFind)
{
    const Pages pages(std::vector<std::vector<TextView>> { { u"ab", u"" } });
    EXPECT_EQ(pages.searchAll(u"").count(), 0);
    EXPECT_TRUE(TextSearch(pages.document, u"").isDone());
    EXPECT_TRUE(TextSearch().isDone());
    EXPECT_EQ(pages.searchAll(u"abc").count(), 0);
    EXPECT_EQ(pages.searchAll(u"abc").pageWithMatch(0, true), -1);
}

TEST(TextSearch, KnowsOnlyThePagesThatItHasSearched)
{
    const Pages pages({ { u"a" }, { u"a" }, { u"a" } });
    TextSearch search(pages.document, u"a");
    EXPECT_FALSE(search.isDone());
    EXPECT_TRUE(search.searchPages(2));
    EXPECT_EQ(search.count(), 2);
    EXPECT_EQ(search.countOn(2), 0);
    EXPECT_FALSE(search.searchPages(5));
    EXPECT_TRUE(search.isDone());
    EXPECT_EQ(search.count(), 3);
}

TEST(TextSearch, GoesRoundThroughThePagesWithAPlace)
{
    const Pages pages({ { u"-" }, { u"a" }, { u"-" }, { u"a" }, { u"-" } });
    const TextSearch search = pages.searchAll(u"a");
    EXPECT_EQ(search.pageWithMatch(0, true), 1);
    EXPECT_EQ(search.pageWithMatch(2, true), 3);
    EXPECT_EQ(search.pageWithMatch(4, true), 1);
    EXPECT_EQ(search.pageWithMatch(5, true), 1);
    EXPECT_EQ(search.pageWithMatch(2, false), 1);
    EXPECT_EQ(search.pageWithMatch(0, false), 3);
    EXPECT_EQ(search.pageWithMatch(-1, false), 3);
}

} // namespace pelloric
