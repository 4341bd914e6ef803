// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "tables/qt/json_table.h"

#include "document/limits.h"
#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "tables/separated_values.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <optional>
#include <unordered_map>
#include <utility>
#include <vector>

namespace pelloric::qt {

namespace {

constexpr std::string_view Blanks = " \t\r\n";

constexpr TextView WantedShape = phraseText(
    u"a table is an array of objects, [{\"name\": value, …}, …], or one object a line");

[[noreturn]] void refuse(const Text& what) { throw RunTimeError(ErrorNumber::TypeMismatch, what); }

/// The columns of the table by their names, in the order in which they came up.
class Names {
public:
    std::size_t columnOf(const std::string& name)
    {
        const auto [found, isNew] = columns_.try_emplace(name, names_.size());
        if (isNew)
            names_.push_back(name);
        return found->second;
    }

    const std::vector<std::string>& all() const { return names_; }

private:
    std::unordered_map<std::string, std::size_t> columns_;
    std::vector<std::string> names_;
};

/// What is known of a text before it is parsed.
struct TextShape {
    bool isOne = false; ///< one object of a file of lines
    std::size_t mostValueBytes = MostValueBytes; ///< see there
};

/// Takes the objects of a table apart as they are parsed.
///
/// Without a grid it only learns the names; with one it fills the rows. What is nested in a value
/// is written down again as it comes.
class TableReceiver : public nlohmann::json_sax<nlohmann::json> {
public:
    TableReceiver(Names& names, TableGrid* grid, const TextShape& shape)
        : names_(names)
        , grid_(grid)
        , objectDepth_(shape.isOne ? 1 : 2)
        , shape_(shape)
    {
    }

    /// Why it is no table; empty: it is one.
    TextView refusal() const { return refusal_; }
    /// Where and why it is no JSON.
    std::optional<std::size_t> errorPosition() const { return errorPosition_; }
    const std::string& error() const { return error_; }

    bool null() override { return take("null", {}); }
    bool boolean(bool value) override
    {
        return value ? take("true", "true") : take("false", "false");
    }
    bool number_integer(number_integer_t value) override
    {
        const std::string text = std::to_string(value);
        return take(text, text);
    }
    bool number_unsigned(number_unsigned_t value) override
    {
        const std::string text = std::to_string(value);
        return take(text, text);
    }
    bool number_float(number_float_t, const string_t& text) override { return take(text, text); }
    bool string(string_t& value) override
    {
        return isNested() ? take(nlohmann::json(value).dump(-1, ' ', false, Replace), {})
                          : take({}, value);
    }
    bool binary(binary_t&) override { return false; }

    bool start_object(std::size_t) override
    {
        ++depth_;
        if (depth_ < objectDepth_)
            return refuseShape();
        if (depth_ > objectDepth_)
            return open('{');
        values_.assign(names_.all().size(), {});
        return true;
    }
    bool key(string_t& name) override
    {
        if (depth_ > objectDepth_) {
            separate();
            nested_ += nlohmann::json(name).dump(-1, ' ', false, Replace) + ":";
            followsKey_ = true;
            return true;
        }
        column_ = names_.columnOf(name);
        return column_ < MostColumns
            || refuseWith(phrase(u"more than %1 different names", { decimal(MostColumns) }));
    }
    bool end_object() override
    {
        if (depth_-- > objectDepth_)
            return close('}');
        endRow();
        return true;
    }
    bool start_array(std::size_t) override
    {
        ++depth_;
        if (depth_ < objectDepth_)
            return true;
        return depth_ > objectDepth_ ? open('[') : refuseShape();
    }
    bool end_array() override { return depth_-- > objectDepth_ ? close(']') : true; }

    bool parse_error(
        std::size_t position, const std::string&, const nlohmann::detail::exception& error) override
    {
        errorPosition_ = position;
        error_ = error.what();
        return false;
    }

private:
    static constexpr auto Replace = nlohmann::json::error_handler_t::replace;

    bool isNested() const { return depth_ > objectDepth_; }

    bool refuseWith(TextView why)
    {
        refusal_ = why;
        return false;
    }

    bool refuseShape() { return refuseWith(phrase(WantedShape)); }

    /// @param json   as it stands in a nested value
    /// @param plain  as a cell shows it
    bool take(const std::string& json, const std::string& plain)
    {
        if (depth_ < objectDepth_)
            return refuseShape();
        const std::size_t size = isNested() ? nested_.size() + json.size() : plain.size();
        if (size > shape_.mostValueBytes)
            return refuseWith(phrase(u"a value holds more than %1 bytes; leave it out, or shorten "
                                     u"it",
                { decimal(static_cast<std::int64_t>(shape_.mostValueBytes)) }));
        if (isNested()) {
            separate();
            nested_ += json;
            return true;
        }
        put(plain);
        return true;
    }

