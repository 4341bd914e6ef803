// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Adds random tables up by whole numbers and compares every row of totals with what is printed.

#include "support/report_world.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <random>

namespace pelloric {

namespace {

constexpr int Tables = 250;
constexpr std::int64_t Unit = 1000; ///< numbers of the tables are thousandths

enum Column { Country, Kind, Name, Price, Pieces, ColumnCount };

const std::vector<Text> Titles { u"Country", u"Kind", u"Name", u"Price", u"Pieces" };

constexpr AggregateFunction Functions[] = { AggregateFunction::Sum, AggregateFunction::Count,
    AggregateFunction::Mean, AggregateFunction::Minimum, AggregateFunction::Maximum };
constexpr const char* FunctionNames[] = { "Sum", "Count", "Mean", "Minimum", "Maximum" };

class Dice {
public:
    int from(int first, int last)
    {
        return first + static_cast<int>(engine_() % static_cast<unsigned>(last - first + 1));
    }

    bool once(int in) { return from(1, in) == 1; }

private:
    std::mt19937 engine_ { 20041023 };
};

/// A cell of numbers: what it shows, and what that is.
struct Amount {
    Text text;
    bool isNumber = false;
    std::int64_t thousandths = 0;
    int decimals = 0;
};

/// A whole number of 10^-decimals, written out.
std::string written(std::int64_t units, int decimals)
{
    std::string digits = std::to_string(std::abs(units));
    if (digits.size() <= static_cast<std::size_t>(decimals))
        digits.insert(0, static_cast<std::size_t>(decimals) + 1 - digits.size(), '0');
    if (decimals > 0)
        digits.insert(digits.size() - static_cast<std::size_t>(decimals), ".");
    return (units < 0 ? "-" : "") + digits;
}

std::string writtenThousandths(std::int64_t thousandths, int decimals)
{
    for (int digit = 3; digit > decimals; --digit)
        thousandths /= 10; // what goes is 0
    return written(thousandths, decimals);
}

Amount amountOf(Dice& dice, bool isPrice)
{
    Amount amount;
    if (dice.once(8)) {
        amount.text = dice.once(2) ? Text() : Text(u"n/a");
        return amount;
    }
    amount.isNumber = true;
    amount.decimals = isPrice ? dice.from(0, 3) : 0;
    std::int64_t number = dice.from(-99999, 99999);
    std::int64_t scale = Unit;
    for (int digit = 0; digit < amount.decimals; ++digit)
        scale /= 10;
    // One and three digits before a point: the three behind it cannot be a group then.
    if (amount.decimals == 3)
        number = number % 1000 + (number < 0 ? -1000000 : 1000000);
    amount.thousandths = number * scale;
    amount.text = fromUtf8(written(number, amount.decimals));
    return amount;
}

struct Row {
    Text texts[3]; ///< country, kind and name
    Amount amounts[2]; ///< price and pieces
    Text text(int column) const
    {
        return column < Price ? texts[column] : amounts[column - Price].text;
    }
};

/// What the rows of a group, or all of them, hold.
class Sums {
public:
    void add(const Row& row)
    {
        for (int column = 0; column < ColumnCount; ++column) {
            counts_[column] += row.text(column).empty() ? 0 : 1;
            if (column >= Price && row.amounts[column - Price].isNumber)
                numbers_[column - Price].push_back(row.amounts[column - Price]);
        }
    }

