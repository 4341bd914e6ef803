// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "settings/text_helpers.h"

#include "platform/numbers.h"

namespace pelloric {

namespace {

/// The character at `position`; moves behind it.
TextView nextCharacter(TextView text, std::size_t& position)
{
    const auto length = static_cast<std::size_t>(characterLength(text, position));
    const TextView character = text.substr(position, length);
    position += length;
    return character;
}

/// Whether one of a text's characters is the given one; half a pair is no part of a whole pair.
bool holds(TextView text, TextView character)
{
    for (std::size_t position = 0; position < text.size();) {
        if (nextCharacter(text, position) == character)
            return true;
    }
    return false;
}

} // namespace

Text filterChars(TextView text, TextView characters, bool keep)
{
    Text result;
    for (std::size_t position = 0; position < text.size();) {
        const TextView character = nextCharacter(text, position);
        if (holds(characters, character) == keep)
            result.append(character);
    }
    return result;
}

std::int16_t countChar(TextView text, TextView character)
{
    std::int64_t count = 0;
    for (std::size_t position = 0; position < text.size();) {
        if (nextCharacter(text, position) == character)
            ++count;
    }
    return narrowToInt16(count);
}

TextView getField(TextView text, int index, TextView separator, bool afterColon)
{
    if (separator.empty())
        return {};
    std::size_t end = text.find(separator);
    for (int cut = 0; cut < index && end != TextView::npos; ++cut) {
        text.remove_prefix(end + separator.size());
        end = text.find(separator);
    }
    if (end == TextView::npos)
        return {};
    const TextView field = text.substr(0, end);
    const std::size_t colon = field.find(u':');
    return afterColon && colon != TextView::npos ? field.substr(colon + 1) : field;
}

} // namespace pelloric
