// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/image_files.h"

#include "export/pdf_syntax.h"

#include <cstdint>

namespace pelloric::pdf {

namespace {

constexpr std::string_view PngSignature = "\x89PNG\r\n\x1A\n";
constexpr std::size_t PngHeadSize = 13;

/// Lengths in a chunk of a PNG file: its size and name in front, its checksum behind.
constexpr std::size_t ChunkHead = 8;
constexpr std::size_t ChunkTail = 4;

constexpr int GreyPng = 0;
constexpr int ColorPng = 2;
constexpr int PalettePng = 3;

/// Markers of JPEG files.
constexpr unsigned StartOfImage = 0xD8;
constexpr unsigned StartOfScan = 0xDA;

unsigned byteAt(std::string_view bytes, std::size_t at)
{
    return static_cast<unsigned char>(bytes[at]);
}

/// A number of `count` bytes, the highest first.
std::uint32_t numberAt(std::string_view bytes, std::size_t at, int count)
{
    std::uint32_t number = 0;
    for (int byte = 0; byte < count; ++byte)
        number = (number << 8U) | byteAt(bytes, at + static_cast<std::size_t>(byte));
    return number;
}

void appendEntry(std::string& entries, std::string_view name, std::int64_t value)
{
    appendName(entries, name);
    entries += ' ';
    appendInteger(entries, value);
}

void appendPalette(std::string& entries, std::string_view palette)
{
    constexpr std::size_t Channels = 3;
    entries += "[/Indexed/DeviceRGB ";
    appendInteger(entries, static_cast<std::int64_t>(palette.size() / Channels) - 1);
    entries += '<';
    for (const char byte : palette)
        appendHexByte(entries, static_cast<unsigned char>(byte));
    entries += ">]";
}

/// The parts of a PNG file that a PDF file needs.
struct PngParts {
    std::string_view head {};
    std::string_view palette {};
    std::string pixels {};
    bool isWhole = false;
    bool isTransparent = false;
};

PngParts pngParts(std::string_view file)
{
    PngParts parts;
    std::size_t at = PngSignature.size();
    while (at + ChunkHead + ChunkTail <= file.size()) {
        const std::size_t size = numberAt(file, at, 4);
        const std::string_view name = file.substr(at + 4, 4);
        if (size > file.size() - at - ChunkHead - ChunkTail)
            break;
        const std::string_view data = file.substr(at + ChunkHead, size);
        if (name == "IHDR")
            parts.head = data;
        else if (name == "PLTE")
            parts.palette = data;
        else if (name == "IDAT")
            parts.pixels += data;
        else if (name == "tRNS")
            parts.isTransparent = true;
        else if (name == "IEND")
            parts.isWhole = true;
        at += ChunkHead + size + ChunkTail;
    }
    return parts;
}

/// What the frame of a JPEG file says.
struct JpegFrame {
    unsigned bits = 0;
    unsigned height = 0;
    unsigned width = 0;
    unsigned channels = 0;
};

bool isFrame(unsigned marker)
{
    const bool isTable = marker == 0xC4 || marker == 0xC8 || marker == 0xCC;
    return marker >= 0xC0 && marker <= 0xCF && !isTable;
}

/// @return  nothing: there is none
std::optional<JpegFrame> jpegFrame(std::string_view file)
{
    constexpr std::size_t FrameSize = 10;
    std::size_t at = 2;
    while (at + FrameSize <= file.size() && byteAt(file, at) == 0xFF) {
        const unsigned marker = byteAt(file, at + 1);
        if (marker == StartOfScan)
            return {};
        if (isFrame(marker))
            return JpegFrame { byteAt(file, at + 4), numberAt(file, at + 5, 2),
                numberAt(file, at + 7, 2), byteAt(file, at + 9) };
        at += 2 + numberAt(file, at + 2, 2);
    }
    return {};
}

} // namespace

std::optional<PackedImage> packedPng(std::string_view file)
{
    if (!file.starts_with(PngSignature))
        return {};
    PngParts parts = pngParts(file);
    if (!parts.isWhole || parts.isTransparent || parts.head.size() != PngHeadSize)
        return {};
    const unsigned bits = byteAt(parts.head, 8);
    const unsigned kind = byteAt(parts.head, 9);
    const bool isInterlaced = byteAt(parts.head, 12) != 0;
    const bool isOpaque = kind == GreyPng || kind == ColorPng || kind == PalettePng;
    if (isInterlaced || !isOpaque || bits > 8 || (kind == PalettePng && parts.palette.empty()))
        return {};
    const std::int64_t width = numberAt(parts.head, 0, 4);
    PackedImage image;
    appendEntry(image.entries, "Width", width);
    appendEntry(image.entries, "Height", numberAt(parts.head, 4, 4));
    appendEntry(image.entries, "BitsPerComponent", bits);
    image.entries += "/ColorSpace";
    if (kind == PalettePng)
        appendPalette(image.entries, parts.palette);
    else
        image.entries += kind == GreyPng ? "/DeviceGray" : "/DeviceRGB";
    image.entries += "/Filter/FlateDecode/DecodeParms<</Predictor 15";
    appendEntry(image.entries, "Columns", width);
    appendEntry(image.entries, "Colors", kind == ColorPng ? 3 : 1);
    appendEntry(image.entries, "BitsPerComponent", bits);
    image.entries += ">>";
    image.bytes = std::move(parts.pixels);
    return image;
}

std::optional<PackedImage> packedJpeg(std::string_view file)
{
    if (file.size() < 4 || byteAt(file, 0) != 0xFF || byteAt(file, 1) != StartOfImage)
        return {};
    const auto frame = jpegFrame(file);
    if (!frame || frame->bits != 8 || (frame->channels != 1 && frame->channels != 3))
        return {};
    PackedImage image;
    appendEntry(image.entries, "Width", frame->width);
    appendEntry(image.entries, "Height", frame->height);
    appendEntry(image.entries, "BitsPerComponent", frame->bits);
    image.entries += frame->channels == 1 ? "/ColorSpace/DeviceGray" : "/ColorSpace/DeviceRGB";
    image.entries += "/Filter/DCTDecode";
    image.bytes = file;
    return image;
}

} // namespace pelloric::pdf
