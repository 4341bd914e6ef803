// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/tool_table.h"

#include "platform/numbers.h"

#include <charconv>

namespace pelloric {

namespace {

/// The number rounded to as many significant digits as a single-precision number shows.
double roundedToSeven(double value)
{
    char digits[32];
    char* const last = digits + sizeof digits;
    const auto end = std::to_chars(digits, last, value, std::chars_format::scientific, 6);
    double rounded = value;
    std::from_chars(digits, end.ptr, rounded);
    return rounded;
}

} // namespace

const PreviewTool* clickedTool(int id)
{
    for (const PreviewTool& tool : PreviewTools) {
        if (tool.id == id && tool.kind != ToolKind::Combo)
            return &tool;
    }
    return nullptr;
}

Text pageEntry(int number) { return u"   " + pageBoxText(number); }

Text pageBoxText(int number) { return u"NO. " + decimal(number); }

Text pageBoxText(int first, int last)
{
    return u"【" + decimal(first) + u"-" + decimal(last) + u"】";
}

Text pageCountLabel(int pages) { return u" 【共 " + decimal(pages) + u" 页】"; }

Text scaleText(float divisor)
{
    return formatNumber(roundedToSeven(100.0 / static_cast<double>(divisor))) + u"%";
}

} // namespace pelloric
