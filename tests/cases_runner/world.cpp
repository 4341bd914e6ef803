// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "world.h"

#include "platform/numbers.h"
#include "settings/settings_file.h"

#include <fstream>
#include <iterator>
#include <stdexcept>

namespace pelloric::cases {

namespace {

Json iconOf(MessageIcon icon)
{
    switch (icon) {
    case MessageIcon::Information:
        return "information";
    case MessageIcon::Critical:
        return "critical";
    case MessageIcon::None:
        break;
    }
    return nullptr;
}

} // namespace

void CaseMessages::show(const Message& message) { shown.push_back(jsonOf(message)); }

/// Each document of a job is titled with its page, which is all that tells a page's operations
/// apart.
void CasePrinter::setDocumentTitle(TextView title)
{
    const std::size_t number = title.find_last_of(u' ') + 1;
    add("page", static_cast<int>(leadingNumber(title.substr(number))));
}

Json jsonOf(const Message& message)
{
    return Json::array({ jsonOf(message.text), message.title ? jsonOf(*message.title) : Json(),
        iconOf(message.icon) });
}

World::World(const std::filesystem::path& directory, TextCodec& codec)
    : codec(codec)
    , platform { metrics, codec, messages, loop, clock, folders, files, printer, printers, library }
    , facade(platform, window)
    , canvas(platform)
    , directory_(directory)
{
    folders.directory = directory;
}

void World::writeLines(const std::filesystem::path& path, const Json& lines) const
{
    std::string bytes;
    for (const Json& line : lines) {
        codec.encode(textOf(line), bytes);
        bytes += "\r\n";
    }
    std::ofstream file(path, std::ios::binary);
    file.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    if (!file)
        throw std::runtime_error("cannot write " + path.string());
}

Json World::readLines(const std::filesystem::path& path) const
{
    std::ifstream file(path, std::ios::binary);
    const std::string bytes { std::istreambuf_iterator<char>(file), {} };
    const Text text = codec.decode(bytes);
    Json lines = Json::array();
    std::size_t start = 0;
    for (std::size_t end = text.find(u"\r\n"); end != Text::npos; end = text.find(u"\r\n", start)) {
        lines.push_back(jsonOf(TextView(text).substr(start, end - start)));
        start = end + 2;
    }
    return lines;
}

std::filesystem::path World::settingsFile() const { return settingsPath(platform); }

void World::takeGrid(const Json& description)
{
    grid = makeGrid(description);
    canvas.m_PrintObj = static_cast<PrintObjKind>(description.at("m_PrintObj").get<std::int16_t>());
}

} // namespace pelloric::cases
