// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "apps/qt/program.h"
#include "platform/qt/qt_fonts.h"
#include "support/test_paths.h"

#include <QFile>
#include <QImage>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QProcess>
#include <QProcessEnvironment>
#include <QSqlDatabase>
#include <QSqlQuery>

#include <gtest/gtest.h>

#include <algorithm>
#include <csignal>
#include <sstream>

namespace pelloric::qt {

TEST_F(Program, PrintsOfficeCellsAsTheyAreShownOnlyWhenAskedTo)
{
    const QString sheet = QStringLiteral(PELLORIC_TESTS_DIR "/data/office/looks.xlsx");
    const auto picture = [&](const QString& name, const QStringList& more) {
        EXPECT_EQ(run(QStringList { "export", sheet, "-o", name } + more).status, 0);
        return QImage(QString::fromStdString(folder_.file(name.toStdString()).string()));
    };
    const auto holds = [](const QImage& image, QColor color) {
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                if (image.pixelColor(x, y) == color)
                    return true;
            }
        }
        return false;
    };
    const QColor gold(0xFF, 0xE6, 0x99);
    EXPECT_FALSE(holds(picture("plain.png", {}), gold));
    EXPECT_TRUE(holds(picture("shown.png", { "--as-shown" }), gold));
    EXPECT_TRUE(holds(
        picture("sorted.png", { "--as-shown", "--sort", "Number", "--columns", "Text" }), gold));
}

TEST_F(Program, LeavesOutWhatASheetHidesAndSaysSo)
{
    const QString sheet = QStringLiteral(PELLORIC_TESTS_DIR "/data/office/hidden.xlsx");
    const QStringList command { QStringLiteral("export"), sheet, QStringLiteral("-o"),
        QStringLiteral("h.pdf") };
    const Ended shown = run(command);
    EXPECT_EQ(shown.status, 0) << shown.errors;
    EXPECT_EQ(shown.errors,
        "pelloric: " + sheet.toStdString()
            + ": left out are 2 hidden rows and 1 hidden column; --hidden takes them, too\n");
    EXPECT_TRUE(has(pdfText("h.pdf"), "nut"));
    EXPECT_FALSE(has(pdfText("h.pdf"), "screw"));
    EXPECT_FALSE(has(pdfText("h.pdf"), "Key"));
    const Ended told = run(command + words("--json"));
    EXPECT_TRUE(has(told.output, "left out are 2 hidden rows and 1 hidden column")) << told.output;
    EXPECT_TRUE(has(told.output, "\"rows\":1"));
    const Ended whole = run(command + words("--hidden"));
    EXPECT_EQ(whole.errors, "");
    EXPECT_TRUE(has(pdfText("h.pdf"), "screw"));
    EXPECT_TRUE(has(pdfText("h.pdf"), "Key"));
}

TEST_F(Program, RefusesALanguageThatItHasNoCatalogueFor)
{
    const Ended refused = run({ "demo", "--walk", "out", "--language", "fi" });
    EXPECT_EQ(refused.status, 2);
    EXPECT_EQ(refused.errors, "pelloric: --language fi: there are de, en, zh_CN, and system\n");
}

TEST_F(Program, ExportsATableAsPdf)
{
    folder_.write("towns.csv", "城市,n\n北京,1\n上海,2\n");
    const Ended ended
        = run(words("export towns.csv -o towns.pdf --title 城市表 --footer-right [Date&Time]"));
    EXPECT_EQ(ended.status, 0) << ended.errors;
    EXPECT_EQ(ended.errors, "");
    const std::string text = pdfText("towns.pdf");
    for (const char* part : { "城市表", "北京", "上海", "1 of 1" })
        EXPECT_TRUE(has(text, part)) << part << " in\n" << text;
}

TEST_F(Program, AppliesTheOptionsOfAReport)
{
    folder_.write("t.csv", "a,b\nx,1\nx,2\n");
    const Ended ended = run(words("export t.csv -o t.png --dpi 100 --paper 100x150mm --landscape "
                                  "--merge --no-headers --font-size 12 --widths 1500,2000"));
    EXPECT_EQ(ended.status, 0) << ended.errors;
    const QImage image(QString::fromStdString(folder_.file("t.png").string()));
    EXPECT_EQ(image.size(), QSize(591, 394));
}

TEST_F(Program, TellsWhichCharactersNoFontHasAndWhichFaceWasTaken)
{
    folder_.write("t.csv", "a\nไทย\n\xF3\xB0\x80\x80\n");
    const Ended ended = run(words("export t.csv -o t.png --font NoSuchFace"));
    EXPECT_EQ(ended.status, 0);
    const std::string taken = qt::QtFonts::resolve(QStringLiteral("NoSuchFace")).toStdString();
    EXPECT_EQ(ended.errors,
        "pelloric: the font NoSuchFace is not installed; " + taken
            + " is taken instead\n"
              "pelloric: 4 characters have no glyph in any installed font and show as hollow boxes "
              "(3 Thai, 1 private); install fonts-noto-core\n");
    folder_.write("u.csv", "a\nÄ 北京\n");
    EXPECT_EQ(run(words("export u.csv -o u.png")).errors, "");
}

