// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/qt/png_bytes.h"

#include <QImage>

#include <png.h>

#include <algorithm>
#include <exception>
#include <memory>
#include <new>
#include <vector>

namespace pelloric::qt {

namespace {

constexpr int Level = 3; ///< of zlib; past it, files of text pages hardly shrink
constexpr int BitsOfSample = 8;
constexpr std::size_t SamplesOfColor = 3;

/// Ends the writer of a file, which is not whole, without a word on standard error.
[[noreturn]] void giveUp(png_structp writer, png_const_charp) { png_longjmp(writer, 1); }

void warnNobody(png_structp, png_const_charp) { }

/// No exception passes through the library's own code.
void appendBytes(png_structp writer, png_bytep bytes, png_size_t size)
{
    auto& file = *static_cast<QByteArray*>(png_get_io_ptr(writer));
    bool isAppended = true;
    try {
        file.append(reinterpret_cast<const char*>(bytes), static_cast<qsizetype>(size));
    } catch (const std::bad_alloc&) {
        isAppended = false;
    }
    if (!isAppended)
        png_error(writer, "");
}

void flushNothing(png_structp) { }

/// Puts the samples of a row of pixels one behind the other.
/// @return  false: it was to be grey and is not
bool takeRow(const QRgb* pixels, int width, bool isGrey, png_byte* samples)
{
    for (int x = 0; x < width; ++x) {
        const QRgb pixel = pixels[x];
        const auto red = static_cast<png_byte>(qRed(pixel));
        const auto green = static_cast<png_byte>(qGreen(pixel));
        const auto blue = static_cast<png_byte>(qBlue(pixel));
        if (isGrey && (red != green || green != blue))
            return false;
        *samples++ = red;
        if (!isGrey) {
            *samples++ = green;
            *samples++ = blue;
        }
    }
    return true;
}

std::vector<png_byte> samplesOf(const QImage& image, bool isGrey)
{
    const auto width = static_cast<std::size_t>(image.width()) * (isGrey ? 1 : SamplesOfColor);
    std::vector<png_byte> samples(width * static_cast<std::size_t>(image.height()));
    for (int y = 0; y < image.height(); ++y) {
        const auto* const pixels = reinterpret_cast<const QRgb*>(image.constScanLine(y));
        png_byte* const row = samples.data() + width * static_cast<std::size_t>(y);
        if (!takeRow(pixels, image.width(), isGrey, row))
            return {};
    }
    return samples;
}

/// What is handed to the library; no object lives here that a long jump would leave behind.
struct PngJob {
    png_structp writer;
    png_infop info;
    const QImage* image;
    const png_byte* samples;
    QByteArray* file;
    bool isGrey;
};

bool writeAll(const PngJob& job)
{
    if (setjmp(png_jmpbuf(job.writer)) != 0)
        return false;
    const auto width = static_cast<png_uint_32>(job.image->width());
    const auto height = static_cast<png_uint_32>(job.image->height());
    png_set_write_fn(job.writer, job.file, appendBytes, flushNothing);
    png_set_compression_level(job.writer, Level);
    png_set_filter(job.writer, PNG_FILTER_TYPE_BASE, PNG_FILTER_NONE);
    png_set_IHDR(job.writer, job.info, width, height, BitsOfSample,
        job.isGrey ? PNG_COLOR_TYPE_GRAY : PNG_COLOR_TYPE_RGB, PNG_INTERLACE_NONE,
        PNG_COMPRESSION_TYPE_BASE, PNG_FILTER_TYPE_BASE);
    png_set_pHYs(job.writer, job.info, static_cast<png_uint_32>(job.image->dotsPerMeterX()),
        static_cast<png_uint_32>(job.image->dotsPerMeterY()), PNG_RESOLUTION_METER);
    png_write_info(job.writer, job.info);
    const std::size_t stride = width * (job.isGrey ? 1 : SamplesOfColor);
    for (png_uint_32 row = 0; row < height; ++row)
        png_write_row(job.writer, job.samples + stride * row);
    png_write_end(job.writer, job.info);
    return true;
}

} // namespace

QByteArray pngBytes(const QImage& image)
{
    std::vector<png_byte> samples = samplesOf(image, true);
    const bool isGrey = !samples.empty();
    if (!isGrey)
        samples = samplesOf(image, false);
    QByteArray file;
    png_structp writer
        = png_create_write_struct(PNG_LIBPNG_VER_STRING, nullptr, giveUp, warnNobody);
    png_infop info = writer != nullptr ? png_create_info_struct(writer) : nullptr;
    const bool isWhole
        = info != nullptr && writeAll({ writer, info, &image, samples.data(), &file, isGrey });
    png_destroy_write_struct(&writer, &info);
    return isWhole ? file : QByteArray();
}

} // namespace pelloric::qt
