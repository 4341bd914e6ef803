// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_file.h"

#include "export/pdf_syntax.h"

#include <algorithm>
#include <array>

namespace pelloric::pdf {

namespace {

/// Bytes above 127 in the second line tell programs that move files that this is no text.
constexpr std::string_view Head = "%PDF-1.7\n%\xE2\xE3\xCF\xD3\n";

constexpr std::size_t Handful = 1U << 16U;

/// A row of the table of objects: ten digits, the generation, whether it is in use.
void appendRow(std::string& out, std::uint64_t place)
{
    constexpr std::size_t Digits = 10;
    const std::string number = std::to_string(place);
    out.append(Digits - std::min(Digits, number.size()), '0');
    out += number;
    out += place == 0 ? " 65535 f \n" : " 00000 n \n";
}

} // namespace

PdfFile::PdfFile(ByteSink& sink, Deflater& deflater)
    : sink_(sink)
    , deflater_(deflater)
{
    put(Head);
}

int PdfFile::reserve()
{
    places_.push_back(0);
    return static_cast<int>(places_.size());
}

void PdfFile::write(int object, std::string_view body)
{
    begin(object);
    put(body);
    put("\nendobj\n");
}

void PdfFile::writeStream(int object, std::string_view entries, std::string_view data)
{
    std::string all(entries);
    all += "/Filter/FlateDecode";
    writePlainStream(object, all, deflater_.deflate(data));
}

void PdfFile::writePlainStream(int object, std::string_view entries, std::string_view data)
{
    begin(object);
    std::string head("<<");
    head += entries;
    head += "/Length ";
    appendInteger(head, static_cast<std::int64_t>(data.size()));
    head += ">>\nstream\n";
    put(head);
    put(data);
    put("\nendstream\nendobj\n");
}

void PdfFile::finish(const Trailer& trailer)
{
    const std::uint64_t table = written_;
    std::string text("xref\n0 ");
    appendInteger(text, static_cast<std::int64_t>(places_.size()) + 1);
    text += '\n';
    appendRow(text, 0);
    for (const std::uint64_t place : places_) {
        appendRow(text, place);
        if (text.size() >= Handful) {
            put(text);
            text.clear();
        }
    }
    text += "trailer\n<</Size ";
    appendInteger(text, static_cast<std::int64_t>(places_.size()) + 1);
    text += "/Root ";
    appendReference(text, trailer.catalog);
    text += "/Info ";
    appendReference(text, trailer.info);
    std::string identifier("<");
    for (const char character : trailer.identifier)
        appendHexByte(identifier, static_cast<unsigned char>(character));
    identifier += '>';
    text += "/ID[" + identifier + identifier + "]>>\nstartxref\n";
    appendInteger(text, static_cast<std::int64_t>(table));
    text += "\n%%EOF\n";
    put(text);
    flush();
}

void PdfFile::begin(int object)
{
    places_[static_cast<std::size_t>(object) - 1] = written_;
    std::string head;
    appendInteger(head, object);
    head += " 0 obj\n";
    put(head);
}

void PdfFile::put(std::string_view bytes)
{
    written_ += bytes.size();
    waiting_ += bytes;
    if (waiting_.size() >= Handful)
        flush();
}

void PdfFile::flush()
{
    sink_.write(waiting_);
    waiting_.clear();
}

} // namespace pelloric::pdf
