// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "export/pdf_outline.h"

#include "export/pdf_file.h"
#include "export/pdf_syntax.h"

#include <algorithm>

namespace pelloric::pdf {

namespace {

/// Groups that are still read at a glance; more pages make larger groups.
constexpr std::size_t MostGroups = 40;

constexpr std::size_t SmallestGroup = 10;

/// An entry of the outline among its neighbours.
struct Entry {
    int object = 0;
    int parent = 0; ///< object number
    int page = 0; ///< object number
    int previous = 0; ///< object number; 0: none
    int next = 0; ///< object number; 0: none
    Text title {};
};

void appendLink(std::string& body, std::string_view name, int object)
{
    if (object == 0)
        return;
    appendName(body, name);
    body += ' ';
    appendReference(body, object);
}

/// @param more  further entries
void writeEntry(PdfFile& file, const Entry& entry, const std::string& more)
{
    std::string body("<</Title");
    appendText(body, entry.title);
    appendLink(body, "Parent", entry.parent);
    appendLink(body, "Prev", entry.previous);
    appendLink(body, "Next", entry.next);
    body += "/Dest[";
    appendReference(body, entry.page);
    body += "/Fit]" + more + ">>";
    file.write(entry.object, body);
}

std::vector<int> reserveMany(PdfFile& file, std::size_t count)
{
    std::vector<int> objects(count);
    std::generate(objects.begin(), objects.end(), [&] { return file.reserve(); });
    return objects;
}

/// The entries of neighbours, all but their titles, pages and parents.
Entry entryAt(const std::vector<int>& objects, std::size_t at)
{
    return { .object = objects[at],
        .previous = at > 0 ? objects[at - 1] : 0,
        .next = at + 1 < objects.size() ? objects[at + 1] : 0 };
}

/// First and last of the children, and how many there are, not shown at first.
std::string childrenOf(const std::vector<int>& children, bool isOpen)
{
    std::string entries;
    appendLink(entries, "First", children.front());
    appendLink(entries, "Last", children.back());
    entries += "/Count ";
    const auto count = static_cast<std::int64_t>(children.size());
    appendInteger(entries, isOpen ? count : -count);
    return entries;
}

} // namespace

int writeOutline(PdfFile& file, std::span<const int> pages)
{
    std::size_t size = SmallestGroup;
    while (pages.size() > size * MostGroups)
        size *= 10;
    const int root = file.reserve();
    const std::vector<int> groups = reserveMany(file, (pages.size() + size - 1) / size);
    for (std::size_t at = 0; at < groups.size(); ++at) {
        const std::size_t first = at * size;
        const std::size_t last = std::min(pages.size(), first + size);
        const std::vector<int> children = reserveMany(file, last - first);
        for (std::size_t child = 0; child < children.size(); ++child) {
            Entry entry = entryAt(children, child);
            entry.parent = groups[at];
            entry.page = pages[first + child];
            entry.title = decimal(static_cast<std::int64_t>(first + child) + 1);
            writeEntry(file, entry, {});
        }
        Entry entry = entryAt(groups, at);
        entry.parent = root;
        entry.page = pages[first];
        entry.title = decimal(static_cast<std::int64_t>(first) + 1) + u" – "
            + decimal(static_cast<std::int64_t>(last));
        writeEntry(file, entry, childrenOf(children, false));
    }
    file.write(root, "<</Type/Outlines" + childrenOf(groups, true) + ">>");
    return root;
}

} // namespace pelloric::pdf
