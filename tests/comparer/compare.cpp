// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "comparer/compare.h"

#include "comparer/sha256.h"
#include "platform/text.h"
#include "platform/text_codec.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <fstream>
#include <iterator>
#include <vector>

namespace pelloric::cases {

namespace {

using nlohmann::json;

/// The keys and indexes from the dump's root to a value.
using Path = std::vector<std::string>;

/// Where single-precision numbers stand; "*" is any index.
const std::vector<Path> Singles = {
    { "document", "pages", "*", "texts", "*", "3" },
    { "style", "bodyFont", "1" },
    { "style", "headerFont", "1" },
    { "style", "footerFont", "1" },
    { "view", "divisor" },
};

bool matches(const Path& pattern, const Path& path)
{
    return std::equal(pattern.begin(), pattern.end(), path.begin(), path.end(),
        [](const std::string& wanted, const std::string& part) {
            return wanted == "*" || wanted == part;
        });
}

bool isWhole(double value) { return std::floor(value) == value && std::fabs(value) < 9e15; }

std::string fifteenDigits(double value)
{
    char digits[40];
    std::snprintf(digits, sizeof digits, "%.15g", value);
    return digits;
}

bool sameNumber(const json& expected, const json& actual, bool single)
{
    if (expected.is_number_integer() && actual.is_number_integer())
        return expected == actual;
    const double a = expected.get<double>();
    const double b = actual.get<double>();
    if (single)
        return static_cast<float>(a) == static_cast<float>(b);
    if (isWhole(a) || isWhole(b))
        return a == b;
    return fifteenDigits(a) == fifteenDigits(b);
}

/// One comparison; remembers on which path it is.
class Comparison {
public:
    /// @param steps  of the case: some results are singles
    explicit Comparison(const json& steps)
        : steps_(steps)
    {
    }

    Difference values(const json& expected, const json& actual)
    {
        if (expected.is_number() && actual.is_number())
            return told(sameNumber(expected, actual, isSingle()), expected, actual);
        if (expected.type() != actual.type())
            return told(false, expected, actual);
        if (expected.is_object())
            return objects(expected, actual);
        if (expected.is_array())
            return arrays(expected, actual);
        return told(expected == actual, expected, actual);
    }

    Difference child(const std::string& key, const json& expected, const json& actual)
    {
        path_.push_back(key);
        Difference difference = values(expected, actual);
        path_.pop_back();
        return difference;
    }

private:
    Difference told(bool same, const json& expected, const json& actual) const
    {
        if (same)
            return std::nullopt;
        return where() + ": expected " + shown(expected) + ", got " + shown(actual);
    }

    Difference objects(const json& expected, const json& actual)
    {
        for (const auto& [key, value] : expected.items()) {
            if (!actual.contains(key))
                return where() + ": the key \"" + key + "\" is missing";
            if (auto difference = child(key, value, actual.at(key)))
                return difference;
        }
        for (const auto& [key, value] : actual.items()) {
            if (!expected.contains(key))
                return where() + ": the key \"" + key + "\" is one too many";
        }
        return std::nullopt;
    }

    Difference arrays(const json& expected, const json& actual)
    {
        const bool isFontSize = expected.size() == 2 && expected[0] == "FontSize";
        for (std::size_t index = 0; index < std::min(expected.size(), actual.size()); ++index) {
            inFontSize_ = isFontSize && index == 1;
            auto difference = child(std::to_string(index), expected[index], actual[index]);
            inFontSize_ = false;
            if (difference)
                return difference;
        }
        if (expected.size() != actual.size()) {
            return where() + ": expected " + std::to_string(expected.size()) + " entries, got "
                + std::to_string(actual.size());
        }
        return std::nullopt;
    }

    bool isSingle() const
    {
        if (inFontSize_)
            return true;
        if (path_.size() == 2 && path_[0] == "results") {
            const std::size_t step = std::stoul(path_[1]);
            return step < steps_.size() && steps_[step][0] == "read DispScale";
        }
        return std::any_of(Singles.begin(), Singles.end(),
            [&](const Path& pattern) { return matches(pattern, path_); });
    }

    std::string where() const
    {
        std::string text = "dump";
        for (const std::string& part : path_)
            text += "/" + part;
        return text;
    }

    static std::string shown(const json& value)
    {
        const std::string text = value.dump(-1, ' ', false, json::error_handler_t::replace);
        return text.size() <= 300 ? text : text.substr(0, 300) + "...";
    }

    const json& steps_;
    Path path_;
    bool inFontSize_ = false;
};

/// The list of results, made up of nulls where it was left out.
json resultsOf(const json& object, std::size_t steps)
{
    return object.contains("results") ? object.at("results") : json(json::array_t(steps));
}

std::string readBytes(const std::filesystem::path& path)
{
    std::ifstream file(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(file), {} };
}

} // namespace

Difference compareDump(const json& description, const json& dump)
{
    if (!dump.is_object())
        return "the dump is no object";
    const json& steps = description.at("input").at("steps");
    json expected = description.at("expected");
    json actual = dump;
    expected.erase("ostl");
    expected["results"] = resultsOf(expected, steps.size());
    actual["results"] = resultsOf(actual, steps.size());
    return Comparison(steps).values(expected, actual);
}

Difference compareFile(const json& expected, const std::string& bytes, const TextCodec& codec)
{
    std::string wanted;
    for (const json& line : expected.at("lines"))
        codec.encode(fromUtf8(line.get<std::string>()) + u"\r\n", wanted);
    const auto size = std::min(wanted.size(), bytes.size());
    const auto first = std::mismatch(
        wanted.begin(), wanted.begin() + static_cast<std::ptrdiff_t>(size), bytes.begin());
    const auto same = static_cast<std::size_t>(first.first - wanted.begin());
    if (same < wanted.size() || same < bytes.size()) {
        const auto line = std::count(wanted.begin(), first.first, '\n') + 1;
        return "file: differs from byte " + std::to_string(same) + " on, in line "
            + std::to_string(line) + "; expected " + std::to_string(wanted.size()) + " bytes, got "
            + std::to_string(bytes.size());
    }
    const std::string hash = sha256(bytes);
    if (hash != expected.at("sha256"))
        return "file: the hash is " + hash;
    return std::nullopt;
}

Difference compareCase(
    const std::filesystem::path& casePath, const std::filesystem::path& out, const TextCodec& codec)
{
    const json description = json::parse(readBytes(casePath));
    const auto id = description.at("id").get<std::string>();
    if (id != casePath.stem().string())
        return "the case's id is not its file's name";
    const std::filesystem::path dumpPath = out / (id + ".json");
    if (!std::filesystem::exists(dumpPath))
        return "there is no dump";
    const json dump = json::parse(readBytes(dumpPath), nullptr, false);
    if (auto difference = compareDump(description, dump))
        return difference;
    const json& expected = description.at("expected");
    if (!expected.contains("ostl"))
        return std::nullopt;
    const std::filesystem::path filePath = out / (id + ".ostl");
    if (!std::filesystem::exists(filePath))
        return "there is no saved file";
    return compareFile(expected.at("ostl"), readBytes(filePath), codec);
}

} // namespace pelloric::cases
