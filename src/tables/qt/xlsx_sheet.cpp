// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/numbers.h"
#include "platform/qt/qt_text.h"
#include "tables/number_look.h"
#include "tables/qt/sheet_cells.h"
#include "tables/qt/sheet_xml.h"
#include "tables/qt/xlsx_styles.h"
#include "tables/qt/zip_entries.h"

#include <QDateTime>
#include <QXmlStreamReader>

#include <algorithm>
#include <cmath>
#include <vector>

namespace pelloric::qt {

namespace {

constexpr double WidestColumn = 255; ///< digits

/// The text of an element with all its runs, but without the readings of Chinese characters.
Text textOf(QXmlStreamReader& xml)
{
    Text text;
    const QString name = xml.name().toString();
    while (!xml.atEnd()) {
        xml.readNext();
        if (xml.isEndElement() && xml.name() == name)
            break;
        if (!xml.isStartElement())
            continue;
        if (xml.name() == QLatin1String("rPh"))
            xml.skipCurrentElement();
        else if (xml.name() == QLatin1String("t"))
            text += toText(xml.readElementText(QXmlStreamReader::IncludeChildElements));
    }
    return text;
}

std::vector<Text> readSharedTexts(const ZipEntries& file)
{
    std::vector<Text> texts;
    const QByteArray bytes = file.read("xl/sharedStrings.xml");
    if (bytes.isEmpty())
        return texts;
    forEachElement(bytes, [&](QXmlStreamReader& xml) {
        if (xml.name() == QLatin1String("si"))
            texts.push_back(textOf(xml));
    });
    return texts;
}

/// What a workbook says of its sheets.
struct Workbook {
    QStringList names;
    QStringList relations;
    bool startsIn1904 = false;
};

Workbook readWorkbook(const ZipEntries& file)
{
    Workbook book;
    forEachElement(file.read("xl/workbook.xml"), [&](QXmlStreamReader& xml) {
        if (xml.name() == QLatin1String("workbookPr")) {
            const QString origin = attribute(xml, "date1904");
            book.startsIn1904 = origin == QLatin1String("1") || origin == QLatin1String("true");
        }
        if (xml.name() != QLatin1String("sheet"))
            return;
        book.names.append(attribute(xml, "name"));
        for (const QXmlStreamAttribute& one : xml.attributes()) {
            if (one.name() == QLatin1String("id"))
                book.relations.append(one.value().toString());
        }
    });
    if (book.names.isEmpty() || book.relations.size() != book.names.size())
        refuseDamaged();
    return book;
}

/// The place of a sheet's file in the archive.
QByteArray sheetFile(const ZipEntries& file, const QString& relation)
{
    QString target;
    forEachElement(file.read("xl/_rels/workbook.xml.rels"), [&](QXmlStreamReader& xml) {
        if (attribute(xml, "Id") == relation)
            target = attribute(xml, "Target");
    });
    if (target.isEmpty())
        refuseDamaged();
    return target.startsWith(u'/') ? target.mid(1).toUtf8() : "xl/" + target.toUtf8();
}

/// The row and column of a place such as "BC12", from 0.
struct Place {
    std::int64_t row = -1;
    std::int64_t column = -1;
};

Place placeOf(const QString& text)
{
    constexpr std::int64_t Letters = 26;
    Place place { 0, 0 };
    for (const QChar character : text) {
        if (character >= u'A' && character <= u'Z')
            place.column = place.column * Letters + (character.unicode() - u'A' + 1);
        else if (character >= u'0' && character <= u'9')
            place.row = place.row * 10 + (character.unicode() - u'0');
        if (place.row > 1'000'000'000 || place.column > 1'000'000'000)
            refuseDamaged();
    }
    return { place.row - 1, place.column - 1 };
}

/// The cells of a range such as "B2:C7".
SheetArea areaOf(const QString& range)
{
    const auto colon = range.indexOf(u':');
    const Place first = placeOf(range.left(colon));
    const Place last = placeOf(range.mid(colon + 1));
    if (first.row < 0 || first.column < 0)
        return { 0, 0, 0, 0 };
    return { first.row, first.column, last.row - first.row + 1, last.column - first.column + 1 };
}

bool isOn(const QXmlStreamReader& xml, const char* name)
{
    const QString value = attribute(xml, name);
    return value == QLatin1String("1") || value == QLatin1String("true");
}

/// A column's width counts the digits of the usual font that it holds, each seven pixels wide at 96
/// an inch, with five pixels around them that are in the number.
Twips twipsOfDigits(double digits)
{
    constexpr double TwipsOfDigit = 7 * 15;
    return roundToInt32(digits * TwipsOfDigit);
}

/// Whole seconds; a date at midnight has no time, and a time of the first day no date.
Text dateText(double days, bool startsIn1904)
{
    constexpr double SecondsOfDay = 86400;
    constexpr double FarthestDay = 3'000'000;
    if (!(std::abs(days) <= FarthestDay))
        return formatNumber(days);
    const QDate first = startsIn1904 ? QDate(1904, 1, 1) : QDate(1899, 12, 30);
    const auto seconds = static_cast<qint64>(std::nearbyint(days * SecondsOfDay));
    const QDateTime moment = QDateTime(first, QTime(0, 0), Qt::UTC).addSecs(seconds);
    const QString time = moment.time().toString(QStringLiteral("HH:mm:ss"));
    if (days >= 0 && days < 1 && seconds > 0)
        return toText(time);
    const QString date = moment.date().toString(Qt::ISODate);
    return toText(moment.time() == QTime(0, 0) ? date : date + u' ' + time);
}

/// Reads the cells of a sheet one by one.
class SheetReader {
public:
    SheetReader(const ZipEntries& file, bool startsIn1904)
        : texts_(readSharedTexts(file))
        , styles_(readXlsxStyles(file))
        , startsIn1904_(startsIn1904)
    {
    }

