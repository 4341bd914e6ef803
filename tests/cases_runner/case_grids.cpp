// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "case_grids.h"

#include "platform/member_names.h"
#include "platform/run_time_error.h"

#include <algorithm>
#include <array>
#include <stdexcept>

namespace pelloric::cases {

namespace {

using Texts = std::vector<Text>;

Texts textsOf(const Json& list)
{
    Texts texts;
    for (const Json& text : list)
        texts.push_back(textOf(text));
    return texts;
}

/// The items of a list of objects of one kind; an item is one object that is told its index.
class Item : public AutomationObject {
public:
    int index = 0; ///< from 0
};

/// `Count` and `Item(i)` over one item object.
class Items final : public AutomationObject {
public:
    Items(Item& item, int count, int first)
        : item_(item)
        , count_(count)
        , first_(first)
    {
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId member, std::span<const Value> arguments) override
    {
        if (member == 0)
            return Value::ofNumber(count_);
        item_.index = indexArgument(arguments, 0, first_, first_ + count_ - 1) - first_;
        return Value::ofObject(item_);
    }

    void put(MemberId member, std::span<const Value>, const Value&) override
    {
        refuseMember(Names, member);
    }

private:
    static constexpr std::array<TextView, 2> Names { u"Count", u"Item" };

    Item& item_;
    int count_;
    int first_;
};

class FlexCase final : public CaseGrid {
public:
    explicit FlexCase(const Json& grid)
        : widths_(grid.at("widths").get<std::vector<double>>())
    {
        for (const Json& row : grid.at("rows"))
            rows_.push_back(textsOf(row));
    }

    std::vector<double> widths() const override { return widths_; }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId member, std::span<const Value> arguments) override
    {
        const int columns = static_cast<int>(widths_.size());
        const int rows = static_cast<int>(rows_.size());
        if (member == 0)
            return Value::ofNumber(columns);
        if (member == 1)
            return Value::ofNumber(rows);
        if (member == 2)
            return Value::ofNumber(widths_[columnOf(arguments, 0)]);
        const auto row = static_cast<std::size_t>(indexArgument(arguments, 0, 0, rows - 1));
        const auto column = columnOf(arguments, 1);
        if (column >= rows_[row].size())
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
        return Value::ofText(rows_[row][column]);
    }

    void put(MemberId member, std::span<const Value> arguments, const Value& value) override
    {
        if (member != 2)
            refuseMember(Names, member);
        widths_[columnOf(arguments, 0)] = value.toNumber();
    }

private:
    static constexpr std::array<TextView, 4> Names { u"Cols", u"Rows", u"ColWidth", u"TextMatrix" };

    std::size_t columnOf(std::span<const Value> arguments, std::size_t position) const
    {
        const int last = static_cast<int>(widths_.size()) - 1;
        return static_cast<std::size_t>(indexArgument(arguments, position, 0, last));
    }

    std::vector<double> widths_;
    std::vector<Texts> rows_;
};

struct Header {
    Text title;
    double width = 0;
};

class HeaderItem final : public Item {
public:
    explicit HeaderItem(const std::vector<Header>& headers)
        : headers_(headers)
    {
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId member, std::span<const Value>) override
    {
        const Header& header = headers_[static_cast<std::size_t>(index)];
        return member == 0 ? Value::ofText(header.title) : Value::ofNumber(header.width);
    }

    void put(MemberId member, std::span<const Value>, const Value&) override
    {
        refuseMember(Names, member);
    }

private:
    static constexpr std::array<TextView, 2> Names { u"Text", u"Width" };

    const std::vector<Header>& headers_;
};

class ListItem final : public Item {
public:
    explicit ListItem(const std::vector<Texts>& items)
        : items_(items)
    {
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId member, std::span<const Value> arguments) override
    {
        const Texts& texts = items_[static_cast<std::size_t>(index)];
        const int position = member == 0 ? 0 : indexArgument(arguments, 0, 1, 32767);
        const auto place = static_cast<std::size_t>(position);
        return Value::ofText(place < texts.size() ? TextView(texts[place]) : TextView());
    }

    void put(MemberId member, std::span<const Value>, const Value&) override
    {
        refuseMember(Names, member);
    }

private:
    static constexpr std::array<TextView, 2> Names { u"Text", u"SubItems" };

    const std::vector<Texts>& items_;
};

class ListCase final : public CaseGrid {
public:
    explicit ListCase(const Json& grid)
        : headerItem_(headers_)
        , listItem_(items_)
        , headerList_(headerItem_, static_cast<int>(grid.at("headers").size()), 1)
        , itemList_(listItem_, static_cast<int>(grid.at("items").size()), 1)
    {
        for (const Json& header : grid.at("headers"))
            headers_.push_back({ textOf(header.at(0)), header.at(1).get<double>() });
        for (const Json& item : grid.at("items"))
            items_.push_back(textsOf(item));
    }

