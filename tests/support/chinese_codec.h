// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_codec.h"

#include <memory>

namespace pelloric {

/// The code page in which a Chinese system writes settings and documents, by what converts text
/// here.
std::unique_ptr<TextCodec> chineseCodec();

} // namespace pelloric
