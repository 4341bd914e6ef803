// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "apps/qt/program.h"

#include <algorithm>

namespace pelloric::qt {

namespace {

/// A call of the program that cannot be done.
struct Refused {
    QStringList arguments;
    int status;
    const char* message; ///< what the first line says behind the program's name
};

/// Only the errors of what the options ask for; each is told before anything is written.
class ProgramErrors : public Program {
protected:
    /// @param options  behind "export t.csv -o t.pdf"
    static QStringList exported(const char* options)
    {
        return words("export t.csv -o t.pdf") + words(options);
    }

    void expectRefusals(const std::vector<Refused>& rows)
    {
        for (const Refused& row : rows) {
            const Ended ended = run(row.arguments);
            const std::string call = row.arguments.join(QLatin1Char(' ')).toStdString();
            EXPECT_EQ(ended.status, row.status) << call;
            EXPECT_EQ(ended.errors.substr(0, ended.errors.find('\n')),
                std::string("pelloric: ") + row.message)
                << call;
            EXPECT_EQ(ended.output, "") << call;
        }
    }
};

} // namespace

TEST_F(ProgramErrors, NameTheOptionAndWhatItTakes)
{
    folder_.write("t.csv", "a\n1\n");
    expectRefusals({
        { {}, 2,
            "say what to do, for example \"pelloric export table.csv -o table.pdf\"; see "
            "\"pelloric help\"" },
        { words("completion tcsh"), 2, "no completion for the shell tcsh; take bash, zsh or fish" },
        { words("export t.csv t.csv -o u.pdf"), 2,
            "t.csv is one input more; several go into a folder, or with --join into one file, and "
            "u.pdf is no folder; quote names with blanks" },
        { words("export t.csv -o t.ostl --pages 1"), 2,
            "--pages is for .pdf, .png and .svg; a document file holds all" },
        { exported("--widths 1,2"), 2, "--widths names 2 columns; the table has 1" },
        { exported("--widths 0"), 1,
            "no column is wide enough to be printed; give other --widths" },
        { exported("--paper Q7"), 2,
            "unknown paper \"Q7\"; take one of Letter, Tabloid, Legal, A3, A4, A5, B5, A2, A6, 8k, "
            "16k, "
            "or a size such as 100x150mm or 4x6in" },
        { words("export t.csv"), 2, "say where to export to: -o OUT.pdf, .png, .svg or .ostl" },
        { words("export t.csv -o out/ --format doc"), 2,
            "--format takes pdf, png, svg or ostl, not \"doc\"" },
        { exported("--dpi 100"), 2, "--dpi is for .png images" },
        { exported("--jobs 2"), 2, "--jobs is for .png images" },
        { words("export t.csv -o t.png --tagged"), 2, "--tagged is for .pdf files" },
        { words("export t.csv -o - --json"), 2, "-o - and --json both want the standard output" },
        { exported("--paper 1x1mm"), 2, "--paper takes lengths from 30 to 2000 mm, not \"1x1mm\"" },
        { exported("--landscape --portrait"), 2,
            "take either --landscape or --portrait, not both" },
        { exported("--defaults --settings s.ini"), 2,
            "take either --defaults or --settings, not both" },
        { exported("--group ,,"), 2, "--group names no column, only \",,\"" },
        { exported("--total ,"), 2, "--total names no column, only \",\"" },
        { exported("--key-columns ,"), 2, "--key-columns names no column, only \",\"" },
        { exported("--total a"), 2,
            "--total takes sum, count, mean, min or max, a colon and a column, such as sum:Price, "
            "not \"a\"" },
        { exported("--logo t.csv --logo-at top"), 2,
            "--logo-at takes left, center or right, not \"top\"" },
        { exported("--opacity 5"), 2,
            "--opacity says something about --watermark, which is not given" },
        { exported("--watermark a --watermark-image b"), 2,
            "--watermark and --watermark-image exclude each other" },
        { exported("--where a"), 2, "--where takes a column, \"=\" and a text, not \"a\"" },
        { exported("--rows few"), 2, "--rows takes a range such as 1-100, not \"few\"" },
        { exported("--delimiter xy"), 2,
            "--delimiter takes one ASCII character, or \"tab\", not \"xy\"" },
    });
    EXPECT_EQ(folder_.names(), std::vector<std::string> { "t.csv" });
}

/// What a script puts there from a variable that is not set.
TEST_F(ProgramErrors, RefuseOptionsWhoseValueSaysNothing)
{
    folder_.write("t.csv", "a\n1\n");
    const auto empty = [](const char* option) {
        return words("export t.csv -o t.pdf") << QString::fromLatin1(option) << QString();
    };
    expectRefusals({
        { empty("--group"), 2,
            "--group takes NAME,..., not \"\": rows with equal texts in these columns stay on one "
            "page" },
        { empty("--total"), 2,
            "--total takes F:NAME,..., not \"\": totals of columns; F is sum, count, mean, min or "
            "max" },
        { empty("--language"), 2,
            "--language takes TAG, not \"\": of the texts of a .pdf file: zh-CN (the locale's)" },
        { empty("--encoding"), 2,
            "--encoding takes NAME, not \"\": of a text file; else found out" },
        { empty("--query"), 2,
            "--query takes SQL, not \"\": what to take of a database: a SELECT statement" },
        { empty("--watermark"), 2,
            "--watermark takes TEXT, not \"\": a faint text across every page" },
        { empty("--watermark-image"), 2,
            "--watermark-image takes FILE, not \"\": a faint picture in the middle of every page" },
        { empty("--logo"), 2, "--logo takes FILE, not \"\": a picture at the top of every page" },
        { empty("--font"), 2, "--font takes NAME, not \"\": the face of all texts" },
        { empty("--delimiter"), 2, "--delimiter takes one ASCII character, or \"tab\", not \"\"" },
        { words("export t.csv -o t.pdf --font") << QStringLiteral("  "), 2,
            "--font takes NAME, not \"  \": the face of all texts" },
        { words("print t.csv --printer") << QString(), 2,
            "--printer takes NAME, not \"\": where to: a name of \"pelloric printers\" (the "
            "current "
            "one)" },
    });
    EXPECT_EQ(folder_.names(), std::vector<std::string> { "t.csv" });
    const Ended ended = run(empty("--header-center") + words("--title") << QString());
    EXPECT_EQ(ended.status, 0) << ended.errors; // a page may have no texts
}

TEST_F(ProgramErrors, NameTheFileAndWhatItIsNot)
{
    folder_.write("t.csv", "a\n1\n");
    folder_.write("plain", "");
    folder_.write("t.sqlite", "SQLite format 3");
    std::string rows = "a\n";
    for (int row = 0; row < 200; ++row)
        rows += "1\n";
    folder_.write("two-pages.csv", rows);
    folder_.write("no.ini", "a=1\n");
    folder_.write("large.ini", std::string((16U << 20U) + 1, '\n'));
    std::filesystem::create_directory(folder_.file("folder"));
    folder_.write("wide.ini", "\"\r\nTop= 4000\r\n\"\r\n");
    for (const char* const call :
        { "export t.csv -o t.ostl", "export t.csv -o a5.ostl --paper A5" })
        ASSERT_EQ(run(words(call)).status, 0) << call;
    expectRefusals({
        { words("export t.ostl -o u.pdf --merge"), 2,
            "--merge does not apply to a saved document, whose pages are laid out" },
        { words("export t.sqlite -o u.pdf --encoding UTF-8"), 2,
            "--encoding is for CSV and TSV files, not databases" },
        { words("export t.sqlite:a -o u.pdf --query select"), 2,
            "take either a table or --query, not both" },
        { words("export t.csv -o u.pdf --settings wide.ini"), 1,
            "Top= 4000 in wide.ini: this margin is at most 361 mm. Correct it in the file, or do "
            "without: --defaults" },
        { words("export t.csv -o u.pdf --settings no.ini"), 1,
            "no.ini holds no setting; \"pelloric settings --path\" names yours" },
        { words("export t.csv -o u.pdf --settings large.ini"), 1,
            "large.ini holds more than 16777216 bytes; settings files are smaller" },
        { words("export folder -o u.pdf"), 1, "folder is a folder; name a file in it" },
        { words("export /dev/null -o u.pdf"), 1, "/dev/null is a device; name a file" },
        { words("export t.ostl t.csv --join -o u.pdf --paper A5"), 2,
            "--paper does not apply to a saved document, whose pages are laid out" },
        { words("export t.ostl a5.ostl --join -o u.pdf"), 1,
            "a5.ostl has pages of another size; --join wants one size" },
        { words("preview t.ostl"), 2,
            "t.ostl is a saved document; show it with \"pelloric open\"" },
        { words("preview t.csv"), 1,
            "there is no display to show windows on; \"pelloric export\" and \"pelloric demo "
            "--walk OUT\" need none" },
        { words("export two-pages.csv -o - --format svg"), 2,
            "several pages as .svg do not go into one output; name a file, or a page with "
            "--pages" },
        { words("demo --walk out --samples folder"), 1,
            "folder/wine.csv cannot be read; name the folder of the samples with "
            "--samples" },
        { words("export t.csv:a -o u.pdf"), 1,
            "t.csv is no SQLite database and no office file, so it has no table \"a\"" },
        { words("export t.csv t.csv -o plain/out/"), 1,
            "plain/out/: the folder cannot be made: Not a directory" },
        { words("demo --walk plain/out"), 1,
            "plain/out: the folder cannot be made: Not a directory" },
    });
    EXPECT_EQ(folder_.names().size(), 10U);
}

TEST_F(ProgramErrors, NameTheFolderOfTemporaryFiles)
{
    folder_.write("t.csv", "a\n1\n");
    surround = [](QProcess&, QProcessEnvironment& environment) {
        environment.insert(QStringLiteral("TMPDIR"), QStringLiteral("/proc"));
    };
    for (const char* const call : { "export t.csv -o -", "demo --walk out" }) {
        const Ended ended = run(words(call));
        EXPECT_EQ(ended.status, 1) << call;
        EXPECT_TRUE(has(ended.errors, "; check the folder of temporary files\n")) << ended.errors;
    }
}

} // namespace pelloric::qt
