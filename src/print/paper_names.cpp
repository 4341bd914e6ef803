// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/paper_names.h"

#include "document/page_document.h"
#include "platform/numbers.h"

#include <algorithm>
#include <array>
#include <utility>

namespace pelloric {

namespace {

/// A paper that the canvas knows by name; 0 keeps the size in force.
struct NamedPaper {
    TextView name;
    double heightCm = 0;
    double widthCm = 0;
};

constexpr std::array<NamedPaper, 6> NamedPapers { {
    { u"8k", 39, 27 },
    { u"16k", 27.3, 19.7 },
    { u"A3", 42, 29.7 },
    { u"A4", 29.7, 21 },
    { u"B4", 0, 0 }, // accepted, but sets no size
    { u"B5", 20, 15 },
} };

/// What is taken off both sizes of a named paper: twips.
constexpr std::int32_t NamedPaperEdge = 400;

Twips sizeOf(double centimetres, Twips present)
{
    return centimetres == 0 ? present : roundToInt32(TwipsPerCm * centimetres);
}

Twips withoutEdge(Twips size) { return roundToInt32(static_cast<double>(size) - NamedPaperEdge); }

/// A standard paper: millimetres; its code is its place in the table, counted from 1.
struct StandardPaper {
    TextView name;
    double widthMm = 0;
    double heightMm = 0;
};

constexpr double Inch = 25.4;

constexpr std::array<StandardPaper, 47> StandardPapers { {
    { u"Letter", 8.5 * Inch, 11 * Inch },
    { u"Letter Small", 8.5 * Inch, 11 * Inch },
    { u"Tabloid", 11 * Inch, 17 * Inch },
    { u"Ledger", 17 * Inch, 11 * Inch },
    { u"Legal", 8.5 * Inch, 14 * Inch },
    { u"Statement", 5.5 * Inch, 8.5 * Inch },
    { u"Executive", 7.25 * Inch, 10.5 * Inch },
    { u"A3", 297, 420 },
    { u"A4", 210, 297 },
    { u"A4 Small", 210, 297 },
    { u"A5", 148, 210 },
    { u"B4 (JIS)", 257, 364 },
    { u"B5 (JIS)", 182, 257 },
    { u"Folio", 8.5 * Inch, 13 * Inch },
    { u"Quarto", 215, 275 },
    { u"10 x 14", 10 * Inch, 14 * Inch },
    { u"11 x 17", 11 * Inch, 17 * Inch },
    { u"Note", 8.5 * Inch, 11 * Inch },
    { u"Envelope #9", 3.875 * Inch, 8.875 * Inch },
    { u"Envelope #10", 4.125 * Inch, 9.5 * Inch },
    { u"Envelope #11", 4.5 * Inch, 10.375 * Inch },
    { u"Envelope #12", 4.75 * Inch, 11 * Inch },
    { u"Envelope #14", 5 * Inch, 11.5 * Inch },
    { u"C Size Sheet", 17 * Inch, 22 * Inch },
    { u"D Size Sheet", 22 * Inch, 34 * Inch },
    { u"E Size Sheet", 34 * Inch, 44 * Inch },
    { u"Envelope DL", 110, 220 },
    { u"Envelope C5", 162, 229 },
    { u"Envelope C3", 324, 458 },
    { u"Envelope C4", 229, 324 },
    { u"Envelope C6", 114, 162 },
    { u"Envelope C65", 114, 229 },
    { u"Envelope B4", 250, 353 },
    { u"Envelope B5", 176, 250 },
    { u"Envelope B6", 176, 125 },
    { u"Envelope Italy", 110, 230 },
    { u"Envelope Monarch", 3.875 * Inch, 7.5 * Inch },
    { u"Envelope #6 3/4", 3.625 * Inch, 6.5 * Inch },
    { u"US Standard Fanfold", 14.875 * Inch, 11 * Inch },
    { u"German Standard Fanfold", 8.5 * Inch, 12 * Inch },
    { u"German Legal Fanfold", 8.5 * Inch, 13 * Inch },
    { u"B4 (ISO)", 250, 353 },
    { u"Japanese Postcard", 100, 148 },
    { u"9 x 11", 9 * Inch, 11 * Inch },
    { u"10 x 11", 10 * Inch, 11 * Inch },
    { u"15 x 11", 15 * Inch, 11 * Inch },
    { u"Envelope Invite", 220, 220 },
} };
static_assert(StandardPapers[9 - 1].name == u"A4");
static_assert(StandardPapers[42 - 1].name == u"B4 (ISO)");

} // namespace

bool applyPaperName(TextView name, PageSetup& setup, bool portrait)
{
    const auto* const paper = std::ranges::find(NamedPapers, name, &NamedPaper::name);
    if (paper == NamedPapers.end())
        return false;
    Twips height = sizeOf(paper->heightCm, setup.myHeight);
    Twips width = sizeOf(paper->widthCm, setup.myWidth);
    if (!portrait)
        std::swap(height, width);
    height = withoutEdge(height);
    width = withoutEdge(width);
    setup.myHeight = height;
    setup.myWidth = width;
    return true;
}

std::vector<PaperForm> standardPaperForms()
{
    std::vector<PaperForm> forms;
    forms.reserve(StandardPapers.size());
    for (const StandardPaper& paper : StandardPapers)
        forms.push_back({ Text(paper.name), paper.widthMm, paper.heightMm });
    return forms;
}

} // namespace pelloric
