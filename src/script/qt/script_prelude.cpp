// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "script/qt/script_prelude.h"

namespace pelloric::qt {

const char ScriptPreludeName[] = "pelloric-prelude";

const char ScriptPrelude[] = R"js(
(function (global, host, argumentList) {
    const enumerations = {
        OrderStyle: { Whole: 0, One: 1, Two: 2, Four: 3, Multiple: 4, UserCustom: 5, Six: 6 },
        PrintObjKind: { MSHFlexGrid: 0, MSFlexGrid: 1, ListView: 2, datagrid: 3 },
        AlignmentType: { LocLeft: 0, LocCenter: 1, LocRight: 2 },
    };
    const records = {
        Tpoint: { x: 0, y: 0 },
        Lineobj: { pt1: null, pt2: null, LineStyle: 0, LineColor: 0, LineWidth: 1, FillStyle: 1,
            FillColor: 0 },
        Textobj: { pt: null, Str: "", prnFont: null, ForeColor: 0 },
        MapLocation: { nLeft: 0, nTop: 0, nWidth: 0, nHeight: 0, nFJBH: "", strFilePath: "" },
        ColPos: { StartCol: 0, EndCol: 0 },
        MuliPageType: { nPages: 0, MinPage: 0, MaxPage: 0 },
    };
    const define = (name, value) => Object.defineProperty(global, name, { value });

    // An error of a property belongs to the line of the script that touched the property.
    const atCaller = (touch) => {
        try {
            return touch();
        } catch (error) {
            const frames = String(error.stack).split("\n");
            const frame = frames.find((line) => line.indexOf("pelloric-prelude:") < 0);
            const line = frame && /:(\d+)$/.exec(frame);
            if (line)
                Object.defineProperty(error, "lineNumber",
                    { value: Number(line[1]), configurable: true });
            throw error;
        }
    };
    const NoSuchMember = 438;
    let refused = null; // what was told of the member that was refused last
    const refuse = (name) => {
        const error = new Error(refused = host.refusal(String(name)));
        error.number = NoSuchMember;
        throw error;
    };
    // Where a member is called, the engine puts an error of its own around the refusal.
    Object.defineProperty(TypeError.prototype, "number", {
        get() { return refused && this.message.indexOf(refused) >= 0 ? NoSuchMember : undefined; },
        set(value) { Object.defineProperty(this, "number", { value, configurable: true }); },
        configurable: true,
    });

    // A control is reached through a stand-in that knows its published members: in any letter case,
    // and no others.
    // The control is a hidden property of its stand-in: weak maps of the engine break when it has
    // collected some of their keys.
    const hidden = Symbol("control");
    const hide = (object, value) =>
        Object.defineProperty(object, hidden, { value, configurable: true });
    const shown = (value) => Object(value) === value ? value[hidden] : undefined;
    const bare = (value) => (shown(value) || { object: value }).object;
    const unasked = ["toJSON", "then"]; // what the language itself looks for
    const standIn = (object, members, prototype) => {
        const known = (name) => typeof name === "string" && members[name.toLowerCase()];
        const inherited = (target, name) => typeof name === "symbol" || name in target;
        return new Proxy(hide(Object.create(prototype), { object, prototype }), {
            get(target, name) {
                const member = known(name);
                if (member)
                    return member.reads || member.calls
                        ? atCaller(() => object[member.name]) : atCaller(() => refuse(name));
                if (inherited(target, name))
                    return Reflect.get(target, name);
                return unasked.indexOf(name) < 0 ? atCaller(() => refuse(name)) : undefined;
            },
            set(target, name, given) {
                const member = known(name);
                if (!member || !member.writes)
                    atCaller(() => refuse(name));
                atCaller(() => { object[member.name] = bare(given); });
                return true;
            },
            has: (target, name) => Boolean(known(name)) || inherited(target, name),
            deleteProperty: (target, name) => atCaller(() => refuse(name)),
            defineProperty: (target, name) => atCaller(() => refuse(name)),
            ownKeys: () => Object.keys(members).map((key) => members[key])
                .filter((member) => member.reads).map((member) => member.name),
            getOwnPropertyDescriptor(target, name) {
                const member = known(name);
                if (!member || !member.reads)
                    return undefined;
                const descriptor = { value: atCaller(() => object[member.name]),
                    writable: member.writes, enumerable: true, configurable: true };
                // The engine compares with the target's own, which has to be there.
                return Object.defineProperty(target, name, descriptor) && descriptor;
            },
        });
    };
    const membersOf = (kind) => {
        const members = Object.create(null);
        for (const member of host.members(kind))
            members[member.name.toLowerCase()] = member;
        return members;
    };
    const control = (kind, constants) => {
        const members = membersOf(kind);
        const constructor = function () {
            return standIn(host.newControl(kind), members, constructor.prototype);
        };
        Object.defineProperty(constructor, Symbol.hasInstance, { value: (value) =>
            (shown(value) || {}).prototype === constructor.prototype });
        return Object.assign(constructor, constants);
    };
    for (const name in enumerations)
        define(name, Object.freeze(enumerations[name]));
    for (const name in records)
        define(name, function (values) { return Object.assign(this, records[name], values); });
    define("Sorvane", control("Sorvane", enumerations.OrderStyle));
    define("Kestrane", control("Kestrane", enumerations.AlignmentType));
    const membersOfWindow = membersOf("PreviewCanvas");
    define("previewCanvas", () => {
        const canvas = host.previewCanvas();
        return canvas ? standIn(canvas, membersOfWindow, global.Sorvane.prototype) : null;
    });
    define("args", Object.freeze(argumentList));
    define("print", (...values) => host.print(values.map(String).join(" ")));
    define("exit", (status = 0) => host.exit(typeof status === "number" ? status : NaN));
    define("csv", (path) => host.csv(path));
    define("sqlite", (path, source) => host.sqlite(path, source));
    define("wait", (milliseconds) => host.wait(milliseconds));
    define("lines", (canvas, page) => host.lines(bare(canvas), page));
    define("texts", (canvas, page) => host.texts(bare(canvas), page));
    define("placePicture",
        (canvas, page, picture) => host.placePicture(bare(canvas), page, picture));
    const messages = [];
    Object.defineProperty(global, "messages", {
        get: () => { messages.push(...host.takeMessages()); return messages; },
    });

    // Promises whose rejection nobody looks after are told when the script has ended.
    const NativePromise = Promise;
    const then = NativePromise.prototype.then;
    const lookedAfter = Symbol("looked after");
    const rejected = [];
    let settled = 0;
    const track = (promise) => {
        then.call(promise, () => { ++settled; },
            (reason) => { ++settled; rejected.push({ promise, reason }); });
        return promise;
    };
    NativePromise.prototype.then = function (...reactions) {
        Object.defineProperty(this, lookedAfter, { value: true, configurable: true });
        return track(then.apply(this, reactions));
    };
    const TrackedPromise = function Promise(executor) {
        return track(new NativePromise(executor));
    };
    TrackedPromise.prototype = NativePromise.prototype;
    for (const name of ["resolve", "reject", "all", "race"])
        TrackedPromise[name] = (given) => track(NativePromise[name](given));
    global.Promise = TrackedPromise;
    return () => ({ settled, reasons: rejected.filter((entry) => !entry.promise[lookedAfter])
        .map((entry) => entry.reason) });
})
)js";

} // namespace pelloric::qt
