// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "view/missing_glyphs.h"

#include "document/page_document.h"
#include "platform/phrase.h"
#include "platform/services.h"
#include "platform/text_metrics.h"

#include <algorithm>
#include <array>
#include <optional>

namespace pelloric {

namespace {

constexpr TextView Noto = u"fonts-noto-core";
constexpr TextView NotoCjk = u"fonts-noto-cjk";
constexpr TextView Unifont = u"fonts-unifont";

struct Script {
    char32_t first;
    char32_t last;
    TextView name;
    TextView package;
};

/// In ascending order.
constexpr auto Scripts = std::to_array<Script>({
    { 0x0000, 0x036F, u"Latin", u"fonts-dejavu-core" },
    { 0x0370, 0x03FF, u"Greek", u"fonts-dejavu-core" },
    { 0x0400, 0x052F, u"Cyrillic", u"fonts-dejavu-core" },
    { 0x0530, 0x058F, u"Armenian", u"fonts-dejavu-core" },
    { 0x0590, 0x05FF, u"Hebrew", Noto },
    { 0x0600, 0x06FF, u"Arabic", Noto },
    { 0x0700, 0x074F, u"Syriac", Noto },
    { 0x0750, 0x077F, u"Arabic", Noto },
    { 0x0780, 0x07BF, u"Thaana", Noto },
    { 0x07C0, 0x07FF, u"N'Ko", Noto },
    { 0x0800, 0x083F, u"Samaritan", Noto },
    { 0x0840, 0x085F, u"Mandaic", Noto },
    { 0x0860, 0x086F, u"Syriac", Noto },
    { 0x0870, 0x08FF, u"Arabic", Noto },
    { 0x0900, 0x097F, u"Devanagari", Noto },
    { 0x0980, 0x09FF, u"Bengali", Noto },
    { 0x0A00, 0x0A7F, u"Gurmukhi", Noto },
    { 0x0A80, 0x0AFF, u"Gujarati", Noto },
    { 0x0B00, 0x0B7F, u"Oriya", Noto },
    { 0x0B80, 0x0BFF, u"Tamil", Noto },
    { 0x0C00, 0x0C7F, u"Telugu", Noto },
    { 0x0C80, 0x0CFF, u"Kannada", Noto },
    { 0x0D00, 0x0D7F, u"Malayalam", Noto },
    { 0x0D80, 0x0DFF, u"Sinhala", Noto },
    { 0x0E00, 0x0E7F, u"Thai", Noto },
    { 0x0E80, 0x0EFF, u"Lao", Noto },
    { 0x0F00, 0x0FFF, u"Tibetan", Noto },
    { 0x1000, 0x109F, u"Myanmar", Noto },
    { 0x10A0, 0x10FF, u"Georgian", Noto },
    { 0x1100, 0x11FF, u"Hangul", NotoCjk },
    { 0x1200, 0x139F, u"Ethiopic", Noto },
    { 0x13A0, 0x13FF, u"Cherokee", Noto },
    { 0x1400, 0x167F, u"Canadian syllabics", Noto },
    { 0x1780, 0x17FF, u"Khmer", Noto },
    { 0x1800, 0x18AF, u"Mongolian", Noto },
    { 0x2000, 0x2BFF, u"symbol", Unifont },
    { 0x2E80, 0x303F, u"Han", NotoCjk },
    { 0x3040, 0x30FF, u"Kana", NotoCjk },
    { 0x3100, 0x312F, u"Bopomofo", NotoCjk },
    { 0x3130, 0x318F, u"Hangul", NotoCjk },
    { 0x3190, 0x9FFF, u"Han", NotoCjk },
    { 0xA000, 0xA4CF, u"Yi", Noto },
    { 0xA960, 0xA97F, u"Hangul", NotoCjk },
    { 0xAC00, 0xD7FF, u"Hangul", NotoCjk },
    { 0xE000, 0xF8FF, u"private", {} },
    { 0xF900, 0xFAFF, u"Han", NotoCjk },
    { 0xFB1D, 0xFB4F, u"Hebrew", Noto },
    { 0xFB50, 0xFDFF, u"Arabic", Noto },
    { 0xFE70, 0xFEFF, u"Arabic", Noto },
    { 0xFF00, 0xFFEF, u"full-width", NotoCjk },
    { 0x1B000, 0x1B16F, u"Kana", NotoCjk },
    { 0x1F000, 0x1FAFF, u"emoji", u"fonts-noto-color-emoji" },
    { 0x20000, 0x3FFFF, u"Han", NotoCjk },
    { 0xF0000, 0x10FFFF, u"private", {} },
});

constexpr Script OtherScript { 0, 0x10FFFF, u"other", Unifont };

/// The last two places of each plane hold no character, whatever a file says.
constexpr Script NoScript { 0, 0x10FFFF, u"invalid", {} };

bool isNoCharacter(char32_t codePoint) { return (codePoint & 0xFFFE) == 0xFFFE; }

const Script& scriptOf(char32_t codePoint)
{
    if (isNoCharacter(codePoint))
        return NoScript;
    const auto script = std::ranges::lower_bound(Scripts, codePoint, {}, &Script::last);
    const bool isInside = script != Scripts.end() && script->first <= codePoint;
    return isInside ? *script : OtherScript;
}

void count(char32_t codePoint, std::vector<MissingScript>& scripts)
{
    const Script& script = scriptOf(codePoint);
    auto found = std::ranges::find(scripts, script.name, &MissingScript::script);
    if (found == scripts.end())
        found = scripts.insert(scripts.end(), { Text(script.name), Text(script.package) });
    ++found->count;
}

/// Most texts lack nothing.
bool isWhole(TextView text, FaceMetrics& face)
{
    return std::ranges::all_of(text, [&](char16_t unit) {
        return !isHalfPair(unit) && face.kindOf(unit) == CharacterKind::Plain;
    });
}

void countIn(TextView text, FaceMetrics& face, std::vector<MissingScript>& scripts)
{
    if (isWhole(text, face))
        return;
    for (std::size_t position = 0; position < text.size();) {
        const char32_t codePoint = nextCodePoint(text, position);
        if (!isHalfPair(codePoint) && face.kindOf(codePoint) == CharacterKind::Missing)
            count(codePoint, scripts);
    }
}

} // namespace

std::vector<MissingScript> missingGlyphs(
    const PageDocument& document, TextMetrics& metrics, MessageLoop* loop)
{
    std::vector<MissingScript> scripts;
    std::optional<std::uint32_t> style;
    FaceMetrics* face = nullptr;
    for (int page = 0; page < document.pageCount(); ++page) {
        if (loop)
            loop->keepAlive();
        for (const TextRecord& text : document.texts(page)) {
            if (style != text.style) {
                const Font& font = document.style(text.style).font;
                face = &metrics.face(font.name, font.bold, font.italic);
                style = text.style;
            }
            countIn(text.text(), *face, scripts);
        }
    }
    std::ranges::stable_sort(scripts, std::greater(), &MissingScript::count);
    return scripts;
}

Text missingGlyphsText(const std::vector<MissingScript>& scripts)
{
    if (scripts.empty())
        return {};
    std::int64_t total = 0;
    Text list;
    std::vector<TextView> packages;
    for (const MissingScript& script : scripts) {
        total += script.count;
        list.append(list.empty() ? u"" : u", ");
        list.append(decimal(script.count)).append(u" ").append(script.script);
        if (!script.package.empty()
            && std::ranges::find(packages, script.package) == packages.end())
            packages.push_back(script.package);
    }
    Text text = phrase(total == 1
            ? phraseText(
                u"%1 character has no glyph in any installed font and shows as a hollow box "
                u"(%2)")
            : phraseText(
                u"%1 characters have no glyph in any installed font and show as hollow boxes "
                u"(%2)"),
        { decimal(total), list });
    if (packages.empty())
        return text;
    Text names;
    for (const TextView package : packages)
        names.append(names.empty() ? u"" : u", ").append(package);
    return phrase(u"%1; install %2", { text, names });
}

} // namespace pelloric
