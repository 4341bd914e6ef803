// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "apps/qt/program.h"

#include <QElapsedTimer>
#include <QThread>

#include <gmock/gmock.h>

#if defined(__unix__)

#include <signal.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <algorithm>
#include <array>
#include <memory>
#include <random>

namespace pelloric::qt {

namespace {

constexpr int Kills = 100; ///< of each writer
constexpr int AtOnce = 10; ///< programs that run side by side

std::string table(int rows)
{
    std::string text = "number,text\n";
    for (int row = 0; row < rows; ++row)
        text += std::to_string(row) + ",some text of a row\n";
    return text;
}

/// Bounds a resource of the program.
void limit(QProcess& process, int resource, rlim_t most)
{
    process.setChildProcessModifier([resource, most] {
        const rlimit bound { most, most };
        setrlimit(static_cast<__rlimit_resource>(resource), &bound);
    });
}

/// Whose rights hold for a user who is no administrator.
void becomeNobody(QProcess& process)
{
    process.setChildProcessModifier([] {
        constexpr uid_t Nobody = 65534;
        if (geteuid() == 0 && (setgid(Nobody) != 0 || setuid(Nobody) != 0))
            _exit(99);
    });
}

/// Runs the program in bad surroundings.
class ProgramFaults : public Program {
protected:
    /// Kills programs at random moments of the time that one of them takes.
    /// @param begin  starts the program with a number in its hands
    void killAtRandom(const std::function<void(QProcess& process, int number)>& begin)
    {
        QElapsedTimer clock;
        clock.start();
        QProcess whole;
        begin(whole, Kills);
        ASSERT_EQ(finish(whole).status, 0);
        const auto longest = static_cast<int>(clock.elapsed());
        std::minstd_rand random(20041023);
        for (int first = 0; first < Kills; first += AtOnce) {
            std::vector<std::unique_ptr<QProcess>> processes;
            std::vector<int> moments;
            for (int number = first; number < first + AtOnce; ++number) {
                processes.push_back(std::make_unique<QProcess>());
                begin(*processes.back(), number);
                moments.push_back(static_cast<int>(random() % static_cast<unsigned>(2 * longest)));
            }
            std::ranges::sort(moments);
            clock.restart();
            for (std::size_t at = 0; at < processes.size(); ++at) {
                while (clock.elapsed() < moments[at])
                    QThread::msleep(1);
                processes[at]->kill();
            }
            for (const auto& process : processes)
                process->waitForFinished(LongestRun);
        }
    }

    void runIn(const char* configuration)
    {
        surround = [configuration](QProcess&, QProcessEnvironment& environment) {
            environment.insert(QStringLiteral("HOME"), QString::fromLatin1(configuration));
            environment.insert(
                QStringLiteral("XDG_CONFIG_HOME"), QString::fromLatin1(configuration));
        };
    }

