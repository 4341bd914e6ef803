// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/qt_font_program.h"

#include "export/cff_charset.h"
#include "export/qt/font_files.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <QCryptographicHash>
#include <QtEndian>

#include <hb-ot.h>
#include <hb-subset.h>

#include <algorithm>
#include <array>

namespace pelloric::qt {

namespace {

constexpr hb_tag_t Head = HB_TAG('h', 'e', 'a', 'd');
constexpr hb_tag_t HorizontalHead = HB_TAG('h', 'h', 'e', 'a');
constexpr hb_tag_t HorizontalMetrics = HB_TAG('h', 'm', 't', 'x');
constexpr hb_tag_t Os2 = HB_TAG('O', 'S', '/', '2');
constexpr hb_tag_t Post = HB_TAG('p', 'o', 's', 't');
constexpr hb_tag_t Characters = HB_TAG('c', 'm', 'a', 'p');
constexpr hb_tag_t Locations = HB_TAG('l', 'o', 'c', 'a');
constexpr hb_tag_t Name = HB_TAG('n', 'a', 'm', 'e');
constexpr hb_tag_t TrueTypeGlyphs = HB_TAG('g', 'l', 'y', 'f');
constexpr hb_tag_t CffGlyphs = HB_TAG('C', 'F', 'F', ' ');

/// Tables of fonts whose glyphs change with axes or come in colours, which no PDF font has.
constexpr auto UnsuitableTables
    = std::to_array<hb_tag_t>({ HB_TAG('f', 'v', 'a', 'r'), HB_TAG('C', 'O', 'L', 'R'),
        HB_TAG('C', 'B', 'D', 'T'), HB_TAG('s', 'b', 'i', 'x'), HB_TAG('S', 'V', 'G', ' ') });

/// Tables that nobody needs who draws glyphs by their numbers.
constexpr auto NeedlessTables = std::to_array<hb_tag_t>({ HB_TAG('G', 'S', 'U', 'B'),
    HB_TAG('G', 'P', 'O', 'S'), HB_TAG('G', 'D', 'E', 'F'), HB_TAG('c', 'm', 'a', 'p'),
    HB_TAG('n', 'a', 'm', 'e'), HB_TAG('O', 'S', '/', '2'), HB_TAG('p', 'o', 's', 't'),
    HB_TAG('g', 'a', 's', 'p'), HB_TAG('v', 'h', 'e', 'a'), HB_TAG('v', 'm', 't', 'x'),
    HB_TAG('h', 'd', 'm', 'x'), HB_TAG('V', 'D', 'M', 'X'), HB_TAG('M', 'A', 'T', 'H'),
    HB_TAG('V', 'O', 'R', 'G'), HB_TAG('B', 'A', 'S', 'E'), HB_TAG('D', 'S', 'I', 'G') });

/// Tables that tell a font from all others: faces of a collection may share all but what leads from
/// characters to glyphs.
constexpr auto TellingTables
    = std::to_array<hb_tag_t>({ Head, HorizontalHead, Os2, Name, Characters, Locations });

/// Embedding rights in the table OS/2.
constexpr unsigned UsageRights = 0xF;
constexpr unsigned NoEmbedding = 0x2;
constexpr unsigned NoSubsetting = 0x100;
constexpr unsigned BitmapsOnly = 0x200;

/// Styles in the table OS/2, and in the table head.
constexpr unsigned BoldOs2 = 1U << 5U;
constexpr unsigned ItalicOs2 = 1U | (1U << 9U);
constexpr unsigned BoldHead = 1U;
constexpr unsigned ItalicHead = 1U << 1U;

/// A number of a table; 0 past its end.
template <typename Number> Number numberAt(const QByteArray& table, qsizetype offset)
{
    if (offset + static_cast<qsizetype>(sizeof(Number)) > table.size())
        return 0;
    return qFromBigEndian<Number>(table.constData() + offset);
}

QByteArray tableOf(const QRawFont& font, hb_tag_t tag)
{
    std::array<char, 5> name {};
    hb_tag_to_string(tag, name.data());
    return font.fontTable(name.data());
}

struct FreeBlob {
    void operator()(hb_blob_t* blob) const { hb_blob_destroy(blob); }
};
using Blob = std::unique_ptr<hb_blob_t, FreeBlob>;

struct FreeInput {
    void operator()(hb_subset_input_t* input) const { hb_subset_input_destroy(input); }
};
struct FreePlan {
    void operator()(hb_subset_plan_t* plan) const { hb_subset_plan_destroy(plan); }
};

QByteArrayView viewOf(const Blob& blob)
{
    unsigned size = 0;
    const char* const data = hb_blob_get_data(blob.get(), &size);
    return data ? QByteArrayView(data, size) : QByteArrayView();
}

/// The PostScript name, which holds nothing but letters, digits and a few signs.
std::string postScriptName(hb_face_t* face, const QRawFont& font)
{
    std::array<char, 128> buffer {};
    unsigned size = buffer.size();
    hb_ot_name_get_utf8(face, HB_OT_NAME_ID_POSTSCRIPT_NAME, hb_language_from_string("en", -1),
        &size, buffer.data());
    std::string name(buffer.data());
    if (name.empty())
        name = font.familyName().toStdString();
    std::erase_if(name, [](char c) { return c <= ' ' || c > '~' || c == '/' || c == '%'; });
    return name.empty() ? "Font" : name;
}

/// The same font in its file, which is mapped into memory; null: no file is known to hold it.
hb_face_t* faceOfFile(const QRawFont& font)
{
    for (const FontFile& file : fontFilesOf(font.familyName())) {
        const Blob bytes(hb_blob_create_from_file_or_fail(file.path.c_str()));
        hb_face_t* const face = bytes ? hb_face_create(bytes.get(), file.index) : nullptr;
        const auto isSame = [&](hb_tag_t tag) {
            const Blob table(hb_face_reference_table(face, tag));
            return viewOf(table) == tableOf(font, tag);
        };
        if (face && std::ranges::all_of(TellingTables, isSame))
            return face;
        hb_face_destroy(face);
    }
    return nullptr;
}

} // namespace

void QtFontProgram::FreeFace::operator()(hb_face_t* face) const { hb_face_destroy(face); }

QtFontProgram::QtFontProgram(const QRawFont& font)
    : font_(font)
    , file_(faceOfFile(font))
{
    const auto blobOf = [](hb_face_t*, hb_tag_t tag, void* program) {
        const QByteArray& bytes = static_cast<const QtFontProgram*>(program)->table(tag);
        return bytes.isEmpty()
            ? nullptr
            : hb_blob_create(bytes.constData(), static_cast<unsigned>(bytes.size()),
                HB_MEMORY_MODE_READONLY, nullptr, nullptr);
    };
    face_.reset(hb_face_create_for_tables(blobOf, this, nullptr));
    refuseUnlessEmbeddable();
    unitsPerEm_ = std::max<int>(1, numberAt<quint16>(table(Head), 18));
    advanceCount_ = numberAt<quint16>(table(HorizontalHead), 34);
    hb_face_set_upem(face_.get(), static_cast<unsigned>(unitsPerEm_));
    readStyle();
    readFacts();
}

QtFontProgram::~QtFontProgram() = default;

double QtFontProgram::advance(std::uint32_t glyph) const
{
    constexpr qsizetype RowSize = 4;
    if (advanceCount_ == 0)
        return 0;
    const auto row = static_cast<qsizetype>(std::min(glyph, advanceCount_ - 1));
    return inThousandths(numberAt<quint16>(table(HorizontalMetrics), row * RowSize));
}

pdf::FontSubset QtFontProgram::subset(std::span<const std::uint32_t> glyphs)
{
    const std::unique_ptr<hb_subset_input_t, FreeInput> input(hb_subset_input_create_or_fail());
    hb_subset_input_set_flags(
        input.get(), HB_SUBSET_FLAGS_NO_HINTING | HB_SUBSET_FLAGS_NOTDEF_OUTLINE);
    hb_set_t* const wanted = hb_subset_input_glyph_set(input.get());
    for (const std::uint32_t glyph : glyphs)
        hb_set_add(wanted, glyph);
    if (!isSubsettingAllowed_)
        hb_set_add_range(wanted, 0, hb_face_get_glyph_count(face_.get()) - 1);
    hb_set_t* const dropped = hb_subset_input_set(input.get(), HB_SUBSET_SETS_DROP_TABLE_TAG);
    for (const hb_tag_t tag : NeedlessTables)
        hb_set_add(dropped, tag);
    const std::unique_ptr<hb_subset_plan_t, FreePlan> plan(
        hb_subset_plan_create_or_fail(face_.get(), input.get()));
    const std::unique_ptr<hb_face_t, FreeFace> left(
        plan ? hb_subset_plan_execute_or_fail(plan.get()) : nullptr);
    if (!left)
        throw RunTimeError(ErrorNumber::WriteFailed,
            phrase(u"the font %1 is damaged", { toText(font_.familyName()) }));
    const bool isCff = facts_.outlines == pdf::Outlines::Cff;
    pdf::FontSubset subset;
    const Blob bytes(isCff ? hb_face_reference_table(left.get(), CffGlyphs)
                           : hb_face_reference_blob(left.get()));
    const QByteArrayView held = viewOf(bytes);
    subset.bytes.assign(held.data(), static_cast<std::size_t>(held.size()));
    const hb_map_t* const numbers = hb_subset_plan_old_to_new_glyph_mapping(plan.get());
    for (const std::uint32_t glyph : glyphs)
        subset.numbers.push_back(static_cast<std::uint16_t>(hb_map_get(numbers, glyph)));
    if (isCff) {
        const std::vector<std::uint16_t> cids = pdf::cidsOfCff(subset.bytes);
        for (std::uint16_t& number : subset.numbers)
            number = number < cids.size() ? cids[number] : number;
    }
    return subset;
}

QByteArray QtFontProgram::fingerprintOf(const QRawFont& font)
{
    QCryptographicHash hash(QCryptographicHash::Md5);
    for (const hb_tag_t tag : TellingTables)
        hash.addData(tableOf(font, tag));
    return hash.result();
}

/// Outlines take megabytes, of which a page needs a few glyphs.
QByteArray QtFontProgram::outlines(std::uint32_t tag) const
{
    if (!file_)
        return tableOf(font_, tag);
    const Blob table(hb_face_reference_table(file_.get(), tag));
    const QByteArrayView bytes = viewOf(table); // stays where it is as long as the file is mapped
    return QByteArray::fromRawData(bytes.data(), bytes.size());
}

const QByteArray& QtFontProgram::table(std::uint32_t tag) const
{
    const auto known = tables_.find(tag);
    if (known != tables_.end())
        return known->second;
    const bool isLarge = tag == TrueTypeGlyphs || tag == CffGlyphs;
    return tables_.emplace(tag, isLarge ? outlines(tag) : tableOf(font_, tag)).first->second;
}

/// @throws CannotEmbed
void QtFontProgram::refuseUnlessEmbeddable()
{
    const auto refuse = [&](TextView reason) {
        throw pdf::CannotEmbed { toText(font_.familyName()), Text(reason) };
    };
    const unsigned rights = numberAt<quint16>(table(Os2), 8);
    if ((rights & UsageRights) == NoEmbedding || (rights & BitmapsOnly) != 0)
        refuse(phraseText(u"the font %1 may not be embedded"));
    isSubsettingAllowed_ = (rights & NoSubsetting) == 0;
    const auto has = [&](hb_tag_t tag) { return !table(tag).isEmpty(); };
    if (std::ranges::any_of(UnsuitableTables, has))
        refuse(phraseText(u"the font %1 is a variable or coloured font"));
    if (!has(Head) || !has(HorizontalMetrics) || (!has(TrueTypeGlyphs) && !has(CffGlyphs)))
        refuse(phraseText(u"the font %1 has no outlines of a kind that can be embedded"));
    facts_.outlines = has(TrueTypeGlyphs) ? pdf::Outlines::TrueType : pdf::Outlines::Cff;
}

void QtFontProgram::readStyle()
{
    const unsigned selection = numberAt<quint16>(table(Os2), 62);
    const unsigned style = numberAt<quint16>(table(Head), 44);
    const bool hasOs2 = !table(Os2).isEmpty();
    isBold_ = hasOs2 ? (selection & BoldOs2) != 0 : (style & BoldHead) != 0;
    isItalic_ = hasOs2 ? (selection & ItalicOs2) != 0 : (style & ItalicHead) != 0;
}

void QtFontProgram::readFacts()
{
    constexpr double Fixed = 65536;
    facts_.name = postScriptName(face_.get(), font_);
    facts_.ascent = inThousandths(numberAt<qint16>(table(HorizontalHead), 4));
    facts_.descent = inThousandths(numberAt<qint16>(table(HorizontalHead), 6));
    const double capHeight = inThousandths(numberAt<qint16>(table(Os2), 88));
    facts_.capHeight = capHeight > 0 ? capHeight : facts_.ascent;
    facts_.italicAngle = numberAt<qint32>(table(Post), 4) / Fixed;
    facts_.underline = inThousandths(numberAt<qint16>(table(Post), 10));
    facts_.isFixedPitch = numberAt<quint32>(table(Post), 12) != 0;
    if (facts_.underline <= 0)
        facts_.underline = pdf::FontFacts().underline;
    if (isBold_)
        facts_.boldness *= 2;
    for (std::size_t edge = 0; edge < facts_.box.size(); ++edge)
        facts_.box[edge]
            = inThousandths(numberAt<qint16>(table(Head), 36 + 2 * static_cast<qsizetype>(edge)));
}

} // namespace pelloric::qt
