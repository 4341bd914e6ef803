// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/paper_choice.h"

#include "platform/numbers.h"
#include "platform/run_time_error.h"
#include "ui/numeric_text.h"

#include <utility>

namespace pelloric {

namespace {

constexpr TextView EnvelopePrefix = u"Enve";

Text lengthText(double millimetres) { return twoDecimals(millimetres) + u" mm"; }

} // namespace

std::vector<PaperRow> paperRows(const std::vector<PaperForm>& forms)
{
    std::vector<PaperRow> rows;
    rows.reserve(forms.size());
    for (const PaperForm& form : forms)
        rows.push_back({ .name = form.name,
            .cx = lengthText(form.widthMm),
            .cy = lengthText(form.heightMm),
            .value = decimal(static_cast<std::int64_t>(rows.size()) + 1),
            .isEnvelope = form.name.starts_with(EnvelopePrefix) });
    return rows;
}

void PaperChoice::chooseRow(const PaperRow& row)
{
    paperName = row.name;
    caption = u"PagerSize: " + row.name;
    widthBox = isPortrait() ? row.cx : row.cy;
    heightBox = isPortrait() ? row.cy : row.cx;
    try {
        paperCode = strictInt16(row.value);
    } catch (const RunTimeError&) {
        return; // a list longer than 16 bits count: the code stays
    }
}

void PaperChoice::chooseOrientation(bool portrait)
{
    orientation = portrait ? 1 : 2;
    const bool wrongOrder = portrait ? widthBox > heightBox : widthBox < heightBox;
    if (wrongOrder)
        std::swap(widthBox, heightBox);
}

} // namespace pelloric
