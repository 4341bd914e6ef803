// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_pictures.h"

namespace pelloric::qt {

/// Reads every kind of image file that the toolkit knows.
class QtPictureReader final : public pdf::PictureReader {
public:
    std::optional<pdf::PictureBytes> read(TextView path) override;
};

} // namespace pelloric::qt
