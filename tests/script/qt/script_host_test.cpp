// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "script/qt/script_host.h"

#include "fakes/temp_folder.h"
#include "grids/qt/held_grid.h"
#include "grids/table_grid.h"
#include "platform/qt/qt_platform.h"
#include "script/qt/script_controls.h"
#include "settings/default_settings.h"
#include "support/test_paths.h"
#include "tables/qt/csv_table.h"

#include <QApplication>
#include <QFile>
#include <QImage>
#include <QProcess>
#include <QProcessEnvironment>
#include <QTest>
#include <QTimer>

#include <gtest/gtest.h>

#include <array>
#include <cmath>

namespace pelloric::qt {

namespace {

constexpr int LongestRun = 60'000; ///< milliseconds

/// Tables of two columns, whatever the file is called.
class FewRows final : public ScriptTables {
public:
    QObject* csv(const QString&) override { return table(); }
    QObject* sqlite(const QString&, const QString&) override { return table(); }

private:
    static QObject* table()
    {
        auto grid = std::make_shared<TableGrid>(
            std::vector<TableColumn> { { u"Name", 2000 }, { u"Number", 1000 } });
        grid->addRow(std::array<TextView, 2> { u"Anna", u"17" });
        return new HeldGrid(std::move(grid));
    }
};

class ScriptHostTest : public testing::Test {
protected:
    ScriptHostTest()
    {
        platform_.folders().setSystemDirectory(folder_.path());
        deployDefaultSettings(platform_.record());
    }

    /// Runs a script and keeps what it wrote.
    int run(const QString& text)
    {
        testing::internal::CaptureStdout();
        testing::internal::CaptureStderr();
        const int status = host_.runText(
            text, QStringLiteral("test.js"), { QString::fromStdString(folder_.path().string()) });
        output = testing::internal::GetCapturedStdout();
        errors = testing::internal::GetCapturedStderr();
        return status;
    }

