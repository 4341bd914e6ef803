// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "support/chinese_codec.h"

#include "platform/qt/qt_text_codec.h"

namespace pelloric {

std::unique_ptr<TextCodec> chineseCodec() { return std::make_unique<qt::QtTextCodec>(); }

} // namespace pelloric
