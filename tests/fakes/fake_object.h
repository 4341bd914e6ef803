// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"
#include "platform/run_time_error.h"

#include <functional>
#include <map>
#include <memory>
#include <vector>

namespace pelloric {

/// A late-bound object that has just the members that a test gives it.
class FakeObject : public AutomationObject {
public:
    using Arguments = std::span<const Value>;
    using Getter = std::function<Value(Arguments)>;
    using Setter = std::function<void(Arguments, const Value&)>;

    void member(TextView name, Getter getter, Setter setter = {})
    {
        members_.push_back({ Text(name), std::move(getter), std::move(setter) });
    }

    /// A member that answers a number.
    void number(TextView name, double value)
    {
        member(name, [value](Arguments) { return Value::ofNumber(value); });
    }

    /// A member that answers a text; the text lives as long as the object.
    void text(TextView name, TextView value)
    {
        auto kept = std::make_shared<Text>(value);
        member(name, [kept](Arguments) { return Value::ofText(*kept); });
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        for (std::size_t at = 0; at < members_.size(); ++at) {
            if (members_[at].name == name)
                return static_cast<MemberId>(at);
        }
        return std::nullopt;
    }

    const void* memberTable() const override { return this; }

    Value get(MemberId member, Arguments arguments) override
    {
        return members_[static_cast<std::size_t>(member)].getter(arguments);
    }

    void put(MemberId member, Arguments arguments, const Value& value) override
    {
        const Setter& setter = members_[static_cast<std::size_t>(member)].setter;
        if (!setter)
            throw RunTimeError(ErrorNumber::NoSuchMember);
        setter(arguments, value);
    }

private:
    struct Member {
        Text name;
        Getter getter;
        Setter setter;
    };

    std::vector<Member> members_;
};

/// A collection of objects with `Count` and `Item(i)`.
class FakeCollection : public FakeObject {
public:
    /// @param first  the index of the first item
    explicit FakeCollection(int first)
    {
        member(u"Count",
            [this](Arguments) { return Value::ofNumber(static_cast<double>(items.size())); });
        member(u"Item", [this, first](Arguments arguments) {
            const auto at = static_cast<std::size_t>(arguments[0].number() - first);
            if (at >= items.size())
                throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
            return Value::ofObject(*items[at]);
        });
    }

    /// Appends an object without members.
    FakeObject& add() { return *items.emplace_back(std::make_unique<FakeObject>()); }

    std::vector<std::unique_ptr<FakeObject>> items;
};

/// A list view: headers of a text and a width, items of texts.
class FakeListView : public FakeObject {
public:
    FakeListView()
    {
        member(u"ColumnHeaders", [this](Arguments) { return Value::ofObject(headers); });
        member(u"ListItems", [this](Arguments) { return Value::ofObject(items); });
    }

    void addHeader(TextView text, double width)
    {
        FakeObject& header = headers.add();
        header.text(u"Text", text);
        header.number(u"Width", width);
    }

    void addItem(std::vector<Text> texts)
    {
        FakeObject& item = items.add();
        item.text(u"Text", texts.at(0));
        item.member(u"SubItems", [texts](Arguments arguments) {
            return Value::ofText(texts.at(static_cast<std::size_t>(arguments[0].number())));
        });
    }

    FakeCollection headers { 1 };
    FakeCollection items { 1 };
};

/// A data grid over a row set.
class FakeDataGrid : public FakeObject {
public:
    FakeDataGrid(Value source, std::vector<double> columnWidths)
        : widths(std::move(columnWidths))
    {
        for (double& width : widths) {
            columns.add().member(
                u"Width", [&width](Arguments) { return Value::ofNumber(width); },
                [&width](Arguments, const Value& value) { width = value.number(); });
        }
        member(u"DataSource", [source](Arguments) { return source; });
        member(u"Columns", [this](Arguments) { return Value::ofObject(columns); });
        member(
            u"col", [](Arguments) { return Value(); },
            [this](Arguments, const Value& value) {
                selected.push_back(static_cast<int>(value.number()));
            });
    }

    std::vector<double> widths;
    FakeCollection columns { 0 };
    std::vector<int> selected; ///< every column that was selected
};

/// A row set that is a late-bound object: records of texts, and a cursor by one of its ways.
class FakeRecords : public FakeObject {
public:
    enum class Cursor { Position, Steps, StepsWithoutMove, Both };

    FakeRecords(std::vector<Text> names, std::vector<std::vector<Text>> records,
        Cursor cursor = Cursor::Position)
        : rows(std::move(records))
    {
        if (cursor != Cursor::Position)
            addSteps(cursor != Cursor::StepsWithoutMove);
        for (std::size_t field = 0; field < names.size(); ++field) {
            FakeObject& item = fields.add();
            item.text(u"Name", names[field]);
            item.member(u"Value", [this, field](Arguments) {
                return Value::ofText(rows.at(static_cast<std::size_t>(position - 1)).at(field));
            });
        }
        number(u"RecordCount", static_cast<double>(rows.size()));
        if (cursor == Cursor::Position || cursor == Cursor::Both)
            addPosition();
        member(u"Fields", [this](Arguments) { return Value::ofObject(fields); });
    }

    std::vector<std::vector<Text>> rows;
    FakeCollection fields { 0 };
    int position = 1; ///< 0 before the first, one more than there are behind the last
    int moves = 0; ///< how often the cursor was moved

private:
    void addPosition()
    {
        member(
            u"AbsolutePosition",
            [this](Arguments) { return Value::ofNumber(static_cast<double>(position)); },
            [this](Arguments, const Value& value) { position = static_cast<int>(value.number()); });
    }

    void addSteps(bool withMove)
    {
        const auto last = [this] { return static_cast<int>(rows.size()); };
        const auto move = [this, last](int records) {
            const int target = position + records;
            if ((records < 0 && position == 0) || (records > 0 && position > last()))
                throw RunTimeError(ErrorNumber::InvalidCall, u"moved past an end");
            position = target < 0 ? 0 : target > last() ? last() + 1 : target;
            ++moves;
            return Value();
        };
        member(u"BOF", [this](Arguments) { return Value::ofTruth(position == 0); });
        member(u"EOF", [this, last](Arguments) { return Value::ofTruth(position > last()); });
        member(u"MoveFirst", [this](Arguments) {
            position = 1;
            ++moves;
            return Value();
        });
        member(u"MoveNext", [move](Arguments) { return move(1); });
        member(u"MovePrevious", [move](Arguments) { return move(-1); });
        if (withMove)
            member(u"Move", [move](Arguments arguments) {
                return move(static_cast<int>(arguments[0].number()));
            });
    }
};

} // namespace pelloric
