// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Any bytes as a settings file: read, look up, rewrite.

#include "fuzz_platform.h"

#include "platform/run_time_error.h"
#include "report/report_style.h"
#include "settings/settings_file.h"
#include "settings/settings_table.h"

using namespace pelloric;

namespace {

constexpr const char* FileName = "OstlConfig.ini";

/// Whether the key's line can be found for a rewrite.
bool canBeWritten(TextView key, TextView text)
{
    try {
        const TextView line = findSettingLine(key, text);
        fuzz::require(line.starts_with(key));
        fuzz::require(line.substr(key.size()).find(u'\r') == TextView::npos);
        return true;
    } catch (const RunTimeError& error) {
        fuzz::require(error.number() == ErrorNumber::InvalidCall);
        return false;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static fuzz::FuzzPlatform platform;
    const std::string_view bytes(reinterpret_cast<const char*>(data), size);
    if (size > 1U << 14U)
        return 0;
    platform.folders.write(FileName, bytes);
    const SettingsSnapshot snapshot(platform.services);
    const std::size_t turn = size == 0 ? 0 : data[size - 1];
    for (const TextView key :
        { settingsTable()[turn % settingsTable().size()].name, TextView(u"a") })
        fuzz::require(snapshot.value(key) == readSetting(platform.services, key));
    ReportStyle style;
    PageSetup setup;
    try {
        loadReportStyle(style, setup, platform.services);
    } catch (const RunTimeError& error) {
        fuzz::require(
            error.number() == ErrorNumber::Overflow || error.number() == ErrorNumber::TypeMismatch);
    }
    const TextView key = settingsTable()[turn % settingsTable().size()].name;
    const bool found = canBeWritten(key, readSettingsText(platform.services));
    const auto outcome = writeSetting(platform.services, key, u"v");
    fuzz::require(outcome == SaveOutcome::Written);
    const Text after = platform.codec.decode(platform.folders.read(FileName));
    fuzz::require(after.starts_with(u'"') && after.ends_with(u"\"\r\n"));
    fuzz::require(!found || contains(after, Text(key) + u"= v\r"));
    return 0;
}