TEST_F(Program, RefusesToWriteWithoutAnyFont)
{
    folder_.write("t.csv", "a\n1\n");
    folder_.write("fonts.conf",
        "<?xml version=\"1.0\"?><!DOCTYPE fontconfig SYSTEM \"fonts.dtd\"><fontconfig>"
        "<dir>/nowhere</dir></fontconfig>");
    qputenv("FONTCONFIG_FILE", QByteArray::fromStdString(folder_.file("fonts.conf").string()));
    const Ended ended = run(words("export t.csv -o t.pdf"));
    qunsetenv("FONTCONFIG_FILE");
    EXPECT_EQ(ended.status, 1);
    EXPECT_EQ(ended.errors,
        "pelloric: no font is installed, so no text can be drawn; install fonts-dejavu-core, and "
        "fonts-arphic-uming for Chinese texts\n");
}

TEST_F(Program, ReadsJsonAndSaysWhatItGuessed)
{
    folder_.write("t.json", "[{\"City\":\"Kyoto\",\"n\":1},{\"n\":2.50}]");
    EXPECT_EQ(run(words("export t.json -o t.pdf")).errors, "");
    EXPECT_TRUE(has(pdfText("t.pdf"), "Kyoto"));
    EXPECT_TRUE(has(pdfText("t.pdf"), "2.50"));
    folder_.write("w.csv", "Name;Ort\nM\xFCller;K\xF6ln\nJos\xE9;Caf\xE9\n");
    EXPECT_EQ(run(words("export w.csv -o w.pdf")).errors,
        "pelloric: w.csv: the encoding was guessed to be windows-1252; name another one if letters "
        "look wrong\n");
    EXPECT_TRUE(has(pdfText("w.pdf"), "Müller"));
}

TEST_F(Program, MakesTheSameImagesWithAnyNumberOfJobs)
{
    std::string rows = "n\n";
    for (int row = 0; row < 300; ++row)
        rows += std::to_string(row) + "\n";
    folder_.write("t.csv", rows);
    EXPECT_EQ(run(words("export t.csv -o one.png --dpi 50 --jobs 1")).status, 0);
    EXPECT_EQ(run(words("export t.csv -o many.png --dpi 50 --jobs 3")).status, 0);
    for (int page = 1; page <= 7; ++page) {
        const std::string number = "-00" + std::to_string(page) + ".png";
        EXPECT_EQ(folder_.read("one" + number), folder_.read("many" + number)) << page;
        EXPECT_FALSE(folder_.read("one" + number).empty()) << page;
    }
}

TEST_F(Program, LeavesTheUsersSettingsAlone)
{
    EXPECT_EQ(run(words("settings")).status, 0);
    const std::string before = settings();
    EXPECT_TRUE(has(before, "PagerWidth= 210"));
    folder_.write("t.csv", "a\n1\n");
    EXPECT_EQ(run(words("export t.csv -o t.pdf --paper A3 --title T --font-size 20")).status, 0);
    EXPECT_EQ(settings(), before);
}

TEST_F(Program, ExportsByTheDefaultSettingsUnlessASettingsFileIsNamed)
{
    run(words("settings"));
    std::string left = settings();
    left.replace(left.find("HeaderCenter= "), 14, "HeaderCenter= by another program");
    folder_.write("config/pelloric/OstlConfig.ini", left);
    folder_.write("partial.ini", "HeaderRight= partly\r\n");
    folder_.write("t.csv", "a\n1\n");
    struct Row {
        const char* options;
        bool isOthers;
        bool isPartial;
    };
    const Row rows[] = { { "", false, false }, { " --defaults", false, false },
        { " --settings config/pelloric/OstlConfig.ini", true, false },
        { " --settings partial.ini", false, true } };
    for (const Row& row : rows) {
        const Ended ended
            = run(words((std::string("export t.csv -o t.pdf") + row.options).c_str()));
        EXPECT_EQ(ended.status, 0) << ended.errors;
        const std::string text = pdfText("t.pdf");
        EXPECT_EQ(has(text, "by another program"), row.isOthers) << row.options << '\n' << text;
        EXPECT_EQ(has(text, "partly"), row.isPartial) << row.options << '\n' << text;
        EXPECT_TRUE(has(text, "1 of 1")) << row.options << '\n' << text;
    }
    EXPECT_EQ(settings(), left);
}

TEST_F(Program, TellsOfSettingsByWhichNothingCanBeRead)
{
    folder_.write("t.csv", "a\n1\n");
    folder_.write("small.ini", "FontSize= 0\r\n");
    const Ended ended = run(words("export t.csv -o t.pdf --settings small.ini"));
    EXPECT_EQ(ended.status, 0);
    EXPECT_EQ(ended.errors,
        "pelloric: FontSize= 0 in small.ini: a font size is a number of points above 0, at most "
        "16000.\n");
}

TEST_F(Program, RefusesSettingsThatCannotBeUsed)
{
    folder_.write("t.csv", "a\n1\n");
    folder_.write("bad.ini", "Top= 4000\r\n");
    struct Row {
        const char* arguments;
        int status;
        const char* message;
    };
    const Row rows[] = {
        { "export t.csv -o t.pdf --defaults --settings bad.ini", 2, "not both" },
        { "export t.csv -o t.pdf --settings none.ini", 1, "none.ini" },
        { "export t.csv -o t.pdf --settings t.csv", 1, "t.csv holds no setting" },
        { "export t.csv -o t.pdf --settings bad.ini", 1,
            "Top= 4000 in bad.ini: this margin is at most 361 mm" },
        { "export t.ostl -o t.pdf --defaults", 2, "--defaults does not apply" },
    };
    for (const Row& row : rows) {
        const Ended ended = run(words(row.arguments));
        EXPECT_EQ(ended.status, row.status) << row.arguments;
        EXPECT_TRUE(has(ended.errors, row.message)) << row.arguments << '\n' << ended.errors;
    }
    EXPECT_EQ(folder_.names().size(), 2U);
}

