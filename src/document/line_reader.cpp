// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/line_reader.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <istream>

namespace pelloric {

namespace {

constexpr std::size_t ChunkBytes = 1U << 18U;

} // namespace

LineReader::LineReader(std::istream& stream, const LineLimits& limits)
    : stream_(stream)
    , limits_(limits)
{
}

bool LineReader::next(std::string_view& line)
{
    if (skipsLineFeed_ && (start_ < buffer_.size() || refill())) {
        start_ += buffer_[start_] == '\n' ? 1 : 0;
        scanned_ = start_;
    }
    skipsLineFeed_ = false;
    while (!findEnd()) {
        if (refill())
            continue;
        line = std::string_view(buffer_).substr(start_);
        start_ = buffer_.size();
        return !line.empty();
    }
    line = std::string_view(buffer_).substr(start_, scanned_ - start_);
    skipsLineFeed_ = buffer_[scanned_] == '\r';
    start_ = ++scanned_;
    return true;
}

/// Leaves `scanned_` on the first line end, or behind all that has been read.
bool LineReader::findEnd()
{
    const char* bytes = buffer_.data();
    const std::size_t size = buffer_.size();
    std::size_t at = scanned_;
    while (at < size && bytes[at] != '\n' && bytes[at] != '\r')
        ++at;
    scanned_ = at;
    return at < size;
}

/// Reads another piece behind what is left; a line that is longer makes the buffer grow.
bool LineReader::refill()
{
    if (!stream_)
        return false;
    buffer_.erase(0, start_);
    scanned_ -= start_;
    start_ = 0;
    const std::size_t kept = buffer_.size();
    buffer_.resize(kept + ChunkBytes);
    stream_.read(buffer_.data() + kept, static_cast<std::streamsize>(ChunkBytes));
    const auto size = static_cast<std::size_t>(stream_.gcount());
    buffer_.resize(kept + size);
    read_ += size;
    requireEnd();
    return size > 0;
}

/// @throws RunTimeError Overflow: what was read so far is behind a limit
void LineReader::requireEnd() const
{
    if (scanned_ > limits_.line)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"a line holds more than %1 bytes",
                { decimal(static_cast<std::int64_t>(limits_.line)) }));
    if (read_ > limits_.all)
        throw RunTimeError(ErrorNumber::Overflow,
            phrase(u"it goes on after %1 bytes, which is the most that is read of what is no "
                   u"ordinary file",
                { decimal(static_cast<std::int64_t>(limits_.all)) }));
}

} // namespace pelloric