    std::vector<std::string> sortedNames() const
    {
        std::vector<std::string> names = folder_.names();
        std::ranges::sort(names);
        return names;
    }
};

/// A kind of file and how it ends when it is whole.
struct Writer {
    const char* ending;
    const char* end;
};

constexpr auto Writers = std::to_array<Writer>({ { "pdf", "%%EOF\n" }, { "ostl", "\"\r\n" },
    { "svg", "</svg>\n" }, { "png", "IEND\xAE\x42\x60\x82" } });

} // namespace

TEST_F(ProgramFaults, LeaveTheOldFileOrAWholeNewOneWhenTheProgramIsKilled)
{
    folder_.write("t.csv", table(40));
    for (const Writer& writer : Writers) {
        const auto target
            = [&](int number) { return "k" + std::to_string(number) + "." + writer.ending; };
        for (int number = 0; number <= Kills; ++number)
            folder_.write(target(number), "old");
        killAtRandom([&](QProcess& process, int number) {
            start(process, words(("export t.csv -o " + target(number)).c_str()));
        });
        int replaced = 0;
        for (int number = 0; number < Kills; ++number) {
            const std::string bytes = folder_.read(target(number));
            replaced += bytes == "old" ? 0 : 1;
            EXPECT_TRUE(bytes == "old" || bytes.ends_with(writer.end)) << target(number);
            std::filesystem::remove(folder_.file(target(number)));
        }
        RecordProperty(writer.ending, replaced);
        EXPECT_EQ(run(words(("export t.csv -o " + target(Kills)).c_str())).status, 0);
        std::filesystem::remove(folder_.file(target(Kills)));
        EXPECT_THAT(sortedNames(), testing::ElementsAre("t.csv")) << writer.ending;
    }
}

TEST_F(ProgramFaults, LeaveOldOrNewSettingsWhenTheProgramIsKilled)
{
    const std::string old = "\"\r\nTop= 12\r\n\"\r\n";
    std::string whole;
    const auto home = [&](int number) { return folder_.file("home" + std::to_string(number)); };
    for (int number = 0; number <= Kills; ++number) {
        std::filesystem::create_directories(home(number) / "pelloric");
        folder_.write("home" + std::to_string(number) + "/pelloric/OstlConfig.ini", old);
    }
    killAtRandom([&](QProcess& process, int number) {
        surround = [&](QProcess&, QProcessEnvironment& environment) {
            environment.insert(
                QStringLiteral("XDG_CONFIG_HOME"), QString::fromStdString(home(number).string()));
        };
        start(process, words("settings --reset"));
    });
    whole = TempFolder::bytesOf(home(Kills) / "pelloric" / "OstlConfig.ini");
    EXPECT_TRUE(whole.ends_with("FooterRight= \r\n\"\r\n")) << whole;
    for (int number = 0; number < Kills; ++number) {
        const std::string bytes = TempFolder::bytesOf(home(number) / "pelloric" / "OstlConfig.ini");
        EXPECT_TRUE(bytes == old || bytes == whole) << bytes;
    }
}

TEST_F(ProgramFaults, LeaveOneWholeFileWhenSeveralProgramsWriteItAtOnce)
{
    folder_.write("t.csv", table(40));
    for (const Writer& writer : Writers) {
        const std::string target = std::string("same.") + writer.ending;
        std::vector<std::unique_ptr<QProcess>> processes;
        for (int number = 0; number < 8; ++number) {
            processes.push_back(std::make_unique<QProcess>());
            start(*processes.back(), words(("export t.csv -o " + target).c_str()));
        }
        for (const auto& process : processes) {
            const Ended ended = finish(*process);
            EXPECT_EQ(ended.status, 0) << ended.errors;
        }
        EXPECT_TRUE(folder_.read(target).ends_with(writer.end)) << target;
        std::filesystem::remove(folder_.file(target));
        EXPECT_THAT(sortedNames(), testing::ElementsAre("t.csv")) << writer.ending;
    }
}

TEST_F(ProgramFaults, KeepTheOldFileWhenTheDiskIsFull)
{
    folder_.write("t.csv", table(30)); // one page
    surround = [](QProcess& process, QProcessEnvironment&) { limit(process, RLIMIT_FSIZE, 3000); };
    for (const Writer& writer : Writers) {
        const std::string target = std::string("kept.") + writer.ending;
        folder_.write(target, "old");
        const Ended ended = run(words(("export t.csv -o " + target).c_str()));
        EXPECT_EQ(ended.status, 1) << target;
        EXPECT_TRUE(ended.errors.starts_with("pelloric: Disk full: ")) << ended.errors;
        EXPECT_TRUE(has(ended.errors, target)) << ended.errors;
        EXPECT_EQ(folder_.read(target), "old");
        std::filesystem::remove(folder_.file(target));
        EXPECT_THAT(sortedNames(), testing::ElementsAre("t.csv")) << writer.ending;
    }
}

TEST_F(ProgramFaults, TellOfADeviceThatIsFull)
{
    folder_.write("t.csv", table(4));
    std::filesystem::create_symlink("/dev/full", folder_.file("full.pdf"));
    const Ended ended = run(words("export t.csv -o full.pdf"));
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(has(ended.errors, "full.pdf")) << ended.errors;
    EXPECT_EQ(std::count(ended.errors.begin(), ended.errors.end(), '\n'), 1) << ended.errors;
}

TEST_F(ProgramFaults, LetReportsBeMadeWithoutAHomeFolder)
{
    runIn("/proc/no-such-home");
    folder_.write("t.csv", table(4));
    folder_.write("s.js", "print('done')\n");
    const Ended exported = run(words("export t.csv -o t.pdf"));
    EXPECT_EQ(exported.status, 0);
    EXPECT_EQ(exported.errors, "");
    const Ended script = run(words("run s.js"));
    EXPECT_EQ(script.status, 0);
    EXPECT_EQ(script.output, "done\n");
    EXPECT_TRUE(has(script.errors, "/proc/no-such-home/pelloric/OstlConfig.ini")) << script.errors;
    const Ended settings = run(words("settings"));
    EXPECT_EQ(settings.status, 1);
    EXPECT_TRUE(has(settings.errors, "/proc/no-such-home/pelloric/OstlConfig.ini"));
    EXPECT_THAT(sortedNames(), testing::ElementsAre("s.js", "t.csv", "t.pdf"));
}

TEST_F(ProgramFaults, LetReportsBeMadeInAHomeFolderThatCannotBeWritten)
{
    namespace fs = std::filesystem;
    folder_.write("t.csv", table(4));
    fs::permissions(folder_.path(), fs::perms::all);
    fs::create_directory(folder_.file("home"));
    fs::permissions(folder_.file("home"), fs::perms::others_read | fs::perms::others_exec);
    surround = [this](QProcess& process, QProcessEnvironment& environment) {
        const QString home = QString::fromStdString(folder_.file("home").string());
        environment.insert(QStringLiteral("HOME"), home);
        environment.insert(QStringLiteral("XDG_CONFIG_HOME"), home);
        becomeNobody(process);
    };
    const Ended exported = run(words("export t.csv -o t.pdf"));
    EXPECT_EQ(exported.status, 0) << exported.errors;
    const Ended reset = run(words("settings --reset"));
    EXPECT_EQ(reset.status, 1);
    EXPECT_TRUE(has(reset.errors, "home/pelloric/OstlConfig.ini")) << reset.errors;
    EXPECT_TRUE(fs::is_empty(folder_.file("home")));
    EXPECT_THAT(sortedNames(), testing::ElementsAre("home", "t.csv", "t.pdf"));
}

TEST_F(ProgramFaults, TellRightsThatAreMissingFromAFullDisk)
{
    namespace fs = std::filesystem;
    folder_.write("t.csv", table(4));
    folder_.write("kept.pdf", "old");
    fs::permissions(folder_.file("kept.pdf"), fs::perms::others_read);
    surround = [](QProcess& process, QProcessEnvironment&) { becomeNobody(process); };
    const Ended ended = run(words("export t.csv -o kept.pdf"));
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(ended.errors.starts_with("pelloric: Permission denied: ")) << ended.errors;
    EXPECT_TRUE(has(ended.errors, "kept.pdf")) << ended.errors;
    EXPECT_EQ(folder_.read("kept.pdf"), "old");
    EXPECT_THAT(sortedNames(), testing::ElementsAre("kept.pdf", "t.csv"));
}

TEST_F(ProgramFaults, NameAFileThatMayNotBeRead)
{
    namespace fs = std::filesystem;
    fs::permissions(folder_.path(), fs::perms::all);
    folder_.write("secret.csv", table(4));
    fs::permissions(folder_.file("secret.csv"), fs::perms::none);
    surround = [](QProcess& process, QProcessEnvironment&) { becomeNobody(process); };
    const Ended ended = run(words("export secret.csv -o t.pdf"));
    EXPECT_EQ(ended.status, 1);
    EXPECT_EQ(ended.errors, "pelloric: secret.csv: you may not read this file\n");
    EXPECT_THAT(sortedNames(), testing::ElementsAre("secret.csv"));
}

TEST_F(ProgramFaults, FollowLinksToTheFilesThatTheyName)
{
    namespace fs = std::filesystem;
    folder_.write("t.csv", table(4));
    folder_.write("present.pdf", "old");
    fs::create_symlink("present.pdf", folder_.file("link.pdf"));
    fs::create_symlink("new.pdf", folder_.file("dangling.pdf"));
    fs::create_symlink("loop.pdf", folder_.file("loop.pdf"));
    for (const char* link : { "link.pdf", "dangling.pdf" }) {
        const Ended ended = run({ "export", "t.csv", "-o", link });
        EXPECT_EQ(ended.status, 0) << ended.errors;
        EXPECT_TRUE(fs::is_symlink(folder_.file(link))) << link;
    }
    EXPECT_TRUE(folder_.read("present.pdf").ends_with("%%EOF\n"));
    EXPECT_TRUE(folder_.read("new.pdf").ends_with("%%EOF\n"));
    const Ended ended = run(words("export t.csv -o loop.pdf"));
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(has(ended.errors, "loop.pdf is a link that leads to no file")) << ended.errors;
    EXPECT_TRUE(fs::is_symlink(folder_.file("loop.pdf")));
    EXPECT_EQ(folder_.names().size(), 6U);
}

TEST_F(ProgramFaults, ReadAndWriteFilesWhoseNamesAreNoText)
{
    folder_.write("n\xFF.csv", "a\n1\n");
    const auto command = [this](const std::string& arguments) {
        QProcess shell;
        shell.setProcessEnvironment(surroundings());
        shell.setWorkingDirectory(QString::fromStdString(folder_.path().string()));
        folder_.write("run.sh", "'" PELLORIC_PROGRAM "' " + arguments + "\n");
        shell.start(QStringLiteral("sh"), { QStringLiteral("run.sh") });
        return finish(shell);
    };
    for (const Writer& writer : Writers) {
        const std::string target = std::string("o\xFE.") + writer.ending;
        const Ended ended = command("export n\xFF.csv -o " + target);
        EXPECT_EQ(ended.status, 0) << ended.errors;
        EXPECT_TRUE(folder_.read(target).ends_with(writer.end)) << target;
    }
    EXPECT_EQ(command("export o\xFE.ostl -o again.pdf").status, 0);
    EXPECT_EQ(folder_.names().size(), 7U); // and the script
}

/// A place for the temporary files of the program, which must be empty behind it.
class Pipes : public ProgramFaults {
protected:
    Pipes()
    {
        namespace fs = std::filesystem;
        fs::create_directory(folder_.file("tmp"));
        // Without one, the toolkit makes itself a folder beside the temporary files.
        fs::create_directory(folder_.file("runtime"));
        fs::permissions(folder_.file("runtime"), fs::perms::owner_all);
        surround = [this](QProcess& process, QProcessEnvironment& environment) {
            environment.insert(
                QStringLiteral("TMPDIR"), QString::fromStdString(folder_.file("tmp").string()));
            environment.insert(QStringLiteral("XDG_RUNTIME_DIR"),
                QString::fromStdString(folder_.file("runtime").string()));
            if (most > 0)
                limit(process, RLIMIT_FSIZE, most);
        };
    }