TEST_F(Program, ShowsAndRestoresTheSettings)
{
    const Ended path = run(words("settings --path"));
    EXPECT_EQ(
        path.output, (folder_.file("config") / "pelloric" / "OstlConfig.ini").string() + "\n");
    const Ended shown = run(words("settings"));
    EXPECT_TRUE(shown.output.starts_with("ShowHeaders= 1\n")) << shown.output;
    const std::string before = settings();
    folder_.write("config/pelloric/OstlConfig.ini", "broken");
    const Ended reset = run(words("settings --reset"));
    EXPECT_EQ(reset.status, 0) << reset.errors;
    EXPECT_EQ(settings(), before);
}

TEST_F(Program, ExportsASavedDocument)
{
    folder_.write("t.csv", "a\n北京\n");
    EXPECT_EQ(run(words("export t.csv -o t.ostl")).status, 0);
    EXPECT_EQ(run(words("export t.ostl -o again.ostl")).status, 0);
    EXPECT_EQ(run(words("export t.ostl -o t.pdf")).status, 0);
    EXPECT_TRUE(has(pdfText("t.pdf"), "北京"));
}

TEST_F(Program, ReadsTablesAndQueriesOfADatabase)
{
    QFile::copy(QStringLiteral(PELLORIC_TESTS_DIR "/../samples/samples.sqlite"),
        QString::fromStdString(folder_.file("s.sqlite").string()));
    EXPECT_EQ(run(words("export s.sqlite:countries_zh -o a.pdf --pages 1")).status, 0);
    EXPECT_TRUE(has(pdfText("a.pdf"), "安道尔"));
    const QStringList query { QStringLiteral("export"), QStringLiteral("s.sqlite"),
        QStringLiteral("--query"), QStringLiteral("SELECT count(*) AS total FROM wine"),
        QStringLiteral("-o"), QStringLiteral("b.pdf") };
    EXPECT_EQ(run(query).status, 0);
    EXPECT_TRUE(has(pdfText("b.pdf"), "178"));
    const Ended missing = run(words("export s.sqlite:nothing -o c.pdf"));
    EXPECT_EQ(missing.status, 1);
    EXPECT_EQ(missing.errors,
        "pelloric: s.sqlite: no table nothing; the database has: countries_zh, time_zones, wine\n");
}

TEST_F(Program, ChoosesAndArrangesRowsAndColumns)
{
    QFile::copy(QStringLiteral(PELLORIC_TESTS_DIR "/../samples/wine.csv"),
        QString::fromStdString(folder_.file("w.csv").string()));
    EXPECT_EQ(run(words("export w.csv -o a.pdf --columns Hue,Alcohol --rows 1-2")).status, 0);
    EXPECT_TRUE(has(pdfText("a.pdf"), "14.23"));
    EXPECT_FALSE(has(pdfText("a.pdf"), "Malic"));
    EXPECT_EQ(
        run(words("export w.csv -o b.pdf --columns Class,Hue --total count:Hue --fit")).status, 0);
    EXPECT_TRUE(has(pdfText("b.pdf"), "178"));
    const Ended missing = run(words("export w.csv -o c.pdf --columns Nope"));
    EXPECT_EQ(missing.status, 2);
    EXPECT_NE(missing.errors.find("Nope"), std::string::npos) << missing.errors;
    EXPECT_EQ(run(words("export w.csv -o c.pdf --rows few")).status, 2);
}

TEST_F(Program, ReadsATableWhoseNameHoldsAColon)
{
    {
        QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"));
        database.setDatabaseName(QString::fromStdString(folder_.file("s.sqlite").string()));
        ASSERT_TRUE(database.open());
        EXPECT_TRUE(database.exec(QStringLiteral("create table \"x:y\" (colons)")).isActive());
        database.close();
    }
    QSqlDatabase::removeDatabase(QLatin1String(QSqlDatabase::defaultConnection));
    EXPECT_EQ(run(words("export s.sqlite:x:y -o a.pdf")).status, 0);
    EXPECT_TRUE(has(pdfText("a.pdf"), "colons"));
}

namespace {

struct ErrorCase {
    const char* arguments;
    int status;
    const char* message; ///< what the one line holds
};

} // namespace

