// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/qt/qt_text_codec.h"

#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"

#include <algorithm>

namespace pelloric::qt {

namespace {

#ifdef Q_OS_WIN
constexpr auto CodePage = QStringConverter::System;
#else
constexpr auto CodePage = "GB18030";
#endif

bool isAscii(char byte) { return static_cast<unsigned char>(byte) < 0x80; }

bool isAsciiUnit(char16_t unit) { return unit < 0x80; }

bool isSurrogate(char16_t unit) { return unit >= 0xD800 && unit < 0xE000; }

/// The text with "?" for each half of a surrogate pair that stands alone.
Text withoutHalfPairs(TextView text)
{
    Text whole(text);
    for (std::size_t at = 0; at < text.size();) {
        const int length = characterLength(text, at);
        if (length == 1 && isSurrogate(text[at]))
            whole[at] = u'?';
        at += static_cast<std::size_t>(length);
    }
    return whole;
}

} // namespace

QtTextCodec::QtTextCodec()
    : decoder_(CodePage)
    , encoder_(CodePage)
{
    if (!decoder_.isValid() || !encoder_.isValid())
        throw RunTimeError(
            ErrorNumber::InvalidCall, phrase(u"this Qt has no converter for GB18030"));
}

Text QtTextCodec::decode(std::string_view bytes) const
{
    if (std::all_of(bytes.begin(), bytes.end(), isAscii))
        return Text(bytes.begin(), bytes.end());
    const auto size = static_cast<qsizetype>(bytes.size());
    constexpr std::size_t TailRoom = 8;
    Text text(static_cast<std::size_t>(decoder_.requiredSpace(size)) + TailRoom, u'\0');
    auto* const first = reinterpret_cast<QChar*>(text.data());
    QChar* end = decoder_.appendToBuffer(first, QByteArrayView(bytes.data(), size));
    // A character that is cut off at the end is held back until an ASCII one follows it.
    end = decoder_.appendToBuffer(end, QByteArrayView("\n", 1)) - 1;
    text.resize(static_cast<std::size_t>(end - first));
    decoder_.resetState();
    return text;
}

void QtTextCodec::encode(TextView text, std::string& bytes) const
{
    if (std::all_of(text.begin(), text.end(), isAsciiUnit)) {
        for (const char16_t unit : text)
            bytes.push_back(static_cast<char>(unit));
        return;
    }
    Text whole;
    if (std::any_of(text.begin(), text.end(), isSurrogate)) {
        whole = withoutHalfPairs(text);
        text = whole;
    }
    buffer_.resize(encoder_.requiredSpace(static_cast<qsizetype>(text.size())));
    const char* end = encoder_.appendToBuffer(buffer_.data(), borrowed(text));
    bytes.append(buffer_.constData(), end);
    encoder_.resetState();
}

} // namespace pelloric::qt
