// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "platform/name_list.h"

#include <algorithm>
#include <optional>

namespace pelloric {

namespace {

constexpr char16_t Quote = u'"';

/// A quoted text and where the list goes on behind it.
struct QuotedText {
    Text text;
    std::size_t end = 0;
};

/// @param at  where the list holds a quote
/// @return    nothing: the quote is text
std::optional<QuotedText> readQuoted(TextView list, std::size_t at)
{
    QuotedText quoted;
    for (++at; at < list.size(); ++at) {
        const bool isTwice = list[at] == Quote && at + 1 < list.size() && list[at + 1] == Quote;
        if (list[at] == Quote && !isTwice) {
            quoted.end = at + 1;
            const std::size_t next = list.find_first_not_of(u' ', quoted.end);
            if (next == TextView::npos || list[next] == u',' || list[next] == u':')
                return quoted;
            return std::nullopt;
        }
        quoted.text.push_back(list[at]);
        at += isTwice ? 1 : 0;
    }
    return std::nullopt;
}

/// Where the quotes of a name may begin: with it, or behind its first colon.
std::size_t quotePlace(TextView list, std::size_t at)
{
    const std::size_t first = std::min(list.find_first_not_of(u' ', at), list.size());
    const std::size_t colon = list.find_first_of(u":,\"", first);
    const bool hasColon = colon < list.size() && list[colon] == u':';
    const std::size_t place = hasColon ? list.find_first_not_of(u' ', colon + 1) : first;
    return place < list.size() && list[place] == Quote ? place : TextView::npos;
}

} // namespace

std::vector<ListedName> listedNames(TextView list)
{
    std::vector<ListedName> names;
    for (std::size_t at = 0; at <= list.size();) {
        const std::size_t place = quotePlace(list, at);
        const auto quoted
            = place != TextView::npos ? readQuoted(list, place) : std::optional<QuotedText>();
        const std::size_t end = std::min(list.find(u',', quoted ? quoted->end : at), list.size());
        if (quoted)
            names.push_back({ Text(trimmed(list.substr(at, place - at))), quoted->text,
                Text(trimmed(list.substr(quoted->end, end - quoted->end))), true });
        else
            names.push_back({ {}, Text(trimmed(list.substr(at, end - at))), {}, false });
        at = end + 1;
    }
    return names;
}

std::vector<Text> namesOf(TextView list)
{
    std::vector<Text> names;
    for (const ListedName& listed : listedNames(list)) {
        if (Text name = listed.whole(); !name.empty())
            names.push_back(std::move(name));
    }
    return names;
}

Text listOf(std::span<const Text> names)
{
    Text list;
    for (const Text& name : names) {
        list += list.empty() ? u"" : u", ";
        const auto read = listedNames(name);
        if (read.size() == 1 && !read.front().isQuoted && read.front().name == name) {
            list += name;
            continue;
        }
        list += Quote;
        for (const char16_t character : name)
            list.append(character == Quote ? 2 : 1, character);
        list += Quote;
    }
    return list;
}

} // namespace pelloric
