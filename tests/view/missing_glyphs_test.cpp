// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/missing_glyphs.h"

#include "document/page_document.h"
#include "fakes/fake_metrics.h"
#include "fakes/fake_services.h"
#include "support/errors.h"
#include "support/recorded_pages.h"

#include <gtest/gtest.h>

namespace pelloric {

namespace {

/// Has the glyphs of ASCII only.
class AsciiFace : public FakeFace {
protected:
    bool hasGlyph(char32_t codePoint) override { return codePoint < 0x80; }
};

class AsciiMetrics : public TextMetrics {
public:
    FaceMetrics& face(TextView, bool, bool) override { return face_; }

private:
    AsciiFace face_;
};

} // namespace

TEST(MissingGlyphs, AreCountedByScriptTheMostFrequentFirst)
{
    PageDocument document;
    addText(document, { 0, 0 }, u"Total\t12\n", {});
    addText(document, { 0, 0 }, u"กa", {});
    document.newPage();
    addText(document, { 0, 0 }, u"한국한국 \U0001F600", {});
    addText(document, { 0, 0 }, Text { u'a', 0xD800, 0xFFFE, 0xE000 }, {});
    AsciiMetrics metrics;
    const auto scripts = missingGlyphs(document, metrics);
    EXPECT_EQ(scripts,
        (std::vector<MissingScript> { { u"Hangul", u"fonts-noto-cjk", 4 },
            { u"Thai", u"fonts-noto-core", 1 }, { u"emoji", u"fonts-noto-color-emoji", 1 },
            { u"invalid", u"", 1 }, { u"private", u"", 1 } }));
}

TEST(MissingGlyphs, AreToldWithThePackagesThatHelp)
{
    EXPECT_EQ(missingGlyphsText({ { u"Hangul", u"fonts-noto-cjk", 40 },
                  { u"Han", u"fonts-noto-cjk", 2 }, { u"Thai", u"fonts-noto-core", 1 } }),
        u"43 characters have no glyph in any installed font and show as hollow boxes "
        u"(40 Hangul, 2 Han, 1 Thai); install fonts-noto-cjk, fonts-noto-core");
    EXPECT_EQ(missingGlyphsText({ { u"private", u"", 1 } }),
        u"1 character has no glyph in any installed font and shows as a hollow box (1 private)");
    EXPECT_EQ(missingGlyphsText({}), u"");
}

TEST(MissingGlyphs, AreNoneInAPlainDocument)
{
    PageDocument document;
    addText(document, { 0, 0 }, u"Total 汉字", {});
    FakeMetrics metrics;
    EXPECT_TRUE(missingGlyphs(document, metrics).empty());
}

TEST(MissingGlyphs, AreCountedNoFurtherOnceTheUserEndsIt)
{
    PageDocument document;
    for (int page = 1; page < 5; ++page)
        document.newPage();
    FakeMetrics metrics;
    FakeMessageLoop loop;
    loop.cancelAtBeat = 3;
    EXPECT_EQ(errorOf([&] { missingGlyphs(document, metrics, &loop); }), ErrorNumber::Cancelled);
    EXPECT_EQ(loop.beats, 3);
}

} // namespace pelloric
