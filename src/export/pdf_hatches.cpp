// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_hatches.h"

#include "export/pdf_file.h"
#include "export/pdf_syntax.h"
#include "platform/units.h"

#include <array>

namespace pelloric::pdf {

namespace {

/// A hatch: the lines of a cell of eight by eight pixels, y growing downwards, one pixel wide.
struct Hatch {
    std::string_view name;
    std::string_view lines;
};

/// By fill style, from 2 on.
constexpr auto Hatches = std::to_array<Hatch>({
    { "H2", "0 4 m 8 4 l S" },
    { "H3", "4 0 m 4 8 l S" },
    { "H4", "-1 5 m 5 -1 l 3 9 m 9 3 l S" },
    { "H5", "-1 3 m 5 9 l 3 -1 m 9 5 l S" },
    { "H6", "4 0 m 4 8 l 0 4 m 8 4 l S" },
    { "H7", "-1 3 m 5 9 l 3 -1 m 9 5 l -1 5 m 5 -1 l 3 9 m 9 3 l S" },
});

constexpr std::int16_t FirstHatch = 2;

void writeHatch(PdfFile& file, int object, const Hatch& hatch, double pixel, Twips paperHeight)
{
    std::string entries("/Type/Pattern/PatternType 1/PaintType 2/TilingType 1/BBox[0 0 8 8]"
                        "/XStep 8/YStep 8/Resources<<>>/Matrix[");
    appendNumber(entries, pixel / TwipsPerPoint, 6);
    entries += " 0 0 ";
    appendNumber(entries, -pixel / TwipsPerPoint, 6);
    entries += " 0 ";
    appendNumber(entries, paperHeight / TwipsPerPoint);
    entries += ']';
    file.writeStream(object, entries, "1 w " + std::string(hatch.lines));
}

} // namespace

std::string_view hatchName(std::int16_t fillStyle)
{
    const int at = fillStyle - FirstHatch;
    if (at < 0 || static_cast<std::size_t>(at) >= Hatches.size())
        return {};
    return Hatches[static_cast<std::size_t>(at)].name;
}

std::string writeHatches(PdfFile& file, double pixel, Twips paperHeight)
{
    std::string entries("/ColorSpace<</Hatch[/Pattern/DeviceRGB]>>/Pattern<<");
    for (const Hatch& hatch : Hatches) {
        const int object = file.reserve();
        writeHatch(file, object, hatch, pixel, paperHeight);
        appendName(entries, hatch.name);
        entries += ' ';
        appendReference(entries, object);
    }
    return entries + ">>";
}

} // namespace pelloric::pdf
