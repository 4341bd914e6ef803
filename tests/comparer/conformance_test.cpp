// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Runs the runner over all cases and compares what it wrote, one test per case: once as it is, and
// once with report options that are off.

#include "comparer/compare.h"

#include "fakes/temp_folder.h"
#include "support/chinese_codec.h"
#include "support/test_paths.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>

namespace pelloric::cases {

namespace {

namespace fs = std::filesystem;

const fs::path CasesFolder = fs::path(PELLORIC_TESTS_DIR) / "cases";

std::vector<std::string> caseIds()
{
    std::vector<std::string> ids;
    for (const auto& entry : fs::directory_iterator(CasesFolder)) {
        if (entry.path().extension() == ".json")
            ids.push_back(entry.path().stem().string());
    }
    std::sort(ids.begin(), ids.end());
    return ids;
}

/// Runs the runner; its status, 0 when every case ran.
/// @param option  of the runner; may be empty
int runCases(const fs::path& cases, const fs::path& out, const std::string& option = {})
{
    std::string command = std::string("\"") + PELLORIC_CASES + "\" \"" + cases.string() + "\" \""
        + out.string() + "\" " + option + " 2>&1";
#ifdef _WIN32
    command = "\"" + command + "\""; // The command interpreter takes the outermost quotes away.
#endif
    return std::system(command.c_str());
}

/// What the runner wrote of all cases.
class RunnerOutput {
public:
    /// @param option  of the runner; may be empty
    explicit RunnerOutput(const std::string& option)
    {
        status_ = runCases(CasesFolder, folder_.path(), option);
    }

    int status() const { return status_; }

    /// How a case differs from what is expected.
    std::string difference(const std::string& id) const
    {
        const std::unique_ptr<TextCodec> codec = chineseCodec();
        return compareCase(CasesFolder / (id + ".json"), folder_.path(), *codec)
            .value_or("no difference");
    }

private:
    TempFolder folder_;
    int status_;
};

template <bool hasOptions> class Cases : public testing::TestWithParam<std::string> {
protected:
    static void SetUpTestSuite()
    {
        run_ = std::make_unique<RunnerOutput>(hasOptions ? "--idle-options" : "");
    }

    static void TearDownTestSuite() { run_.reset(); }

    static inline std::unique_ptr<RunnerOutput> run_;
};

using ConformanceCases = Cases<false>;
using ConformanceCasesWithIdleOptions = Cases<true>;

std::string nameOf(const testing::TestParamInfo<std::string>& info)
{
    std::string name = info.param;
    std::replace(name.begin(), name.end(), '-', '_');
    return name;
}

} // namespace

TEST_P(ConformanceCases, EndsAsExpected)
{
    EXPECT_EQ(run_->status(), 0);
    EXPECT_EQ(run_->difference(GetParam()), "no difference");
}

TEST_P(ConformanceCasesWithIdleOptions, EndsAsExpected)
{
    EXPECT_EQ(run_->status(), 0);
    EXPECT_EQ(run_->difference(GetParam()), "no difference");
}

INSTANTIATE_TEST_SUITE_P(All, ConformanceCases, testing::ValuesIn(caseIds()), nameOf);
INSTANTIATE_TEST_SUITE_P(
    All, ConformanceCasesWithIdleOptions, testing::ValuesIn(caseIds()), nameOf);

TEST(ConformanceRunner, RefusesAFolderThatIsNotThere)
{
    const TempFolder folder;
    EXPECT_NE(runCases(folder.file("none"), folder.file("out")), 0);
}

TEST(ConformanceRunner, GoesOnBehindACaseThatItCannotRun)
{
    const TempFolder folder;
    folder.write("a-broken.json", "{");
    folder.write("b-unknown.json",
        R"({"id": "b-unknown", "input": {"steps": [["fly"]], "show": []}, "expected": {}})");
    folder.write("c-good.json",
        R"({"id": "c-good", "input": {"steps": [["clear"]], "show": []}, "expected": {}})");
    EXPECT_NE(runCases(folder.path(), folder.file("out")), 0);
    EXPECT_FALSE(fs::exists(folder.file("out") / "a-broken.json"));
    EXPECT_FALSE(fs::exists(folder.file("out") / "b-unknown.json"));
    EXPECT_EQ(
        compareCase(folder.file("c-good.json"), folder.file("out"), *chineseCodec()), std::nullopt);
}

} // namespace pelloric::cases
