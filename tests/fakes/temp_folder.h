// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>
#include <string_view>
#include <vector>

namespace pelloric {

/// A folder of its own, removed with all that is in it.
class TempFolder {
public:
    TempFolder()
        : path_(unusedPath())
    {
        std::filesystem::create_directories(path_);
    }

    ~TempFolder()
    {
        std::error_code ignored;
        std::filesystem::permissions(path_, std::filesystem::perms::owner_all, ignored);
        std::filesystem::remove_all(path_, ignored);
    }

    TempFolder(const TempFolder&) = delete;
    TempFolder& operator=(const TempFolder&) = delete;

    const std::filesystem::path& path() const { return path_; }

    std::filesystem::path file(std::string_view name) const { return path_ / name; }

    /// Writes a file of exactly these bytes.
    std::filesystem::path write(std::string_view name, std::string_view bytes) const
    {
        std::ofstream stream(file(name), std::ios::binary | std::ios::trunc);
        stream.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
        return file(name);
    }

    /// The bytes of a file; "(no file)" when there is none.
    std::string read(std::string_view name) const { return bytesOf(file(name)); }

    /// The names of everything in the folder, in no order.
    std::vector<std::string> names() const
    {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(path_))
            names.push_back(entry.path().filename().string());
        return names;
    }

    /// The bytes of any file; "(no file)" when there is none.
    static std::string bytesOf(const std::filesystem::path& path)
    {
        std::ifstream stream(path, std::ios::binary);
        if (!stream)
            return "(no file)";
        return { std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>() };
    }

private:
    static std::filesystem::path unusedPath()
    {
        std::random_device random;
        std::filesystem::path path;
        do {
            const auto number = (std::uint64_t { random() } << 32U) | random();
            path = std::filesystem::temp_directory_path() / ("pelloric-" + std::to_string(number));
        } while (std::filesystem::exists(path));
        return path;
    }

    std::filesystem::path path_;
};

} // namespace pelloric
