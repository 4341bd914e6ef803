// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_metadata.h"

#include <gtest/gtest.h>

namespace pelloric::pdf {

namespace {

bool says(const Metadata& metadata, std::string_view text)
{
    return metadataOf(metadata).find(text) != std::string::npos;
}

} // namespace

TEST(PdfMetadata, EscapesWhatXmlWouldTakeForItself)
{
    EXPECT_TRUE(says({ .title = u"a<b> & 总\u0001" },
        "<rdf:li xml:lang=\"x-default\">a&lt;b&gt; &amp; 总</rdf:li>"));
}

TEST(PdfMetadata, WritesTheDateAsXmlDoes)
{
    EXPECT_TRUE(says({ .created = "20260131093005-03'30'" },
        "<xmp:CreateDate>2026-01-31T09:30:05-03:30</xmp:CreateDate>"));
    EXPECT_FALSE(says({ .created = "2026" }, "CreateDate"));
}

TEST(PdfMetadata, ClaimsToBeAnArchivesOnlyWhenItIs)
{
    EXPECT_TRUE(says({ .isArchive = true }, "<pdfaid:part>2</pdfaid:part>"));
    EXPECT_TRUE(says({ .isArchive = true }, "<pdfaid:conformance>B</pdfaid:conformance>"));
    EXPECT_FALSE(says({}, "<pdfaid:"));
}

} // namespace pelloric::pdf