    void separate()
    {
        if (!followsKey_ && !nested_.empty() && nested_.back() != '[' && nested_.back() != '{')
            nested_ += ",";
        followsKey_ = false;
    }

    bool open(char bracket)
    {
        separate();
        nested_ += bracket;
        return true;
    }

    bool close(char bracket)
    {
        nested_ += bracket;
        if (depth_ == objectDepth_) {
            put(nested_);
            nested_.clear();
        }
        return true;
    }

    void put(const std::string& value)
    {
        if (values_.size() <= column_)
            values_.resize(column_ + 1);
        values_[column_] = value;
    }

    void endRow()
    {
        if (grid_ == nullptr)
            return;
        texts_.clear();
        for (const std::string& value : values_)
            texts_.push_back(fromUtf8(value));
        grid_->addRow(std::vector<TextView>(texts_.begin(), texts_.end()));
    }

    Names& names_;
    TableGrid* grid_;
    int objectDepth_; ///< of the objects that are rows
    TextShape shape_;
    int depth_ = 0;
    std::size_t column_ = 0;
    std::vector<std::string> values_;
    std::vector<Text> texts_;
    std::string nested_;
    bool followsKey_ = false;
    Text refusal_;
    std::optional<std::size_t> errorPosition_;
    std::string error_;
};

std::int64_t lineAt(std::string_view text, std::size_t position)
{
    return std::ranges::count(text.substr(0, position), '\n') + 1;
}

/// What the parser says, without its own name and counts.
Text explained(const std::string& error)
{
    const std::size_t colon = error.rfind(": ");
    if (colon != std::string::npos)
        return phrase(u"this is no JSON: %1", { fromUtf8(error.substr(colon + 2)) });
    // Of a number that no program could hold, the parser gives its own name and the number.
    const std::size_t number = error.rfind('\'', error.size() - 2);
    return phrase(u"the number %1 is too large; write it in quotation marks",
        { fromUtf8(error.substr(std::min(number, error.size()))) });
}

/// @param firstLine  of the text in its file
void parse(std::string_view text, TableReceiver& receiver, std::int64_t firstLine)
{
    if (nlohmann::json::sax_parse(text.begin(), text.end(), &receiver))
        return;
    if (receiver.errorPosition()) {
        const std::size_t position = std::min(*receiver.errorPosition(), text.size());
        refuse(atLine(firstLine - 1 + lineAt(text, position > 0 ? position - 1 : 0),
            explained(receiver.error())));
    }
    refuse(atLine(firstLine, receiver.refusal()));
}

/// Parses all of a file: an array or one object as a whole, and anything else line by line.
void parseAll(std::string_view text, const TextShape& shape, Names& names, TableGrid* grid)
{
    const std::size_t first = text.find_first_not_of(Blanks);
    if (first == std::string_view::npos)
        refuse(phrase(u"the file is empty"));
    if (shape.isOne || text[first] == '[') {
        TableReceiver receiver(names, grid, shape);
        parse(text, receiver, 1);
        return;
    }
    std::int64_t line = 0;
    while (!text.empty()) {
        ++line;
        const std::size_t end = std::min(text.find('\n'), text.size());
        const std::string_view object = text.substr(0, end);
        text.remove_prefix(std::min(end + 1, text.size()));
        if (object.find_first_not_of(Blanks) == std::string_view::npos)
            continue;
        TableReceiver receiver(names, grid, { true, shape.mostValueBytes });
        parse(object, receiver, line);
    }
}

using Object = nlohmann::ordered_json;

constexpr std::size_t MostNamed = 4; ///< of the members of an object, in an error
constexpr int MostDepth = 4; ///< of objects in objects in which arrays are looked for

bool isRows(const Object& value)
{
    return value.is_array() && !value.empty() && value.front().is_object();
}

bool isWord(std::string_view name)
{
    const auto isOfWord = [](char letter) {
        return letter == '_' || (letter >= '0' && letter <= '9') || (letter >= 'a' && letter <= 'z')
            || (letter >= 'A' && letter <= 'Z');
    };
    return !name.empty() && (name.front() < '0' || name.front() > '9')
        && std::ranges::all_of(name, isOfWord);
}

/// A step of a path as jq takes it.
std::string stepTo(const std::string& name)
{
    return isWord(name) ? "." + name : "." + Object(name).dump();
}

/// The paths of the first arrays of objects in an object, those that lie deeper behind the others.
std::vector<std::string> pathsOfRows(const Object& object)
{
    std::vector<std::string> paths;
    std::vector<std::pair<const Object*, std::string>> level { { &object, "" } };
    for (int depth = 0; depth < MostDepth && paths.size() < MostNamed; ++depth) {
        std::vector<std::pair<const Object*, std::string>> next;
        for (const auto& [parent, path] : level) {
            for (const auto& [name, value] : parent->items()) {
                if (isRows(value) && paths.size() < MostNamed)
                    paths.push_back(path + stepTo(name));
                if (value.is_object())
                    next.emplace_back(&value, path + stepTo(name));
            }
        }
        level = std::move(next);
    }
    return paths;
}

/// A path as a word of a shell.
Text shellWord(const std::string& path)
{
    constexpr std::string_view Apart = "'\\''";
    if (path.find_first_of("\"'[") == std::string::npos)
        return fromUtf8(path);
    std::string word = "'";
    for (const char letter : path)
        word += letter == '\'' ? std::string(Apart) : std::string(1, letter);
    return fromUtf8(word + "'");
}

/// What the first members of an object are: name: […], name: {…}, name: 7.
Text membersOf(const Object& object)
{
    constexpr std::size_t MostBytes = 40; ///< of a member
    std::string members;
    std::size_t told = 0;
    for (const auto& [name, value] : object.items()) {
        members += told > 0 ? ", " : "";
        if (++told > MostNamed) {
            members += "…";
            break;
        }
        const bool isNested = value.is_structured() && !value.empty();
        const std::string shown = !isNested ? value.dump() : value.is_array() ? "[…]" : "{…}";
        members += Object(name).dump() + ": " + (shown.size() > MostBytes ? "…" : shown);
    }
    return fromUtf8(members);
}

/// What can be done about an object that is no table.
Text wayOut(const Object& object)
{
    const std::vector<std::string> paths = pathsOfRows(object);
    if (paths.size() == 1)
        return phrase(
            u"take the array out of it, for example with: jq %1", { shellWord(paths.front()) });
    if (!paths.empty()) {
        Text words;
        for (const std::string& path : paths)
            words.append(words.empty() ? u"" : u", ").append(shellWord(path));
        return phrase(
            u"take one of its arrays out of it, for example with jq and one of: %1", { words });
    }
    if (std::ranges::all_of(object, [](const Object& value) { return value.is_object(); }))
        return phrase(u"make rows of its objects, for example with: jq '[.[]]'");
    return phrase(u"it holds no array of objects, but %1", { membersOf(object) });
}

/// Whether a text is one object alone.
bool isOneObject(std::string_view text)
{
    const std::size_t first = text.find_first_not_of(Blanks);
    return first != std::string_view::npos && text[first] == '{' && nlohmann::json::accept(text);
}

/// One object alone is a row where its values are plain ones. With arrays or objects in it, it is
/// something that holds tables, unless the file's name says that its lines are rows.
void refuseNestedObject(std::string_view text)
{
    const Object object = Object::parse(text);
    const auto isPlain = [](const Object& value) { return value.is_primitive(); };
    if (!std::ranges::all_of(object, isPlain))
        refuse(phrase(u"the file is one object; %1; %2", { phrase(WantedShape), wayOut(object) }));
}

bool hasLineName(const std::filesystem::path& path)
{
    const auto extension = path.extension();
    return extension == ".jsonl" || extension == ".ndjson";
}

} // namespace

bool looksLikeJson(std::string_view start)
{
    const std::size_t first = start.find_first_not_of(Blanks);
    if (first == std::string_view::npos || (start[first] != '[' && start[first] != '{'))
        return false;
    const std::size_t next = start.find_first_not_of(Blanks, first + 1);
    if (next == std::string_view::npos)
        return false;
    constexpr std::string_view InArray = "{[]\"-0123456789tfn";
    const std::string_view expected = start[first] == '{' ? "\"}" : InArray;
    const bool isLine = start.find('\n', first) < next;
    return expected.find(start[next]) != std::string_view::npos
        && (start[first] == '{' || start[next] == '{' || isLine);
}

TableGrid readJson(const std::filesystem::path& path, const TextFileOptions& options)
{
    const TextFile file = readTextFile(path, options);
    const TextShape shape { isOneObject(file.text), options.mostValueBytes };
    if (shape.isOne && !hasLineName(path))
        refuseNestedObject(file.text);
    Names names;
    parseAll(file.text, shape, names, nullptr);
    if (names.all().empty())
        refuse(phrase(u"no object of the file has a name, so there is no column; %1",
            { phrase(WantedShape) }));
    std::vector<TableColumn> columns;
    for (const std::string& name : names.all())
        columns.push_back({ .title = fromUtf8(name), .width = -1 });
    TableGrid grid(std::move(columns));
    parseAll(file.text, shape, names, &grid);
    return grid;
}

} // namespace pelloric::qt
