// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/preview_notice.h"

#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "report/settings_check.h"

#include <algorithm>
#include <utility>

namespace pelloric {

namespace {

constexpr std::size_t MostTold = 3; ///< problems in one notice

PreviewNotice noticeOf(Text text, const std::vector<SettingProblem>& problems)
{
    PreviewNotice notice { .text = std::move(text), .offersDefaults = true };
    const std::size_t told = std::min(problems.size(), MostTold);
    for (std::size_t at = 0; at < told; ++at) {
        if (!notice.text.empty())
            notice.text.append(u" ");
        notice.text.append(problems[at].text);
    }
    if (problems.size() > told)
        notice.text.append(u" ").append(phrase(u"There are %1 more like this.",
            { decimal(static_cast<std::int64_t>(problems.size() - told)) }));
    for (const SettingProblem& problem : problems) {
        notice.offersPageSetup = notice.offersPageSetup || problem.isInPageSetup;
        notice.offersGridStyle = notice.offersGridStyle || problem.isInGridStyle;
    }
    return notice;
}

std::vector<SettingProblem> problemsOf(const Platform& platform, const ReportSettings* own)
{
    return own != nullptr ? settingProblems(*own) : settingProblems(platform);
}

/// Whether another paper, margin or font could make the pages possible.
bool dependsOnStyle(const RunTimeError& error)
{
    return error.number() == ErrorNumber::Overflow || error.number() == ErrorNumber::DivisionByZero;
}

} // namespace

PreviewNotice noticeOfFailure(
    const RunTimeError& error, const Platform& platform, const ReportSettings* own)
{
    const std::vector<SettingProblem> problems = problemsOf(platform, own);
    if (!problems.empty())
        return noticeOf(phrase(u"The pages could not be built."), problems);
    PreviewNotice notice = noticeOfError(error);
    notice.text.insert(0, phrase(u"The pages could not be built.") + u" ");
    notice.offersPageSetup = notice.offersGridStyle = dependsOnStyle(error);
    return notice;
}

std::optional<PreviewNotice> noticeOfSettings(const Platform& platform, const ReportSettings* own)
{
    const std::vector<SettingProblem> problems = problemsOf(platform, own);
    if (problems.empty())
        return std::nullopt;
    return noticeOf({}, problems);
}

PreviewNotice noticeOfError(const RunTimeError& error) { return { .text = error.text() + u"." }; }

} // namespace pelloric
