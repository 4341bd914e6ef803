// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "shape_options.h"

#include "document/limits.h"
#include "platform/name_list.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_text.h"

#include <algorithm>
#include <array>
#include <initializer_list>

namespace pelloric::app {

namespace {

constexpr auto Options = std::to_array<Option>({
    { "where", "NAME=TEXT", phraseText(u"only rows whose column NAME holds TEXT") },
    { "as-shown", nullptr,
        phraseText(u"cells have the fonts, colours and alignment of the office file") },
    { "fit", nullptr,
        phraseText(u"turn the paper, then shrink, until the table is as wide as one page") },
    { "pages-across", "N", phraseText(u"shrink until the table is at most N pages wide") },
    { "key-columns", "N|NAME,...", phraseText(u"columns to repeat at the left of every page") },
    { "down-first", nullptr,
        phraseText(u"all rows of the first columns come before the next columns") },
    { "group", "NAME,...", phraseText(u"rows with equal texts in these columns stay on one page") },
    { "total", "F:NAME,...", phraseText(u"totals of columns; F is sum, count, mean, min or max") },
    { "watermark", "TEXT", phraseText(u"a faint text across every page") },
    { "watermark-image", "FILE", phraseText(u"a faint picture in the middle of every page") },
    { "opacity", "PERCENT", phraseText(u"of the watermark, 1 to 100 (15)") },
    { "above", nullptr, phraseText(u"the watermark lies above the table, not behind it") },
    { "logo", "FILE", phraseText(u"a picture at the top of every page") },
    { "logo-at", "SLOT", phraseText(u"where the logo stands: left, center or right (left)") },
});

constexpr double MostPagesAcross = 1000;

constexpr double Percent = 100;

constexpr auto Slots = std::to_array<const char*>({ "left", "center", "right" });

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

/// The names of an option's list; none when it was not given.
/// @throws CommandError WrongUsage: the list holds only commas
std::vector<ListedName> itemsOf(const CommandLine& line, const char* option)
{
    std::vector<ListedName> items = listedNames(qt::toText(line.value(option)));
    std::erase_if(items, [](const ListedName& item) { return item.whole().empty(); });
    if (items.empty() && line.has(option))
        throw CommandError(qt::phrased(u"--%1 names no column, only \"%2\"",
                               { QLatin1String(option), line.value(option) }),
            WrongUsage);
    return items;
}

std::vector<Text> namesOf(const CommandLine& line, const char* option)
{
    std::vector<Text> names;
    for (const ListedName& name : itemsOf(line, option))
        names.push_back(name.whole());
    return names;
}

Aggregation totalOf(const ListedName& listed)
{
    const QString text = qt::toQString(listed.whole());
    const auto colon = text.indexOf(QLatin1Char(':'));
    const QString name = text.left(colon).trimmed();
    for (const FunctionName& row : Functions) {
        if (colon > 0 && name.compare(QLatin1String(row.name), Qt::CaseInsensitive) == 0)
            return { qt::toText(text.mid(colon + 1).trimmed()), row.function };
    }
    throw CommandError(
        qt::phrased(u"--total takes sum, count, mean, min or max, a colon and a column, such as "
                    u"sum:Price, not \"%1\"")
            .arg(text),
        WrongUsage);
}

void takeKeys(const CommandLine& line, ReportOptions& options)
{
    const QString text = line.value("key-columns");
    bool isCount = false;
    text.toInt(&isCount);
    if (isCount)
        options.keyColumns = static_cast<int>(numberOf("key-columns", text, 0, MostColumns, true));
    else
        options.keyColumnNames = namesOf(line, "key-columns");
}

int slotOf(const QString& name)
{
    for (std::size_t slot = 0; slot < Slots.size(); ++slot) {
        if (name.compare(QLatin1String(Slots[slot]), Qt::CaseInsensitive) == 0)
            return static_cast<int>(slot);
    }
    throw CommandError(
        qt::phrased(u"--logo-at takes left, center or right, not \"%1\"").arg(name), WrongUsage);
}

/// @param needs  one of them must be given, too
void require(const CommandLine& line, const char* option, std::initializer_list<const char*> needs)
{
    const auto isGiven = [&](const char* name) { return line.has(name); };
    if (line.has(option) && std::none_of(needs.begin(), needs.end(), isGiven))
        throw CommandError(qt::phrased(u"--%1 says something about --%2, which is not given")
                               .arg(QLatin1String(option), QLatin1String(*needs.begin())),
            WrongUsage);
}

void takePictures(const CommandLine& line, ReportOptions& options)
{
    require(line, "opacity", { "watermark", "watermark-image" });
    require(line, "above", { "watermark", "watermark-image" });
    require(line, "logo-at", { "logo" });
    if (line.has("watermark") && line.has("watermark-image"))
        throw CommandError(
            qt::phrased(u"--watermark and --watermark-image exclude each other"), WrongUsage);
    options.watermark.text = qt::toText(line.value("watermark"));
    options.watermark.imageFile = qt::toText(line.value("watermark-image"));
    options.watermark.isAbove = line.has("above");
    if (line.has("opacity"))
        options.watermark.opacity
            = numberOf("opacity", line.value("opacity"), 1, Percent, false) / Percent;
    options.logo.imageFile = qt::toText(line.value("logo"));
    if (line.has("logo-at"))
        options.logo.slot = slotOf(line.value("logo-at"));
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
    options.asShown = line.has("as-shown");
    if (line.has("where")) {
        const QString condition = line.value("where");
        const auto sign = condition.indexOf(QLatin1Char('='));
        if (sign <= 0)
            throw CommandError(
                qt::phrased(u"--where takes a column, \"=\" and a text, not \"%1\"").arg(condition),
                WrongUsage);
        options.whereColumn = qt::toText(condition.left(sign).trimmed());
        options.whereText = qt::toText(condition.mid(sign + 1));
    }
    options.fit.toSheet = line.has("fit");
    if (line.has("pages-across"))
        options.fit.pagesAcross = static_cast<int>(
            numberOf("pages-across", line.value("pages-across"), 1, MostPagesAcross, true));
    if (line.has("key-columns"))
        takeKeys(line, options);
    if (line.has("down-first"))
        options.pageOrder = PageOrder::DownThenAcross;
    options.groupColumns = namesOf(line, "group");
    options.keepsGroups = !options.groupColumns.empty();
    for (const ListedName& total : itemsOf(line, "total"))
        options.totals.push_back(totalOf(total));
    takePictures(line, options);
    return options;
}

} // namespace pelloric::app
