// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <cstddef>
#include <cstdint>
#include <span>

namespace pelloric::fuzz {

/// Takes an input apart, from its beginning; behind its end everything is 0.
class Bytes {
public:
    Bytes(const std::uint8_t* data, std::size_t size)
        : left_(data, size)
    {
    }

    bool isEmpty() const { return left_.empty(); }

    unsigned byte()
    {
        if (left_.empty())
            return 0;
        const unsigned value = left_.front();
        left_ = left_.subspan(1);
        return value;
    }

    /// 0 to `most`, both of them.
    unsigned atMost(unsigned most) { return (byte() << 8U | byte()) % (most + 1); }

    bool chance() { return (byte() & 1U) != 0; }

    /// A number of any size, infinite or none at times.
    double number()
    {
        static constexpr double Odd[] = { -1, 0, 143.999, 144, 144.001, 1e9, -2147483649.0, 1e300 };
        const unsigned kind = byte();
        return kind < 8 ? Odd[kind] : static_cast<double>(atMost(12000)) - 100;
    }

    /// Some code units; blanks, line ends, separators and halves of pairs among them.
    Text text(unsigned most)
    {
        static constexpr char16_t Odd[] = { u' ', u'\r', u'\n', u'★', 0xD83D, 0xDE00, u'\t', 0,
            u'[', u'宋', u'\u0301', u'\u202E' };
        Text text;
        for (unsigned length = atMost(most); length > 0; --length) {
            const unsigned unit = byte();
            text.push_back(unit < std::size(Odd) ? Odd[unit] : static_cast<char16_t>(unit));
        }
        return text;
    }

private:
    std::span<const std::uint8_t> left_;
};

} // namespace pelloric::fuzz