    std::vector<double> widths() const override
    {
        std::vector<double> widths;
        for (const Header& header : headers_)
            widths.push_back(header.width);
        return widths;
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId member, std::span<const Value>) override
    {
        return Value::ofObject(member == 0 ? headerList_ : itemList_);
    }

    void put(MemberId member, std::span<const Value>, const Value&) override
    {
        refuseMember(Names, member);
    }

private:
    static constexpr std::array<TextView, 2> Names { u"ColumnHeaders", u"ListItems" };

    std::vector<Header> headers_;
    std::vector<Texts> items_;
    HeaderItem headerItem_;
    ListItem listItem_;
    Items headerList_;
    Items itemList_;
};

/// The row set of a data grid, its values as the JSON holds them.
class CaseRows final : public RowSet {
public:
    CaseRows(const Json& fields, Json records)
        : names_(textsOf(fields))
        , records_(std::move(records))
    {
    }

    int fieldCount() const override { return static_cast<int>(names_.size()); }

    TextView fieldName(int field) const override
    {
        checkField(field);
        return names_[static_cast<std::size_t>(field)];
    }

    std::int64_t recordCount() const override { return static_cast<std::int64_t>(records_.size()); }
    std::int64_t position() const override { return position_; }

    void setPosition(std::int64_t position) override
    {
        position_ = std::clamp<std::int64_t>(position, 0, recordCount() + 1);
    }

    Value value(int field) override
    {
        checkField(field);
        if (isBeforeFirst() || isAfterLast())
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
        const Json& record = records_.at(static_cast<std::size_t>(position_ - 1));
        const Json& value = record.at(static_cast<std::size_t>(field));
        if (value.is_null())
            return {};
        if (value.is_number())
            return Value::ofNumber(value.get<double>());
        if (value.is_boolean())
            return Value::ofTruth(value.get<bool>());
        buffer_ = textOf(value);
        return Value::ofText(buffer_);
    }

private:
    void checkField(int field) const
    {
        if (field < 0 || field >= fieldCount())
            throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
    }

    Texts names_;
    Json records_;
    Text buffer_;
    std::int64_t position_ = 0;
};

class ColumnItem final : public Item {
public:
    explicit ColumnItem(std::vector<double>& widths)
        : widths_(widths)
    {
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId, std::span<const Value>) override
    {
        return Value::ofNumber(widths_[static_cast<std::size_t>(index)]);
    }

    void put(MemberId, std::span<const Value>, const Value& value) override
    {
        widths_[static_cast<std::size_t>(index)] = value.toNumber();
    }

private:
    static constexpr std::array<TextView, 1> Names { u"Width" };

    std::vector<double>& widths_;
};

class DataCase final : public CaseGrid {
public:
    explicit DataCase(const Json& grid)
        : widths_(grid.at("widths").get<std::vector<double>>())
        , rows_(grid.at("fields"), grid.at("records"))
        , column_(widths_)
        , columns_(column_, static_cast<int>(widths_.size()), 0)
    {
    }

    std::vector<double> widths() const override { return widths_; }
    RowSet* source() override { return &rows_; }

    std::optional<MemberId> findMember(TextView name) override
    {
        return findMemberName(Names, name);
    }

    const void* memberTable() const override { return &Names; }

    Value get(MemberId member, std::span<const Value>) override
    {
        if (member == 0)
            return Value::ofRows(rows_);
        if (member == 1)
            return Value::ofObject(columns_);
        refuseMember(Names, member);
    }

    void put(MemberId member, std::span<const Value>, const Value& value) override
    {
        if (member != 2)
            refuseMember(Names, member);
        indexArgument({ &value, 1 }, 0, 0, static_cast<int>(widths_.size()) - 1);
    }

private:
    static constexpr std::array<TextView, 3> Names { u"DataSource", u"Columns", u"col" };

    std::vector<double> widths_;
    CaseRows rows_;
    ColumnItem column_;
    Items columns_;
};

} // namespace

std::unique_ptr<CaseGrid> makeGrid(const Json& grid)
{
    const auto type = grid.at("type").get<std::string>();
    if (type == "flex")
        return std::make_unique<FlexCase>(grid);
    if (type == "list")
        return std::make_unique<ListCase>(grid);
    if (type == "data")
        return std::make_unique<DataCase>(grid);
    throw std::invalid_argument("unknown grid type \"" + type + "\"");
}

std::unique_ptr<RowSet> makeRecord(const Json& fields, const Json& record)
{
    auto rows = std::make_unique<CaseRows>(fields, Json::array({ record }));
    rows->moveFirst();
    return rows;
}

} // namespace pelloric::cases
