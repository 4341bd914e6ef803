// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/paper_names.h"

#include "document/page_document.h"
#include "platform/numbers.h"
#include "platform/units.h"

#include <algorithm>
#include <array>
#include <span>
#include <utility>

namespace pelloric {

namespace {

/// A paper under all its names; a name that it does not have is empty.
struct Paper {
    TextView form; ///< in the list of forms
    double widthMm = 0; ///< 0: the size in force is kept
    double heightMm = 0;
    TextView canvas {}; ///< what the canvas calls it
    TextView choice {}; ///< what people call it who choose one by its name
};

/// The forms first, in the order of their codes, which count from 1.
constexpr auto Papers = std::to_array<Paper>({
    { u"Letter", 8.5 * MmPerInch, 11 * MmPerInch, u"", u"Letter" },
    { u"Letter Small", 8.5 * MmPerInch, 11 * MmPerInch },
    { u"Tabloid", 11 * MmPerInch, 17 * MmPerInch, u"", u"Tabloid" },
    { u"Ledger", 17 * MmPerInch, 11 * MmPerInch },
    { u"Legal", 8.5 * MmPerInch, 14 * MmPerInch, u"", u"Legal" },
    { u"Statement", 5.5 * MmPerInch, 8.5 * MmPerInch },
    { u"Executive", 7.25 * MmPerInch, 10.5 * MmPerInch }, { u"A3", 297, 420, u"A3", u"A3" },
    { u"A4", 210, 297, u"A4", u"A4" }, { u"A4 Small", 210, 297 }, { u"A5", 148, 210, u"", u"A5" },
    { u"B4 (JIS)", 257, 364 }, { u"B5 (JIS)", 182, 257, u"", u"B5" },
    { u"Folio", 8.5 * MmPerInch, 13 * MmPerInch }, { u"Quarto", 215, 275 },
    { u"10 x 14", 10 * MmPerInch, 14 * MmPerInch }, { u"11 x 17", 11 * MmPerInch, 17 * MmPerInch },
    { u"Note", 8.5 * MmPerInch, 11 * MmPerInch },
    { u"Envelope #9", 3.875 * MmPerInch, 8.875 * MmPerInch },
    { u"Envelope #10", 4.125 * MmPerInch, 9.5 * MmPerInch },
    { u"Envelope #11", 4.5 * MmPerInch, 10.375 * MmPerInch },
    { u"Envelope #12", 4.75 * MmPerInch, 11 * MmPerInch },
    { u"Envelope #14", 5 * MmPerInch, 11.5 * MmPerInch },
    { u"C Size Sheet", 17 * MmPerInch, 22 * MmPerInch },
    { u"D Size Sheet", 22 * MmPerInch, 34 * MmPerInch },
    { u"E Size Sheet", 34 * MmPerInch, 44 * MmPerInch }, { u"Envelope DL", 110, 220 },
    { u"Envelope C5", 162, 229 }, { u"Envelope C3", 324, 458 }, { u"Envelope C4", 229, 324 },
    { u"Envelope C6", 114, 162 }, { u"Envelope C65", 114, 229 }, { u"Envelope B4", 250, 353 },
    { u"Envelope B5", 176, 250 }, { u"Envelope B6", 176, 125 }, { u"Envelope Italy", 110, 230 },
    { u"Envelope Monarch", 3.875 * MmPerInch, 7.5 * MmPerInch },
    { u"Envelope #6 3/4", 3.625 * MmPerInch, 6.5 * MmPerInch },
    { u"US Standard Fanfold", 14.875 * MmPerInch, 11 * MmPerInch },
    { u"German Standard Fanfold", 8.5 * MmPerInch, 12 * MmPerInch },
    { u"German Legal Fanfold", 8.5 * MmPerInch, 13 * MmPerInch }, { u"B4 (ISO)", 250, 353 },
    { u"Japanese Postcard", 100, 148 }, { u"9 x 11", 9 * MmPerInch, 11 * MmPerInch },
    { u"10 x 11", 10 * MmPerInch, 11 * MmPerInch }, { u"15 x 11", 15 * MmPerInch, 11 * MmPerInch },
    { u"Envelope Invite", 220, 220 },
    // No forms of a printer.
    { u"", 420, 594, u"", u"A2" }, { u"", 105, 148, u"", u"A6" }, { u"", 270, 390, u"8k", u"8k" },
    { u"", 197, 273, u"16k", u"16k" },
    { u"", 150, 200, u"B5" }, // smaller than the B5 of the forms, on purpose
    { u"", 0, 0, u"B4" }, // accepted by the canvas, but sets no size
});
constexpr std::size_t FormCount = 47;
static_assert(Papers[9 - 1].form == u"A4");
static_assert(Papers[42 - 1].form == u"B4 (ISO)");
static_assert(!Papers[FormCount - 1].form.empty() && Papers[FormCount].form.empty());

/// What is taken off both sizes of a named paper: twips.
constexpr std::int32_t NamedPaperEdge = 400;

Twips sizeOf(double millimetres, Twips present)
{
    return millimetres == 0 ? present : roundToInt32(twipsOfMm(millimetres));
}

Twips withoutEdge(Twips size) { return roundToInt32(static_cast<double>(size) - NamedPaperEdge); }

} // namespace

bool applyPaperName(TextView name, PageSetup& setup, bool portrait)
{
    const auto paper = std::ranges::find(Papers, name, &Paper::canvas);
    if (paper == Papers.end() || name.empty())
        return false;
    Twips height = sizeOf(paper->heightMm, setup.myHeight);
    Twips width = sizeOf(paper->widthMm, setup.myWidth);
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
    forms.reserve(FormCount);
    for (const Paper& paper : std::span(Papers).first(FormCount))
        forms.push_back({ Text(paper.form), paper.widthMm, paper.heightMm });
    return forms;
}

std::vector<PaperForm> papersToChoose()
{
    std::vector<PaperForm> papers;
    for (const Paper& paper : Papers) {
        if (!paper.choice.empty())
            papers.push_back({ Text(paper.choice), paper.widthMm, paper.heightMm });
    }
    return papers;
}

} // namespace pelloric