    std::string output;
    std::string errors;
    TempFolder folder_;

private:
    QtPlatform platform_;
    FewRows tables_;
    ScriptHost host_ { platform_, tables_ };
};

} // namespace

TEST_F(ScriptHostTest, SetsFieldsByNameAndRoundsHalvesToEven)
{
    EXPECT_EQ(run(QStringLiteral("const c = new Sorvane(); c.intLeft = 2.5; c.PageHeader = 'x';"
                                 "print(c.intLeft, c.PageHeader, c.strSCliectRect,"
                                 " c.WindowOrderStyle() === OrderStyle.One);")),
        0)
        << errors;
    EXPECT_EQ(output, "2 x small true\n");
}

TEST_F(ScriptHostTest, GivesErrorsTheirNumberAndLine)
{
    EXPECT_EQ(run(QStringLiteral("const c = new Sorvane();\n"
                                 "try {\n"
                                 "    c.intTop = 70000;\n"
                                 "} catch (e) { print(e.number, e.lineNumber); }")),
        0)
        << errors;
    EXPECT_EQ(output, "6 3\n");
}

TEST_F(ScriptHostTest, TellsOfAnUncaughtExceptionWithFileAndLine)
{
    EXPECT_EQ(run(QStringLiteral("\n\nnew Sorvane().intTop = 70000;")), 1);
    EXPECT_EQ(errors.rfind("test.js:3: ", 0), 0U) << errors;
    EXPECT_NE(errors.find("(error 6)"), std::string::npos) << errors;
    EXPECT_EQ(run(QStringLiteral("let a = ;")), 1);
    EXPECT_EQ(errors.rfind("test.js:1: ", 0), 0U) << errors;
    EXPECT_EQ(run(QStringLiteral("\nthrow 'a text';")), 1);
    EXPECT_NE(errors.find("a text"), std::string::npos) << errors;
}

TEST_F(ScriptHostTest, EndsWithTheStatusThatTheScriptAsksFor)
{
    EXPECT_EQ(run(QStringLiteral("exit(3); print('not reached');")), 3);
    EXPECT_EQ(output + errors, "");
    EXPECT_EQ(run(QStringLiteral("try { exit(4); } catch (e) { print('caught'); }")), 4);
    EXPECT_EQ(run(QStringLiteral("for (;;) exit(5);")), 5);
    EXPECT_EQ(run(QStringLiteral("exit();")), 0);
    EXPECT_EQ(run(QStringLiteral("print(args.length)")), 0);
    EXPECT_EQ(output, "1\n");
}

TEST_F(ScriptHostTest, CollectsMessageBoxes)
{
    EXPECT_EQ(run(QStringLiteral("new Sorvane().Currentpage = 2;"
                                 "print(messages.length, messages[0].text);")),
        0)
        << errors;
    EXPECT_EQ(output, "1 无下一页！\n");
}

TEST_F(ScriptHostTest, BuildsFromTablesAndReadsThePagesBack)
{
    EXPECT_EQ(run(QStringLiteral("const c = new Sorvane(); c.m_PrintObj = PrintObjKind.MSFlexGrid;"
                                 "for (const grid of [csv('a'), sqlite('b', 'c')]) {"
                                 "  c.doPreview(grid);"
                                 "  print(c.Totalpages, texts(c, 0).some(t => t.Str === 'Anna'),"
                                 "    lines(c, 0).length > 4, texts(c, 0)[0] instanceof Textobj);"
                                 "}"
                                 "try { lines(c, 9); } catch (e) { print(e.number); }")),
        0)
        << errors;
    EXPECT_EQ(output, "1 true true true\n1 true true true\n9\n");
}

TEST_F(ScriptHostTest, RefusesMembersThatAreNotThere)
{
    EXPECT_EQ(run(QStringLiteral("'use strict'; new Sorvane().intBottom = 1;")), 1);
    EXPECT_FALSE(errors.empty());
    EXPECT_EQ(run(QStringLiteral("new Sorvane().noSuchMethod();")), 1);
    EXPECT_FALSE(errors.empty());
}

TEST_F(ScriptHostTest, RefusesEveryUnknownMemberWithError438)
{
    const char* const attempts[] = { "c.curentpage = 3", "c.curentpage", "c.noSuchMethod()",
        "c.VerticalDir", "c.clear = 1", "'use strict'; c.intBottom = 1", "c.windowTitle",
        "c.deleteLater()", "k.Cols", "k.doPreview = 1", "k.intTop" };
    for (const char* const attempt : attempts) {
        EXPECT_EQ(run(QStringLiteral("const c = new Sorvane(), k = new Kestrane();\n"
                                     "try { (() => { %1; })(); print('nothing'); }\n"
                                     "catch (e) { print(e.number, e.lineNumber); }")
                          .arg(QLatin1String(attempt))),
            0)
            << errors;
        EXPECT_EQ(output, "438 2\n") << attempt;
    }
}

TEST_F(ScriptHostTest, TakesPublishedMembersInAnyLetterCase)
{
    EXPECT_EQ(
        run(QStringLiteral(
            "const c = new Sorvane(); c.INTLEFT = 7; c.pageheader = 'x'; const left = c.intLeft;"
            "c.M_PRINTOBJ = PrintObjKind.MSFlexGrid; c.DOPREVIEW(csv('a'));"
            "print(left, c.PageHeader, c.currentPage, c.totalPAGES, 'dispscale' in c);"
            "const k = new Kestrane(); k.marvenstartrow = 3; print(k.MarvenStartRow);")),
        0)
        << errors;
    EXPECT_EQ(output, "7 x 1 1 true\n3\n");
}

TEST_F(ScriptHostTest, MembersOfHostObjectsNeedTheirExactName)
{
    EXPECT_EQ(run(QStringLiteral("const c = new Sorvane(); c.m_PrintObj = PrintObjKind.MSFlexGrid;"
                                 "try { c.doPreview({ cols: 1, Rows: 1, ColWidth: () => 900,"
                                 "    TextMatrix: () => 'A' }); }"
                                 "catch (e) { print(e.number, e.message.indexOf('Cols') >= 0); }")),
        0)
        << errors;
    EXPECT_EQ(output, "438 true\n");
}

TEST_F(ScriptHostTest, ListsAndWritesAControlsProperties)
{
    EXPECT_EQ(run(QStringLiteral(
                  "const c = new Sorvane(); const keys = Object.keys(c);"
                  "print(keys.indexOf('Currentpage') >= 0, keys.indexOf('VerticalDir') >= 0);"
                  "const read = JSON.parse(JSON.stringify(c));"
                  "print(read.Currentpage, read.myWidth, Object.keys(read).length === keys.length);"
                  "print(JSON.stringify(new Kestrane()));"
                  "print(c instanceof Sorvane, c instanceof Kestrane);")),
        0)
        << errors;
    EXPECT_EQ(output,
        "true false\n1 11907 true\n"
        "{\"MarvenStartRow\":1,\"MergeGrid\":false,\"ShowHeader\":false}\n"
        "true false\n");
}

TEST_F(ScriptHostTest, PreviewsInTheWindowWithoutShowingIt)
{
    EXPECT_EQ(run(QStringLiteral(
                  "print(previewCanvas());"
                  "const k = new Kestrane(); k.AddHeader('Page [Page #]', Kestrane.LocRight);"
                  "k.doPreview(csv('a'));"
                  "const c = previewCanvas();"
                  "print(c.Totalpages, c.strSCliectRect, c.m_PrintObj === PrintObjKind.MSHFlexGrid,"
                  "    texts(c, 0).map(t => t.Str).join());"
                  "k.doPreview({ Cols: 1, Rows: 1, ColWidth: () => 900,"
                  "    TextMatrix: () => 'B' });"
                  "print(texts(c, 0).map(t => t.Str).join());")),
        0)
        << errors;
    EXPECT_EQ(output,
        "null\n1 full true Page 1,Name,Number,Anna,17,1 of [Pages]\n"
        "Page 1,B,1 of [Pages]\n");
    for (const QWidget* const window : QApplication::topLevelWidgets())
        EXPECT_FALSE(window->isVisible()) << window->objectName().toStdString();
}

TEST_F(ScriptHostTest, WhateverACellFunctionThrowsIsAnError)
{
    for (const char* const thrown : { "'a text'", "null", "undefined", "7", "new Error('e')" }) {
        for (const char* const cell : { "TextMatrix() { throw %1; }",
                 "get Rows() { throw %1; },"
                 "TextMatrix: () => ''" }) {
            const QString members = QString::fromLatin1(cell).arg(QLatin1String(thrown));
            EXPECT_EQ(run(QStringLiteral(
                          "const c = new Sorvane(); c.m_PrintObj = PrintObjKind.MSFlexGrid;"
                          "try { c.doPreview({ Cols: 1, Rows: 2, ColWidth: () => 900, %1 });"
                          "    print('nothing', c.Totalpages); }"
                          "catch (e) { print(e.number); }")
                              .arg(members)),
                0)
                << errors;
            EXPECT_EQ(output, "5\n") << thrown << " " << cell;
        }
    }
}

TEST_F(ScriptHostTest, MakesAnyNumberOfControlsAndPromises)
{
    EXPECT_EQ(run(QStringLiteral("let last; for (let i = 0; i < 1500; ++i) {"
                                 "    last = new Sorvane(); new Sorvane().intTop = i % 100;"
                                 "    Promise.resolve(last).then(() => 1); }"
                                 "print(last instanceof Sorvane, last instanceof Kestrane)")),
        0)
        << errors;
    EXPECT_EQ(output, "true false\n");
}

TEST_F(ScriptHostTest, RefusesAStatusThatNoProgramEndsWith)
{
    for (const char* status : { "256", "-1", "1e308", "'x'", "NaN", "1.5", "null" }) {
        EXPECT_EQ(run(QStringLiteral("exit(%1)").arg(QLatin1String(status))), 1) << status;
        EXPECT_NE(errors.find("exit: a status is a whole number from 0 to 255"), std::string::npos)
            << errors;
    }
    EXPECT_EQ(run(QStringLiteral("exit(255)")), 255);
}

TEST_F(ScriptHostTest, SaysWhatIsWrongWithObjectsThatAreHandedOver)
{
    struct Case {
        const char* script;
        const char* message;
    };
    constexpr Case Cases[] = {
        { "lines(new Kestrane(), 0)", "a Sorvane was expected" },
        { "const c = new Sorvane(); c.m_PrintObj = PrintObjKind.MSFlexGrid;"
          "c.doPreview({ Cols: 1, Rows: 2, ColWidth: () => 900, TextMatrix: () => Symbol('s') });",
            "a symbol is no value" },
        { "const c = new Sorvane(); c.m_PrintObj = PrintObjKind.MSFlexGrid;"
          "c.doPreview({ Cols: 1, Rows: 2, ColWidth: 900, TextMatrix: () => '' });",
            "only an array takes an index" },
    };
    for (const Case& row : Cases) {
        EXPECT_EQ(run(QString::fromLatin1(row.script)), 1) << row.script;
        EXPECT_NE(errors.find(row.message), std::string::npos) << row.script << ": " << errors;
    }
}

TEST_F(ScriptHostTest, ReportsPromisesThatWereRejectedAndThatNobodyLooksAfter)
{
    EXPECT_EQ(run(QStringLiteral("Promise.reject(new Error('lost'));")), 1);
    EXPECT_NE(errors.find("lost"), std::string::npos) << errors;
    EXPECT_EQ(run(QStringLiteral("Promise.resolve(1).then(() => { throw 'later'; });")), 1);
    EXPECT_NE(errors.find("later"), std::string::npos) << errors;
    EXPECT_EQ(run(QStringLiteral("new Promise((_, reject) => reject('a'))"
                                 "    .catch(reason => print('caught', reason))"
                                 "    .then(() => print('after'));"
                                 "Promise.all([Promise.reject(1)]).then(null, () => 0);")),
        0)
        << errors;
    EXPECT_EQ(output, "caught a\nafter\n");
}

TEST_F(ScriptHostTest, AThrownNothingIsToldAndFails)
{
    EXPECT_EQ(run(QStringLiteral("throw null;")), 1);
    EXPECT_EQ(run(QStringLiteral("throw undefined;")), 1);
    EXPECT_FALSE(errors.empty());
}

TEST_F(ScriptHostTest, RaisesEvents)
{
    QTimer::singleShot(200, [] {
        for (QWidget* const window : QApplication::topLevelWidgets()) {
            if (auto* const paper = window->findChild<QWidget*>(QStringLiteral("paper(0)")))
                QTest::mouseClick(paper, Qt::RightButton, {}, { 20, 20 });
        }
    });
    EXPECT_EQ(run(QStringLiteral("const c = new Sorvane(); c.resize(400, 300);"
                                 "c.m_PrintObj = PrintObjKind.MSFlexGrid; c.doPreview(csv('a'));"
                                 "c.Click.connect(b => print('down', b));"
                                 "c.MouseUp.connect(b => print('up', b)); wait(600);")),
        0)
        << errors;
    EXPECT_EQ(output, "down 2\nup 2\n");
}

TEST_F(ScriptHostTest, SavesPictures)
{
    EXPECT_EQ(run(QStringLiteral("const c = new Sorvane(); c.resize(320, 200);"
                                 "c.grab(args[0] + '/picture.png');"
                                 "try { c.grab(args[0] + '/no/such/folder.png'); }"
                                 "catch (e) { print('refused'); }")),
        0)
        << errors;
    EXPECT_EQ(output, "refused\n");
    const QImage picture(QString::fromStdString(folder_.file("picture.png").string()));
    EXPECT_EQ(picture.size(), QSize(320, 200));
}

/// The built program, in a folder of its own.
class ScriptProgram : public testing::Test {
protected:
    int run(const QStringList& arguments, const QString& scale = {})
    {
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("XDG_CONFIG_HOME"), path("config"));
        environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
        if (!scale.isEmpty())
            environment.insert(QStringLiteral("QT_SCALE_FACTOR"), scale);
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(path("."));
        process.start(
            QStringLiteral(PELLORIC_PROGRAM), QStringList { QStringLiteral("run") } + arguments);
        EXPECT_TRUE(process.waitForFinished(LongestRun));
        output = process.readAllStandardOutput();
        errors = process.readAllStandardError();
        return process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
    }

