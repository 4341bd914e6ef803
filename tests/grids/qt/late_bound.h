// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "platform/automation_object.h"

namespace pelloric::qt {

/// Calls members of an object by name, as a script does.
class LateBound {
public:
    explicit LateBound(AutomationObject& object)
        : object_(object)
    {
    }

    Value get(TextView name) { return getMember(object_, name); }

    Value get(TextView name, double index)
    {
        const Value arguments[] = { Value::ofNumber(index) };
        return object_.get(memberOf(object_, name), arguments);
    }

    Value get(TextView name, double row, double column)
    {
        const Value arguments[] = { Value::ofNumber(row), Value::ofNumber(column) };
        return object_.get(memberOf(object_, name), arguments);
    }

    /// A text of its own, which stays when the object is asked again.
    Text text(TextView name, double row, double column)
    {
        return Text(get(name, row, column).text());
    }

    LateBound child(TextView name) { return LateBound(get(name).toObject()); }

    LateBound item(double index) { return LateBound(get(u"Item", index).toObject()); }

    void put(TextView name, const Value& value) { object_.put(memberOf(object_, name), {}, value); }

    void put(TextView name, double index, double value)
    {
        const Value arguments[] = { Value::ofNumber(index) };
        object_.put(memberOf(object_, name), arguments, Value::ofNumber(value));
    }

private:
    AutomationObject& object_;
};

} // namespace pelloric::qt
