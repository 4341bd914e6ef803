// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_font.h"

#include "export/pdf_file.h"
#include "export/pdf_syntax.h"

#include <algorithm>

namespace pelloric::pdf {

namespace {

/// Bytes that mean something in a string.
constexpr std::string_view SpecialBytes = "\n\r()\\";

constexpr auto PlainBytes = [] {
    std::array<unsigned char, 256 - SpecialBytes.size()> bytes {};
    std::size_t count = 0;
    for (int byte = 0; byte < 256; ++byte) {
        if (SpecialBytes.find(static_cast<char>(byte)) == std::string_view::npos)
            bytes[count++] = static_cast<unsigned char>(byte);
    }
    return bytes;
}();

/// Codes of one byte end before this byte, those of two begin with it or one behind it.
constexpr std::size_t FirstOfTwo = 0x80;

/// The bytes that are codes; 0 is none.
constexpr auto ShortCodes = static_cast<std::size_t>(std::count_if(PlainBytes.begin(),
    PlainBytes.end(), [](unsigned char byte) { return byte > 0 && byte < FirstOfTwo; }));

constexpr std::size_t LongCodes = (256 - FirstOfTwo) * PlainBytes.size();

/// Alphabets of few letters end here, and writings of many begin.
constexpr char16_t FirstOfMany = 0x0600;

/// A block of a character map holds no more.
constexpr std::size_t BlockSize = 100;

constexpr double DefaultWidth = 1000;

/// Flags of a font descriptor.
constexpr int FixedPitch = 1;
constexpr int Symbolic = 4;
constexpr int Italic = 64;

constexpr std::string_view SystemInfo = "<</Registry(Adobe)/Ordering(Identity)/Supplement 0>>";

/// @param place  in the order of the codes of one byte
std::uint16_t shortCode(std::size_t place) { return PlainBytes[place + 1]; }

/// @param place  in the order of the codes of two bytes
std::uint16_t longCode(std::size_t place)
{
    const auto high = static_cast<unsigned>(FirstOfTwo + place / PlainBytes.size());
    const unsigned low = PlainBytes[place % PlainBytes.size()];
    return static_cast<std::uint16_t>((high << 8U) | low);
}

void appendCode(std::string& out, std::uint16_t code)
{
    constexpr std::string_view Digits = "0123456789ABCDEF";
    out += '<';
    for (unsigned shift = isLongCode(code) ? 16 : 8; shift > 0;) {
        shift -= 4;
        out += Digits[(code >> shift) & 0xFU];
    }
    out += '>';
}

std::string mapHead(std::string_view name)
{
    std::string map("/CIDInit /ProcSet findresource begin\n12 dict begin\nbegincmap\n"
                    "/CIDSystemInfo ");
    map += SystemInfo;
    map += " def\n/CMapName ";
    appendName(map, name);
    map += " def\n/CMapType 1 def\n2 begincodespacerange\n<00> <7F>\n<8000> <FFFF>\n"
           "endcodespacerange\n";
    return map;
}

constexpr std::string_view MapTail
    = "endcmap\nCMapName currentdict /CMap defineresource pop\nend\nend\n";

/// Appends rows in blocks, each between "begin" and "end" of what they are.
template <typename Row>
void appendBlocks(std::string& out, std::string_view what, std::size_t count, const Row& row)
{
    for (std::size_t first = 0; first < count; first += BlockSize) {
        const std::size_t last = std::min(count, first + BlockSize);
        appendInteger(out, static_cast<std::int64_t>(last - first));
        out.append(" begin").append(what) += '\n';
        for (std::size_t at = first; at < last; ++at)
            row(at);
        out.append("end").append(what) += '\n';
    }
}

} // namespace

PdfFont::PdfFont(FontProgram& program, int object)
    : program_(program)
    , object_(object)
{
}

std::optional<std::uint16_t> PdfFont::code(std::uint32_t glyph, TextView meaning)
{
    Text key { static_cast<char16_t>(glyph >> 16U), static_cast<char16_t>(glyph & 0xFFFFU) };
    key += meaning;
    const auto known = known_.find(key);
    if (known != known_.end())
        return known->second;
    const auto code = nextCode(meaning);
    if (code) {
        known_.emplace(std::move(key), *code);
        entries_.push_back({ *code, glyph, Text(meaning) });
    }
    return code;
}

/// Letters of alphabets get the codes of one byte as long as there are any.
std::optional<std::uint16_t> PdfFont::nextCode(TextView meaning)
{
    const bool isLetter = meaning.size() == 1 && meaning.front() < FirstOfMany;
    if (isLetter && shortCodes_ < ShortCodes)
        return shortCode(shortCodes_++);
    if (longCodes_ < LongCodes)
        return longCode(longCodes_++);
    return std::nullopt;
}

void PdfFont::write(PdfFile& file) const
{
    std::vector<Entry> entries = entries_;
    std::ranges::sort(entries, {}, &Entry::code);
    std::vector<std::uint32_t> glyphs;
    for (const Entry& entry : entries)
        glyphs.push_back(entry.glyph);
    const FontSubset subset = program_.subset(glyphs);
    const std::string name = taggedName();
    const int descendant = writeDescendant(file, subset, name, widths(glyphs, subset));
    const int meanings = file.reserve();
    file.writeStream(meanings, "", toUnicode(entries));
    const int encoding = file.reserve();
    std::string encodingEntries("/Type/CMap/CMapName/Codes/CIDSystemInfo");
    encodingEntries += SystemInfo;
    file.writeStream(encoding, encodingEntries, cids(entries, subset));
    std::string body("<</Type/Font/Subtype/Type0/BaseFont");
    appendName(body, name);
    body += "/Encoding ";
    appendReference(body, encoding);
    body += "/DescendantFonts[";
    appendReference(body, descendant);
    body += "]/ToUnicode ";
    appendReference(body, meanings);
    body += ">>";
    file.write(object_, body);
}

/// The name with six letters in front that tell this part of the font from others.
std::string PdfFont::taggedName() const
{
    std::uint64_t hash = 14695981039346656037U;
    for (const Entry& entry : entries_)
        hash = (hash ^ entry.glyph) * 1099511628211U;
    std::string name;
    for (int letter = 0; letter < 6; ++letter) {
        name += static_cast<char>('A' + hash % 26);
        hash /= 26;
    }
    return name + '+' + program_.facts().name;
}

/// The character map from codes to the glyphs of the subset.
std::string PdfFont::cids(std::span<const Entry> entries, const FontSubset& subset)
{
    std::string map = mapHead("Codes");
    appendBlocks(map, "cidchar", entries.size(), [&](std::size_t at) {
        appendCode(map, entries[at].code);
        map += ' ';
        appendInteger(map, subset.numbers[at]);
        map += '\n';
    });
    map += MapTail;
    return map;
}

/// Widths by glyph of the subset.
std::string PdfFont::widths(std::span<const std::uint32_t> glyphs, const FontSubset& subset) const
{
    std::vector<std::pair<std::uint16_t, double>> widths;
    for (std::size_t at = 0; at < glyphs.size(); ++at) {
        const double width = program_.advance(glyphs[at]);
        if (width != DefaultWidth)
            widths.emplace_back(subset.numbers[at], width);
    }
    std::sort(widths.begin(), widths.end());
    widths.erase(std::unique(widths.begin(), widths.end()), widths.end());
    std::string list;
    for (std::size_t at = 0; at < widths.size(); ++at) {
        const bool follows = at > 0 && widths[at].first == widths[at - 1].first + 1;
        if (!follows) {
            list += at > 0 ? "]" : "";
            appendInteger(list, widths[at].first);
        }
        list += follows ? ' ' : '[';
        appendNumber(list, widths[at].second);
    }
    return widths.empty() ? list : list + ']';
}

std::string PdfFont::toUnicode(std::span<const Entry> entries)
{
    std::vector<const Entry*> meant;
    for (const Entry& entry : entries) {
        if (!entry.meaning.empty())
            meant.push_back(&entry);
    }
    std::string map = mapHead("Adobe-Identity-UCS");
    appendBlocks(map, "bfchar", meant.size(), [&](std::size_t at) {
        appendCode(map, meant[at]->code);
        map += " <";
        appendHex(map, meant[at]->meaning);
        map += ">\n";
    });
    map += MapTail;
    return map;
}

int PdfFont::writeProgram(PdfFile& file, const FontSubset& subset, const std::string& name) const
{
    const FontFacts& facts = program_.facts();
    const bool isTrueType = facts.outlines == Outlines::TrueType;
    const int bytes = file.reserve();
    std::string entries(isTrueType ? "/Length1 " : "/Subtype/CIDFontType0C");
    if (isTrueType)
        appendInteger(entries, static_cast<std::int64_t>(subset.bytes.size()));
    file.writeStream(bytes, entries, subset.bytes);
    std::string body("<</Type/FontDescriptor/FontName");
    appendName(body, name);
    body += "/Flags ";
    appendInteger(body,
        Symbolic + (facts.isFixedPitch ? FixedPitch : 0) + (facts.italicAngle != 0 ? Italic : 0));
    body += "/FontBBox[";
    appendNumbers(body, facts.box[0], facts.box[1], facts.box[2], facts.box[3]);
    body += "]/ItalicAngle ";
    appendNumber(body, facts.italicAngle);
    body += "/Ascent ";
    appendNumber(body, facts.ascent);
    body += "/Descent ";
    appendNumber(body, facts.descent);
    body += "/CapHeight ";
    appendNumber(body, facts.capHeight);
    body += "/StemV ";
    appendNumber(body, facts.boldness);
    body += isTrueType ? "/FontFile2 " : "/FontFile3 ";
    appendReference(body, bytes);
    body += ">>";
    const int descriptor = file.reserve();
    file.write(descriptor, body);
    return descriptor;
}

/// @param widthList  the widths of the glyphs
int PdfFont::writeDescendant(PdfFile& file, const FontSubset& subset, const std::string& name,
    const std::string& widthList) const
{
    const bool isTrueType = program_.facts().outlines == Outlines::TrueType;
    const int descriptor = writeProgram(file, subset, name);
    std::string body("<</Type/Font/Subtype/CIDFontType");
    body += isTrueType ? '2' : '0';
    body += "/BaseFont";
    appendName(body, name);
    body += "/CIDSystemInfo";
    body += SystemInfo;
    body += "/FontDescriptor ";
    appendReference(body, descriptor);
    body += "/DW 1000/W[" + widthList + ']';
    if (isTrueType)
        body += "/CIDToGIDMap/Identity";
    body += ">>";
    const int descendant = file.reserve();
    file.write(descendant, body);
    return descendant;
}

} // namespace pelloric::pdf
