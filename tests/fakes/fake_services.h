// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/run_time_error.h"
#include "platform/services.h"
#include "platform/text_codec.h"

#include <gtest/gtest.h>

#include <utility>
#include <vector>

namespace pelloric {

/// A code page whose bytes are UTF-8; a character that it has no bytes for can be set.
class Utf8Codec : public TextCodec {
public:
    Text decode(std::string_view bytes) const override { return fromUtf8(bytes); }

    void encode(TextView text, std::string& bytes) const override
    {
        bytes += toUtf8(replaceAll(text, missing, u"?"));
    }

    Text missing; ///< a text that becomes "?"
};

/// Keeps the message boxes and fails the test that did not take one that was shown.
class FakeMessages : public MessageService {
public:
    ~FakeMessages() override
    {
        for (const Message& message : shown_)
            ADD_FAILURE() << "unexpected message box: " << toUtf8(message.text);
    }

    void show(const Message& message) override { shown_.push_back(message); }

    /// The boxes shown since the last call.
    std::vector<Message> take() { return std::exchange(shown_, {}); }

private:
    std::vector<Message> shown_;
};

/// Counts how often pending messages were let run; can play a user who ends the operation.
class FakeMessageLoop : public MessageLoop {
public:
    void runOnce() override
    {
        ++runs;
        if (runs == cancelAt)
            throw RunTimeError(ErrorNumber::Cancelled);
    }

    void keepAlive() override
    {
        if (++beats == cancelAtBeat)
            throw RunTimeError(ErrorNumber::Cancelled);
    }

    int runs = 0;
    int cancelAt = 0; ///< the run in which the user ends the operation; 0: never
    int beats = 0;
    int cancelAtBeat = 0; ///< the same for the calls of `keepAlive`
};

/// A clock that stands still.
class FakeClock : public Clock {
public:
    Text date() const override { return day; }
    Text time() const override { return hour; }

    Text day = u"2004-10-23";
    Text hour = u"12:34:56";
};

/// The system directory is where a test says.
class FakeFolders : public SystemFolders {
public:
    std::filesystem::path systemDirectory() const override { return directory; }

    std::filesystem::path directory;
};

/// Pictures of 200 by 100 pixels, but for files that are called "missing"; they are named after
/// what was asked for.
class FakePictureService : public PictureService {
public:
    std::optional<Tpoint> pixelSize(TextView file) override
    {
        return file == u"missing" ? std::nullopt : std::optional<Tpoint>({ 200, 100 });
    }

    Text kept(TextView file, double opacity) override { return Text(file) + percent(opacity); }

    Text writtenAcross(TextView text, Tpoint, double opacity) override
    {
        return u"text " + Text(text) + percent(opacity);
    }

private:
    static Text percent(double opacity)
    {
        return u" " + decimal(static_cast<std::int64_t>(opacity * 100 + 0.5)) + u"%";
    }
};

} // namespace pelloric
