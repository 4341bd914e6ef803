// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text_codec.h"

#include <QStringDecoder>
#include <QStringEncoder>

namespace pelloric::qt {

/// The system's ANSI code page on Windows, GB18030 elsewhere.
///
/// Both converters are kept: one object is used by one thread.
class QtTextCodec final : public TextCodec {
public:
    /// @throws RunTimeError InvalidCall: the toolkit has no converter for the code page
    QtTextCodec();

    Text decode(std::string_view bytes) const override;
    void encode(TextView text, std::string& bytes) const override;

private:
    mutable QStringDecoder decoder_;
    mutable QStringEncoder encoder_;
    mutable QByteArray buffer_;
};

} // namespace pelloric::qt
