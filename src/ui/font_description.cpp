// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/font_description.h"

#include "document/records.h"
#include "platform/numbers.h"

#include <array>

namespace pelloric {

namespace {

struct StyleWord {
    bool Font::*style;
    TextView word;
};

/// In the order in which the words stand.
constexpr auto StyleWords = std::to_array<StyleWord>({
    { &Font::bold, u"Bold " },
    { &Font::italic, u"Italic " },
    { &Font::strikethrough, u"StrikeOut " },
    { &Font::underline, u"Underline " },
});

} // namespace

Text fontDescription(const Font& font)
{
    Text words;
    for (const StyleWord& row : StyleWords) {
        if (font.*row.style)
            words += row.word;
    }
    Text text = formatSingle(font.size) + u" pt. " + font.name;
    if (!words.empty())
        text += u" [ " + words + u"]";
    return text;
}

} // namespace pelloric
