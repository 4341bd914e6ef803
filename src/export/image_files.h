// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace pelloric::pdf {

/// An image whose packed bytes a PDF file can hold as they are.
struct PackedImage {
    std::string entries {}; ///< of a stream's dictionary: size, colours, packing
    std::string bytes {};
};

/// The packed pixels of a PNG file.
///
/// @return  nothing: it is no PNG file, is interlaced, or some pixels are not opaque
std::optional<PackedImage> packedPng(std::string_view file);

/// A JPEG file as it stands.
///
/// @return  nothing: it is no JPEG file, or is neither grey nor made of three colours
std::optional<PackedImage> packedJpeg(std::string_view file);

} // namespace pelloric::pdf
