// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/xlsx_styles.h"

#include "tables/qt/sheet_xml.h"
#include "tables/qt/zip_entries.h"

#include <QColor>
#include <QXmlStreamReader>

#include <algorithm>
#include <array>
#include <string>
#include <unordered_map>

namespace pelloric::qt {

namespace {

/// The formats that files name only by their numbers.
std::string_view builtInFormat(int number)
{
    static const std::unordered_map<int, std::string_view> Formats { { 1, "0" }, { 2, "0.00" },
        { 3, "#,##0" }, { 4, "#,##0.00" }, { 9, "0%" }, { 10, "0.00%" }, { 14, "m/d/yy" },
        { 15, "d-mmm-yy" }, { 16, "d-mmm" }, { 17, "mmm-yy" }, { 18, "h:mm" }, { 19, "h:mm:ss" },
        { 20, "h:mm" }, { 21, "h:mm:ss" }, { 22, "m/d/yy h:mm" }, { 45, "mm:ss" },
        { 46, "[h]:mm:ss" }, { 47, "mm:ss.0" } };
    const auto found = Formats.find(number);
    return found != Formats.end() ? found->second : std::string_view();
}

/// The colours of a theme, in the order in which cells count them: each light one stands before its
/// dark one there, behind it in the file.
std::vector<QColor> readTheme(const ZipEntries& file)
{
    std::vector<QColor> colors;
    const QByteArray bytes = file.read("xl/theme/theme1.xml");
    if (bytes.isEmpty())
        return colors;
    bool isScheme = false;
    forEachElement(bytes, [&](QXmlStreamReader& xml) {
        if (xml.name() == QLatin1String("clrScheme") || xml.name() == QLatin1String("fontScheme"))
            isScheme = xml.name() == QLatin1String("clrScheme");
        const bool isSystem = xml.name() == QLatin1String("sysClr");
        if (isScheme && (isSystem || xml.name() == QLatin1String("srgbClr")))
            colors.emplace_back(u'#' + attribute(xml, isSystem ? "lastClr" : "val"));
    });
    for (std::size_t dark = 0; dark + 1 < std::min<std::size_t>(colors.size(), 4); dark += 2)
        std::swap(colors[dark], colors[dark + 1]);
    return colors;
}

/// A tint below 0 darkens by that part, one above lightens.
QColor tinted(const QColor& color, double tint)
{
    float hue = 0;
    float saturation = 0;
    float lightness = 0;
    color.getHslF(&hue, &saturation, &lightness);
    const auto part = static_cast<float>(std::clamp(tint, -1.0, 1.0));
    lightness = part < 0 ? lightness * (1 + part) : lightness * (1 - part) + part;
    return QColor::fromHslF(hue, saturation, std::clamp(lightness, 0.0F, 1.0F));
}

/// The colour that an element names; nothing: the usual one.
std::optional<Color> colorOf(const QXmlStreamReader& xml, const std::vector<QColor>& theme)
{
    QColor color;
    const QString rgb = attribute(xml, "rgb");
    const QString number = attribute(xml, "theme");
    if (!rgb.isEmpty())
        color = QColor(u'#' + rgb.right(6));
    else if (!number.isEmpty() && number.toULongLong() < theme.size())
        color = theme[number.toULongLong()];
    if (!color.isValid())
        return std::nullopt;
    return colorNumber(tinted(color, attribute(xml, "tint").toDouble()));
}

bool isOn(const QXmlStreamReader& xml)
{
    const QString value = attribute(xml, "val");
    return value != QLatin1String("0") && value != QLatin1String("false")
        && value != QLatin1String("none");
}

struct AlignmentName {
    const char* name;
    CellAlignment alignment;
};

constexpr auto Alignments = std::to_array<AlignmentName>(
    { { "left", CellAlignment::Left }, { "center", CellAlignment::Centre },
        { "centerContinuous", CellAlignment::Centre }, { "right", CellAlignment::Right } });

/// Puts the parts of styles together while the file is walked.
class StyleReader {
public:
    explicit StyleReader(std::vector<QColor> theme)
        : theme_(std::move(theme))
    {
    }

