// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"

#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace pelloric::pdf {

class PdfFile;

/// An image file as it was read.
struct PictureBytes {
    int width = 0; ///< pixels
    int height = 0; ///< pixels
    std::string file {}; ///< the image file itself, where it may be passed on as it is
    std::string colors {}; ///< red, green and blue of each pixel, rows from the top
    std::string opacities {}; ///< of each pixel; empty: all of them are opaque
};

/// Reads image files.
class PictureReader {
public:
    virtual ~PictureReader() = default;

    /// @return  nothing: there is no such file, or it is no image
    virtual std::optional<PictureBytes> read(TextView path) = 0;
};

/// The pictures of a PDF file, each of which is embedded once for all pages.
///
/// JPEG files and plain PNG files are passed on without being unpacked.
class PdfPictures {
public:
    /// @param file    borrowed
    /// @param reader  borrowed
    PdfPictures(PdfFile& file, PictureReader& reader);

    /// The name of a picture in content streams, written to the file at its first use.
    /// @return  empty: it cannot be read
    std::string_view nameOf(TextView path);

    /// The entries of the dictionary of external objects: "/P1 7 0 R".
    const std::string& resources() const { return resources_; }

private:
    std::string add(TextView path);

    PdfFile& file_;
    PictureReader& reader_;
    std::map<Text, std::string, std::less<>> names_;
    std::string resources_;
    int count_ = 0;
};

} // namespace pelloric::pdf
