// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// A random grid on random paper: laid out, walked, saved and opened again.

#include "fuzz_bytes.h"
#include "fuzz_platform.h"

#include "controls/canvas.h"
#include "document/ostl_reader.h"
#include "document/ostl_writer.h"
#include "grids/table_grid.h"
#include "platform/run_time_error.h"
#include "settings/settings_table.h"

#include <sstream>

using namespace pelloric;

namespace {

TableGrid gridOf(fuzz::Bytes& bytes)
{
    std::vector<TableColumn> columns(1 + bytes.atMost(12));
    for (TableColumn& column : columns)
        column = { bytes.text(12), static_cast<Twips>(bytes.atMost(7000)) - 1 };
    const std::size_t count = columns.size();
    TableGrid grid(std::move(columns));
    for (unsigned row = bytes.atMost(60); row > 0; --row) {
        std::vector<Text> texts(count);
        for (Text& text : texts)
            text = bytes.text(bytes.chance() ? 4 : 60);
        grid.addRow(std::vector<TextView>(texts.begin(), texts.end()));
    }
    return grid;
}

/// The settings of a report: the default ones, some of them changed.
Text settingsOf(fuzz::Bytes& bytes)
{
    Text settings;
    for (const Setting& setting : settingsTable()) {
        settings.append(setting.name).append(u"= ");
        const unsigned kind = bytes.byte();
        if (kind < 200)
            settings.append(setting.start);
        else if (kind < 240)
            settings.append(decimal(bytes.atMost(400)));
        else
            settings.append(replaceAll(replaceAll(bytes.text(20), u"\r", u""), u"\n", u""));
        settings.append(u"\r\n");
    }
    return settings;
}

/// Walks every record, by iteration and by number.
void checkRecords(const PageDocument& document)
{
    for (int page = 0; page < document.pageCount(); ++page) {
        std::size_t index = 0;
        for (const LineRecord line : document.lines(page))
            fuzz::require(document.lines(page)[index++] == line);
        fuzz::require(index == document.lines(page).size());
        index = 0;
        for (const TextRecord text : document.texts(page)) {
            fuzz::require(!contains(text.text(), u"\n") && !contains(text.text(), u"\r"));
            fuzz::require(document.texts(page)[index++].text() == text.text());
        }
        fuzz::require(index == document.texts(page).size());
    }
}

void checkFile(const Canvas& canvas, const fuzz::FuzzPlatform& platform)
{
    std::stringstream file;
    writeOstl(canvas.document(), canvas.page, { platform.codec, u'.' }, {}, file);
    PageDocument opened;
    PageSetup setup;
    readOstl(platform.codec, file, opened, setup);
    fuzz::require(setup.myWidth == canvas.page.myWidth);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static fuzz::FuzzPlatform platform;
    if (size > 1U << 13U)
        return 0;
    fuzz::Bytes bytes(data, size);
    platform.folders.write("OstlConfig.ini", toUtf8(settingsOf(bytes)));
    platform.library.MarvenStartRow = static_cast<std::int32_t>(bytes.atMost(3));
    TableGrid grid = gridOf(bytes);
    Canvas canvas(platform.services);
    try {
        canvas.doPreview(grid);
        checkRecords(canvas.document());
        if (bytes.chance() && canvas.table() != nullptr) {
            canvas.Maximum();
            canvas.ReDrawZoom(grid);
            checkRecords(canvas.document());
        }
        checkFile(canvas, platform);
    } catch (const RunTimeError& error) {
        fuzz::require(
            error.number() == ErrorNumber::Overflow || error.number() == ErrorNumber::TypeMismatch);
        checkRecords(canvas.document());
    }
    fuzz::require(!canvas.isBusy() && !canvas.progress().visible);
    return 0;
}
