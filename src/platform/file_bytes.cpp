// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/file_bytes.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"

#include <array>
#include <fstream>

namespace pelloric {

Text pathText(const std::filesystem::path& path)
{
    const std::u8string bytes = path.u8string();
    return fromUtf8({ reinterpret_cast<const char*>(bytes.data()), bytes.size() });
}

std::string readFileBytes(const std::filesystem::path& path, std::size_t most)
{
    std::ifstream stream(path, std::ios::binary);
    std::string bytes;
    std::array<char, 1U << 14U> chunk {};
    while (stream) {
        stream.read(chunk.data(), chunk.size());
        bytes.append(chunk.data(), static_cast<std::size_t>(stream.gcount()));
        if (bytes.size() > most)
            throw RunTimeError(ErrorNumber::Overflow,
                phrase(u"%1 holds more than %2 bytes",
                    { pathText(path), decimal(static_cast<std::int64_t>(most)) }));
    }
    if (!stream.is_open() || stream.bad())
        throw RunTimeError(ErrorNumber::FileNotFound, pathText(path));
    return bytes;
}

std::string firstFileBytes(const std::filesystem::path& path, std::size_t most)
{
    std::error_code ignored;
    if (!std::filesystem::is_regular_file(path, ignored))
        return {};
    std::ifstream stream(path, std::ios::binary);
    std::string bytes(most, '\0');
    stream.read(bytes.data(), static_cast<std::streamsize>(most));
    bytes.resize(static_cast<std::size_t>(stream.gcount()));
    return bytes;
}

} // namespace pelloric