    SheetCells read(const QByteArray& bytes)
    {
        forEachElement(bytes, [&](QXmlStreamReader& xml) {
            if (xml.name() == QLatin1String("row")) {
                const QString number = attribute(xml, "r");
                const std::int64_t row
                    = number.isEmpty() ? next_.row + 1 : std::max(number.toLongLong(), 0LL) - 1;
                next_ = { std::min(row, SheetCells::MostRows), 0 };
                if (isOn(xml, "hidden"))
                    cells_.hiddenRows().hide(next_.row, 1);
                fillFrom(xml, "s", { next_.row, 0, 1, SheetCells::MostColumns });
            } else if (xml.name() == QLatin1String("c")) {
                readCell(xml);
            } else if (xml.name() == QLatin1String("col")) {
                readColumns(xml);
            } else if (xml.name() == QLatin1String("mergeCell")) {
                cells_.merge(areaOf(attribute(xml, "ref")));
            }
        });
        return std::move(cells_);
    }

private:
    void readCell(QXmlStreamReader& xml)
    {
        const QString place = attribute(xml, "r");
        if (!place.isEmpty())
            next_ = placeOf(place);
        const QString type = attribute(xml, "t");
        const auto style = attribute(xml, "s").toULongLong();
        Text text;
        while (!xml.atEnd()) {
            xml.readNext();
            if (xml.isEndElement() && xml.name() == QLatin1String("c"))
                break;
            if (xml.isStartElement() && xml.name() == QLatin1String("is"))
                text = textOf(xml);
            else if (xml.isStartElement() && xml.name() == QLatin1String("v"))
                text = shown(xml.readElementText(), type, style);
        }
        const SheetLook look = style < styles_.size() ? styles_[style].look : SheetLook();
        cells_.put(next_.row, next_.column, std::move(text), look, valueOf(type));
        ++next_.column;
    }

    /// Columns that have a width or a style.
    void readColumns(const QXmlStreamReader& xml)
    {
        const std::int64_t first = attribute(xml, "min").toLongLong() - 1;
        const std::int64_t last = attribute(xml, "max").toLongLong() - 1;
        if (first < 0 || last < first || last >= SheetCells::MostColumns)
            return;
        fillFrom(xml, "style", { 0, first, SheetCells::MostRows, last - first + 1 });
        bool isNumber = false;
        const double width = attribute(xml, "width").toDouble(&isNumber);
        if (isOn(xml, "hidden"))
            cells_.hiddenColumns().hide(first, last - first + 1);
        if (isNumber && width > 0 && width <= WidestColumn)
            cells_.setWidth(first, last - first + 1, twipsOfDigits(width));
    }

    /// The style of a row or column holds for the cells that are not in the file.
    void fillFrom(const QXmlStreamReader& xml, const char* name, const SheetArea& area)
    {
        const QString style = attribute(xml, name);
        if (!style.isEmpty() && style.toULongLong() < styles_.size())
            cells_.fillBlanks(area, styles_[style.toULongLong()].look);
    }

    static SheetValue valueOf(const QString& type)
    {
        if (type == QLatin1String("b") || type == QLatin1String("e"))
            return SheetValue::Truth;
        return type.isEmpty() || type == QLatin1String("n") ? SheetValue::Number
                                                            : SheetValue::Words;
    }

    Text shown(const QString& value, const QString& type, std::size_t style) const
    {
        if (type == QLatin1String("s")) {
            const auto number = value.toULongLong();
            return number < texts_.size() ? texts_[number] : Text();
        }
        if (type == QLatin1String("b"))
            return value == QLatin1String("1") ? u"True" : u"False";
        bool isNumber = false;
        const double number = value.toDouble(&isNumber);
        if (!isNumber || (!type.isEmpty() && type != QLatin1String("n")))
            return toText(value);
        const NumberLook look = style < styles_.size() ? styles_[style].number : NumberLook();
        return look.isDate ? dateText(number, startsIn1904_) : shownNumber(number, look);
    }

    std::vector<Text> texts_;
    std::vector<XlsxStyle> styles_;
    bool startsIn1904_;
    Place next_;
    SheetCells cells_;
};

} // namespace

SheetCells readXlsxSheet(const ZipEntries& file, const QString& sheet)
{
    const Workbook book = readWorkbook(file);
    const qsizetype index = sheet.isEmpty() ? 0 : book.names.indexOf(sheet);
    if (index < 0)
        refuseSheet(sheet, book.names);
    return SheetReader(file, book.startsIn1904)
        .read(file.read(sheetFile(file, book.relations.at(index))));
}

} // namespace pelloric::qt