    QString path(const char* name) const
    {
        return QString::fromStdString((folder_.path() / name).string());
    }

    static QString source(const char* name)
    {
        return QStringLiteral(PELLORIC_TESTS_DIR "/../") + QLatin1String(name);
    }

    QByteArray output;
    QByteArray errors;
    TempFolder folder_;
};

TEST_F(ScriptProgram, FailsWhenNobodyCanReadWhatItPrints)
{
    QFile script(path("print.js"));
    ASSERT_TRUE(script.open(QIODevice::WriteOnly));
    script.write("try { print('lost'); } catch (e) { } exit(0);\n");
    script.close();
    QProcess process;
    process.setStandardOutputFile(QStringLiteral("/dev/full"));
    process.start(QStringLiteral(PELLORIC_PROGRAM), { QStringLiteral("run"), path("print.js") });
    ASSERT_TRUE(process.waitForFinished(LongestRun));
    EXPECT_EQ(process.exitCode(), 1);
    EXPECT_NE(process.readAllStandardError().indexOf("No space left"), -1);
}

TEST_F(ScriptProgram, ReadsDeeplyNestedExpressions)
{
    QFile script(path("nested.js"));
    ASSERT_TRUE(script.open(QIODevice::WriteOnly));
    script.write("const nested = '('.repeat(Number(args[0])) + ')'.repeat(Number(args[0]));\n"
                 "try { print(new RegExp(nested).test('x')); } catch (e) { print(e.name); }\n");
    script.close();
    EXPECT_EQ(run({ path("nested.js"), QStringLiteral("50000") }), 0) << errors.toStdString();
    EXPECT_EQ(output, "true\n");
    EXPECT_EQ(run({ path("nested.js"), QStringLiteral("300000") }), 0) << errors.toStdString();
    EXPECT_EQ(run({ path("nested.js"), QStringLiteral("2000000") }), 0) << errors.toStdString();
    EXPECT_EQ(output, "SyntaxError\n");
}

