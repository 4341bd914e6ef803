// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/phrase.h"

#include "platform/run_time_error.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// Puts a translator in force for the time of a test.
struct InLanguage {
    explicit InLanguage(PhraseTranslator translator) { usePhraseTranslator(translator); }
    ~InLanguage() { usePhraseTranslator(nullptr); }
    InLanguage(const InLanguage&) = delete;
    InLanguage& operator=(const InLanguage&) = delete;
};

Text german(TextView english)
{
    if (english == u"%1 of %2 pages")
        return u"von %2 Seiten %1";
    if (english == u"Overflow")
        return u"Überlauf";
    return Text(english);
}

} // namespace

TEST(Phrase, PutsValuesWhereTheirNumbersStand)
{
    EXPECT_EQ(phrase(u"%2 before %1, %2 again", { u"a", u"b" }), u"b before a, b again");
    EXPECT_EQ(phrase(u"a file of 100%"), u"a file of 100%");
}

TEST(Phrase, LeavesValuesAndPlacesWithoutValuesAsTheyStand)
{
    EXPECT_EQ(phrase(u"%1 and %2", { u"50%2", u"%1" }), u"50%2 and %1");
    EXPECT_EQ(phrase(u"%1 %2 %0 %%1", { u"x" }), u"x %2 %0 %x");
}

TEST(Phrase, TakesTheOrderOfTheLanguageInForce)
{
    const InLanguage language(german);
    EXPECT_EQ(phrase(u"%1 of %2 pages", { u"3", u"9" }), u"von 9 Seiten 3");
    EXPECT_EQ(phrase(u"not in the catalogue"), u"not in the catalogue");
}

TEST(Phrase, GivesErrorsTheTextOfTheirNumberInTheLanguageInForce)
{
    const RunTimeError english(ErrorNumber::Overflow, u"Top: 4000");
    const InLanguage language(german);
    const RunTimeError error(ErrorNumber::Overflow, u"Top: 4000");
    EXPECT_EQ(error.text(), u"Überlauf: Top: 4000");
    EXPECT_EQ(error.detail(), u"Top: 4000");
    EXPECT_EQ(english.detail(), u"Top: 4000");
    EXPECT_EQ(RunTimeError(ErrorNumber::Overflow).text(), u"Überlauf");
    EXPECT_EQ(RunTimeError(ErrorNumber::Overflow).detail(), u"");
}

} // namespace pelloric
