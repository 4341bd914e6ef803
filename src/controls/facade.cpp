// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/facade.h"

#include "platform/automation_object.h"
#include "platform/platform.h"
#include "platform/services.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

#include <utility>

namespace pelloric {

namespace {

/// The key of a slot; the three of a line stand together.
SettingKey slotKey(SettingKey left, std::int32_t location)
{
    const bool isSlot = location == static_cast<std::int32_t>(AlignmentType::LocLeft)
        || location == static_cast<std::int32_t>(AlignmentType::LocCenter);
    const auto slot = isSlot ? location : static_cast<std::int32_t>(AlignmentType::LocRight);
    return static_cast<SettingKey>(static_cast<std::int32_t>(left) + slot);
}

static_assert(
    static_cast<int>(SettingKey::HeaderRight) == static_cast<int>(SettingKey::HeaderLeft) + 2);
static_assert(
    static_cast<int>(SettingKey::FooterRight) == static_cast<int>(SettingKey::FooterLeft) + 2);

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
    writeSlot(slotKey(SettingKey::HeaderLeft, Location), strHeader);
}

void Facade::AddFooter(TextView strFooter, std::int32_t Location)
{
    writeSlot(slotKey(SettingKey::FooterLeft, Location), strFooter);
}

void Facade::setShowHeader(bool show)
{
    showHeader_ = show;
    writeSetting(platform_, settingName(SettingKey::ShowHeaders), switchText(show));
}

std::int32_t Facade::MarvenStartRow() const { return platform_.library.MarvenStartRow; }

void Facade::setMarvenStartRow(std::int32_t row) { platform_.library.MarvenStartRow = row; }

void Facade::setMergeGrid(bool merge)
{
    mergeGrid_ = merge;
    writeSetting(platform_, settingName(SettingKey::GridMerge), switchText(merge));
}

void Facade::writeSlot(SettingKey key, TextView text)
{
    writeSetting(platform_, settingName(key), onOneLine(text));
}

} // namespace pelloric
