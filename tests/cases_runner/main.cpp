// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Runs every case of a folder in a world of its own and writes what came out; on demand on canvases
// that were given report options, every one of which is off.

#include "json.h"
#include "steps.h"
#include "world.h"

#include "settings/settings_file.h"
#include "support/chinese_codec.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <random>
#include <string>
#include <vector>

namespace {

namespace fs = std::filesystem;
using namespace pelloric;
using cases::Json;

/// A folder for one case that goes with it; the system directory is a folder inside it.
class CaseFolder {
public:
    CaseFolder()
        : path_(
            fs::temp_directory_path() / ("pelloric-case-" + std::to_string(std::random_device()())))
    {
        fs::create_directories(systemDirectory());
    }

    ~CaseFolder()
    {
        std::error_code ignored;
        fs::remove_all(path_, ignored);
    }

    CaseFolder(const CaseFolder&) = delete;
    CaseFolder& operator=(const CaseFolder&) = delete;

    fs::path systemDirectory() const { return path_ / "system"; }

private:
    fs::path path_;
};

Json parse(const fs::path& path)
{
    std::ifstream file(path, std::ios::binary);
    return Json::parse(file);
}

/// Every switch is off; what says more about a switch differs from its start value.
ReportOptions idleOptions()
{
    return { .fit = { .leastSize = 8, .leastScale = 0.9 },
        .firstRow = 2,
        .lastRow = 3,
        .whereText = u"nothing",
        .watermark = { .opacity = 0.5, .isAbove = true },
        .logo = { .slot = 2, .height = 999 } };
}

void runCase(const fs::path& path, const fs::path& out, TextCodec& codec, bool hasOptions)
{
    const Json description = parse(path);
    const Json& input = description.at("input");
    const CaseFolder folder;
    cases::World world(folder.systemDirectory(), codec);
    if (hasOptions)
        world.canvas.options = idleOptions();
    if (input.contains("settings") && !input.at("settings").is_null())
        world.writeLines(world.settingsFile(), input.at("settings"));
    if (input.contains("grid") && !input.at("grid").is_null())
        world.takeGrid(input.at("grid"));
    Json dump = { { "results", Json::array() } };
    for (const Json& step : input.at("steps"))
        dump["results"].push_back(cases::takeStep(world, step));
    bool saves = false;
    for (const Json& section : input.at("show")) {
        const auto name = section.get<std::string>();
        if (name == "ostl")
            saves = true;
        else
            dump[name] = cases::dumpSection(world, name);
    }
    const auto id = description.at("id").get<std::string>();
    if (saves && !world.canvas.SaveFile(out / (id + ".ostl")))
        throw std::runtime_error("cannot write " + (out / (id + ".ostl")).string());
    std::ofstream file(out / (id + ".json"), std::ios::binary);
    file << dump.dump(1) << '\n';
    if (!file)
        throw std::runtime_error("cannot write " + (out / (id + ".json")).string());
}

std::vector<fs::path> casesOf(const fs::path& folder)
{
    std::vector<fs::path> paths;
    for (const auto& entry : fs::directory_iterator(folder)) {
        if (entry.path().extension() == ".json")
            paths.push_back(entry.path());
    }
    std::sort(paths.begin(), paths.end());
    return paths;
}

int run(const fs::path& folder, const fs::path& out, bool hasOptions)
{
    fs::create_directories(out);
    const std::unique_ptr<TextCodec> codec = chineseCodec();
    int status = 0;
    for (const fs::path& path : casesOf(folder)) {
        try {
            runCase(path, out, *codec, hasOptions);
        } catch (const std::exception& error) {
            std::cerr << path.filename().string() << ": " << error.what() << '\n';
            status = 1;
        }
    }
    return status;
}

} // namespace

int main(int count, char** arguments)
{
    const bool hasOptions = count == 4 && std::string(arguments[3]) == "--idle-options";
    if (count != 3 && !hasOptions) {
        std::cerr << "usage: pelloric_cases CASES OUT [--idle-options]\n";
        return 1;
    }
    try {
        return run(arguments[1], arguments[2], hasOptions);
    } catch (const std::exception& error) {
        std::cerr << error.what() << '\n';
        return 1;
    }
}
