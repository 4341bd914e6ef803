// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/no_printer.h"
#include "platform/platform.h"
#include "platform/services.h"
#include "platform/std_files.h"
#include "platform/text_codec.h"
#include "platform/text_metrics.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

namespace pelloric::fuzz {

/// Ends the run where a rule that holds for every input does not hold.
inline void require(bool holds)
{
    if (!holds)
        std::abort();
}

/// A code page whose bytes are UTF-8.
class Utf8Codec final : public TextCodec {
public:
    Text decode(std::string_view bytes) const override { return fromUtf8(bytes); }
    void encode(TextView text, std::string& bytes) const override { bytes += toUtf8(text); }
};

class EvenFace final : public FaceMetrics {
public:
    EvenFace()
        : FaceMetrics(24)
    {
    }

protected:
    double measureAdvance(char32_t) override { return 10; }
};

class EvenMetrics final : public TextMetrics {
public:
    FaceMetrics& face(TextView, bool, bool) override { return face_; }

private:
    EvenFace face_;
};

class NoMessages final : public MessageService {
public:
    void show(const Message&) override { }
};

class NoLoop final : public MessageLoop {
public:
    void runOnce() override { }
};

class FixedClock final : public Clock {
public:
    Text date() const override { return u"2004-10-23"; }
    Text time() const override { return u"12:34:56"; }
};

/// A folder of this process, removed at its end.
class ProcessFolder final : public SystemFolders {
public:
    ProcessFolder()
    {
        std::string name
            = (std::filesystem::temp_directory_path() / "pelloric-fuzz-XXXXXX").string();
        require(mkdtemp(name.data()) != nullptr);
        path_ = name;
    }

    ~ProcessFolder() override
    {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }

    std::filesystem::path systemDirectory() const override { return path_; }

    std::filesystem::path write(const std::string& name, std::string_view bytes) const
    {
        std::ofstream(path_ / name, std::ios::binary)
            .write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
        return path_ / name;
    }

    std::string read(const std::string& name) const
    {
        std::ifstream file(path_ / name, std::ios::binary);
        return { std::istreambuf_iterator<char>(file), {} };
    }

private:
    std::filesystem::path path_;
};

/// All services that the core asks for.
struct FuzzPlatform {
    EvenMetrics metrics;
    Utf8Codec codec;
    NoMessages messages;
    NoLoop loop;
    FixedClock clock;
    ProcessFolder folders;
    StdFiles files;
    NoPrinter printer;
    NoPrinters printers;
    LibraryState library;
    Platform services { metrics, codec, messages, loop, clock, folders, files, printer, printers,
        library };
};

} // namespace pelloric::fuzz
