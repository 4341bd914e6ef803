// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "sample_table.h"

#include "platform/numbers.h"

#include <array>
#include <fstream>

namespace pelloric::bench {

namespace {

constexpr std::array<TextView, 8> Towns { u"北京市海淀区", u"上海市", u"广州市天河区", u"成都市",
    u"Hamburg", u"São Paulo", u"武汉市江汉区", u"Reykjavík" };
constexpr std::array<TextView, 7> Goods { u"Copper wire", u"不锈钢螺丝", u"Gasket set",
    u"轴承 6204", u"Ball valve", u"电缆 3×2.5", u"Hex bolt M8" };
constexpr std::array<TextView, 5> Names { u"王小明", u"Anna Berg", u"李雷", u"J. Okafor", u"陈静" };

} // namespace

TableGrid sampleTable(std::int64_t rows)
{
    TableGrid table({ { u"No.", 900 }, { u"Article", 1400 }, { u"品名", 1500 }, { u"Town", 1500 },
        { u"Buyer", 1200 }, { u"Date", 1300 }, { u"Quantity", 1100 }, { u"Amount", 1300 } });
    table.reserve(static_cast<std::size_t>(rows));
    for (std::int64_t row = 0; row < rows; ++row) {
        const auto pick = static_cast<std::size_t>(row);
        const Text number = decimal(row + 1);
        const Text article = u"A-" + decimal(100000 + row * 7919 % 899999);
        const Text date = u"2004-" + decimal(10 + row % 3) + u"-" + decimal(10 + row % 19);
        const Text quantity = decimal(row * 37 % 5000);
        const Text amount = formatNumber(static_cast<double>(row * 104729 % 1000000) / 100);
        const std::array<TextView, 8> cells { number, article, Goods[pick % Goods.size()],
            Towns[pick % Towns.size()], Names[pick % Names.size()], date, quantity, amount };
        table.addRow(cells);
    }
    return table;
}

TableGrid wideTable(std::int64_t rows, int columns)
{
    std::vector<TableColumn> titles;
    for (int column = 1; column <= columns; ++column)
        titles.push_back({ u"Column " + decimal(column), 1200 });
    TableGrid table(std::move(titles));
    std::vector<Text> texts(static_cast<std::size_t>(columns));
    for (std::int64_t row = 1; row <= rows; ++row) {
        for (int column = 0; column < columns; ++column)
            texts[static_cast<std::size_t>(column)] = decimal(row) + u"." + decimal(column + 1);
        table.addRow(std::vector<TextView>(texts.begin(), texts.end()));
    }
    return table;
}

void writeCsv(const TableGrid& table, const std::filesystem::path& path)
{
    std::ofstream stream(path, std::ios::binary);
    for (int column = 0; column < table.columnCount(); ++column)
        stream << (column > 0 ? "," : "") << toUtf8(table.column(column).title);
    stream << '\n';
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column)
            stream << (column > 0 ? "," : "") << toUtf8(table.cell(row, column));
        stream << '\n';
    }
}

std::int64_t textBytes(const TableGrid& table)
{
    std::int64_t units = 0;
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        for (int column = 0; column < table.columnCount(); ++column)
            units += static_cast<std::int64_t>(table.cell(row, column).size());
    }
    return units * static_cast<std::int64_t>(sizeof(char16_t));
}

} // namespace pelloric::bench
