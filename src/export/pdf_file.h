// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace pelloric::pdf {

/// Takes the bytes of a file in their order.
class ByteSink {
public:
    virtual ~ByteSink() = default;

    /// @throws RunTimeError WriteFailed
    virtual void write(std::string_view bytes) = 0;
};

/// Makes bytes fewer.
class Deflater {
public:
    virtual ~Deflater() = default;

    /// The bytes in the zlib format; valid until the next call.
    virtual std::string_view deflate(std::string_view bytes) = 0;
};

/// What the end of the file says about it.
struct Trailer {
    int catalog = 0; ///< object number
    int info = 0; ///< object number
    std::string identifier {}; ///< any bytes that tell this file from others
};

/// A PDF file as a row of numbered objects, written as they come.
///
/// Only the places of the objects are kept, so that memory does not grow with their sizes.
class PdfFile {
public:
    /// Begins the file.
    /// @param sink      borrowed
    /// @param deflater  borrowed
    PdfFile(ByteSink& sink, Deflater& deflater);

    /// The number of an object that is written later.
    int reserve();

    /// Bytes written so far.
    std::uint64_t size() const { return written_; }

    /// Writes an object.
    /// @param body  all that stands between "obj" and "endobj"
    void write(int object, std::string_view body);

    /// Writes a stream, compressed.
    /// @param entries  of its dictionary, without length and filter
    void writeStream(int object, std::string_view entries, std::string_view data);

    /// Writes a stream of bytes that are left as they are.
    /// @param entries  of its dictionary, without the length
    void writePlainStream(int object, std::string_view entries, std::string_view data);

    /// Writes the table of objects and ends the file. All reserved objects are written by then.
    void finish(const Trailer& trailer);

private:
    void begin(int object);
    void put(std::string_view bytes);
    void flush();

    ByteSink& sink_;
    Deflater& deflater_;
    std::string waiting_; ///< bytes that are not handed over yet
    std::uint64_t written_ = 0; ///< bytes put so far
    std::vector<std::uint64_t> places_; ///< of the objects, from number 1; 0: not written
};

} // namespace pelloric::pdf