TEST_F(Program, ExplainsEveryErrorInOneLine)
{
    folder_.write("t.csv", "a\n1\n");
    folder_.write("one_object.json", "{\n\"rows\": []\n}\n");
    folder_.write("bad_bytes.csv", "a\n\xB3\xC7\xB1");
    folder_.write("empty.csv", "");
    folder_.write("broken.ostl", "nothing");
    folder_.write("kept.pdf", "old");
    folder_.write("table.svg", "a\n1\n");
    folder_.write("large.ostl",
        "##Release2004-10-23\n##Release2004-10-23PageWidth=1e12\n"
        "##Release2004-10-23PageHeight=1\n");
    const ErrorCase cases[] = {
        { "", 2, "pelloric help" },
        { "dance", 2, "no command dance" },
        { "t.csv", 2, "t.csv is a file; say what to do with it: pelloric preview t.csv" },
        { "broken.ostl", 2, "pelloric open broken.ostl" },
        { "export", 2, "an argument is missing" },
        { "export t.csv", 2, "-o OUT" },
        { "export t.csv more.csv -o t.pdf", 2, "more.csv" },
        { "export t.csv -o t.doc", 2, ".pdf, .png, .svg or .ostl" },
        { "export t.csv -o t.pdf --bogus", 2, "bogus" },
        { "export t.csv -o t.pdf --paper Q7", 2, "Q7" },
        { "export t.csv -o t.png --dpi x", 2, "from 10 to 2400" },
        { "export t.csv -o t.ostl --pages 1", 2, "--pages" },
        { "export t.csv -o t.pdf --pages=", 2,
            "--pages takes LIST, not \"\": only these pages: 1" },
        { "print t.csv --pages=", 2, "--pages takes LIST, not \"\": only these pages: 1,3,5-12" },
        { "export t.csv -o t.pdf --margins 9999mm", 2, "of 1 mm or more and at most " },
        { "export t.csv -o t.pdf --landscape --portrait", 2, "not both" },
        { "export missing.csv -o t.pdf", 1, "missing.csv: there is no such file" },
        { "export one_object.json -o kept.pdf", 1, "one_object.json: the file is one object" },
        { "export t.csv -o t.pdf --delimiter xy", 2, "--delimiter" },
        { "export t.csv -o t.pdf --jobs 2", 2, "--jobs is for .png" },
        { "export bad_bytes.csv -o kept.pdf", 1, "line 2: bytes that are neither" },
        { "export empty.csv -o kept.pdf", 1, "empty.csv: the file is empty" },
        { "export t.csv -o kept.pdf --encoding no", 1, "unknown encoding no" },
        { "export t.csv -o kept.pdf --pages 9", 1, "the document has 1" },
        { "export t.csv -o kept.pdf --widths 0", 1, "--widths" },
        { "export t.csv -o kept.pdf --query x", 1, "t.csv is none" },
        { "export t.csv -o missing/t.pdf", 1, "missing/t.pdf; check that the folder exists" },
        { "export table.svg -o table.svg", 1, "table.svg is the file that is read" },
        { "export table.svg -o ./table.svg", 1, "export to another one" },
        { "export /dev/zero -o kept.pdf", 1, "/dev/zero is a device" },
        { "export large.ostl -o kept.pdf", 1, "large.ostl is damaged" },
        { "export broken.ostl -o kept.pdf", 1, "broken.ostl is no document file" },
        { "settings --bogus", 2, "bogus" },
        { "help dance", 2, "no command dance" },
    };
    for (const ErrorCase& row : cases) {
        const Ended ended = run(words(row.arguments));
        EXPECT_EQ(ended.status, row.status) << row.arguments;
        EXPECT_TRUE(ended.errors.starts_with("pelloric: ")) << row.arguments;
        EXPECT_TRUE(has(ended.errors, row.message)) << row.arguments << '\n' << ended.errors;
        const bool tellsUsage = has(ended.errors, "\nusage: pelloric ");
        EXPECT_EQ(std::count(ended.errors.begin(), ended.errors.end(), '\n'), tellsUsage ? 2 : 1)
            << row.arguments;
        EXPECT_EQ(ended.output, "") << row.arguments;
    }
    EXPECT_EQ(folder_.read("kept.pdf"), "old");
    EXPECT_EQ(folder_.read("table.svg"), "a\n1\n");
    EXPECT_EQ(folder_.names().size(), 8U); // the files above
}

TEST_F(Program, SaysHowACommandIsCalledWhereItsArgumentsDoNotFit)
{
    struct Row {
        const char* arguments;
        const char* errors; ///< behind the program's name, up to the advice to ask for help
    };
    const Row rows[] = {
        { "demo t.csv",
            "one argument too many: t.csv; quote names with blanks\n"
            "usage: pelloric demo; for example: pelloric demo" },
        { "preview",
            "an argument is missing\n"
            "usage: pelloric preview FILE; for example: pelloric preview stock.csv" },
        { "open --bogus",
            "Unknown option 'bogus'.\n"
            "usage: pelloric open FILE.ostl; for example: pelloric open stock.ostl" },
        { "export",
            "an argument is missing\nusage: pelloric export FILE... -o OUT; for example: pelloric "
            "export "
            "stock.csv -o stock.pdf" },
        { "export t.csv -o",
            "Missing value after '-o'.\nusage: pelloric export FILE... -o OUT; for example: "
            "pelloric "
            "export stock.csv -o stock.pdf" },
        { "run",
            "say which script to run\nusage: pelloric run SCRIPT.js [ARGUMENT...]; for example: "
            "pelloric run report.js" },
        { "print",
            "an argument is missing\nusage: pelloric print FILE; for example: pelloric print "
            "stock.csv" },
        { "printers x",
            "one argument too many: x; quote names with blanks\n"
            "usage: pelloric printers; for example: pelloric printers" },
        { "settings x",
            "one argument too many: x; quote names with blanks\n"
            "usage: pelloric settings; for example: pelloric settings --path" },
        { "completion",
            "an argument is missing\n"
            "usage: pelloric completion SHELL; for example: pelloric completion bash" },
    };
    for (const Row& row : rows) {
        const QStringList arguments = words(row.arguments);
        const Ended ended = run(arguments);
        EXPECT_EQ(ended.status, 2) << row.arguments;
        EXPECT_EQ(ended.errors,
            std::string("pelloric: ") + row.errors + "; \"pelloric help "
                + arguments.front().toStdString() + "\" says more\n");
    }
}