    /// Whether the text shows the total; a mean is told by its distance from the exact one.
    bool isShown(const std::string& text, int column, AggregateFunction function) const
    {
        if (function == AggregateFunction::Count)
            return text == std::to_string(counts_[column]);
        const auto& numbers = numbers_[column - Price];
        if (numbers.empty())
            return text.empty();
        std::int64_t sum = 0;
        int decimals = 0;
        std::int64_t least = numbers.front().thousandths;
        std::int64_t most = least;
        for (const Amount& number : numbers) {
            sum += number.thousandths;
            decimals = std::max(decimals, number.decimals);
            least = std::min(least, number.thousandths);
            most = std::max(most, number.thousandths);
        }
        if (function == AggregateFunction::Sum)
            return text == writtenThousandths(sum, decimals);
        if (function == AggregateFunction::Minimum)
            return text == writtenThousandths(least, decimals);
        if (function == AggregateFunction::Maximum)
            return text == writtenThousandths(most, decimals);
        const std::size_t point = text.find('.');
        const auto shown
            = static_cast<int>(point == std::string::npos ? 0 : text.size() - point - 1);
        const double mean = static_cast<double>(sum) / static_cast<double>(numbers.size()) / Unit;
        return shown >= decimals && shown <= decimals + 2
            && std::abs(std::stod(text) - mean) <= 0.5 * std::pow(10, -(decimals + 2)) + 1e-9;
    }

private:
    std::int64_t counts_[ColumnCount] {};
    std::vector<Amount> numbers_[2];
};

/// A row that has to be printed.
struct Expected {
    const Row* row = nullptr; ///< null: a row of totals
    Sums sums {};
    AggregateFunction function {};
    std::string label {};
};

/// A printed table, put together from its pages and bands: texts by column.
std::vector<std::vector<std::string>> printedColumns(
    const PageDocument& document, std::size_t columns)
{
    std::vector<std::vector<std::string>> printed(columns);
    std::vector<std::vector<std::uint32_t>> bandOf(columns); ///< titles of the first band with it
    for (int page = 0; page < document.pageCount(); ++page) {
        const PageStructure& structure = document.structure;
        const auto texts = document.texts(page);
        auto text = texts.begin();
        for (std::uint32_t skipped = 0; skipped < structure.headerTexts(page); ++skipped)
            ++text;
        std::vector<std::uint32_t> band;
        const auto take = [&](const CellTexts& cell) {
            std::string all;
            for (std::uint32_t piece = 0; piece < cell.texts; ++piece, ++text)
                all += toUtf8((*text).text());
            return all;
        };
        for (const CellTexts& title : structure.titles(page)) {
            band.push_back(title.field);
            take(title);
        }
        for (std::size_t row = 0; row < structure.rowCount(page); ++row) {
            for (const CellTexts& cell : structure.row(page, row)) {
                auto& known = bandOf[cell.field];
                if (known.empty())
                    known = band;
                const std::string shown = take(cell);
                if (known == band)
                    printed[cell.field].push_back(shown);
            }
        }
    }
    return printed;
}

class ReportTotals : public testing::Test, protected ReportWorld {
protected:
    ReportTotals() { canvas.m_PrintObj = PrintObjKind::MSFlexGrid; }

    void makeRows()
    {
        rows_.clear();
        const int count = dice_.once(15) ? 0 : dice_.from(1, 130);
        for (int number = 0; number < count; ++number) {
            Row& row = rows_.emplace_back();
            const bool goesOn = number > 0 && !dice_.once(6);
            const Row* const last = goesOn ? &rows_[rows_.size() - 2] : nullptr;
            row.texts[Country] = last ? last->texts[Country] : u"c" + decimal(dice_.from(1, 3));
            row.texts[Kind]
                = last && !dice_.once(4) ? last->texts[Kind] : u"k" + decimal(dice_.from(1, 2));
            row.texts[Name] = dice_.once(9) ? Text() : u"n" + decimal(number);
            row.amounts[0] = amountOf(dice_, true);
            row.amounts[1] = amountOf(dice_, false);
        }
    }

    void chooseOptions()
    {
        ReportOptions& options = canvas.options;
        options = {};
        columns_ = { Country, Kind, Name, Price, Pieces };
        if (dice_.once(2)) {
            std::shuffle(columns_.begin(), columns_.end(), std::mt19937(7));
            for (const int column : columns_)
                options.columns.push_back(Titles[static_cast<std::size_t>(column)]);
        }
        groups_.clear();
        for (int column = Country; column < Country + dice_.from(0, 2); ++column)
            groups_.push_back(column);
        for (const int column : groups_)
            options.groupColumns.push_back(Titles[static_cast<std::size_t>(column)]);
        options.keepsGroups = dice_.once(2);
        options.keyColumns = dice_.from(0, 2);
        options.pageOrder = dice_.once(2) ? PageOrder::DownThenAcross : PageOrder::AcrossThenDown;
        for (const AggregateFunction function : Functions) {
            for (const int column : { Price, Pieces }) {
                if (dice_.once(2))
                    options.totals.push_back(
                        { Titles[static_cast<std::size_t>(column)], function });
            }
        }
        if (options.totals.empty())
            options.totals = { { u"Price" } };
        if (dice_.once(3)) {
            options.rows = RowChoice::Range;
            options.firstRow = dice_.from(1, 40);
            options.lastRow = dice_.from(1, 130);
        }
        if (dice_.once(3))
            options.filter
                = [](std::int64_t row, std::span<const TextView>) { return row % 3 != 1; };
    }

    bool isPrinted(std::int64_t row) const
    {
        const ReportOptions& options = canvas.options;
        const bool isInRange = options.rows != RowChoice::Range
            || (row >= options.firstRow && row <= options.lastRow);
        return isInRange && (!options.filter || row % 3 != 1);
    }

