// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "table_selection.h"

#include "platform/name_list.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"
#include "report/shown_number.h"

#include <QCollator>
#include <QLocale>

#include <algorithm>
#include <array>
#include <numeric>
#include <optional>
#include <span>
#include <utility>
#include <vector>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "columns", "NAME,...", phraseText(u"only these columns, in this order; #3 is the third") },
    { "sort", "NAME,...", phraseText(u"sort the rows by these columns; NAME:desc downwards") },
    { "rows", "A-B",
        phraseText(u"only these rows, from 1, after sorting; 100- and -100 work, too") },
});

QStringList titlesOf(const TableGrid& table)
{
    QStringList titles;
    for (int column = 0; column < table.columnCount(); ++column)
        titles.append(qt::toQString(table.column(column).title).trimmed());
    return titles;
}

/// The first column of a title, whatever its letter case where no other has it exactly.
/// @param isQuoted  "#3" is that title, not the third column
int columnNamed(const QString& name, bool isQuoted, const QStringList& titles, const char* option)
{
    bool isNumber = false;
    const int number = name.startsWith(QLatin1Char('#')) ? name.mid(1).toInt(&isNumber) : 0;
    if (isNumber && !isQuoted && number >= 1 && number <= titles.size())
        return number - 1;
    const auto exact = titles.indexOf(name);
    if (exact >= 0)
        return static_cast<int>(exact);
    for (int column = 0; column < titles.size(); ++column) {
        if (titles.at(column).compare(name, Qt::CaseInsensitive) == 0)
            return column;
    }
    constexpr int MostTold = 20;
    std::vector<Text> told;
    for (const QString& title : titles.mid(0, MostTold))
        told.push_back(qt::toText(title));
    QString known = qt::toQString(listOf(told));
    if (titles.size() > MostTold)
        known += QStringLiteral(", …");
    throw CommandError(qt::phrased(u"--%1: there is no column \"%2\"; the table has %3")
                           .arg(QLatin1String(option), name, known),
        WrongUsage);
}

std::vector<int> columnsOf(const CommandLine& line, const QStringList& titles)
{
    std::vector<int> columns;
    if (!line.has("columns")) {
        columns.resize(static_cast<std::size_t>(titles.size()));
        std::iota(columns.begin(), columns.end(), 0);
        return columns;
    }
    for (const ListedName& name : listedNames(qt::toText(line.value("columns"))))
        columns.push_back(
            columnNamed(qt::toQString(name.whole()), name.isQuoted, titles, "columns"));
    return columns;
}

/// What a row is sorted by in one column: numbers by size before texts, these as the locale has it.
struct SortKey {
    bool isText = false;
    double number = 0;
    QCollatorSortKey text;
};

/// The decimal separator of a column: that of the first cell which can be read in one way only, or
/// the locale's.
char16_t separatorOf(const TableGrid& table, int column)
{
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        if (const auto separator = decimalSeparatorOf(table.cell(row, column)))
            return *separator;
    }
    const QString point = QLocale().decimalPoint();
    return point.isEmpty() ? u'.' : point.front().unicode();
}

void sortBy(const TableGrid& table, int column, bool isDown, std::vector<std::int64_t>& rows)
{
    QCollator collator;
    collator.setNumericMode(true);
    const char16_t separator = separatorOf(table, column);
    std::vector<SortKey> keys;
    keys.reserve(rows.size());
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        const TextView cell = table.cell(row, column);
        const auto number = readShownNumber(cell, separator);
        const bool isText = !number;
        keys.push_back({ isText, isText ? 0 : number->value,
            collator.sortKey(isText ? qt::toQString(cell) : QString()) });
    }
    const auto isBefore = [&keys, isDown](std::int64_t one, std::int64_t other) {
        const SortKey& first = keys[static_cast<std::size_t>(isDown ? other : one)];
        const SortKey& second = keys[static_cast<std::size_t>(isDown ? one : other)];
        if (first.isText != second.isText)
            return second.isText;
        return first.isText ? first.text < second.text : first.number < second.number;
    };
    std::stable_sort(rows.begin(), rows.end(), isBefore);
}

/// The last column that is named matters least, so it is sorted by first.
void sortRows(const TableGrid& table, const CommandLine& line, const QStringList& titles,
    std::vector<std::int64_t>& rows)
{
    std::vector<ListedName> names = listedNames(qt::toText(line.value("sort")));
    std::reverse(names.begin(), names.end());
    for (const ListedName& listed : names) {
        QString name = qt::toQString(listed.whole());
        const QString order = listed.isQuoted ? qt::toQString(listed.after) : name;
        const bool isDown = order.endsWith(QLatin1String(":desc"), Qt::CaseInsensitive);
        if (isDown || order.endsWith(QLatin1String(":asc"), Qt::CaseInsensitive))
            name.truncate(name.lastIndexOf(QLatin1Char(':')));
        sortBy(table, columnNamed(name.trimmed(), listed.isQuoted, titles, "sort"), isDown, rows);
    }
}

