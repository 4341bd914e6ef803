// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "fakes/fake_platform.h"
#include "grids/table_grid.h"
#include "settings/settings_table.h"
#include "support/build_bar.h"

#include <initializer_list>
#include <span>
#include <utility>
#include <vector>

namespace pelloric {

/// A flex grid of columns (title and width) and rows of texts.
inline TableGrid gridOf(
    std::vector<TableColumn> columns, const std::vector<std::vector<Text>>& rows)
{
    TableGrid grid(std::move(columns));
    for (const auto& row : rows)
        grid.addRow(std::vector<TextView>(row.begin(), row.end()));
    return grid;
}

/// Rows "r1c1", "r1c2", ...
inline std::vector<std::vector<Text>> numberedRows(int rows, int columns)
{
    std::vector<std::vector<Text>> cells;
    for (int row = 1; row <= rows; ++row) {
        auto& line = cells.emplace_back();
        for (int column = 1; column <= columns; ++column)
            line.push_back(u"r" + decimal(row) + u"c" + decimal(column));
    }
    return cells;
}

/// A canvas on a platform whose settings file holds the default settings, with the footer empty.
class ReportWorld : public FakePlatform {
public:
    using Change = std::pair<Text, Text>; ///< key and value
    using Settings = std::initializer_list<Change>; ///< lives as long as its statement

    ReportWorld(Settings changes = {})
        : canvas(services())
    {
        set(changes);
    }

    /// Writes the settings file anew: the default settings with these values changed.
    void set(Settings changes) { set(std::span(changes.begin(), changes.size())); }

    /// The same.
    void set(std::span<const Change> changes)
    {
        Text text;
        for (const Setting& setting : settingsTable()) {
            Text value(setting.key == SettingKey::FooterCenter ? TextView() : setting.start);
            for (const auto& [key, changed] : changes) {
                if (key == setting.name)
                    value = changed;
            }
            text.append(setting.name).append(u"= ").append(value).append(u"\r\n");
        }
        folder.write("OstlConfig.ini", toUtf8(text));
    }

    Canvas canvas;
    BuildBar buildBar { canvas };
};

} // namespace pelloric
