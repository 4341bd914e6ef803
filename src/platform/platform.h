// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>

namespace pelloric {

class Clock;
class FileSystem;
class MessageLoop;
class MessageService;
class PictureService;
class Printer;
class PrinterSystem;
class SystemFolders;
class TextCodec;
class TextMetrics;

/// What all controls of a program share.
struct LibraryState {
    std::int32_t MarvenStartRow = 1; ///< the first row of a flex grid that is printed
};

/// The services that the core works on; the references outlive whatever is given the record.
struct Platform {
    TextMetrics& metrics;
    TextCodec& codec;
    MessageService& messages;
    MessageLoop& loop;
    Clock& clock;
    SystemFolders& folders;
    FileSystem& files;
    Printer& printer;
    PrinterSystem& printers;
    LibraryState& library;
    char16_t decimalSeparator = u'.'; ///< of the user's locale
    PictureService* pictures = nullptr; ///< null: reports have neither watermarks nor logos
};

} // namespace pelloric