    void take(QXmlStreamReader& xml)
    {
        const auto name = xml.name();
        for (const char* const part : { "fonts", "fills", "borders", "cellStyleXfs", "cellXfs",
                 "cellStyles", "dxfs", "numFmts" }) {
            if (name == QLatin1String(part))
                part_ = part;
        }
        const std::string_view part = part_;
        if (part == "numFmts" && name == QLatin1String("numFmt"))
            formats_[attribute(xml, "numFmtId").toInt()]
                = attribute(xml, "formatCode").toStdString();
        else if (part == "fonts")
            takeFont(xml);
        else if (part == "fills")
            takeFill(xml);
        else if (part == "cellXfs")
            takeStyle(xml);
    }

    std::vector<XlsxStyle> styles;

private:
    void takeFont(QXmlStreamReader& xml)
    {
        const auto name = xml.name();
        if (name == QLatin1String("font"))
            fonts_.emplace_back();
        if (fonts_.empty())
            return;
        CellLook& font = fonts_.back();
        if (name == QLatin1String("b"))
            font.bold = isOn(xml);
        else if (name == QLatin1String("i"))
            font.italic = isOn(xml);
        else if (name == QLatin1String("u"))
            font.underline = isOn(xml);
        else if (name == QLatin1String("strike"))
            font.strikethrough = isOn(xml);
        else if (name == QLatin1String("color"))
            font.foreground = colorOf(xml, theme_);
    }

    void takeFill(QXmlStreamReader& xml)
    {
        const auto name = xml.name();
        if (name == QLatin1String("fill"))
            fills_.emplace_back();
        else if (name == QLatin1String("patternFill"))
            isSolid_ = attribute(xml, "patternType") == QLatin1String("solid");
        else if (name == QLatin1String("fgColor") && isSolid_ && !fills_.empty())
            fills_.back() = colorOf(xml, theme_);
    }

    void takeStyle(QXmlStreamReader& xml)
    {
        if (xml.name() == QLatin1String("alignment") && !styles.empty())
            return align(xml, styles.back().look);
        if (xml.name() != QLatin1String("xf"))
            return;
        const int number = attribute(xml, "numFmtId").toInt();
        const auto own = formats_.find(number);
        XlsxStyle style;
        style.number = numberLook(
            own != formats_.end() ? std::string_view(own->second) : builtInFormat(number));
        if (const auto font = attribute(xml, "fontId").toULongLong(); font < fonts_.size())
            style.look.cell = fonts_[font];
        if (const auto fill = attribute(xml, "fillId").toULongLong(); fill < fills_.size())
            style.look.cell.background = fills_[fill];
        style.look.cell.place = CellPlace::Bottom;
        styles.push_back(style);
    }

    static void align(const QXmlStreamReader& xml, SheetLook& look)
    {
        const QString across = attribute(xml, "horizontal");
        for (const AlignmentName& row : Alignments) {
            if (across == QLatin1String(row.name)) {
                look.cell.alignment = row.alignment;
                look.isAligned = true;
            }
        }
        const QString down = attribute(xml, "vertical");
        if (down == QLatin1String("top"))
            look.cell.place = CellPlace::Top;
        else if (down == QLatin1String("center"))
            look.cell.place = CellPlace::Middle;
    }

    std::vector<QColor> theme_;
    std::unordered_map<int, std::string> formats_;
    std::vector<CellLook> fonts_;
    std::vector<std::optional<Color>> fills_;
    bool isSolid_ = false;
    std::string_view part_;
};

} // namespace

std::vector<XlsxStyle> readXlsxStyles(const ZipEntries& file)
{
    const QByteArray bytes = file.read("xl/styles.xml");
    if (bytes.isEmpty())
        return {};
    StyleReader reader(readTheme(file));
    forEachElement(bytes, [&](QXmlStreamReader& xml) { reader.take(xml); });
    return std::move(reader.styles);
}

} // namespace pelloric::qt
