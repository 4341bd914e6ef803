// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fuzz_bytes.h"

#include "document/page_document.h"
#include "document/recorder.h"

#include <algorithm>

namespace pelloric::fuzz {

/// A place on a page, at times far off it.
inline Twips twips(Bytes& bytes)
{
    static constexpr Twips Odd[] = { -1, 0, 1, 2147483647, -2147483647 - 1, 288000, 32768, -40000 };
    const unsigned kind = bytes.byte();
    return kind < std::size(Odd) ? Odd[kind] : static_cast<Twips>(bytes.atMost(17000));
}

inline std::int16_t shortNumber(Bytes& bytes)
{
    const unsigned kind = bytes.byte();
    if (kind < 8)
        return static_cast<std::int16_t>(bytes.atMost(65535) - 32768);
    return static_cast<std::int16_t>(kind % 9);
}

inline Color color(Bytes& bytes)
{
    return bytes.chance() ? static_cast<Color>(bytes.atMost(65535)) << 8 : -1 - twips(bytes);
}

inline Font font(Bytes& bytes)
{
    static constexpr TextView Names[] = { u"宋体", u"0", u"", u"DejaVu Sans", u"AR PL UMing CN" };
    static constexpr float Sizes[] = { 0, -3, 1, 9, 10.5F, 72, 1000, 1e6F, 1e30F, 1e-30F };
    Font font;
    const unsigned name = bytes.byte();
    font.name = name < 16 ? bytes.text(10) : Text(Names[name % std::size(Names)]);
    const unsigned size = bytes.byte();
    font.size = size < 100 ? Sizes[size % std::size(Sizes)] : static_cast<float>(size) / 10;
    font.bold = bytes.chance();
    font.italic = bytes.chance();
    return font;
}

/// One recording operation.
inline void record(Bytes& bytes, Recorder& recorder)
{
    switch (bytes.atMost(6)) {
    case 0:
        recorder.setLineAttributes({ shortNumber(bytes), color(bytes), shortNumber(bytes),
            shortNumber(bytes), color(bytes) });
        break;
    case 1:
        recorder.setTextFont(font(bytes), color(bytes));
        break;
    case 2:
        recorder.lineTo({ twips(bytes), twips(bytes) });
        break;
    case 3:
        recorder.printCentred(bytes.text(20), twips(bytes), bytes.number(), twips(bytes));
        break;
    case 4:
        recorder.wrappingPrint(bytes.text(60), bytes.number());
        break;
    default:
        recorder.moveTo({ twips(bytes), twips(bytes) });
        recorder.printText(bytes.text(40), bytes.chance());
    }
}

/// Pages of any lines and texts. @throws RunTimeError of the recording operations
inline void record(Bytes& bytes, PageDocument& document, TextMetrics& metrics)
{
    Recorder recorder(document, metrics);
    for (unsigned page = bytes.atMost(3);; --page) {
        for (unsigned left = bytes.atMost(40); left > 0; --left)
            record(bytes, recorder);
        if (page == 0)
            break;
        recorder.newPage();
    }
}

} // namespace pelloric::fuzz
