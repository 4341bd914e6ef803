// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "fakes/fake_metrics.h"
#include "fakes/fake_printer.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "platform/platform.h"
#include "platform/std_files.h"

namespace pelloric {

/// All services of a platform, with a temporary folder as the system directory.
struct FakePlatform {
    FakePlatform() { folders.directory = folder.path(); }

    /// The record that the core takes; it borrows the services from this object.
    Platform& services() { return record_; }

    TempFolder folder;
    FakeMetrics metrics;
    Utf8Codec codec;
    FakeMessages messages;
    FakeMessageLoop loop;
    FakeClock clock;
    FakeFolders folders;
    StdFiles files;
    FakePrinter printer;
    FakePrinterSystem printers;
    LibraryState library;
    FakePictureService pictures;

private:
    Platform record_ { metrics, codec, messages, loop, clock, folders, files, printer, printers,
        library, u'.', &pictures };
};

} // namespace pelloric
