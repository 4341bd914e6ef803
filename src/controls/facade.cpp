// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/facade.h"

#include "platform/automation_object.h"
#include "platform/platform.h"
#include "platform/services.h"
#include "settings/settings_file.h"

#include <utility>

namespace pelloric {

namespace {

TextView slotName(std::int32_t location)
{
    if (location == static_cast<std::int32_t>(AlignmentType::LocLeft))
        return u"Left";
    if (location == static_cast<std::int32_t>(AlignmentType::LocCenter))
        return u"Center";
    return u"Right";
}

/// A setting is one line of its file.
Text onOneLine(TextView text)
{
    Text line = replaceAll(text, u"\r\n", u" ");
    for (char16_t& unit : line) {
        if (unit == u'\r' || unit == u'\n')
            unit = u' ';
    }
    return line;
}

TextView switchText(bool on) { return on ? TextView(u"1") : TextView(u"0"); }

} // namespace

Facade::Facade(Platform& platform, PreviewOpener& opener)
    : platform_(platform)
    , opener_(opener)
{
    platform_.library.MarvenStartRow = 1;
}

void Facade::doPreview(std::unique_ptr<AutomationObject> grid)
{
    platform_.loop.runOnce();
    opener_.openPreview(std::move(grid));
}

void Facade::AddHeader(TextView strHeader, std::int32_t Location)
{
    writeSlot(u"Header", strHeader, Location);
}

void Facade::AddFooter(TextView strFooter, std::int32_t Location)
{
    writeSlot(u"Footer", strFooter, Location);
}

void Facade::setShowHeader(bool show)
{
    showHeader_ = show;
    writeSetting(platform_, u"ShowHeaders", switchText(show));
}

std::int32_t Facade::MarvenStartRow() const { return platform_.library.MarvenStartRow; }

void Facade::setMarvenStartRow(std::int32_t row) { platform_.library.MarvenStartRow = row; }

void Facade::setMergeGrid(bool merge)
{
    mergeGrid_ = merge;
    writeSetting(platform_, u"GridMerge", switchText(merge));
}

void Facade::writeSlot(TextView line, TextView text, std::int32_t location)
{
    const Text key = Text(line).append(slotName(location));
    writeSetting(platform_, key, onOneLine(text));
}

} // namespace pelloric
