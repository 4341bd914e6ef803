// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/messages.h"

#include "platform/run_time_error.h"

#include <array>

namespace pelloric {

namespace {

constexpr TextView DefaultTitle; ///< stands for the application's display name
constexpr TextView HintTitle = u"提示";

struct NoticeRow {
    Notice notice;
    TextView text;
    TextView title;
    MessageIcon icon;
};

constexpr auto Notices = std::to_array<NoticeRow>({
    { Notice::NoNextPage, u"无下一页！", DefaultTitle, MessageIcon::None },
    { Notice::BadDocumentFile, u"文件格式不正确，打开失败", HintTitle, MessageIcon::Critical },
    { Notice::UnknownPaper, u"非法纸张参数！", DefaultTitle, MessageIcon::Critical },
    { Notice::NoFontRow, u"请选择一项进行设置", u"Font", MessageIcon::Information },
    { Notice::NoPrinter, u"对不起，不能打印，系统没有默认的打印机", HintTitle,
        MessageIcon::Information },
    { Notice::PrinterNotWorking, u"打印机没有正常工作，不能打印", HintTitle,
        MessageIcon::Information },
});

/// A notice is looked up by its place.
constexpr bool standInOrder()
{
    for (std::size_t place = 0; place < Notices.size(); ++place) {
        if (Notices[place].notice != static_cast<Notice>(place))
            return false;
    }
    return true;
}
static_assert(Notices.size() == static_cast<std::size_t>(Notice::PrinterNotWorking) + 1);
static_assert(standInOrder());

} // namespace

Message messageOf(Notice notice)
{
    const NoticeRow& row = Notices[static_cast<std::size_t>(notice)];
    Message message { .text = Text(row.text), .title = {}, .icon = row.icon };
    if (!row.title.empty())
        message.title = Text(row.title);
    return message;
}

Message messageOf(const RunTimeError& error)
{
    return { .text = error.text(), .title = Text(HintTitle), .icon = MessageIcon::Critical };
}

} // namespace pelloric
