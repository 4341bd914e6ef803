// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include <pelloric/preview.h>

#include "controls/qt/script_caller.h"
#include "platform/phrase.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "script/qt/script_object.h"

#include <QJSEngine>
#include <QJSValue>

namespace pelloric::qt {

namespace {

QJSValue::ErrorType scriptError(ErrorNumber number)
{
    switch (number) {
    case ErrorNumber::Overflow:
    case ErrorNumber::SubscriptOutOfRange:
        return QJSValue::RangeError;
    case ErrorNumber::TypeMismatch:
        return QJSValue::TypeError;
    default:
        return QJSValue::GenericError;
    }
}

class EngineCaller final : public ScriptCaller {
public:
    bool isScriptValue(const QVariant& argument) const override
    {
        return argument.metaType() == QMetaType::fromType<QJSValue>();
    }

    QVariant plainValue(const QVariant& argument) const override
    {
        return argument.value<QJSValue>().toVariant();
    }

    std::unique_ptr<AutomationObject> object(
        const QVariant& argument, const QObject& control) const override
    {
        const auto value = argument.value<QJSValue>();
        if (value.isQObject() && value.toQObject() == nullptr)
            throw RunTimeError(ErrorNumber::ObjectMissing, phrase(u"the object is gone"));
        return objectOfScript(value, qjsEngine(&control));
    }

    bool raise(const QObject& control, const RunTimeError& error) const override
    {
        QJSEngine* const engine = qjsEngine(&control);
        if (engine == nullptr)
            return false;
        QJSValue thrown
            = engine->newErrorObject(scriptError(error.number()), toQString(error.text()));
        thrown.setProperty(QStringLiteral("number"), static_cast<int>(error.number()));
        engine->throwError(thrown);
        return true;
    }
};

} // namespace

void letScriptsCall()
{
    static const EngineCaller caller;
    useScriptCaller(caller);
}

} // namespace pelloric::qt
