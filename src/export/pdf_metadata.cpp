// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_metadata.h"

namespace pelloric::pdf {

namespace {

std::string escaped(TextView text)
{
    std::string bytes;
    for (const char byte : toUtf8(text)) {
        switch (byte) {
        case '&':
            bytes += "&amp;";
            break;
        case '<':
            bytes += "&lt;";
            break;
        case '>':
            bytes += "&gt;";
            break;
        default:
            // XML knows no other control characters.
            if (static_cast<unsigned char>(byte) >= ' ' || byte == '\t' || byte == '\n')
                bytes += byte;
        }
    }
    return bytes;
}

std::string element(std::string_view name, const std::string& content)
{
    const std::string tag(name);
    return "<" + tag + ">" + content + "</" + tag + ">\n";
}

/// "2026-01-31T09:30:00+01:00".
std::string dateOf(const std::string& stamp)
{
    constexpr std::size_t WholeStamp = 20;
    if (stamp.size() < WholeStamp)
        return {};
    const auto part = [&](std::size_t at, std::size_t size) { return stamp.substr(at, size); };
    return part(0, 4) + "-" + part(4, 2) + "-" + part(6, 2) + "T" + part(8, 2) + ":" + part(10, 2)
        + ":" + part(12, 2) + part(14, 3) + ":" + part(18, 2);
}

} // namespace

std::string metadataOf(const Metadata& metadata)
{
    std::string xml("<?xpacket begin=\"\xEF\xBB\xBF\" id=\"W5M0MpCehiHzreSzNTczkc9d\"?>\n"
                    "<x:xmpmeta xmlns:x=\"adobe:ns:meta/\">\n"
                    "<rdf:RDF xmlns:rdf=\"http://www.w3.org/1999/02/22-rdf-syntax-ns#\">\n"
                    "<rdf:Description rdf:about=\"\"\n"
                    " xmlns:dc=\"http://purl.org/dc/elements/1.1/\"\n"
                    " xmlns:xmp=\"http://ns.adobe.com/xap/1.0/\"\n"
                    " xmlns:pdf=\"http://ns.adobe.com/pdf/1.3/\"\n"
                    " xmlns:pdfaid=\"http://www.aiim.org/pdfa/ns/id/\">\n");
    if (!metadata.title.empty())
        xml += element("dc:title",
            "<rdf:Alt><rdf:li xml:lang=\"x-default\">" + escaped(metadata.title)
                + "</rdf:li></rdf:Alt>");
    if (!metadata.language.empty())
        xml += element("dc:language",
            "<rdf:Bag><rdf:li>" + escaped(metadata.language) + "</rdf:li></rdf:Bag>");
    xml += element("xmp:CreatorTool", escaped(metadata.program));
    xml += element("pdf:Producer", escaped(metadata.program));
    if (const std::string date = dateOf(metadata.created); !date.empty())
        xml += element("xmp:CreateDate", date);
    if (metadata.isArchive)
        xml += element("pdfaid:part", "2") + element("pdfaid:conformance", "B");
    xml += "</rdf:Description>\n</rdf:RDF>\n</x:xmpmeta>\n<?xpacket end=\"w\"?>";
    return xml;
}

} // namespace pelloric::pdf
