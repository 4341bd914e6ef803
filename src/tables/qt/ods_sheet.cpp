// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text.h"
#include "tables/qt/sheet_cells.h"
#include "tables/qt/zip_entries.h"

#include <QStringList>
#include <QXmlStreamReader>

#include <algorithm>
#include <utility>

namespace pelloric::qt {

namespace {

constexpr std::int64_t MostRepeated = 1048576;

/// How often a row or cell stands there.
std::int64_t repeated(const QXmlStreamReader& xml, const char* name)
{
    for (const QXmlStreamAttribute& one : xml.attributes()) {
        if (one.name() == QLatin1String(name))
            return std::clamp<std::int64_t>(one.value().toLongLong(), 1, MostRepeated);
    }
    return 1;
}

QString attribute(const QXmlStreamReader& xml, const char* name)
{
    for (const QXmlStreamAttribute& one : xml.attributes()) {
        if (one.name() == QLatin1String(name))
            return one.value().toString();
    }
    return {};
}

bool isCell(QStringView name)
{
    return name == QLatin1String("table-cell") || name == QLatin1String("covered-table-cell");
}

/// Reads one sheet; the file keeps every cell's text as it looks.
class SheetReader {
public:
    explicit SheetReader(QXmlStreamReader& xml)
        : xml_(xml)
    {
    }

    /// From the beginning of a sheet to its end.
    SheetCells read()
    {
        std::int64_t row = 0;
        while (!atEndOf("table")) {
            if (xml_.isStartElement() && xml_.name() == QLatin1String("table-row"))
                row += readRow(row);
        }
        return std::move(cells_);
    }

private:
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
        std::int64_t column = 0;
        std::vector<std::pair<std::int64_t, Text>> texts;
        while (!atEndOf("table-row")) {
            if (!xml_.isStartElement() || !isCell(xml_.name()))
                continue;
            const std::int64_t columns = repeated(xml_, "number-columns-repeated");
            const Text text = readCell();
            for (std::int64_t at = 0; at < columns && !text.empty(); ++at)
                texts.emplace_back(column + at, text);
            column += columns;
        }
        for (std::int64_t at = 0; at < rows && !texts.empty(); ++at) {
            for (const auto& [place, text] : texts)
                cells_.put(row + at, place, text);
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
                text += QString(std::max(1, attribute(xml_, "c").toInt()), u' ');
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
            return SheetReader(xml).read();
        xml.skipCurrentElement();
    }
    if (xml.hasError() || names.isEmpty())
        refuseDamaged();
    refuseSheet(sheet, names);
}

} // namespace pelloric::qt
