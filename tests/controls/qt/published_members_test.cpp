// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/member_table.h"

#include "controls/facade.h"
#include "controls/qt/sorvane_world.h"
#include "platform/qt/qt_text.h"
#include "settings/settings_file.h"
#include "support/errors.h"
#include <pelloric/kestrane.h>
#include <pelloric/preview.h>

#include <QJSEngine>
#include <QMetaMethod>
#include <QMetaProperty>
#include <QTableWidget>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>
#include <span>

namespace pelloric::qt {

namespace {

using testing::ElementsAre;

/// Keeps what it was asked to preview.
class FakeOpener : public PreviewOpener {
public:
    void openPreview(std::unique_ptr<AutomationObject> grid) override
    {
        grids.push_back(std::move(grid));
        previewed.push_back(options);
    }

    void setReportOptions(const ReportOptions& now) override { options = now; }

    ReportOptions options;
    std::vector<ReportOptions> previewed; ///< the options of each preview
    std::vector<std::unique_ptr<AutomationObject>> grids;
};

bool isProperty(const MemberRow& row)
{
    return row.kind == MemberKind::Field || row.kind == MemberKind::PropertyGet
        || row.kind == MemberKind::PropertyPut;
}

std::size_t argumentCount(const MemberRow& row)
{
    std::size_t count = 0;
    for (const MemberArgument& argument : row.arguments)
        count += argument.name.empty() ? 0 : 1;
    return count;
}

std::string nameOf(const MemberRow& row) { return std::string(row.name); }

/// What a member of a type answers by name.
QMetaType answeredType(MemberType type)
{
    switch (type) {
    case MemberType::Int16:
        return QMetaType::fromType<short>();
    case MemberType::Int32:
    case MemberType::Enum:
        return QMetaType::fromType<int>();
    case MemberType::Single:
        return QMetaType::fromType<float>();
    case MemberType::Truth:
        return QMetaType::fromType<bool>();
    case MemberType::Text:
        return QMetaType::fromType<QString>();
    case MemberType::None:
    case MemberType::Object:
        break;
    }
    return {};
}

/// A value that a type refuses, and how; nothing where a type takes all numbers and texts.
struct Refusal {
    QVariant value;
    TextView text;
};

Refusal refusalOf(MemberType type)
{
    switch (type) {
    case MemberType::Int16:
    case MemberType::Enum:
        return { 32768, u"Overflow" };
    case MemberType::Int32:
        return { 2147483648.0, u"Overflow" };
    case MemberType::Single:
        return { 1e39, u"Overflow" };
    case MemberType::Truth:
        return { QStringLiteral("perhaps"), u"Type mismatch" };
    case MemberType::Text:
        return { QVariantList(), u"Type mismatch" };
    case MemberType::Object:
        return { 7, u"Type mismatch" };
    case MemberType::None:
        break;
    }
    return {};
}

/// A value that a type takes.
QVariant harmless(MemberType type)
{
    return type == MemberType::Text ? QVariant(QStringLiteral("text")) : QVariant(1);
}

/// Every name of the interface once, in its order: what a kind of member of a class is called.
std::vector<std::string> tableNames(std::span<const MemberRow> table, bool properties)
{
    std::vector<std::string> names;
    for (const MemberRow& row : table) {
        const bool wanted = properties ? isProperty(row) : row.kind == MemberKind::Method;
        if (wanted && std::find(names.begin(), names.end(), nameOf(row)) == names.end())
            names.push_back(nameOf(row));
    }
    return names;
}

std::vector<std::string> ownProperties(const QMetaObject& meta)
{
    std::vector<std::string> names;
    for (int at = meta.propertyOffset(); at < meta.propertyCount(); ++at) {
        EXPECT_EQ(meta.property(at).metaType(), QMetaType::fromType<QVariant>());
        names.emplace_back(meta.property(at).name());
    }
    return names;
}

/// What every caller by name finds besides the members of every widget.
std::vector<QMetaMethod> publishedMethods(const QMetaObject& meta)
{
    std::vector<QMetaMethod> methods;
    for (int at = QWidget::staticMetaObject.methodCount(); at < meta.methodCount(); ++at) {
        if (meta.method(at).access() == QMetaMethod::Public)
            methods.push_back(meta.method(at));
    }
    return methods;
}

std::vector<std::string> ownMethods(const QMetaObject& meta, QMetaMethod::MethodType type)
{
    std::vector<std::string> names;
    for (const QMetaMethod& method : publishedMethods(meta)) {
        if (method.methodType() == type)
            names.push_back(method.name().toStdString());
    }
    return names;
}

QMetaMethod methodOf(const QMetaObject& meta, const std::string& name)
{
    for (const QMetaMethod& method : publishedMethods(meta)) {
        if (method.name() == QByteArray::fromStdString(name))
            return method;
    }
    return {};
}

void callByName(QObject& object, const std::string& name, const std::vector<QVariant>& arguments)
{
    const QMetaMethod method = methodOf(*object.metaObject(), name);
    switch (arguments.size()) {
    case 1:
        EXPECT_TRUE(method.invoke(&object, Q_ARG(QVariant, arguments[0])));
        break;
    case 2:
        EXPECT_TRUE(
            method.invoke(&object, Q_ARG(QVariant, arguments[0]), Q_ARG(QVariant, arguments[1])));
        break;
    default:
        EXPECT_TRUE(method.invoke(&object, Q_ARG(QVariant, arguments[0]),
            Q_ARG(QVariant, arguments[1]), Q_ARG(QVariant, arguments[2])));
        break;
    }
}

void expectOneBox(FakeMessages& messages, TextView text, const std::string& member)
{
    const auto shown = messages.take();
    ASSERT_EQ(shown.size(), 1U) << member;
    EXPECT_EQ(shown[0].text.substr(0, text.size()), text) << member;
    EXPECT_EQ(shown[0].title, u"提示") << member;
    EXPECT_EQ(shown[0].icon, MessageIcon::Critical) << member;
}

void expectNames(const QMetaObject& meta, std::span<const MemberRow> table)
{
    EXPECT_THAT(tableNames(table, false),
        testing::UnorderedElementsAreArray(ownMethods(meta, QMetaMethod::Method)));
    EXPECT_THAT(tableNames(table, true), testing::UnorderedElementsAreArray(ownProperties(meta)));
    std::vector<std::string> events;
    for (const MemberRow& row : table) {
        if (row.kind == MemberKind::Event)
            events.push_back(nameOf(row));
    }
    EXPECT_THAT(ownMethods(meta, QMetaMethod::Signal), testing::ElementsAreArray(events));
}

/// Names and number of arguments, and what is answered.
void expectSignatures(QObject& object, std::span<const MemberRow> table)
{
    for (const MemberRow& row : table) {
        if (isProperty(row)) {
            if (row.kind == MemberKind::PropertyPut)
                continue;
            const QVariant value = object.property(nameOf(row).c_str());
            EXPECT_EQ(value.metaType(), answeredType(row.type)) << row.name;
            continue;
        }
        const QMetaMethod method = methodOf(*object.metaObject(), nameOf(row));
        ASSERT_EQ(static_cast<std::size_t>(method.parameterCount()), argumentCount(row));
        for (std::size_t at = 0; at < argumentCount(row); ++at) {
            const auto parameter = static_cast<qsizetype>(at);
            EXPECT_EQ(method.parameterNames()[parameter].toStdString(), row.arguments[at].name);
            const auto type = row.kind == MemberKind::Event ? QMetaType::fromType<short>()
                                                            : QMetaType::fromType<QVariant>();
            EXPECT_EQ(method.parameterMetaType(static_cast<int>(at)), type) << row.name;
        }
        if (row.type == MemberType::None) {
            EXPECT_EQ(method.returnMetaType(), QMetaType::fromType<void>()) << row.name;
            continue;
        }
        QVariant answer;
        EXPECT_TRUE(method.invoke(&object, Q_RETURN_ARG(QVariant, answer)));
        EXPECT_EQ(answer.metaType(), answeredType(row.type)) << row.name;
    }
}

/// What a member takes shows in what it refuses.
void expectRefusals(QObject& object, std::span<const MemberRow> table, FakeMessages& messages)
{
    for (const MemberRow& row : table) {
        if (row.kind == MemberKind::Field || row.kind == MemberKind::PropertyPut) {
            const Refusal refusal = refusalOf(row.type);
            const QVariant before = object.property(nameOf(row).c_str());
            object.setProperty(nameOf(row).c_str(), refusal.value);
            expectOneBox(messages, refusal.text, nameOf(row));
            EXPECT_EQ(object.property(nameOf(row).c_str()), before) << row.name;
        }
        for (std::size_t at = 0; row.kind == MemberKind::Method && at < argumentCount(row); ++at) {
            std::vector<QVariant> arguments;
            for (std::size_t other = 0; other < argumentCount(row); ++other)
                arguments.push_back(harmless(row.arguments[other].type));
            const Refusal refusal = refusalOf(row.arguments[at].type);
            arguments[at] = refusal.value;
            callByName(object, nameOf(row), arguments);
            expectOneBox(messages, refusal.text, nameOf(row));
        }
    }
}

} // namespace

TEST(PublishedMembers, OfSorvaneAreThoseOfTheTable)
{
    SorvaneWorld world;
    expectNames(Sorvane::staticMetaObject, SorvaneMembers);
    expectSignatures(world.sorvane, SorvaneMembers);
    expectRefusals(world.sorvane, SorvaneMembers, world.platform.messages);
}

TEST(PublishedMembers, OfKestraneAreThoseOfTheTable)
{
    QuietPlatform platform;
    Kestrane kestrane(platform);
    expectNames(Kestrane::staticMetaObject, KestraneMembers);
    expectSignatures(kestrane, KestraneMembers);
    expectRefusals(kestrane, KestraneMembers, platform.messages);
}

TEST(PublishedMembers, RoundHalvesToEvenAndReadNumbersInTexts)
{
    SorvaneWorld world;
    const auto stored = [&](const QVariant& value) {
        world.sorvane.setProperty("intTop", value);
        return world.sorvane.property("intTop").toInt();
    };
    EXPECT_EQ(stored(2.5), 2);
    EXPECT_EQ(stored(3.5), 4);
    EXPECT_EQ(stored(-32768), -32768);
    EXPECT_EQ(stored(32767.5 - 0.5), 32767);
    EXPECT_EQ(stored(QStringLiteral(" 12 ")), 12);
    EXPECT_EQ(stored(true), -1);
    for (const QVariant& bad : { QVariant(), QVariant(QStringLiteral("abc")),
             QVariant(QStringLiteral("")), QVariant(QStringLiteral("12a")) }) {
        EXPECT_EQ(stored(bad), -1);
        expectOneBox(world.platform.messages, u"Type mismatch", "intTop");
    }
}

TEST(PublishedMembers, ReadTheScaleAsTheDivisor)
{
    SorvaneWorld world;
    world.sorvane.setProperty("DispScale", 2);
    EXPECT_EQ(world.sorvane.property("DispScale").toFloat(), 0.5F);
    world.sorvane.setProperty("DispScale", 0);
    expectOneBox(world.platform.messages, u"Division by zero", "DispScale");
    EXPECT_EQ(world.sorvane.property("DispScale").toFloat(), 0.5F);
}

TEST(PublishedMembers, AnswerTheWindowOfPagesWithTypesToHostsAndByName)
{
    SorvaneWorld world;
    const Sorvane& canvas = world.sorvane;
    world.sorvane.SetShowStyle(4, 8, 11);
    world.makePages(12);
    world.sorvane.showMuliPage(std::int16_t { 4 });
    const std::int16_t first = canvas.WindowMinPage();
    const std::int16_t last = canvas.WindowMaxPage();
    const std::int16_t pages = canvas.WindowPages();
    const Sorvane::OrderStyle style = canvas.WindowOrderStyle();
    EXPECT_EQ(first, 8);
    EXPECT_EQ(last, 11);
    EXPECT_EQ(pages, 4);
    EXPECT_EQ(style, Sorvane::Four);
    QVariant byName;
    EXPECT_TRUE(
        QMetaObject::invokeMethod(&world.sorvane, "WindowMinPage", Q_RETURN_ARG(QVariant, byName)));
    EXPECT_EQ(byName, QVariant::fromValue(std::int16_t { 8 }));
    EXPECT_TRUE(QMetaObject::invokeMethod(
        &world.sorvane, "WindowOrderStyle", Q_RETURN_ARG(QVariant, byName)));
    EXPECT_EQ(byName, QVariant(static_cast<int>(Sorvane::Four)));
}

TEST(PublishedMembers, AreErrorsOfAScriptThatUsesThem)
{
    SorvaneWorld world;
    letScriptsCall();
    QJSEngine engine;
    QJSEngine::setObjectOwnership(&world.sorvane, QJSEngine::CppOwnership);
    engine.globalObject().setProperty("s", engine.newQObject(&world.sorvane));
    const auto numberOf = [&](const char* script) {
        const QString wrapped
            = QStringLiteral("(function(){ try { %1; return 0 } catch (e) { return e.number } })()")
                  .arg(QString::fromLatin1(script));
        return engine.evaluate(wrapped).toInt();
    };
    EXPECT_EQ(numberOf("s.intTop = 70000"), 6);
    EXPECT_EQ(numberOf("s.intTop = 'abc'"), 13);
    EXPECT_EQ(numberOf("s.showMuliPage(1e9)"), 6);
    EXPECT_EQ(numberOf("s.DispScale = 0"), 11);
    EXPECT_EQ(numberOf("s.OpenFile('/nowhere/at/all.ostl')"), 53);
    EXPECT_EQ(numberOf("s.Minimum()"), 91);
    EXPECT_EQ(numberOf("s.doPreview(1)"), 13);
    EXPECT_EQ(numberOf("s.doPreview({ Cols: 1, Rows: 2, ColWidth: () => 1000,"
                       " TextMatrix: () => Symbol('no text') })"),
        13);
    EXPECT_EQ(numberOf("s.VerticalDir"), 438);
    EXPECT_EQ(numberOf("s.VerticalDir = false"), 0);
    EXPECT_EQ(engine.evaluate("s.myWidth").toInt(), 16840);
    EXPECT_EQ(engine.evaluate("s.WindowOrderStyle()").toInt(), 1);
    EXPECT_EQ(engine.evaluate("s.strSCliectRect = 'full'; s.strSCliectRect").toString(), "full");
}

TEST(PublishedMembers, LetAScriptMakeAControlAndPreviewAnObjectOfItsOwn)
{
    SorvaneWorld world;
    letScriptsCall();
    QJSEngine engine;
    QJSEngine::setObjectOwnership(&world.sorvane, QJSEngine::CppOwnership);
    engine.globalObject().setProperty("s", engine.newQObject(&world.sorvane));
    engine.globalObject().setProperty("Sorvane", engine.newQMetaObject(&Sorvane::staticMetaObject));
    EXPECT_EQ(engine.evaluate("Sorvane.Four").toInt(), 3);
    EXPECT_EQ(engine.evaluate("Sorvane.datagrid").toInt(), 3);
    const QJSValue result = engine.evaluate(
        "s.doPreview({ Cols: 2, Rows: 3, ColWidth: function (i, v) { return 2000 },"
        " TextMatrix: function (r, c) { return 'r' + r + 'c' + c } })");
    EXPECT_FALSE(result.isError()) << result.toString().toStdString();
    EXPECT_FALSE(world.canvas.document().texts(0).empty());
    engine.evaluate("s.Click.connect(function (button) { clicked = button }); var clicked = 0");
    emit world.sorvane.Click(2);
    EXPECT_EQ(engine.evaluate("clicked").toInt(), 2);
}

TEST(PublishedMembers, PreviewAViewLateBound)
{
    SorvaneWorld world;
    QTableWidget table(3, 2);
    table.setItem(1, 1, new QTableWidgetItem(QStringLiteral("cell")));
    callByName(world.sorvane, "doPreview", { QVariant::fromValue<QObject*>(&table) });
    EXPECT_EQ(world.canvas.Totalpages(), 1);
    EXPECT_FALSE(world.canvas.document().texts(0).empty());
    callByName(world.sorvane, "ReDrawZoom", { QVariant::fromValue<QObject*>(&table) });
    callByName(world.sorvane, "doPreview", { QVariant::fromValue<QObject*>(nullptr) });
    expectOneBox(world.platform.messages, u"Object variable not set", "doPreview");
}

TEST(PublishedMembers, TellOfAPageBeyondTheLast)
{
    SorvaneWorld world;
    world.makePages(3);
    world.sorvane.setProperty("Currentpage", 3);
    EXPECT_EQ(world.sorvane.Currentpage(), 3);
    world.sorvane.setProperty("Currentpage", 4);
    const auto shown = world.platform.messages.take();
    ASSERT_EQ(shown.size(), 1U);
    EXPECT_EQ(shown[0].text, u"无下一页！");
    EXPECT_EQ(shown[0].icon, MessageIcon::None);
    EXPECT_EQ(world.sorvane.property("Currentpage").toInt(), 3);
}

TEST(Kestrane, HandsGridsToWhoeverOpensTheWindow)
{
    QuietPlatform platform;
    Kestrane kestrane(platform);
    QTableWidget table(1, 1);
    kestrane.doPreview(&table);
    expectOneBox(platform.messages, u"Invalid procedure call", "doPreview");
    FakeOpener byDefault;
    FakeOpener own;
    Kestrane::setDefaultPreviewOpener(&byDefault);
    kestrane.doPreview(&table);
    kestrane.setPreviewOpener(&own);
    callByName(kestrane, "doPreview", { QVariant::fromValue<QObject*>(&table) });
    Kestrane::setDefaultPreviewOpener(nullptr);
    EXPECT_EQ(byDefault.grids.size(), 1U);
    ASSERT_EQ(own.grids.size(), 1U);
    EXPECT_TRUE(own.grids[0]->findMember(u"TextMatrix"));
}

TEST(Kestrane, HandsItsOwnReportOptionsToEachPreview)
{
    QuietPlatform platform;
    Kestrane plain(platform);
    Kestrane shown(platform);
    FakeOpener opener;
    plain.setPreviewOpener(&opener);
    shown.setPreviewOpener(&opener);
    ReportOptions options;
    options.asShown = true;
    options.keyColumns = 2;
    shown.setReportOptions(options);
    QTableWidget table(1, 1);
    shown.doPreview(&table);
    plain.doPreview(&table);
    shown.doPreview(&table);
    ASSERT_EQ(opener.previewed.size(), 3U);
    EXPECT_TRUE(opener.previewed[0].asShown);
    EXPECT_EQ(opener.previewed[0].keyColumns, 2);
    EXPECT_FALSE(opener.previewed[1].asShown) << "the other control has none";
    EXPECT_TRUE(opener.previewed[2].asShown);
    EXPECT_TRUE(shown.reportOptions().asShown);
}

TEST(Kestrane, WritesWhatItIsTold)
{
    QuietPlatform platform;
    const Platform services = platform.record();
    Kestrane kestrane(platform);
    kestrane.setProperty("ShowHeader", true);
    kestrane.setProperty("MergeGrid", true);
    callByName(kestrane, "AddHeader", { QStringLiteral("left"), 0 });
    callByName(kestrane, "AddHeader", { QStringLiteral("页"), 7 });
    callByName(kestrane, "AddFooter", { 12.5, 1 });
    EXPECT_EQ(readSetting(services, u"ShowHeaders"), u"1");
    EXPECT_EQ(readSetting(services, u"GridMerge"), u"1");
    EXPECT_EQ(readSetting(services, u"HeaderLeft"), u"left");
    EXPECT_EQ(readSetting(services, u"HeaderRight"), u"页");
    EXPECT_EQ(readSetting(services, u"FooterCenter"), u"12.5");
    kestrane.setMarvenStartRow(3);
    EXPECT_EQ(platform.library().MarvenStartRow, 3);
    const Kestrane other(platform);
    EXPECT_EQ(kestrane.property("MarvenStartRow").toInt(), 1);
}

TEST(Kestrane, ShowsARectangleThatCoversIt)
{
    QuietPlatform platform;
    Kestrane kestrane(platform);
    for (const QSize size : { QSize(60, 40), QSize(200, 100) }) {
        kestrane.resize(size);
        const QImage image = kestrane.grab().toImage();
        const QRgb frame = image.pixel(0, 0);
        EXPECT_EQ(image.pixel(size.width() - 1, size.height() - 1), frame);
        EXPECT_EQ(image.pixel(size.width() / 2, 0), frame);
        EXPECT_NE(image.pixel(size.width() / 2, size.height() / 2), frame);
    }
}

TEST(PlainCalls, MembersTakePlainTypesByName)
{
    SorvaneWorld world;
    Sorvane& canvas = world.sorvane;
    EXPECT_TRUE(QMetaObject::invokeMethod(
        &canvas, "SetShowStyle", Q_ARG(short, 6), Q_ARG(short, 0), Q_ARG(short, 5)));
    EXPECT_EQ(canvas.WindowPages(), 6);
    EXPECT_TRUE(QMetaObject::invokeMethod(
        &canvas, "SetShowStyle", Q_ARG(int, 4), Q_ARG(int, 0), Q_ARG(int, 3)));
    EXPECT_EQ(canvas.WindowPages(), 4);
    world.makePages(4);
    EXPECT_TRUE(QMetaObject::invokeMethod(&canvas, "showMuliPage", Q_ARG(short, 4)));
    EXPECT_EQ(canvas.WindowOrderStyle(), Sorvane::Four);
    const QString file = QString::fromStdString(world.platform.folder.file("a.ostl").string());
    EXPECT_TRUE(QMetaObject::invokeMethod(&canvas, "SaveFile", Q_ARG(QString, file)));
    canvas.clear();
    EXPECT_TRUE(QMetaObject::invokeMethod(&canvas, "OpenFile", Q_ARG(QString, file)));
    EXPECT_EQ(world.canvas.Totalpages(), 4);
    QTableWidget grid(1, 1);
    canvas.setProperty("m_PrintObj", Sorvane::MSFlexGrid);
    EXPECT_TRUE(QMetaObject::invokeMethod(&canvas, "doPreview", Q_ARG(QObject*, &grid)));
    EXPECT_EQ(world.canvas.Totalpages(), 1);
    EXPECT_TRUE(QMetaObject::invokeMethod(&canvas, "ReDrawZoom", Q_ARG(QObject*, &grid)));

    Kestrane facade(world.platform);
    FakeOpener opener;
    facade.setPreviewOpener(&opener);
    EXPECT_TRUE(QMetaObject::invokeMethod(&facade, "doPreview", Q_ARG(QObject*, &grid)));
    EXPECT_EQ(opener.grids.size(), 1U);
    EXPECT_TRUE(QMetaObject::invokeMethod(&facade, "AddHeader",
        Q_ARG(QString, QStringLiteral("plain")), Q_ARG(short, Kestrane::LocRight)));
    EXPECT_TRUE(QMetaObject::invokeMethod(
        &facade, "AddFooter", Q_ARG(QString, QStringLiteral("foot")), Q_ARG(int, 0)));
    const Platform platform = world.platform.record();
    EXPECT_EQ(readSetting(platform, u"HeaderRight"), u"plain");
    EXPECT_EQ(readSetting(platform, u"FooterLeft"), u"foot");
}

TEST(PlainCalls, AreCheckedAndNeverWrapANumberOfAScript)
{
    SorvaneWorld world;
    Sorvane& canvas = world.sorvane;
    EXPECT_TRUE(QMetaObject::invokeMethod(&canvas, "showMuliPage", Q_ARG(int, 70000)));
    expectOneBox(world.platform.messages, u"Overflow", "showMuliPage");
    EXPECT_TRUE(QMetaObject::invokeMethod(
        &canvas, "doPrint", Q_ARG(bool, true), Q_ARG(QString, QString()), Q_ARG(int, 70000)));
    expectOneBox(world.platform.messages, u"Overflow", "doPrint");
    letScriptsCall();
    QJSEngine engine;
    QJSEngine::setObjectOwnership(&canvas, QJSEngine::CppOwnership);
    engine.globalObject().setProperty("s", engine.newQObject(&canvas));
    for (const char* const call : { "s.showMuliPage(70000)", "s.SetShowStyle(70000, 0, 1)",
             "s.SetShowStyle(1, 0, -40000)", "s.doPrint(true, '', 70000)" }) {
        const QString script
            = QStringLiteral("(() => { try { %1; return 0; } catch (e) { return e.number; } })()")
                  .arg(QLatin1String(call));
        EXPECT_EQ(engine.evaluate(script).toInt(), 6) << call;
    }
}

TEST(PublishedRecordTypes, AreKnownToTheMetaTypeSystemByName)
{
    const SorvaneWorld world;
    const std::pair<const char*, QMetaType> types[] = {
        { "Tpoint", QMetaType::fromType<Tpoint>() },
        { "Lineobj", QMetaType::fromType<Lineobj>() },
        { "Textobj", QMetaType::fromType<Textobj>() },
        { "MapLocation", QMetaType::fromType<MapLocation>() },
        { "ColPos", QMetaType::fromType<ColPos>() },
        { "MuliPageType", QMetaType::fromType<MuliPageType>() },
    };
    for (const auto& [name, type] : types) {
        EXPECT_EQ(QMetaType::fromName(name), type) << name;
        EXPECT_EQ(QMetaType::fromName(QByteArray("pelloric::") + name), type) << name;
    }
}

} // namespace pelloric::qt
