// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Objects that answer anything when they are asked as a grid: every kind of grid is tried on them.

#include "fuzz_bytes.h"
#include "fuzz_platform.h"

#include "controls/canvas.h"
#include "platform/automation_object.h"
#include "platform/run_time_error.h"
#include "settings/default_settings.h"

#include <memory>
#include <vector>

using namespace pelloric;

namespace {

constexpr TextView Names[] = { u"Cols", u"Rows", u"ColWidth", u"TextMatrix", u"ColumnHeaders",
    u"ListItems", u"Count", u"Item", u"Width", u"Text", u"SubItems", u"DataSource", u"Columns",
    u"col", u"RecordCount", u"AbsolutePosition", u"Fields", u"Name", u"Value" };

/// Members whose numbers say how much there is.
bool isCount(MemberId member)
{
    const TextView name = Names[static_cast<std::size_t>(member)];
    return name == u"Cols" || name == u"Rows" || name == u"Count" || name == u"RecordCount";
}

/// Every member answers what comes next in the input.
class AnyObject final : public AutomationObject {
public:
    AnyObject(fuzz::Bytes& bytes, int depth)
        : bytes_(bytes)
        , depth_(depth)
        , hidden_(bytes.atMost(60))
    {
    }

    std::optional<MemberId> findMember(TextView name) override
    {
        for (std::size_t at = 0; at < std::size(Names); ++at) {
            if (Names[at] == name && at != hidden_)
                return static_cast<MemberId>(at);
        }
        return std::nullopt;
    }

    const void* memberTable() const override { return nullptr; }

    Value get(MemberId member, std::span<const Value>) override
    {
        if (Names[static_cast<std::size_t>(member)] == u"Cols" && bytes_.atMost(8) == 0)
            return Value::ofNumber(bytes_.number());
        if (isCount(member))
            return Value::ofNumber(bytes_.atMost(9));
        switch (bytes_.atMost(12)) {
        case 0:
            return {};
        case 1:
            return Value::ofTruth(bytes_.chance());
        case 2:
            return Value::ofDate(bytes_.chance() ? INT64_MIN + bytes_.byte() : bytes_.byte());
        case 3:
        case 4:
            return Value::ofNumber(bytes_.number());
        case 5:
            throw RunTimeError(ErrorNumber::InvalidCall, u"the member fails");
        case 6:
        case 7:
        case 8:
            text_ = bytes_.text(40);
            return Value::ofText(text_);
        default:
            return answerObject();
        }
    }

    void put(MemberId, std::span<const Value>, const Value&) override
    {
        if (bytes_.atMost(20) == 1)
            throw RunTimeError(ErrorNumber::NoSuchMember);
    }

private:
    Value answerObject()
    {
        constexpr int Deepest = 6;
        if (depth_ == Deepest)
            return Value::ofObject(*this);
        children_.push_back(std::make_unique<AnyObject>(bytes_, depth_ + 1));
        return Value::ofObject(*children_.back());
    }

    fuzz::Bytes& bytes_;
    int depth_;
    std::size_t hidden_;
    Text text_;
    std::vector<std::unique_ptr<AnyObject>> children_;
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    static fuzz::FuzzPlatform platform;
    static const bool deployed = deployDefaultSettings(platform.services);
    fuzz::require(deployed);
    if (size > 1U << 13U)
        return 0;
    fuzz::Bytes bytes(data, size);
    Canvas canvas(platform.services);
    canvas.m_PrintObj = static_cast<PrintObjKind>(bytes.atMost(4));
    AnyObject grid(bytes, 0);
    try {
        canvas.doPreview(grid);
    } catch (const RunTimeError&) {
        fuzz::require(canvas.document().pageCount() == 1);
    }
    fuzz::require(!canvas.isBusy() && !canvas.progress().visible);
    return 0;
}
