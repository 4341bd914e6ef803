// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace pelloric {

/// The structural lines of a document file; its values stand on lines of their own between them.
/// Bytes, for every line of the file's structure is plain ASCII.
namespace ostl {

inline constexpr std::string_view Quote = "\"";
inline constexpr std::string_view Tag = "##Release2004-10-23";
inline constexpr std::string_view PageWidth = "##Release2004-10-23PageWidth=";
inline constexpr std::string_view PageHeight = "##Release2004-10-23PageHeight=";
inline constexpr std::string_view Page = "##Release2004-10-23[";
inline constexpr std::string_view LinesBegin = "##Release2004-10-23 PLine Begin";
inline constexpr std::string_view LinesEnd = "##Release2004-10-23 PLine End";
inline constexpr std::string_view TextsBegin = "##Release2004-10-23 Text Begin";
inline constexpr std::string_view TextsEnd = "##Release2004-10-23 Text End";

/// The index of the last page that a file can hold; further pages are left out without a message.
inline constexpr int LastPageIndex = 130;

} // namespace ostl

} // namespace pelloric