TEST_F(Program, SpeaksTheLanguageOfTheLocaleExceptToPrograms)
{
    const auto in = [this](const char* locale) {
        surround = [locale](QProcess&, QProcessEnvironment& environment) {
            environment.remove(QStringLiteral("LANGUAGE"));
            environment.insert(QStringLiteral("LC_ALL"), QString::fromLatin1(locale));
        };
    };
    folder_.write("t.csv", "a;b\n1;2\n3\n4;5\n");
    in("de_DE.UTF-8");
    EXPECT_EQ(run(words("export no.csv -o t.pdf")).errors,
        "pelloric: no.csv: diese Datei gibt es nicht\n");
    EXPECT_TRUE(has(run(words("export t.csv -o t.pdf")).errors,
        "pelloric: t.csv: 1 von 3 Zeilen haben nicht so viele Werte wie die Titelzeile"));
    EXPECT_TRUE(
        has(run(words("help export")).output, "--merge                 gleiche Nachbarzellen"));
    EXPECT_TRUE(
        has(run(words("export t.csv -o t.pdf --json")).output, "1 of 3 rows have not as many"));
    folder_.write(
        "t.js", "try { new Sorvane().Currentpage = 'x'; } catch (e) { print(e.message); }");
    EXPECT_TRUE(has(run(words("run t.js")).output, "Type mismatch"));
    in("zh_CN.UTF-8");
    EXPECT_EQ(run(words("export no.csv -o t.pdf")).errors, "pelloric: no.csv：没有这个文件\n");
    for (const char* const other : { "C.UTF-8", "fi_FI.UTF-8", "en_GB.UTF-8" }) {
        in(other);
        EXPECT_EQ(run(words("export no.csv -o t.pdf")).errors,
            "pelloric: no.csv: there is no such file\n")
            << other;
    }
}

TEST_F(Program, SaysOfADamagedDocumentThatItOpensWhatItSaysWhenItExportsIt)
{
    folder_.write("large.ostl",
        "##Release2004-10-23\n##Release2004-10-23PageWidth=1e12\n"
        "##Release2004-10-23PageHeight=1\n");
    surround = [](QProcess&, QProcessEnvironment& environment) {
        environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    };
    for (const char* arguments : { "open large.ostl", "export large.ostl -o t.pdf" }) {
        const Ended ended = run(words(arguments));
        EXPECT_EQ(ended.status, 1) << arguments;
        EXPECT_TRUE(has(ended.errors, "large.ostl is damaged: 1000000000000 is not between "))
            << ended.errors;
        EXPECT_FALSE(has(ended.errors, "shown")) << ended.errors; // for nothing stands before it
    }
}

TEST_F(Program, SaysWhatADocumentFileCannotHold)
{
    std::string rows = "n\n";
    for (int row = 0; row < 12000; ++row)
        rows += "1\n";
    folder_.write("long.csv", rows);
    const Ended ended = run(words("export long.csv -o long.ostl"));
    EXPECT_EQ(ended.status, 0);
    EXPECT_TRUE(has(ended.errors, "a document file holds 131 pages; the last ")) << ended.errors;
}

#if defined(__unix__)

TEST_F(Program, EndsCleanlyWhenInterrupted)
{
    std::string rows = "n,text\n";
    for (int row = 0; row < 300000; ++row)
        rows += "1,some text\n";
    folder_.write("long.csv", rows);
    folder_.write("long.pdf", "old");
    QProcess process;
    start(process, words("export long.csv -o long.pdf"));
    // The file that is being written shows that the work is under way.
    for (int wait = 0; wait < 600 && folder_.names().size() < 3; ++wait)
        process.waitForFinished(50);
    ASSERT_EQ(process.state(), QProcess::Running);
    kill(static_cast<pid_t>(process.processId()), SIGINT);
    const Ended ended = finish(process);
    EXPECT_EQ(ended.status, 130);
    EXPECT_EQ(ended.errors, "");
    EXPECT_EQ(folder_.read("long.pdf"), "old");
    EXPECT_EQ(folder_.names().size(), 2U); // the table and the old file
}

TEST_F(Program, EndsAtOnceDuringAQueryWithoutEnd)
{
    QFile::copy(QStringLiteral(PELLORIC_TESTS_DIR "/../samples/samples.sqlite"),
        QString::fromStdString(folder_.file("s.sqlite").string()));
    QProcess process;
    start(process,
        { QStringLiteral("export"), QStringLiteral("s.sqlite"), QStringLiteral("--query"),
            QStringLiteral("WITH RECURSIVE c(x) AS (SELECT 1 UNION ALL SELECT x + 1 FROM c) "
                           "SELECT count(*) FROM c"),
            QStringLiteral("-o"), QStringLiteral("c.pdf") });
    ASSERT_FALSE(process.waitForFinished(1500));
    kill(static_cast<pid_t>(process.processId()), SIGINT);
    const Ended ended = finish(process);
    EXPECT_EQ(ended.status, 130);
    EXPECT_EQ(ended.errors, "");
    EXPECT_EQ(folder_.names().size(), 1U);
}

TEST_F(Program, SaysInOneLineThatAPictureCannotBeWritten)
{
    folder_.write("t.csv", "a\n1\n");
    std::filesystem::create_symlink("/dev/full", folder_.file("full.png"));
    const Ended ended = run(words("export t.csv -o full.png"));
    EXPECT_EQ(ended.status, 1);
    EXPECT_EQ(ended.errors,
        "pelloric: Disk full: full.png; make room on the disk, or choose another one\n");
}

