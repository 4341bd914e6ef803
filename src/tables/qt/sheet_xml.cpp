// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/sheet_xml.h"

#include "tables/qt/sheet_cells.h"

#include <QXmlStreamReader>

namespace pelloric::qt {

void forEachElement(const QByteArray& bytes, const Element& element)
{
    QXmlStreamReader xml(bytes);
    while (!xml.atEnd()) {
        if (xml.readNext() == QXmlStreamReader::StartElement)
            element(xml);
    }
    if (xml.hasError())
        refuseDamaged();
}

QString attribute(const QXmlStreamReader& xml, const char* name)
{
    for (const QXmlStreamAttribute& one : xml.attributes()) {
        if (one.name() == QLatin1String(name))
            return one.value().toString();
    }
    return {};
}

} // namespace pelloric::qt
