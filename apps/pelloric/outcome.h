// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "command_line.h"

#include <QJsonObject>

namespace pelloric::app {

/// The options that say what a command tells of its work.
OptionTable outcomeOptions();

/// Tells a note that no error is, unless the person wants none; it is kept for the next outcome.
void note(const QString& text);

/// Whether nothing but errors is told.
bool isQuiet();

/// What a command tells of what it has made.
class Outcome {
public:
    /// From now on notes are told or kept as the options say.
    explicit Outcome(const CommandLine& line);

    bool isJson() const { return isJson_; }

    /// Tells of one thing that was made: in JSON, an object on a line of its own with the notes
    /// since the last one as "warnings"; else the sentence, if there is one.
    void tellMade(QJsonObject facts, const QString& sentence = {}) const;

private:
    bool isJson_;
};

} // namespace pelloric::app