#endif

TEST_F(Program, TakesTheColumnsAndRowsThatAreAskedForInTheirOrder)
{
    folder_.write("t.csv", "Name,Size,Town\nb,10,Y\na,9,X\nd,x,Y\nc,-1,X\n");
    struct Case {
        const char* options;
        const char* text;
    };
    const Case cases[] = {
        { "--columns Town,Name",
            "TownName"
            "Yb"
            "Xa"
            "Yd"
            "Xc" },
        { "--columns #3,size --rows 2-3",
            "TownSize"
            "X9"
            "Yx" },
        { "--columns Name --sort Size",
            "Name"
            "c"
            "a"
            "b"
            "d" },
        { "--columns Name --sort Size:desc --rows -2",
            "Name"
            "d"
            "b" },
        { "--columns Name --sort Town,Name:desc",
            "Name"
            "c"
            "a"
            "d"
            "b" },
        { "--columns Name --rows 4",
            "Name"
            "c" },
        { "--columns Name --rows 3-",
            "Name"
            "d"
            "c" },
    };
    for (const Case& row : cases) {
        const Ended ended
            = run(words("export t.csv -o t.pdf --footer-center . ") + words(row.options));
        EXPECT_EQ(ended.status, 0) << ended.errors;
        std::string text = pdfText("t.pdf");
        std::erase_if(text, [](char c) { return c == ' ' || c == '\n' || c == '\f'; });
        EXPECT_TRUE(has(text, row.text)) << row.options << ": " << text;
    }
    folder_.write("c.csv", "\"Price, net\",#1,Size 5\"\n7,x,8\n9,y,6\n");
    const Ended quoted = run({ QStringLiteral("export"), QStringLiteral("c.csv"),
        QStringLiteral("-o"), QStringLiteral("c.pdf"), QStringLiteral("--columns"),
        QStringLiteral("\"#1\",\"Price, net\",Size 5\""), QStringLiteral("--sort"),
        QStringLiteral("\"Price, net\":desc"), QStringLiteral("--key-columns"),
        QStringLiteral("\"Price, net\",\"#1\""), QStringLiteral("--group"),
        QStringLiteral("\"Price, net\""), QStringLiteral("--total"),
        QStringLiteral("sum:\"Price, net\",\"max:Price, net\",mean:Size 5\"") });
    EXPECT_EQ(quoted.status, 0) << quoted.errors;
    EXPECT_EQ(run(words("export c.csv -o u.pdf --sort Price")).errors,
        "pelloric: --sort: there is no column \"Price\"; the table has \"Price, net\", #1, Size "
        "5\"\n");
    const std::string listed = pdfText("c.pdf");
    EXPECT_LT(listed.find("Price, net"), listed.find("#1"));
    EXPECT_LT(listed.find('y'), listed.find('x')) << listed;
    EXPECT_TRUE(has(listed, "16")) << listed;
    const Ended unknown = run(words("export t.csv -o u.pdf --columns Nope"));
    EXPECT_EQ(unknown.status, 2);
    EXPECT_EQ(unknown.errors,
        "pelloric: --columns: there is no column \"Nope\"; the table has Name, Size, Town\n");
    EXPECT_EQ(run(words("export t.csv -o u.pdf --rows 5-9")).errors,
        "pelloric: --rows 5-9 names no row; the table has 4\n");
    EXPECT_EQ(run(words("export t.csv -o u.pdf --rows x")).status, 2);
}

TEST_F(Program, TakesPapersAndMarginsInTheUsualUnits)
{
    folder_.write("t.csv", "a\n1\n");
    struct Case {
        const char* paper;
        int width;
        int height;
    };
    const Case cases[] = {
        { "A6", 413, 583 },
        { "tabloid", 1100, 1700 },
        { "10x15cm", 394, 591 },
        { "4x6in", 400, 600 },
        { "4inx150mm", 400, 591 },
        { "100x150", 394, 591 },
    };
    for (const Case& row : cases) {
        const Ended ended
            = run(words("export t.csv -o t.png --dpi 100 --paper") + words(row.paper));
        EXPECT_EQ(ended.status, 0) << ended.errors;
        const QSize size = QImage(QString::fromStdString(folder_.file("t.png").string())).size();
        EXPECT_NEAR(size.width(), row.width, 1) << row.paper;
        EXPECT_NEAR(size.height(), row.height, 1) << row.paper;
    }
    EXPECT_EQ(run(words("export t.csv -o t.pdf --paper 1x1mm")).status, 2);
    EXPECT_EQ(run(words("export t.csv -o t.pdf --margins 10mm,1cm,0.5in,20")).status, 0);
    EXPECT_EQ(run(words("export t.csv -o t.pdf --margins 15mm")).status, 0);
    for (const char* const wrong : { "0", "1,2", "x", "-5", "10mm,10mm,10mm,10mm,10mm" }) {
        const Ended ended = run(words("export t.csv -o t.pdf --margins") + words(wrong));
        EXPECT_EQ(ended.status, 2) << wrong;
        EXPECT_TRUE(has(ended.errors, "--margins takes one length")) << ended.errors;
    }
}