/// Keeps the rows of a range: "5", "5-9", "5-", "-9".
void cutRows(const QString& range, std::vector<std::int64_t>& rows)
{
    const auto dash = range.indexOf(QLatin1Char('-'));
    const auto end = [&](const QString& text, std::int64_t missing) {
        bool isNumber = false;
        const qlonglong number = text.trimmed().toLongLong(&isNumber);
        if (text.trimmed().isEmpty() && dash >= 0)
            return missing;
        if (!isNumber || number < 1)
            throw CommandError(
                qt::phrased(u"--rows takes a range such as 1-100, not \"%1\"").arg(range),
                WrongUsage);
        return static_cast<std::int64_t>(number);
    };
    const auto count = static_cast<std::int64_t>(rows.size());
    const std::int64_t first = end(dash < 0 ? range : range.left(dash), 1);
    const std::int64_t last = dash < 0 ? first : end(range.mid(dash + 1), count);
    if (first > last || first > count)
        throw CommandError(
            qt::phrased(u"--rows %1 names no row; the table has %2").arg(range).arg(count));
    rows.resize(static_cast<std::size_t>(std::min(last, count)));
    rows.erase(rows.begin(), rows.begin() + (first - 1));
}

/// Where what stood at a place stands now; -1: it is left out.
std::vector<std::int64_t> placesOf(std::span<const std::int64_t> taken, std::int64_t count)
{
    std::vector<std::int64_t> places(static_cast<std::size_t>(count), -1);
    for (std::size_t at = 0; at < taken.size(); ++at)
        places[static_cast<std::size_t>(taken[at])] = static_cast<std::int64_t>(at);
    return places;
}

/// First and last place of what stood from one place to another, as far as it is taken.
/// @return  nothing: none of it is, or it is not side by side and in order any more
std::optional<std::pair<std::int32_t, std::int32_t>> rangeOf(
    std::span<const std::int64_t> places, std::int32_t first, std::int32_t last)
{
    std::optional<std::pair<std::int32_t, std::int32_t>> range;
    for (std::int32_t at = first; at <= last; ++at) {
        const std::int64_t place = places[static_cast<std::size_t>(at)];
        if (place < 0)
            continue;
        if (range && place != range->second + 1)
            return std::nullopt;
        range = { range ? range->first : static_cast<std::int32_t>(place),
            static_cast<std::int32_t>(place) };
    }
    return range;
}

/// Boxes over several cells follow their cells; those that are torn apart are boxes no more.
std::vector<CellLook> movedLooks(const TableGrid& table, std::span<const std::int64_t> rows,
    std::span<const std::int64_t> columns)
{
    const std::vector<std::int64_t> rowPlaces = placesOf(rows, table.rowCount());
    const std::vector<std::int64_t> columnPlaces = placesOf(columns, table.columnCount());
    std::vector<CellLook> looks = table.looks();
    for (CellLook& look : looks) {
        if (!look.box)
            continue;
        const CellBox old = *look.box;
        look.box.reset();
        const auto down = rangeOf(rowPlaces, old.firstRow - 1, old.lastRow - 1);
        const auto across = rangeOf(columnPlaces, old.firstColumn, old.lastColumn);
        if (down && across)
            look.box = CellBox { down->first + 1, down->second + 1, across->first, across->second };
    }
    return looks;
}

} // namespace

OptionTable selectionOptions() { return Options; }

QString namesDetails()
{
    return qt::phrased(u"A NAME that holds a comma stands in double quotes, as in a CSV file:\n"
                       u"--columns 'Item,\"Price, net\"'.\n");
}

TableGrid selected(TableGrid table, const CommandLine& line)
{
    if (!line.has("columns") && !line.has("sort") && !line.has("rows"))
        return table;
    const QStringList titles = titlesOf(table);
    const std::vector<int> columns = columnsOf(line, titles);
    std::vector<std::int64_t> rows(static_cast<std::size_t>(table.rowCount()));
    std::iota(rows.begin(), rows.end(), 0);
    if (line.has("sort"))
        sortRows(table, line, titles, rows);
    if (line.has("rows"))
        cutRows(line.value("rows").trimmed(), rows);
    std::vector<TableColumn> taken;
    taken.reserve(columns.size());
    for (const int column : columns)
        taken.push_back(table.column(column));
    TableGrid result(std::move(taken));
    result.setLooks(
        movedLooks(table, rows, std::vector<std::int64_t>(columns.begin(), columns.end())));
    std::vector<TextView> cells(columns.size());
    std::vector<std::uint16_t> looks(columns.size());
    for (const std::int64_t row : rows) {
        for (std::size_t at = 0; at < columns.size(); ++at) {
            cells[at] = table.cell(row, columns[at]);
            looks[at] = table.lookNumber(row, columns[at]);
        }
        result.addRow(cells, looks);
    }
    return result;
}

} // namespace pelloric::app
