// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/image_files.h"

#include <gtest/gtest.h>

#include <string>

namespace pelloric::pdf {

namespace {

std::string bytes(std::initializer_list<int> numbers) { return { numbers.begin(), numbers.end() }; }

std::string chunk(const std::string& name, const std::string& data)
{
    const auto size = static_cast<int>(data.size());
    return bytes({ 0, 0, size >> 8, size & 0xFF }) + name + data + "sums";
}

/// A PNG file of 3 by 2 pixels.
std::string png(int bits, int kind, const std::string& more = "", int interlace = 0)
{
    return std::string("\x89PNG\r\n\x1A\n")
        + chunk("IHDR", bytes({ 0, 0, 0, 3, 0, 0, 0, 2, bits, kind, 0, 0, interlace })) + more
        + chunk("IDAT", "first") + chunk("IDAT", "second") + chunk("IEND", "");
}

std::string jpeg(int channels)
{
    return bytes({ 0xFF, 0xD8, 0xFF, 0xE0, 0, 4, 1, 2, 0xFF, 0xC4, 0, 3, 0 })
        + bytes({ 0xFF, 0xC2, 0, 17, 8, 0, 5, 1, 4, channels }) + std::string(12, 'x');
}

} // namespace

TEST(ImageFiles, PassesThePackedPixelsOfAPngOn)
{
    const auto image = packedPng(png(8, 2));
    ASSERT_TRUE(image);
    EXPECT_EQ(image->bytes, "firstsecond");
    EXPECT_EQ(image->entries,
        "/Width 3/Height 2/BitsPerComponent 8/ColorSpace/DeviceRGB/Filter/FlateDecode/DecodeParms"
        "<</Predictor 15/Columns 3/Colors 3/BitsPerComponent 8>>");
}

TEST(ImageFiles, KeepsThePaletteOfAPng)
{
    const auto image = packedPng(png(1, 3, chunk("PLTE", bytes({ 255, 0, 0, 0, 0, 255 }))));
    ASSERT_TRUE(image);
    EXPECT_NE(
        image->entries.find("/ColorSpace[/Indexed/DeviceRGB 1<FF00000000FF>]"), std::string::npos);
}

TEST(ImageFiles, UnpacksAPngThatNoPdfCanHoldAsItIs)
{
    EXPECT_FALSE(packedPng(png(8, 6))) << "with opacity";
    EXPECT_FALSE(packedPng(png(8, 2, chunk("tRNS", "123456")))) << "with a transparent colour";
    EXPECT_FALSE(packedPng(png(8, 2, "", 1))) << "interlaced";
    EXPECT_FALSE(packedPng(png(16, 2))) << "16 bits";
    EXPECT_FALSE(packedPng(png(8, 3))) << "no palette";
    EXPECT_FALSE(packedPng("GIF89a")) << "no PNG";
    const std::string whole = png(8, 2);
    for (std::size_t size = 0; size < whole.size(); ++size)
        EXPECT_FALSE(packedPng(whole.substr(0, size))) << "cut off";
}

TEST(ImageFiles, PassesAJpegOn)
{
    const auto image = packedJpeg(jpeg(3));
    ASSERT_TRUE(image);
    EXPECT_EQ(image->bytes, jpeg(3));
    EXPECT_EQ(image->entries,
        "/Width 260/Height 5/BitsPerComponent 8/ColorSpace/DeviceRGB/Filter/DCTDecode");
    EXPECT_NE(packedJpeg(jpeg(1))->entries.find("/DeviceGray"), std::string::npos);
}

TEST(ImageFiles, UnpacksAJpegOfFourColours)
{
    EXPECT_FALSE(packedJpeg(jpeg(4)));
    EXPECT_FALSE(packedJpeg(png(8, 2)));
    for (std::size_t size = 0; size < 23; ++size)
        EXPECT_FALSE(packedJpeg(jpeg(3).substr(0, size))) << "cut off";
}

} // namespace pelloric::pdf