TEST_F(Program, ReadsAndWritesPipes)
{
    QProcess process;
    start(process, words("export - -o - --title Piped --delimiter |"));
    process.write("a|b\n1|2,5\n");
    process.closeWriteChannel();
    ASSERT_TRUE(process.waitForFinished(LongestRun));
    EXPECT_EQ(process.exitCode(), 0);
    EXPECT_EQ(process.readAllStandardError().toStdString(), "");
    folder_.write("piped.pdf", process.readAllStandardOutput().toStdString());
    const std::string text = pdfText("piped.pdf");
    for (const char* const part : { "Piped", "2,5" })
        EXPECT_TRUE(has(text, part)) << text;
    QProcess svg;
    start(svg, words("export - -o - --format svg"));
    svg.write("a\n1\n");
    svg.closeWriteChannel();
    ASSERT_TRUE(svg.waitForFinished(LongestRun));
    EXPECT_TRUE(svg.readAllStandardOutput().contains("<svg"));
}

TEST_F(Program, WritesSeveralInputsIntoAFolderOrOneBehindTheOther)
{
    folder_.write("one.csv", "a\nfirst\n");
    folder_.write("two.csv", "a\nsecond\n");
    std::filesystem::create_directory(folder_.path() / "other");
    folder_.write("other/one.csv", "a\nthird\n");
    EXPECT_EQ(run(words("export one.csv two.csv other/one.csv -o out")).status, 0);
    EXPECT_TRUE(has(pdfText("out/one.pdf"), "first"));
    EXPECT_TRUE(has(pdfText("out/two.pdf"), "second"));
    EXPECT_TRUE(has(pdfText("out/one-2.pdf"), "third"));
    const Ended joined
        = run(words("export one.csv two.csv -o all.pdf --join --footer-center [Page&#]"));
    EXPECT_EQ(joined.status, 0) << joined.errors;
    const std::string text = pdfText("all.pdf");
    EXPECT_LT(text.find("first"), text.find('\f'));
    EXPECT_GT(text.find("second"), text.find('\f'));
    EXPECT_EQ(run(words("export one.csv two.csv -o all.csv --join")).status, 2);
}

TEST_F(Program, TellsInJsonWhatItMadeAndNothingWhenQuiet)
{
    folder_.write("one.csv", "a,b\n1,2\n3,4\n");
    folder_.write("two.csv", "a\n1\n");
    const Ended told = run(words("export one.csv two.csv -o out --json --font Nowhere"));
    EXPECT_EQ(told.status, 0);
    EXPECT_EQ(told.errors, "");
    const QList<QByteArray> lines = QByteArray::fromStdString(told.output).trimmed().split('\n');
    ASSERT_EQ(lines.size(), 2);
    const QJsonObject first = QJsonDocument::fromJson(lines[0]).object();
    EXPECT_EQ(first[QStringLiteral("pages")].toInt(), 1);
    EXPECT_EQ(first[QStringLiteral("rows")].toInt(), 2);
    EXPECT_EQ(first[QStringLiteral("columns")].toInt(), 2);
    EXPECT_EQ(first[QStringLiteral("bands")].toInt(), 1);
    EXPECT_EQ(first[QStringLiteral("input")].toString(), "one.csv");
    EXPECT_TRUE(first[QStringLiteral("file")].toString().endsWith(QStringLiteral("one.pdf")));
    EXPECT_TRUE(first[QStringLiteral("warnings")].toArray().at(0).toString().contains(
        QStringLiteral("Nowhere is not installed")));
    const Ended quiet = run(words("export one.csv -o q.pdf --quiet --font Nowhere"));
    EXPECT_EQ(quiet.status, 0);
    EXPECT_EQ(quiet.output + quiet.errors, "");
    const Ended wrong = run(words("export missing.csv -o q.pdf --quiet"));
    EXPECT_EQ(wrong.status, 1);
    EXPECT_TRUE(has(wrong.errors, "missing.csv"));
}

TEST_F(Program, AddsUpNumbersAsTheTableShowsThemInEveryLocale)
{
    folder_.write("points.csv", "Name,Price\nx,12.50\ny,12.50\nz,\"1,234.50\"\n");
    folder_.write("commas.csv", "Name;Price\nx;12,50\ny;n/a\nz;1.234,50\n");
    for (const char* const locale : { "C", "de_DE.UTF-8", "en_US.UTF-8" }) {
        surround = [locale](QProcess&, QProcessEnvironment& environment) {
            environment.insert(QStringLiteral("LC_ALL"), QString::fromLatin1(locale));
        };
        const Ended points = run(words("export points.csv -o p.pdf --total sum:Price"));
        EXPECT_EQ(points.status, 0) << points.errors;
        EXPECT_EQ(points.errors, "");
        EXPECT_TRUE(has(pdfText("p.pdf"), "1,259.50")) << locale << pdfText("p.pdf");
        const bool isGerman = std::string_view(locale).starts_with("de");
        const char* const name = isGerman ? "Gesamt: Summe" : "Total: Sum";
        EXPECT_TRUE(has(pdfText("p.pdf"), name)) << "in one line";
        run(words("export points.csv -o s.pdf --sort Price:desc --columns Name"));
        EXPECT_LT(pdfText("s.pdf").find('z'), pdfText("s.pdf").find('x')) << locale;
        const Ended commas
            = run(words("export commas.csv -o c.pdf --total sum:Price --delimiter ; --json --fit"));
        EXPECT_TRUE(has(pdfText("c.pdf"), name)) << "though what is told is English";
        EXPECT_TRUE(has(pdfText("c.pdf"), "1.247,00")) << locale << pdfText("c.pdf");
        const QJsonObject told
            = QJsonDocument::fromJson(QByteArray::fromStdString(commas.output)).object();
        EXPECT_EQ(told[QStringLiteral("warnings")].toArray().at(0).toString(),
            QStringLiteral("the total of Price leaves out 1 cell, being no numbers"));
        EXPECT_EQ(told[QStringLiteral("fit")].toString(), QStringLiteral("as is"));
        EXPECT_EQ(told[QStringLiteral("bands")].toInt(), 1);
    }
    run(words("export points.csv -o z.pdf --total mean:Price --language zh_CN"));
    EXPECT_TRUE(has(pdfText("z.pdf"), "总计: 平均值")) << pdfText("z.pdf");
}

