// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/file_kinds.h"

#include "platform/phrase.h"

#include <algorithm>
#include <array>

namespace pelloric {

namespace {

constexpr std::string_view Blanks = " \t\r\n";

constexpr TextView Picture = phraseText(u"this is a picture, not a table");
constexpr TextView Packed
    = phraseText(u"this is a packed file; unpack it first, for example with: gunzip -c FILE");
constexpr TextView Document
    = phraseText(u"this is an HTML or XML document, not a table; save its table as CSV");

struct FileKind {
    std::string_view mark;
    bool isText; ///< in small letters; blanks may stand before it, and capitals are no others
    TextView what;
};

constexpr auto Kinds = std::to_array<FileKind>({
    { "%PDF-", false,
        phraseText(
            u"this is a PDF file; take the file that it was made from, or save its table as CSV") },
    { "PK\x03\x04", false, phraseText(u"this is a ZIP archive; unpack it first") },
    { "\x1F\x8B", false, Packed },
    { "BZh91AY", false, Packed },
    { "\xFD"
      "7zXZ",
        false, Packed },
    { "\x28\xB5\x2F\xFD", false, Packed },
    { "\x89PNG", false, Picture },
    { "\xFF\xD8\xFF", false, Picture },
    { "GIF89a", false, Picture },
    { "\x7F"
      "ELF",
        false, phraseText(u"this is a program, not a table") },
    { std::string_view("ARROW1\0", 7), false,
        phraseText(u"this is an Arrow file; save its table as CSV") },
    { "PAR1\x15", false, phraseText(u"this is a Parquet file; save its table as CSV") },
    { "{\\rtf", false, phraseText(u"this is a text document, not a table; save its table as CSV") },
    { "<?xml", true, Document },
    { "<!doctype", true, Document },
    { "<html", true, Document },
    { "<svg", true, Document },
});

char small(char letter)
{
    return letter >= 'A' && letter <= 'Z' ? static_cast<char>(letter - 'A' + 'a') : letter;
}

bool startsWithWord(std::string_view text, std::string_view word)
{
    const std::size_t first = std::min(text.find_first_not_of(Blanks), text.size());
    const std::string_view start = text.substr(first, word.size());
    return std::ranges::equal(start, word, {}, small);
}

} // namespace

TextView notATable(std::string_view start)
{
    for (const FileKind& kind : Kinds) {
        if (kind.isText ? startsWithWord(start, kind.mark) : start.starts_with(kind.mark))
            return kind.what;
    }
    return {};
}

} // namespace pelloric