    ~Pipes() override
    {
        for (const auto& left : std::filesystem::directory_iterator(folder_.file("tmp")))
            ADD_FAILURE() << left.path().string() << " was left";
    }

    /// Runs a line of the shell in which $P is the program.
    Ended shell(const std::string& line)
    {
        QProcess process;
        QProcessEnvironment environment = surroundings();
        environment.insert(QStringLiteral("P"), QStringLiteral(PELLORIC_PROGRAM));
        surround(process, environment);
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(QString::fromStdString(folder_.path().string()));
        process.start(QStringLiteral("bash"), { QStringLiteral("-c"), line.c_str() });
        return finish(process);
    }

    /// Starts the program, which will wait or work for ever, and has it ended by Ctrl+C.
    /// @return  milliseconds from the signal to the program's end
    qint64 interrupted(const QStringList& arguments, const QString& input = {})
    {
        QProcess process;
        if (!input.isEmpty())
            process.setStandardInputFile(input);
        start(process, arguments);
        EXPECT_FALSE(process.waitForFinished(1500)) << process.readAllStandardError().toStdString();
        QElapsedTimer clock;
        clock.start();
        kill(static_cast<pid_t>(process.processId()), SIGINT);
        const Ended ended = finish(process);
        EXPECT_EQ(ended.status, 130) << ended.errors;
        EXPECT_EQ(ended.errors, "");
        return clock.elapsed();
    }

