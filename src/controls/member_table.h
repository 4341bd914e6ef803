// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstdint>
#include <string_view>

namespace pelloric {

/// What a published member is.
enum class MemberKind : std::uint8_t { Field, PropertyPut, PropertyGet, Method, Event };

/// The type of a value that a published member takes or answers.
enum class MemberType : std::uint8_t { None, Int16, Int32, Single, Truth, Text, Object, Enum };

/// An argument of a published member.
struct MemberArgument {
    std::string_view name {}; ///< empty: there is no such argument
    MemberType type = MemberType::None;
};

/// A member that a control publishes.
struct MemberRow {
    std::string_view name;
    MemberKind kind = MemberKind::Method;
    MemberType type = MemberType::None; ///< of the field or property; what a method answers
    std::array<MemberArgument, 3> arguments {}; ///< of a method or event, in order
};

/// What `Sorvane` publishes: the fields, then properties and methods in the order of the
/// interface, then the events.
inline constexpr auto SorvaneMembers = std::to_array<MemberRow>({
    { "intTop", MemberKind::Field, MemberType::Int16 },
    { "intButtom", MemberKind::Field, MemberType::Int16 },
    { "intLeft", MemberKind::Field, MemberType::Int16 },
    { "intRight", MemberKind::Field, MemberType::Int16 },
    { "myHeight", MemberKind::Field, MemberType::Int32 },
    { "myWidth", MemberKind::Field, MemberType::Int32 },
    { "Totalpages", MemberKind::Field, MemberType::Int16 },
    { "bGetText", MemberKind::Field, MemberType::Truth },
    { "m_PrintObj", MemberKind::Field, MemberType::Enum },
    { "strSCliectRect", MemberKind::Field, MemberType::Text },
    { "Currentpage", MemberKind::PropertyPut, MemberType::Int16 },
    { "Currentpage", MemberKind::PropertyGet, MemberType::Int16 },
    { "showWholePage" },
    { "showPage" },
    { "showAllPage" },
    { "showMuliPage", MemberKind::Method, MemberType::None,
        { { { "nPages", MemberType::Int16 } } } },
    { "CurrentX", MemberKind::PropertyGet, MemberType::Int32 },
    { "CurrentX", MemberKind::PropertyPut, MemberType::Int32 },
    { "CurrentY", MemberKind::PropertyGet, MemberType::Int32 },
    { "CurrentY", MemberKind::PropertyPut, MemberType::Int32 },
    { "clear" },
    { "zoomIn" },
    { "zoomOut" },
    { "Minimum" },
    { "Maximum" },
    { "setMouse" },
    { "Pan" },
    { "DispScale", MemberKind::PropertyGet, MemberType::Single },
    { "DispScale", MemberKind::PropertyPut, MemberType::Single },
    { "VerticalDir", MemberKind::PropertyPut, MemberType::Truth },
    { "doPrint", MemberKind::Method, MemberType::None,
        { { { "bAllPrint", MemberType::Truth }, { "strPrintRange", MemberType::Text },
            { "nPrintPageNum", MemberType::Int16 } } } },
    { "PageHeader", MemberKind::PropertyGet, MemberType::Text },
    { "PageHeader", MemberKind::PropertyPut, MemberType::Text },
    { "doPreview", MemberKind::Method, MemberType::None,
        { { { "PrintObj", MemberType::Object } } } },
    { "ReSetLeftTop", MemberKind::PropertyGet, MemberType::Truth },
    { "ReSetLeftTop", MemberKind::PropertyPut, MemberType::Truth },
    { "SetShowStyle", MemberKind::Method, MemberType::None,
        { { { "nPages", MemberType::Int16 }, { "nStartPage", MemberType::Int16 },
            { "nEndPage", MemberType::Int16 } } } },
    { "WindowMinPage", MemberKind::Method, MemberType::Int16 },
    { "WindowMaxPage", MemberKind::Method, MemberType::Int16 },
    { "WindowPages", MemberKind::Method, MemberType::Int16 },
    { "WindowOrderStyle", MemberKind::Method, MemberType::Enum },
    { "OnDraw" },
    { "SaveFile", MemberKind::Method, MemberType::None, { { { "FilePath", MemberType::Text } } } },
    { "OpenFile", MemberKind::Method, MemberType::None, { { { "FilePath", MemberType::Text } } } },
    { "ReDrawZoom", MemberKind::Method, MemberType::None,
        { { { "PrintObj", MemberType::Object } } } },
    { "Click", MemberKind::Event, MemberType::None, { { { "Button", MemberType::Int16 } } } },
    { "MouseUp", MemberKind::Event, MemberType::None, { { { "Button", MemberType::Int16 } } } },
});

/// What `Kestrane` publishes, in the order of the interface; it has no events.
inline constexpr auto KestraneMembers = std::to_array<MemberRow>({
    { "doPreview", MemberKind::Method, MemberType::None,
        { { { "PrintObj", MemberType::Object } } } },
    { "AddHeader", MemberKind::Method, MemberType::None,
        { { { "strHeader", MemberType::Text }, { "Location", MemberType::Enum } } } },
    { "AddFooter", MemberKind::Method, MemberType::None,
        { { { "strFooter", MemberType::Text }, { "Location", MemberType::Enum } } } },
    { "ShowHeader", MemberKind::PropertyGet, MemberType::Truth },
    { "ShowHeader", MemberKind::PropertyPut, MemberType::Truth },
    { "MarvenStartRow", MemberKind::PropertyGet, MemberType::Int32 },
    { "MarvenStartRow", MemberKind::PropertyPut, MemberType::Int32 },
    { "MergeGrid", MemberKind::PropertyGet, MemberType::Truth },
    { "MergeGrid", MemberKind::PropertyPut, MemberType::Truth },
});

} // namespace pelloric
