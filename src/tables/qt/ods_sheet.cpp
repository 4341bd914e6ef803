// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text.h"
#include "tables/qt/ods_styles.h"
#include "tables/qt/sheet_cells.h"
#include "tables/qt/sheet_xml.h"
#include "tables/qt/zip_entries.h"

#include <QStringList>
#include <QXmlStreamReader>

#include <algorithm>
#include <utility>
#include <vector>

namespace pelloric::qt {

namespace {

constexpr int MostBlanks = 1 << 24; ///< that one element stands for

/// How often a row or cell stands there.
std::int64_t repeated(const QXmlStreamReader& xml, const char* name)
{
    for (const QXmlStreamAttribute& one : xml.attributes()) {
        if (one.name() == QLatin1String(name))
            return std::clamp<std::int64_t>(one.value().toLongLong(), 1, SheetCells::MostRows);
    }
    return 1;
}

bool isCell(QStringView name)
{
    return name == QLatin1String("table-cell") || name == QLatin1String("covered-table-cell");
}

/// Reads one sheet; the file keeps every cell's text as it looks.
class SheetReader {
public:
    /// @param file  the one that `xml` reads
    SheetReader(QXmlStreamReader& xml, const ZipEntries& file)
        : xml_(xml)
        , looks_(readOdsStyles(file))
        , widths_(readOdsWidths(file))
    {
    }

    /// From the beginning of a sheet to its end.
    SheetCells read()
    {
        std::int64_t row = 0;
        while (!atEndOf("table")) {
            if (!xml_.isStartElement())
                continue;
            if (xml_.name() == QLatin1String("table-row"))
                row += readRow(row);
            else if (xml_.name() == QLatin1String("table-column"))
                readColumns();
        }
        return std::move(cells_);
    }

private:
    struct Filled {
        std::int64_t column;
        Text text;
        SheetValue value;
        SheetLook look;
    };

    /// What the cell that begins here holds.
    SheetValue valueHere() const
    {
        const QString type = attribute(xml_, "value-type");
        if (type.isEmpty() || type == QLatin1String("string"))
            return SheetValue::Words;
        return type == QLatin1String("boolean") ? SheetValue::Truth : SheetValue::Number;
    }

    /// The look of a style, or of the column's where the cell names none.
    SheetLook lookAt(const QString& style, std::int64_t column) const
    {
        if (!style.isEmpty())
            return looks_.value(style);
        for (const auto& [count, columnStyle] : columns_) {
            if (column < count)
                return looks_.value(columnStyle);
            column -= count;
        }
        return {};
    }

    /// Whether the rows or columns that begin here are hidden, by hand or by a filter.
    bool isHidden() const
    {
        const QString visibility = attribute(xml_, "visibility");
        return !visibility.isEmpty() && visibility != QLatin1String("visible");
    }

    /// Columns of one style, and what their cells look like that name none.
    void readColumns()
    {
        const std::int64_t count = repeated(xml_, "number-columns-repeated");
        const QString style = attribute(xml_, "default-cell-style-name");
        columns_.emplace_back(count, style);
        if (!style.isEmpty())
            cells_.fillBlanks(
                { 0, columnCount_, SheetCells::MostRows, count }, looks_.value(style));
        const auto width = widths_.constFind(attribute(xml_, "style-name"));
        if (isHidden())
            cells_.hiddenColumns().hide(columnCount_, count);
        if (width != widths_.constEnd())
            cells_.setWidth(columnCount_, count, *width);
        columnCount_ += count;
    }

    /// Goes on. @return  whether it came to the end of the element
    bool atEndOf(const char* element)
    {
        if (xml_.atEnd() || xml_.hasError())
            refuseDamaged();
        xml_.readNext();
        return xml_.isEndElement() && xml_.name() == QLatin1String(element);
    }