    rlim_t most = 0; ///< bytes that a file may hold; 0: no limit
};

TEST_F(Pipes, ThatHaveNoEndAreRefusedWhereNothingMoreFits)
{
    most = 8U << 20U;
    for (const char* line : { "yes | $P export - -o t.pdf", "$P export - -o t.pdf < /dev/zero",
             "$P export <(yes) -o t.pdf", "yes | $P export - -o - > /dev/null" }) {
        const Ended ended = shell(line);
        EXPECT_EQ(ended.status, 1) << line;
        EXPECT_TRUE(has(ended.errors, "does not fit into ")) << line << ended.errors;
        EXPECT_TRUE(has(ended.errors, "TMPDIR")) << ended.errors;
    }
    EXPECT_FALSE(std::filesystem::exists(folder_.file("t.pdf")));
}

TEST_F(Pipes, EndAtOnceWhenInterrupted)
{
    ASSERT_EQ(mkfifo(folder_.file("silent.csv").c_str(), 0600), 0);
    ASSERT_EQ(mkfifo(folder_.file("silent.ostl").c_str(), 0600), 0);
    constexpr qint64 Longest = 5000; // of a machine that does much else
    constexpr qint64 Grace = 3000; // for what is asked to end
    EXPECT_LT(interrupted(words("export silent.csv -o t.pdf")), Longest);
    EXPECT_LT(interrupted(words("export - -o -")), Longest);
    folder_.write("t.csv", "a\n1\n");
    EXPECT_LT(interrupted(words("export t.csv -o t.pdf --logo silent.csv")), Longest + Grace);
    std::filesystem::remove(folder_.file("t.csv"));
    const Ended document = run(words("export silent.ostl -o t.pdf"));
    EXPECT_EQ(document.status, 1);
    EXPECT_TRUE(has(document.errors, "silent.ostl is a pipe; a saved document is read from"))
        << document.errors;
    EXPECT_THAT(sortedNames(), testing::ElementsAre("runtime", "silent.csv", "silent.ostl", "tmp"));
}

TEST_F(Pipes, AreReadAsFilesOfTheirKindAre)
{
    const Ended json = shell("$P export <(echo '[{\"a\": 1}]') -o t.svg");
    EXPECT_EQ(json.status, 0) << json.errors;
    EXPECT_TRUE(has(folder_.read("t.svg"), ">a<")) << folder_.read("t.svg");
    ASSERT_EQ(mkfifo(folder_.file("x.tsv").c_str(), 0600), 0);
    const Ended tabs = shell("printf 'a,b\tc\n1\t2\n' > x.tsv & $P export x.tsv -o t.svg");
    EXPECT_EQ(tabs.status, 0) << tabs.errors;
    EXPECT_TRUE(has(folder_.read("t.svg"), ">a,b<")) << folder_.read("t.svg");
}

TEST_F(Pipes, AndOtherThingsThatCannotBeReadAreNamed)
{
    struct Case {
        const char* line;
        const char* message;
    };
    folder_.write("t.csv", "a\n1\n");
    constexpr Case Cases[] = {
        { "$P export - -o t.pdf < .", "standard input cannot be read: Is a directory" },
        { "$P export - -o t.pdf <&-", "standard input cannot be read: " },
        { "$P export tmp -o t.pdf", "tmp is a folder" },
        { "$P export /dev/zero -o t.pdf", "/dev/zero is a device" },
        { "ln -s /dev/zero z.ostl; $P export z.ostl -o t.pdf", "z.ostl is a device" },
        { "$P export t.csv -o - >&-", "standard output cannot be written" },
        { "$P export t.csv -o u.pdf --json >&-", "standard output cannot be written" },
        { "$P help >&-", "standard output cannot be written" },
    };
    for (const Case& row : Cases) {
        const Ended ended = shell(row.line);
        EXPECT_EQ(ended.status, 1) << row.line;
        EXPECT_TRUE(has(ended.errors, row.message)) << row.line << ": " << ended.errors;
    }
    EXPECT_FALSE(std::filesystem::exists(folder_.file("t.pdf")));
    EXPECT_TRUE(folder_.read("u.pdf").ends_with("%%EOF\n")); // what was made is whole
    EXPECT_EQ(shell("$P export t.csv -o v.pdf 2>&-").status, 0);
    EXPECT_TRUE(folder_.read("v.pdf").ends_with("%%EOF\n"));
}

/// Pictures of a report are kept beside other temporary files.
TEST_F(Pipes, AndPicturesTellOfAFullDisk)
{
    folder_.write("t.csv", table(30));
    folder_.write("t.pdf", "old");
    most = 500;
    const Ended full = run(words("export t.csv -o t.pdf --watermark DRAFT"));
    EXPECT_EQ(full.status, 1);
    EXPECT_TRUE(full.errors.starts_with("pelloric: Disk full: ")) << full.errors;
    EXPECT_TRUE(has(full.errors, folder_.file("tmp").string())) << full.errors;
    const Ended none = shell("TMPDIR=/proc $P export t.csv -o t.pdf --watermark DRAFT");
    EXPECT_EQ(none.status, 1);
    EXPECT_TRUE(has(none.errors, "pictures cannot be kept in /proc: ")) << none.errors;
    EXPECT_EQ(folder_.read("t.pdf"), "old");
}

TEST_F(Pipes, ThatASocketIsNamedAsOne)
{
    const int end = socket(AF_UNIX, SOCK_STREAM, 0);
    sockaddr_un address {};
    address.sun_family = AF_UNIX;
    const std::string name = folder_.file("s").string();
    ASSERT_LT(name.size(), sizeof address.sun_path);
    std::ranges::copy(name, address.sun_path);
    ASSERT_EQ(bind(end, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
    const Ended ended = run(words("export s -o t.pdf"));
    close(end);
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(has(ended.errors, "s is a socket; name a file")) << ended.errors;
}

#if !defined(__SANITIZE_ADDRESS__) // which takes more addresses than there are bytes of memory
TEST_F(ProgramFaults, TellThatThereIsNotEnoughMemory)
{
    folder_.write("t.csv", table(500000));
    folder_.write("t.pdf", "old");
    surround
        = [](QProcess& process, QProcessEnvironment&) { limit(process, RLIMIT_AS, 200UL << 20U); };
    const Ended ended = run(words("export t.csv -o t.pdf"));
    EXPECT_EQ(ended.status, 1);
    EXPECT_TRUE(has(ended.errors, "there is not enough memory for this table")) << ended.errors;
    EXPECT_EQ(folder_.read("t.pdf"), "old");
    EXPECT_THAT(sortedNames(), testing::ElementsAre("t.csv", "t.pdf"));
}

TEST_F(ProgramFaults, TellOfAScriptThatIsNestedTooDeeply)
{
    const std::string nested = "let a = []; for (let i = 0; i < 300000; i++) a = [a];\n";
    for (const char* const line : { "String(a)", "a.flat(Infinity)", "new Sorvane().m_PrintObj = a",
             "let p = a; for (let i = 0; i < 300000; i++) p = new Proxy(p, {}); p.x" }) {
        folder_.write("s.js", nested + line);
        const Ended ended = run(words("run s.js"));
        EXPECT_EQ(ended.status, 1) << line;
        EXPECT_EQ(ended.errors, "pelloric: the script nests values deeper than its stack holds\n")
            << line;
    }
}

TEST_F(ProgramFaults, NameALimitThatLeavesTheToolkitNoRoom)
{
    folder_.write("t.csv", table(4));
    const auto limited = [this](int resource, rlim_t most) {
        surround = [resource, most](
                       QProcess& process, QProcessEnvironment&) { limit(process, resource, most); };
        return run(words("export t.csv -o t.pdf"));
    };
    const Ended stack = limited(RLIMIT_STACK, 64U << 10U);
    EXPECT_EQ(stack.status, 1);
    EXPECT_EQ(stack.errors,
        "pelloric: the stack may hold 64 KB only; allow 256 at least: ulimit -s 8192\n");
    // The loader needs one of them, and whoever started the tests may have left some open.
    const Ended files = limited(RLIMIT_NOFILE, 8);
    EXPECT_EQ(files.status, 1);
    EXPECT_EQ(
        files.errors, "pelloric: only 8 files may be open; allow 16 at least: ulimit -n 1024\n");
    EXPECT_EQ(limited(RLIMIT_STACK, 256U << 10U).status, 0);
    EXPECT_EQ(limited(RLIMIT_NOFILE, 16).status, 0);
}
#endif

} // namespace pelloric::qt

#endif
