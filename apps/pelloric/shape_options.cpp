// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "shape_options.h"

#include "platform/qt/qt_text.h"

#include <array>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "where", "NAME=TEXT", "only rows whose column NAME holds TEXT" },
    { "as-shown", nullptr, "cells have the fonts, colours and alignment of the office file" },
    { "fit", nullptr, "turn the paper, then shrink, until the table is as wide as one page" },
    { "pages-across", "N", "shrink until the table is at most N pages wide" },
    { "key-columns", "N|NAME,...", "columns to repeat at the left of every page" },
    { "down-first", nullptr, "all rows of the first columns come before the next columns" },
    { "group", "NAME,...", "rows with equal texts in these columns stay on one page" },
    { "total", "F:NAME,...", "totals of columns; F is sum, count, mean, min or max" },
});

constexpr double MostPages = 1000;
constexpr double MostColumns = 32767;

struct FunctionName {
    const char* name;
    AggregateFunction function;
};

constexpr auto Functions = std::to_array<FunctionName>({
    { "sum", AggregateFunction::Sum },
    { "count", AggregateFunction::Count },
    { "mean", AggregateFunction::Mean },
    { "min", AggregateFunction::Minimum },
    { "max", AggregateFunction::Maximum },
});

std::vector<Text> namesOf(const QString& list)
{
    std::vector<Text> names;
    for (const QString& name : list.split(QLatin1Char(','), Qt::SkipEmptyParts))
        names.push_back(qt::toText(name.trimmed()));
    return names;
}

Aggregation totalOf(const QString& text)
{
    const auto colon = text.indexOf(QLatin1Char(':'));
    const QString name = text.left(colon).trimmed();
    for (const FunctionName& row : Functions) {
        if (colon > 0 && name.compare(QLatin1String(row.name), Qt::CaseInsensitive) == 0)
            return { qt::toText(text.mid(colon + 1).trimmed()), row.function };
    }
    throw CommandError(
        QStringLiteral("--total takes sum, count, mean, min or max, a colon and a column, such as "
                       "sum:Price, not \"%1\"")
            .arg(text),
        WrongUsage);
}

void takeKeys(const QString& text, ReportOptions& options)
{
    bool isCount = false;
    text.toInt(&isCount);
    if (isCount)
        options.keyColumns = static_cast<int>(numberOf("key-columns", text, 0, MostColumns, true));
    else
        options.keyColumnNames = namesOf(text);
}

} // namespace

OptionTable shapeOptions() { return Options; }

const char* firstShapeOption(const CommandLine& line)
{
    for (const Option& option : Options) {
        if (line.has(option.name))
            return option.name;
    }
    return nullptr;
}

ReportOptions shapeOf(const CommandLine& line)
{
    ReportOptions options;
    if (line.has("where")) {
        const QString condition = line.value("where");
        const auto sign = condition.indexOf(QLatin1Char('='));
        if (sign <= 0)
            throw CommandError(
                QStringLiteral("--where takes a column, \"=\" and a text, not \"%1\"")
                    .arg(condition),
                WrongUsage);
        options.whereColumn = qt::toText(condition.left(sign).trimmed());
        options.whereText = qt::toText(condition.mid(sign + 1));
    }
    options.asShown = line.has("as-shown");
    options.fit.toSheet = line.has("fit");
    if (line.has("pages-across"))
        options.fit.pagesAcross = static_cast<int>(
            numberOf("pages-across", line.value("pages-across"), 1, MostPages, true));
    if (line.has("key-columns"))
        takeKeys(line.value("key-columns"), options);
    if (line.has("down-first"))
        options.pageOrder = PageOrder::DownThenAcross;
    options.groupColumns = namesOf(line.value("group"));
    options.keepsGroups = !options.groupColumns.empty();
    for (const QString& total : line.value("total").split(QLatin1Char(','), Qt::SkipEmptyParts))
        options.totals.push_back(totalOf(total));
    return options;
}

} // namespace pelloric::app