TEST_F(Program, TakesQuotationMarksForWhatTheyAreWhenAsked)
{
    folder_.write("q.csv", "a;b\n\"1\" x;2\"\n");
    const Ended ended = run(words("export q.csv -o q.pdf --delimiter ; --no-quote"));
    EXPECT_EQ(ended.status, 0) << ended.errors;
    EXPECT_TRUE(has(pdfText("q.pdf"), "\"1\" x"));
    EXPECT_EQ(run(words("export q.csv -o q.pdf --delimiter ab")).status, 2);
}

TEST_F(Program, CompletesItsCommandsAndOptionsInBash)
{
    const std::string file = folder_.file("pelloric.bash").string();
    folder_.write("pelloric.bash", run(words("completion bash")).output);
    const auto completed = [&](const QString& typed) {
        QProcess bash;
        bash.start(QStringLiteral("bash"),
            { QStringLiteral("-c"),
                QStringLiteral("cd %1; . ./pelloric.bash; COMP_WORDS=(%2); "
                               "COMP_CWORD=$((${#COMP_WORDS[@]} - 1)); _pelloric; "
                               "printf '%s ' \"${COMPREPLY[@]}\"")
                    .arg(QString::fromStdString(folder_.path().string()), typed) });
        bash.waitForFinished();
        return bash.readAllStandardOutput().trimmed().toStdString();
    };
    EXPECT_EQ(completed(QStringLiteral("pelloric ex")), "export");
    EXPECT_EQ(completed(QStringLiteral("pelloric export --head")),
        "--header-left --header-center --header-right");
    EXPECT_EQ(completed(QStringLiteral("pelloric export pell")), "pelloric.bash");
    EXPECT_EQ(completed(QStringLiteral("pelloric completion z")), "zsh");
}

TEST_F(Program, WritesItsManualInTheLanguageOfTheLocale)
{
    struct Row {
        const char* locale;
        const char* headings;
        const char* status;
    };
    const Row rows[] = {
        { "C.UTF-8", "NAME|SYNOPSIS|DESCRIPTION|COMMANDS|\"EXIT STATUS\"|FILES|",
            ".TP\n0\nEverything was done.\n" },
        { "de_DE.UTF-8", "BEZEICHNUNG|ÜBERSICHT|BESCHREIBUNG|BEFEHLE|EXIT-STATUS|DATEIEN|",
            ".TP\n0\nAlles " },
        { "zh_CN.UTF-8", "名称|概述|描述|命令|退出状态|文件|", ".TP\n0\n一切都已完成。\n" },
    };
    for (const Row& row : rows) {
        surround = [&row](QProcess&, QProcessEnvironment& environment) {
            environment.remove(QStringLiteral("LANGUAGE"));
            environment.insert(QStringLiteral("LC_ALL"), QString::fromLatin1(row.locale));
        };
        const Ended ended = run(words("help --man"));
        std::string headings;
        std::istringstream lines(ended.output);
        for (std::string line; std::getline(lines, line);) {
            if (line.starts_with(".SH "))
                headings += line.substr(4) + "|";
        }
        EXPECT_EQ(QString::fromStdString(headings).remove(u'\\').toStdString(), row.headings);
        EXPECT_TRUE(has(ended.output, row.status)) << row.locale;
        EXPECT_FALSE(has(ended.output, "\n\n")) << "an empty line is a gap in the page";
    }
}

TEST_F(Program, NamesEveryOptionInItsManualAndCompletions)
{
    const std::string manual = run(words("help --man")).output;
    const std::string zsh = run(words("completion zsh")).output;
    const std::string fish = run(words("completion fish")).output;
    EXPECT_TRUE(manual.starts_with(".TH PELLORIC 1"));
    int options = 0;
    for (const QString& command : words("demo preview export print printers settings")) {
        const QString help
            = QString::fromStdString(run({ QStringLiteral("help"), command }).output);
        for (const QString& line : help.split(QLatin1Char('\n'))) {
            if (!line.startsWith(QStringLiteral("  -")))
                continue;
            ++options;
            std::string name = line.trimmed().section(QLatin1Char(' '), 0, 0).toStdString();
            EXPECT_TRUE(has(zsh, "'" + name + "[")) << name;
            const std::size_t start = name.find_first_not_of('-');
            EXPECT_TRUE(has(fish, (start == 1 ? " -s " : " -l ") + name.substr(start) + " "))
                << name;
            for (std::size_t at = 0; (at = name.find('-', at)) != std::string::npos; at += 2)
                name.insert(at, "\\");
            EXPECT_TRUE(has(manual, "\\fB" + name + "\\fR")) << name;
        }
    }
    EXPECT_GT(options, 40);
    EXPECT_EQ(run(words("completion tcsh")).status, 2);
}

} // namespace pelloric::qt
