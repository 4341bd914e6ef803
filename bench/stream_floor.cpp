// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "stream_floor.h"

#include "document/page_document.h"
#include "export/qt/zlib_deflater.h"

#include <charconv>
#include <cstdio>
#include <ctime>
#include <string_view>
#include <vector>

namespace pelloric::bench {

namespace {

double processorSeconds() { return static_cast<double>(std::clock()) / CLOCKS_PER_SEC; }

char* put(char* out, int number, char behind)
{
    out = std::to_chars(out, out + 12, number).ptr;
    *out = behind;
    return out + 1;
}

/// Room for the numbers of a record, and for what stands around them.
constexpr std::size_t RecordRoom = 64;

/// Lines that go on where an upright one of the row before ended become one.
char* putLines(char* out, const PageDocument& document, int page)
{
    std::vector<LineRecord> upright;
    std::size_t next = 0;
    const auto putLine = [&](const LineRecord& line) {
        out = put(put(out, line.pt1.x, ' '), line.pt1.y, 'm');
        out = put(put(out, line.pt2.x, ' '), line.pt2.y, 'l');
    };
    for (const LineRecord& line : document.lines(page)) {
        if (line.pt1.x != line.pt2.x) {
            putLine(line);
            continue;
        }
        next = next < upright.size() ? next : 0;
        if (!upright.empty() && upright[next].pt2 == line.pt1)
            upright[next].pt2 = line.pt2;
        else
            upright.insert(upright.begin() + static_cast<std::ptrdiff_t>(next), line);
        ++next;
    }
    for (const LineRecord& line : upright)
        putLine(line);
    return out;
}

char* putTexts(char* out, const PageDocument& document, int page)
{
    Tpoint last;
    for (const TextRecord& text : document.texts(page)) {
        out = put(put(out, text.pt.x - last.x, ' '), last.y - text.pt.y, ' ');
        last = text.pt;
        *out++ = 'T';
        *out++ = 'd';
        *out++ = '(';
        for (const char16_t unit : text.text()) {
            *out++ = static_cast<char>(unit >> 8U);
            *out++ = static_cast<char>(unit & 0xFFU);
        }
        *out++ = ')';
        *out++ = 'T';
        *out++ = 'j';
    }
    return out;
}

std::size_t roomFor(const PageDocument& document, int page)
{
    std::size_t room = RecordRoom * document.lines(page).size();
    for (const TextRecord& text : document.texts(page))
        room += RecordRoom + 2 * text.length;
    return room;
}

} // namespace

double streamFloorSeconds(const PageDocument& document, const std::filesystem::path& path)
{
    const double begin = processorSeconds();
    std::FILE* const file = std::fopen(path.c_str(), "wb");
    qt::ZlibDeflater deflater;
    std::vector<char> stream;
    for (int page = 0; page < document.pageCount(); ++page) {
        stream.resize(std::max(stream.size(), roomFor(document, page)));
        char* const end = putTexts(putLines(stream.data(), document, page), document, page);
        const auto size = static_cast<std::size_t>(end - stream.data());
        const std::string_view packed = deflater.deflate({ stream.data(), size });
        std::fwrite(packed.data(), 1, packed.size(), file);
    }
    std::fclose(file);
    return processorSeconds() - begin;
}

} // namespace pelloric::bench
