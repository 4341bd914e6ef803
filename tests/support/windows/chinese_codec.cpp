// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "support/chinese_codec.h"

#include <windows.h>

namespace pelloric {

namespace {

constexpr UINT SimplifiedChinese = 936;

class WindowsCodec final : public TextCodec {
public:
    Text decode(std::string_view bytes) const override
    {
        if (bytes.empty())
            return {};
        const int size = static_cast<int>(bytes.size());
        std::wstring wide(bytes.size(), L'\0');
        const int count
            = MultiByteToWideChar(SimplifiedChinese, 0, bytes.data(), size, wide.data(), size);
        return Text(wide.begin(), wide.begin() + count);
    }

    void encode(TextView text, std::string& bytes) const override
    {
        if (text.empty())
            return;
        const std::wstring wide(text.begin(), text.end());
        const int size = static_cast<int>(wide.size());
        std::string encoded(2 * wide.size(), '\0');
        const int count = WideCharToMultiByte(
            SimplifiedChinese, 0, wide.data(), size, encoded.data(), 2 * size, "?", nullptr);
        bytes.append(encoded, 0, static_cast<std::size_t>(count));
    }
};

} // namespace

std::unique_ptr<TextCodec> chineseCodec() { return std::make_unique<WindowsCodec>(); }

} // namespace pelloric