    void expectTotals(const Sums& sums, const std::string& name)
    {
        std::vector<AggregateFunction> done;
        for (const Aggregation& total : canvas.options.totals) {
            if (std::find(done.begin(), done.end(), total.function) != done.end())
                continue;
            done.push_back(total.function);
            const auto place = static_cast<std::size_t>(total.function);
            expected_.push_back(
                { nullptr, sums, total.function, name + ": " + FunctionNames[place] });
        }
    }

    std::string groupOf(const Row& row) const
    {
        std::string name;
        for (const int column : groups_)
            name += (name.empty() ? "" : " ") + toUtf8(row.text(column));
        return name;
    }

    void expectRows()
    {
        expected_.clear();
        Sums all;
        Sums group;
        const Row* last = nullptr;
        for (std::size_t at = 0; at < rows_.size(); ++at) {
            const Row& row = rows_[at];
            if (!isPrinted(static_cast<std::int64_t>(at) + 1))
                continue;
            if (last && !groups_.empty() && groupOf(row) != groupOf(*last)) {
                expectTotals(group, groupOf(*last));
                group = {};
            }
            expected_.push_back({ &row });
            group.add(row);
            all.add(row);
            last = &row;
        }
        if (last && !groups_.empty())
            expectTotals(group, groupOf(*last));
        if (last)
            expectTotals(all, "Total");
    }

    bool isAskedFor(int column, AggregateFunction function) const
    {
        const Aggregation wanted { Titles[static_cast<std::size_t>(column)], function };
        const auto& totals = canvas.options.totals;
        return std::find(totals.begin(), totals.end(), wanted) != totals.end();
    }

    void checkTotal(const Expected& row, std::size_t place, std::string shown)
    {
        const int column = columns_[place];
        if (shown.rfind(row.label, 0) == 0) {
            ++labels_;
            shown.erase(
                0, std::min(shown.size(), row.label.size() + (shown.size() > row.label.size())));
        }
        if (!isAskedFor(column, row.function)) {
            EXPECT_EQ(shown, "") << row.label;
            return;
        }
        EXPECT_TRUE(row.sums.isShown(shown, column, row.function))
            << row.label << " " << toUtf8(Titles[static_cast<std::size_t>(column)]) << " " << shown;
        ++totals_;
    }

    Dice dice_;
    std::vector<Row> rows_;
    std::vector<int> columns_;
    std::vector<int> groups_;
    std::vector<Expected> expected_;
    int labels_ = 0;
    int totals_ = 0;
};

} // namespace

TEST_F(ReportTotals, EqualIndependentOnesBehindEveryGroupAndAtTheEnd)
{
    int manyPages = 0;
    int manyBands = 0;
    for (int table = 0; table < Tables && !HasFailure(); ++table) {
        makeRows();
        chooseOptions();
        expectRows();
        std::vector<TableColumn> columns;
        for (const Text& title : Titles)
            columns.push_back({ title, dice_.from(3000, 4500) });
        std::vector<std::vector<Text>> texts;
        for (const Row& row : rows_) {
            auto& cells = texts.emplace_back();
            for (int column = 0; column < ColumnCount; ++column)
                cells.push_back(row.text(column));
        }
        TableGrid grid = gridOf(columns, texts);
        canvas.doPreview(grid);
        SCOPED_TRACE("table " + std::to_string(table));
        const auto printed = printedColumns(canvas.document(), columns_.size());
        labels_ = 0;
        for (std::size_t place = 0; place < columns_.size(); ++place) {
            ASSERT_EQ(printed[place].size(), expected_.size()) << place;
            for (std::size_t at = 0; at < expected_.size(); ++at) {
                if (expected_[at].row == nullptr)
                    checkTotal(expected_[at], place, printed[place][at]);
                else
                    EXPECT_EQ(printed[place][at], toUtf8(expected_[at].row->text(columns_[place])));
            }
        }
        EXPECT_EQ(labels_,
            std::count_if(expected_.begin(), expected_.end(),
                [](const Expected& row) { return row.row == nullptr; }));
        manyBands += canvas.fit().pagesAcross > 1 ? 1 : 0;
        manyPages += canvas.Totalpages() > canvas.fit().pagesAcross ? 1 : 0;
    }
    EXPECT_GT(manyPages, Tables / 4);
    EXPECT_GT(manyBands, Tables / 2);
    EXPECT_GT(totals_, 5 * Tables);
    std::printf("%d totals looked at\n", totals_);
}

} // namespace pelloric
