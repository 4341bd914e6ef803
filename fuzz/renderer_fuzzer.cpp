// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any records on any pages: replayed on a surface, joined, found, and read as a table.

#include "fuzz_document.h"
#include "fuzz_platform.h"

#include "document/text_search.h"
#include "platform/drawing_state.h"
#include "platform/run_time_error.h"
#include "view/joined_lines.h"
#include "view/missing_glyphs.h"
#include "view/page_renderer.h"
#include "view/page_texts.h"

using namespace pelloric;

namespace {

/// Counts what is drawn; texts have no line ends and sizes are numbers.
class CountingSurface final : public StatefulSurface {
public:
    std::size_t lines = 0;
    std::size_t texts = 0;
    bool hasPageCount = false;

    void clear() override { }
    void setFontSize(float size) override { fuzz::require(size == size); }
    void line(Tpoint, Tpoint) override { ++lines; }
    void box(Tpoint, Tpoint, Color) override { ++lines; }
    void print(TextView text) override
    {
        ++texts;
        hasPageCount = hasPageCount || contains(text, PageCountToken);
    }
    void picture(TextView, Tpoint, Tpoint) override { }
};

ReplayOptions optionsOf(fuzz::Bytes& bytes)
{
    ReplayOptions options;
    static constexpr float Divisors[] = { 1, 0.14F, 0.01F, 1000, 1e-30F, 1e30F };
    options.divisor = Divisors[bytes.atMost(5)];
    options.fillPageCount = bytes.chance();
    options.isCleared = bytes.chance();
    options.resetsFill = bytes.chance();
    options.makesTextsTransparent = bytes.chance();
    if (bytes.chance())
        options.visible = PageRect { fuzz::twips(bytes), fuzz::twips(bytes), fuzz::twips(bytes),
            fuzz::twips(bytes) };
    return options;
}

void replay(const PageDocument& document, int page, const ReplayOptions& options)
{
    const PageRenderer renderer(document);
    CountingSurface plain;
    renderer.replay(page, options, plain);
    fuzz::require(plain.texts <= document.texts(page).size());
    fuzz::require(plain.lines <= document.lines(page).size());
    if (!options.visible)
        fuzz::require(plain.texts == document.texts(page).size());
    CountingSurface under;
    JoinedLines joined(under);
    renderer.replay(page, options, joined);
    joined.finish();
    fuzz::require(under.texts == plain.texts && under.lines <= plain.lines);
}

void find(const PageDocument& document, TextView text, TextMetrics& metrics)
{
    for (int page = 0; page < document.pageCount(); ++page) {
        const auto placed = placedTexts(document, page, metrics);
        fuzz::require(placed.size() == document.texts(page).size());
        asTable(placed);
        for (std::size_t at = 0; at < placed.size(); ++at)
            areaOf(document, page, { at, text.size(), text.size() }, metrics);
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static fuzz::FuzzPlatform platform;
    if (size > 1U << 12U)
        return 0;
    fuzz::Bytes bytes(data, size);
    const ReplayOptions options = optionsOf(bytes);
    PageDocument document;
    try {
        fuzz::record(bytes, document, platform.metrics);
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::Overflow && !error.detail().empty());
    }
    for (int page = 0; page < document.pageCount(); ++page)
        replay(document, page, options);
    find(document, bytes.text(4), platform.metrics);
    missingGlyphsText(missingGlyphs(document, platform.metrics));
    return 0;
}
