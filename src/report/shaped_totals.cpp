// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// The rows of totals of a shaped report; those of records are in shaped_rows.cpp.

#include "report/shaped_rows.h"

#include "document/page_document.h"
#include "platform/numbers.h"
#include "platform/platform.h"
#include "platform/row_set.h"
#include "platform/services.h"
#include "report/report_style.h"
#include "report/shown_text.h"

#include <algorithm>

namespace pelloric {

/// The decimal separator of a field: that of the first text which can be read in one way only, or
/// the locale's.
char16_t ShapedRows::separatorOf(int field)
{
    const auto found = std::find(totalFields_.begin(), totalFields_.end(), field);
    const auto place = static_cast<std::size_t>(found - totalFields_.begin());
    if (place < separators_.size()
        && source_.options.totals[place].function != AggregateFunction::Count)
        return separators_[place];
    for (std::int64_t record = 1; record <= source_.rows.recordCount(); ++record) {
        platform_.loop.keepAlive();
        source_.rows.setPosition(record);
        const Value value = source_.rows.value(field);
        if (const auto separator
            = decimalSeparatorOf(displayText(value, platform_.decimalSeparator, buffer_)))
            return *separator;
    }
    return platform_.decimalSeparator;
}

std::vector<LeftOut> ShapedRows::leftOut() const
{
    std::vector<LeftOut> all;
    for (std::size_t place = 0; place < totalFields_.size(); ++place) {
        const Text& column = source_.options.totals[place].column;
        const std::int64_t cells = allTotals_.leftOut(place);
        const bool isTold = std::any_of(
            all.begin(), all.end(), [&](const LeftOut& other) { return other.column == column; });
        if (cells > 0 && !isTold)
            all.push_back({ column, cells });
    }
    return all;
}

/// Adds the totals of the group that has ended.
void ShapedRows::closeGroup()
{
    if (groupTexts_.empty())
        return;
    Text name;
    for (const TextView text : groupTexts_) {
        name += name.empty() ? u"" : u" ";
        name += text;
    }
    addTotals(groupTotals_, name);
    groupTotals_.clear();
}

void ShapedRows::noteNumbers(const ShapedRow& row)
{
    for (std::size_t place = 0; place < totalFields_.size(); ++place) {
        const int field = totalFields_[place];
        const TextView text = row.cells[static_cast<std::size_t>(field)].text;
        const auto number = numberOf(row.record, field, text, separators_[place]);
        groupTotals_.add(place, number, !text.empty());
        allTotals_.add(place, number, !text.empty());
    }
}

/// What the cell shows; where the view knows its number more exactly, that with the text's
/// decimals.
std::optional<ShownNumber> ShapedRows::numberOf(
    std::int64_t record, int field, TextView text, char16_t separator) const
{
    auto shown = readShownNumber(text, separator);
    const auto known = source_.number ? source_.number(record, field) : std::nullopt;
    if (!known)
        return shown;
    if (!shown)
        shown = readShownNumber(formatNumber(*known), u'.');
    if (!shown)
        shown.emplace(); // an infinite one
    shown->value = *known;
    return shown;
}

/// One row per function; the name stands in the first column that holds no total, or before the
/// first total.
void ShapedRows::addTotals(const Totals& totals, TextView name)
{
    for (std::size_t number = 0; number < totals.rowCount(); ++number) {
        TotalTexts texts(source_.widths.size());
        for (std::size_t place = 0; place < texts.size(); ++place)
            texts[place] = document_.store().add(totals.text(number, static_cast<int>(place)));
        const Text label = Text(name) + u": " + wordOf(words_, totals.function(number));
        const auto first = static_cast<std::size_t>(bands_.front().front());
        texts[first] = document_.store().add(
            texts[first].empty() ? label : label + u" " + Text(texts[first]));
        totalTexts_.push_back(std::move(texts));
        ShapedRow row = takeSpare();
        layTotals(totalTexts_.size() - 1, row);
        rows_.push_back(std::move(row));
    }
}

void ShapedRows::layTotals(std::size_t total, ShapedRow& row)
{
    row.total = total;
    row.looks.clear();
    const MeasuredFont& face = font(true, source_.style.body.font.italic);
    row.textHeight = face.lineHeight;
    for (std::size_t place = 0; place < row.cells.size(); ++place) {
        ShapedCell& cell = row.cells[place];
        cell.text = totalTexts_[total][place];
        const double room = source_.widths[place] - 2 * padding_;
        if (cell.text.empty() || room <= 0)
            continue;
        cell.firstLine = row.lines.size();
        wrapWords(cell.text, room, face, row.lines);
        cell.lineCount = row.lines.size() - cell.firstLine;
        row.textHeight
            = std::max(row.textHeight, static_cast<double>(cell.lineCount) * face.lineHeight);
    }
}

} // namespace pelloric