    std::int64_t readRow(std::int64_t row)
    {
        const std::int64_t rows = repeated(xml_, "number-rows-repeated");
        if (isHidden())
            cells_.hiddenRows().hide(row, rows);
        std::int64_t column = 0;
        std::int64_t end = 0; ///< of what is filled
        std::int64_t characters = 0;
        std::vector<Filled> filled;
        while (!atEndOf("table-row")) {
            if (!xml_.isStartElement() || !isCell(xml_.name()))
                continue;
            const std::int64_t columns = repeated(xml_, "number-columns-repeated");
            const SheetValue value = valueHere();
            const QString style = attribute(xml_, "style-name");
            const SheetArea box { row, column, repeated(xml_, "number-rows-spanned"),
                repeated(xml_, "number-columns-spanned") };
            const Text text = readCell();
            if (rows == 1 && columns == 1)
                cells_.merge(box);
            if (text.empty() && !style.isEmpty())
                cells_.fillBlanks({ row, column, rows, columns }, looks_.value(style));
            if (!text.empty()) {
                if (column >= SheetCells::MostColumns)
                    cells_.put(row, column, text, {}, value); // which refuses it
                end = std::min(column + columns, SheetCells::MostColumns + 1);
                characters += (end - column) * std::ssize(text);
                cells_.requireRoom(0, characters);
            }
            for (std::int64_t at = column; at < end && !text.empty(); ++at)
                filled.push_back({ at, text, value, lookAt(style, at) });
            column += columns;
        }
        cells_.requireRoom(end * rows, 0);
        cells_.requireRoom(0, characters * rows);
        for (std::int64_t at = 0; at < rows && !filled.empty(); ++at) {
            for (const Filled& cell : filled)
                cells_.put(row + at, cell.column, cell.text, cell.look, cell.value);
        }
        return rows;
    }

    Text readCell()
    {
        const bool isCovered = xml_.name() == QLatin1String("covered-table-cell");
        const char* const element = isCovered ? "covered-table-cell" : "table-cell";
        QString text;
        bool isFirst = true;
        while (!atEndOf(element)) {
            if (!xml_.isStartElement())
                continue;
            if (xml_.name() != QLatin1String("p")) {
                xml_.skipCurrentElement();
                continue;
            }
            text += std::exchange(isFirst, false) ? QString() : QStringLiteral("\n");
            text += readParagraph();
        }
        return isCovered ? Text() : toText(text);
    }

    QString readParagraph()
    {
        QString text;
        while (!atEndOf("p")) {
            if (xml_.isCharacters())
                text += xml_.text();
            if (!xml_.isStartElement())
                continue;
            if (xml_.name() == QLatin1String("s"))
                text += QString(std::clamp(attribute(xml_, "c").toInt(), 1, MostBlanks), u' ');
            else if (xml_.name() == QLatin1String("tab"))
                text += u'\t';
            else if (xml_.name() == QLatin1String("line-break"))
                text += u'\n';
            else if (xml_.name() == QLatin1String("annotation"))
                xml_.skipCurrentElement();
        }
        return text;
    }

    QXmlStreamReader& xml_;
    QHash<QString, SheetLook> looks_;
    QHash<QString, Twips> widths_;
    std::int64_t columnCount_ = 0;
    std::vector<std::pair<std::int64_t, QString>> columns_; ///< so many columns, and their style
    SheetCells cells_;
};

} // namespace

SheetCells readOdsSheet(const ZipEntries& file, const QString& sheet)
{
    QXmlStreamReader xml(file.read("content.xml"));
    QStringList names;
    while (!xml.atEnd()) {
        xml.readNext();
        if (!xml.isStartElement() || xml.name() != QLatin1String("table"))
            continue;
        names.append(attribute(xml, "name"));
        if (sheet.isEmpty() || names.last() == sheet)
            return SheetReader(xml, file).read();
        xml.skipCurrentElement();
    }
    if (xml.hasError() || names.isEmpty())
        refuseDamaged();
    refuseSheet(sheet, names);
}

} // namespace pelloric::qt