TEST_F(ScriptProgram, RunsTheExamples)
{
    EXPECT_EQ(run({ source("examples/scripts/plain_objects.js") }), 0) << errors.toStdString();
    EXPECT_EQ(output.count("Apple @"), 3) << output.toStdString();
    EXPECT_TRUE(QFile::exists(path("fruit.ostl")));
    EXPECT_EQ(run({ source("examples/scripts/errors_and_events.js") }), 0) << errors.toStdString();
    EXPECT_EQ(output.count("error "), 4) << output.toStdString();
    EXPECT_EQ(run({ source("examples/scripts/display_modes.js"), source("samples/time-zones.tsv"),
                  path(".") }),
        0)
        << errors.toStdString();
    for (const char* name : { "mode-one.png", "mode-whole.png", "mode-six.png", "mode-all.png" })
        EXPECT_FALSE(QImage(path(name)).isNull()) << name;
}

TEST_F(ScriptProgram, PaintsPicturesAtTheirPixelsAtEveryScaleOfTheScreen)
{
    QImage red(4, 4, QImage::Format_RGB32);
    red.fill(Qt::red);
    ASSERT_TRUE(red.save(path("red.png")));
    QFile script(path("sharp.js"));
    ASSERT_TRUE(script.open(QIODevice::WriteOnly));
    script.write("const c = new Sorvane(); c.resize(400, 300); c.strSCliectRect = 'full';\n"
                 "const cells = { Cols: 1, Rows: 2, ColWidth: () => 2000,\n"
                 "    TextMatrix: (row, column) => 'A' };\n"
                 "c.m_PrintObj = PrintObjKind.MSFlexGrid; c.doPreview(cells);\n"
                 "placePicture(c, 0, new MapLocation({ nLeft: 600, nTop: 300, nWidth: 900,\n"
                 "    nHeight: 600, strFilePath: args[0] }));\n"
                 "c.grab('sharp.png');\n");
    script.close();
    for (const double scale : { 1.0, 1.25, 2.0 }) {
        ASSERT_EQ(run({ path("sharp.js"), path("red.png") }, QString::number(scale)), 0)
            << errors.toStdString();
        const QImage image(path("sharp.png"));
        ASSERT_EQ(image.size(), (QSizeF(400, 300) * scale).toSize()) << scale;
        // The page's corner: two pixels of edge and 100 twips, a whole pixel of the widget.
        const auto device
            = [&](double twips) { return (2 + std::nearbyint(100 / 15.0) + twips / 15.0) * scale; };
        const auto isRed = [&](double x, double y) {
            const QColor color
                = image.pixelColor(static_cast<int>(device(x)), static_cast<int>(device(y)));
            return color.red() > 200 && color.green() < 60;
        };
        EXPECT_TRUE(isRed(660, 360)) << scale;
        EXPECT_TRUE(isRed(1440, 840)) << scale;
        EXPECT_FALSE(isRed(540, 360)) << scale;
        EXPECT_FALSE(isRed(660, 240)) << scale;
        EXPECT_FALSE(isRed(1560, 840)) << scale;
        EXPECT_FALSE(isRed(1440, 960)) << scale;
    }
}

} // namespace pelloric::qt
