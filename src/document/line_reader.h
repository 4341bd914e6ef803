// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <iosfwd>
#include <string>
#include <string_view>

namespace pelloric {

/// Reads the lines of a stream of bytes in large pieces; a line ends at CR LF, at LF alone or at
/// CR alone, and may be of any length.
class LineReader {
public:
    /// @param stream  borrowed, outlives the reader
    explicit LineReader(std::istream& stream);

    /// Reads one line, without its end.
    ///
    /// @param line  borrowed until the next call
    /// @return      false: the stream has ended
    bool next(std::string_view& line);

private:
    bool refill();
    bool findEnd();

    std::istream& stream_;
    std::string buffer_;
    std::size_t start_ = 0; ///< of what has not been handed out
    std::size_t scanned_ = 0; ///< from `start_` to here there is no line end
    bool skipsLineFeed_ = false; ///< the last line ended with a CR, whose LF may follow
};

} // namespace pelloric
