// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>
#include <string_view>

namespace pelloric {

/// What is read of a stream before it is taken for one without an end.
struct LineLimits {
    std::size_t line = 1U << 28U; ///< bytes of a line
    std::size_t all = std::string::npos; ///< bytes of the stream
};

/// Reads the lines of a stream of bytes in large pieces; a line ends at CR LF, at LF alone or at
/// CR alone.
class LineReader {
public:
    /// @param stream  borrowed, outlives the reader
    explicit LineReader(std::istream& stream, const LineLimits& limits = {});

    /// Reads one line, without its end.
    ///
    /// @param line  borrowed until the next call
    /// @return      false: the stream has ended
    /// @throws RunTimeError Overflow: the line or the stream goes on behind its limit
    bool next(std::string_view& line);

private:
    bool refill();
    bool findEnd();
    void requireEnd() const;

    std::istream& stream_;
    LineLimits limits_;
    std::size_t read_ = 0; ///< bytes of the stream
    std::string buffer_;
    std::size_t start_ = 0; ///< of what has not been handed out
    std::size_t scanned_ = 0; ///< from `start_` to here there is no line end
    bool skipsLineFeed_ = false; ///< the last line ended with a CR, whose LF may follow
};

} // namespace pelloric
