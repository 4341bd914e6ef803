// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// The errors that the library throws, each with a number and a text for people.
///
/// The controls throw none: an error of a member becomes a message box there, or an error of the
/// script that called it.
///
/// @code
/// try {
///     report.build(grid);
/// } catch (const pelloric::RunTimeError& error) {
///     std::cerr << error.what() << '\n'; // "Overflow: ...", UTF-8
/// }
/// @endcode

#include <pelloric/version.h>

#include <stdexcept>
#include <string>
#include <string_view>

namespace pelloric {

/// Every number that a `RunTimeError` carries.
enum class ErrorNumber {
    InvalidCall = 5,
    Overflow = 6,
    SubscriptOutOfRange = 9,
    DivisionByZero = 11,
    TypeMismatch = 13,
    FileNotFound = 53,
    WriteFailed = 57,
    DiskFull = 61,
    PermissionDenied = 70,
    ObjectMissing = 91,
    NoSuchMember = 438,
    Cancelled = 32755,
};

/// What the library throws; nothing else leaves it on purpose.
class PELLORIC_EXPORT RunTimeError : public std::runtime_error {
public:
    /// An error with the plain text of its number.
    explicit RunTimeError(ErrorNumber number);

    /// @param detail  what went wrong, for a person: names the member, the file or the value
    RunTimeError(ErrorNumber number, std::u16string_view detail);

    ~RunTimeError() override;
    /// Copies number and text.
    RunTimeError(const RunTimeError&) = default;
    /// Copies number and text.
    RunTimeError& operator=(const RunTimeError&) = default;

    /// The number, from the one list.
    ErrorNumber number() const { return number_; }

    /// What a message box shows: the number's text, then ": " and the detail when there is one.
    const std::u16string& text() const { return text_; }

    /// What stands behind the number's text; empty when there is nothing more to say.
    std::u16string_view detail() const;

private:
    ErrorNumber number_;
    std::u16string text_;
};

} // namespace pelloric
