// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/file_bytes.h"

#include "platform/run_time_error.h"

#include <array>
#include <fstream>

namespace pelloric {

namespace {

/// Nothing is truncated before the new bytes stand, so that no moment leaves an empty file.
bool overwrite(const std::filesystem::path& path, std::string_view bytes)
{
    std::fstream stream(path, std::ios::binary | std::ios::in | std::ios::out);
    stream.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    stream.close();
    if (!stream)
        return false;
    std::error_code error;
    if (std::filesystem::file_size(path, error) != bytes.size())
        std::filesystem::resize_file(path, bytes.size(), error);
    return !error;
}

} // namespace

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
                pathText(path) + u" holds more than " + decimal(static_cast<std::int64_t>(most))
                    + u" bytes");
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

bool createFile(const std::filesystem::path& path, std::string_view bytes)
{
    std::ofstream stream(path, std::ios::binary | std::ios::trunc);
    if (!stream)
        return false;
    stream.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    stream.close();
    if (stream)
        return true;
    std::error_code ignored;
    std::filesystem::remove(path, ignored);
    return false;
}

bool rewriteFile(
    const std::filesystem::path& path, std::string_view bytes, std::string_view oldBytes)
{
    if (overwrite(path, bytes))
        return true;
    overwrite(path, oldBytes);
    return false;
}

} // namespace pelloric
