// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/ods_styles.h"

#include "platform/numbers.h"
#include "tables/qt/sheet_xml.h"
#include "tables/qt/zip_entries.h"

#include <QColor>
#include <QXmlStreamReader>

#include <functional>
#include <vector>

namespace pelloric::qt {

namespace {

constexpr int MostParents = 32; ///< a ring of styles that derive from each other ends there

/// What an attribute of a style does to a look.
struct Property {
    const char* name;
    void (*apply)(const QString& value, SheetLook& look);
};

std::optional<Color> colorOf(const QString& value)
{
    const QColor color(value);
    return color.isValid() && value.startsWith(u'#') ? std::optional(colorNumber(color))
                                                     : std::nullopt;
}

void alignAcross(const QString& value, SheetLook& look)
{
    look.isAligned = true;
    look.cell.alignment = value == QLatin1String("center")   ? CellAlignment::Centre
        : value == QLatin1String("end") || value == u"right" ? CellAlignment::Right
                                                             : CellAlignment::Left;
}

void alignDown(const QString& value, SheetLook& look)
{
    look.cell.place = value == QLatin1String("top") ? CellPlace::Top
        : value == QLatin1String("middle")          ? CellPlace::Middle
                                                    : CellPlace::Bottom;
}

constexpr Property Properties[] = {
    { "background-color",
        [](const QString& value, SheetLook& look) { look.cell.background = colorOf(value); } },
    { "vertical-align", alignDown },
    { "text-align", alignAcross },
    { "font-weight",
        [](const QString& value, SheetLook& look) {
            look.cell.bold = value == QLatin1String("bold") || value.toInt() >= 600;
        } },
    { "font-style",
        [](const QString& value, SheetLook& look) {
            look.cell.italic = value != QLatin1String("normal");
        } },
    { "text-underline-style",
        [](const QString& value, SheetLook& look) {
            look.cell.underline = value != QLatin1String("none");
        } },
    { "text-line-through-style",
        [](const QString& value, SheetLook& look) {
            look.cell.strikethrough = value != QLatin1String("none");
        } },
    { "color",
        [](const QString& value, SheetLook& look) { look.cell.foreground = colorOf(value); } },
};

/// A style as the file has it.
struct Style {
    QString parent;
    std::vector<std::pair<const Property*, QString>> properties;
};

using Styles = QHash<QString, Style>;

void readStyles(const QByteArray& bytes, Styles& styles)
{
    Style* style = nullptr;
    forEachElement(bytes, [&](QXmlStreamReader& xml) {
        const auto name = xml.name();
        if (name == QLatin1String("style") || name == QLatin1String("default-style")) {
            style = nullptr;
            if (attribute(xml, "family") != QLatin1String("table-cell"))
                return;
            style = &styles[attribute(xml, "name")];
            style->parent = attribute(xml, "parent-style-name");
        }
        if (style == nullptr || !name.endsWith(QLatin1String("-properties")))
            return;
        for (const Property& property : Properties) {
            const QString value = attribute(xml, property.name);
            if (!value.isEmpty())
                style->properties.emplace_back(&property, value);
        }
    });
}

/// The properties of the farthest parent come first.
SheetLook lookOf(const Styles& styles, const QString& name)
{
    std::vector<const Style*> line;
    for (auto found = styles.find(name); found != styles.end() && line.size() < MostParents;
         found = styles.find(found->parent)) {
        line.push_back(&*found);
        if (found.key().isEmpty())
            break;
    }
    SheetLook look;
    look.cell.place = CellPlace::Bottom;
    for (auto style = line.rbegin(); style != line.rend(); ++style) {
        for (const auto& [property, value] : (*style)->properties)
            property->apply(value, look);
    }
    return look;
}

/// A length such as "2.26cm": twips.
std::optional<Twips> twipsOf(const QString& length)
{
    struct Unit {
        const char* name;
        double twips;
    };
    constexpr Unit Units[]
        = { { "cm", 566.929 }, { "mm", 56.6929 }, { "in", 1440 }, { "pt", 20 }, { "pc", 240 } };
    constexpr double Widest = 60000; ///< twips
    for (const Unit& unit : Units) {
        if (!length.endsWith(QLatin1String(unit.name)))
            continue;
        const double twips = length.chopped(2).toDouble() * unit.twips;
        if (twips > 0 && twips <= Widest)
            return roundToInt32(twips);
    }
    return std::nullopt;
}

} // namespace

QHash<QString, Twips> readOdsWidths(const ZipEntries& file)
{
    QHash<QString, Twips> widths;
    QString style;
    forEachElement(file.read("content.xml"), [&](QXmlStreamReader& xml) {
        if (xml.name() == QLatin1String("style"))
            style = attribute(xml, "name");
        if (xml.name() != QLatin1String("table-column-properties"))
            return;
        if (const auto width = twipsOf(attribute(xml, "column-width")))
            widths.insert(style, *width);
    });
    return widths;
}

QHash<QString, SheetLook> readOdsStyles(const ZipEntries& file)
{
    Styles styles;
    for (const char* const part : { "styles.xml", "content.xml" }) {
        const QByteArray bytes = file.read(part);
        if (!bytes.isEmpty())
            readStyles(bytes, styles);
    }
    QHash<QString, SheetLook> looks;
    for (auto style = styles.cbegin(); style != styles.cend(); ++style)
        looks.insert(style.key(), lookOf(styles, style.key()));
    return looks;
}

} // namespace pelloric::qt
