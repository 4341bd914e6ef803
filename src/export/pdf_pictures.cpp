// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_pictures.h"

#include "export/image_files.h"
#include "export/pdf_file.h"
#include "export/pdf_syntax.h"

namespace pelloric::pdf {

namespace {

std::string entriesOf(const PictureBytes& picture, std::string_view colorSpace)
{
    std::string entries("/Width ");
    appendInteger(entries, picture.width);
    entries += "/Height ";
    appendInteger(entries, picture.height);
    entries += "/BitsPerComponent 8/ColorSpace";
    appendName(entries, colorSpace);
    return entries;
}

constexpr std::string_view Type = "/Type/XObject/Subtype/Image";

void writePixels(PdfFile& file, int object, const PictureBytes& picture)
{
    std::string entries(Type);
    entries += entriesOf(picture, "DeviceRGB");
    if (!picture.opacities.empty()) {
        const int mask = file.reserve();
        file.writeStream(
            mask, std::string(Type) + entriesOf(picture, "DeviceGray"), picture.opacities);
        entries += "/SMask ";
        appendReference(entries, mask);
    }
    file.writeStream(object, entries, picture.colors);
}

} // namespace

PdfPictures::PdfPictures(PdfFile& file, PictureReader& reader)
    : file_(file)
    , reader_(reader)
{
}

std::string_view PdfPictures::nameOf(TextView path)
{
    auto known = names_.find(path);
    if (known == names_.end())
        known = names_.emplace(Text(path), add(path)).first;
    return known->second;
}

std::string PdfPictures::add(TextView path)
{
    const auto picture = reader_.read(path);
    if (!picture)
        return {};
    const int object = file_.reserve();
    auto packed = packedPng(picture->file);
    if (!packed)
        packed = packedJpeg(picture->file);
    if (packed)
        file_.writePlainStream(object, std::string(Type) + packed->entries, packed->bytes);
    else
        writePixels(file_, object, *picture);
    std::string name = "P" + std::to_string(++count_);
    appendName(resources_, name);
    resources_ += ' ';
    appendReference(resources_, object);
    return name;
}

} // namespace pelloric::pdf
