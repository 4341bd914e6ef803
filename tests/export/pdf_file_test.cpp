// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_file.h"

#include "fakes/fake_glyph_faces.h"

#include <gtest/gtest.h>

namespace pelloric::pdf {

namespace {

/// The row of an object in the table at the end.
std::string rowOf(const std::string& file, int object)
{
    const std::size_t table = file.rfind("xref\n0 ", file.rfind("startxref"));
    return file.substr(file.find('\n', table + 5) + 1 + 20 * static_cast<std::size_t>(object), 20);
}

} // namespace

TEST(PdfFile, KnowsWhereEachObjectStands)
{
    StringSink sink;
    NoDeflater deflater;
    PdfFile file(sink, deflater);
    const int first = file.reserve();
    const int second = file.reserve();
    file.writeStream(second, "/Kind/Test", "bytes");
    file.write(first, "<</Other 2 0 R>>");
    file.finish({ .catalog = first, .info = second, .identifier = "\x01\xFF" });
    EXPECT_EQ(sink.bytes.substr(0, 9), "%PDF-1.7\n");
    for (const int object : { first, second }) {
        const std::size_t place = std::stoul(rowOf(sink.bytes, object));
        EXPECT_EQ(sink.bytes.substr(place, 8), std::to_string(object) + " 0 obj\n");
        EXPECT_EQ(rowOf(sink.bytes, object).substr(10), " 00000 n \n");
    }
    EXPECT_EQ(rowOf(sink.bytes, 0), "0000000000 65535 f \n");
    const std::size_t start = sink.bytes.rfind("startxref\n") + 10;
    EXPECT_EQ(sink.bytes.substr(std::stoul(sink.bytes.substr(start)), 9), "xref\n0 3\n");
    EXPECT_NE(sink.bytes.find("trailer\n<</Size 3/Root 1 0 R/Info 2 0 R/ID[<01FF><01FF>]>>"),
        std::string::npos);
    EXPECT_TRUE(sink.bytes.ends_with("%%EOF\n"));
}

TEST(PdfFile, SaysHowLongAStreamIs)
{
    StringSink sink;
    NoDeflater deflater;
    PdfFile file(sink, deflater);
    file.writeStream(file.reserve(), "/Kind/Test", "12345");
    file.finish({ 1, 1, "x" });
    EXPECT_NE(
        sink.bytes.find("<</Kind/Test/Filter/FlateDecode/Length 5>>\nstream\n12345\nendstream"),
        std::string::npos);
}

TEST(PdfFile, HandsBytesOnWhileItGrows)
{
    StringSink sink;
    NoDeflater deflater;
    PdfFile file(sink, deflater);
    const std::string data(100'000, 'x');
    file.writeStream(file.reserve(), "", data);
    EXPECT_GE(sink.bytes.size(), data.size());
}

} // namespace pelloric::pdf
