// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/text.h"
#include "platform/units.h"

#include <filesystem>
#include <optional>

namespace pelloric {

/// Icons of message boxes.
enum class MessageIcon { None, Information, Critical };

/// One message box with an OK button.
struct Message {
    Text text;
    std::optional<Text> title; ///< nothing: the application's display name
    MessageIcon icon = MessageIcon::None;

    bool operator==(const Message&) const = default;
};

/// Shows message boxes; a headless program puts another one in.
class MessageService {
public:
    virtual ~MessageService() = default;

    /// Returns when the user has closed the box.
    virtual void show(const Message& message) = 0;
};

/// The message loop of the user-interface thread.
class MessageLoop {
public:
    virtual ~MessageLoop() = default;

    /// Lets the messages that are pending run once.
    /// @throws RunTimeError Cancelled: the user asked to end the operation that is under way
    virtual void runOnce() = 0;

    /// Lets windows live while a long operation runs, a few times a second: what waits to be
    /// painted is painted, and the Escape key and closing a window are taken, which end the
    /// operation. Other input is refused, and timers wait.
    ///
    /// To be called at every step of an operation: between two of its passes it costs next to
    /// nothing.
    /// @throws RunTimeError Cancelled: the user asked to end the operation that is under way
    virtual void keepAlive() { }
};

/// Date and time, as texts in the user's form.
class Clock {
public:
    virtual ~Clock() = default;

    /// Today as YYYY-MM-DD.
    virtual Text date() const = 0;

    /// The time with seconds, as the locale writes it.
    virtual Text time() const = 0;
};

/// Folders of the system.
class SystemFolders {
public:
    virtual ~SystemFolders() = default;

    /// The folder of the settings file, without a separator at its end.
    virtual std::filesystem::path systemDirectory() const = 0;
};

/// Makes and measures the pictures that reports draw on pages.
class PictureService {
public:
    virtual ~PictureService() = default;

    /// The size of an image file in pixels; nothing when it cannot be read.
    virtual std::optional<Tpoint> pixelSize(TextView file) = 0;

    /// An image file that shows the same as another one, faded, and stays while the program runs.
    /// @param opacity  0 to 1
    /// @throws RunTimeError FileNotFound: it cannot be read; WriteFailed
    virtual Text kept(TextView file, double opacity) = 0;

    /// An image file that shows a text across a sheet, from the lower left to the upper right; it
    /// stays while the program runs.
    /// @param size     of the sheet: twips
    /// @param opacity  0 to 1
    /// @throws RunTimeError WriteFailed
    virtual Text writtenAcross(TextView text, Tpoint size, double opacity) = 0;
};

} // namespace pelloric
