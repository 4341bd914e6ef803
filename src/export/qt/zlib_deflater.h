// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "export/pdf_file.h"

#include <memory>

struct libdeflate_compressor;

namespace pelloric::qt {

/// Compresses with libdeflate.
class ZlibDeflater final : public pdf::Deflater {
public:
    ZlibDeflater();

    std::string_view deflate(std::string_view bytes) override;

private:
    struct Free {
        void operator()(libdeflate_compressor* compressor) const;
    };

    std::unique_ptr<libdeflate_compressor, Free> compressor_;
    std::string buffer_;
};

} // namespace pelloric::qt
