// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/ostl_losses.h"

#include "document/ostl_format.h"
#include "document/page_document.h"
#include "platform/text_codec.h"

#include <algorithm>
#include <string>

namespace pelloric {

namespace {

bool isPlain(TextView text)
{
    return std::all_of(text.begin(), text.end(), [](char16_t unit) { return unit < 0x80; });
}

/// Counts the texts of a page that do not come back as they were written.
class TextCheck {
public:
    explicit TextCheck(const TextCodec& codec)
        : codec_(codec)
    {
    }

    bool isChanged(TextView text)
    {
        if (isPlain(text))
            return false;
        bytes_.clear();
        codec_.encode(text, bytes_);
        return codec_.decode(bytes_) != text;
    }

private:
    const TextCodec& codec_;
    std::string bytes_;
};

} // namespace

OstlLosses ostlLosses(const PageDocument& document, const TextCodec& codec)
{
    OstlLosses losses;
    losses.pages = std::max(0, document.Totalpages - 1 - ostl::LastPageIndex);
    const int pages = std::min(document.pageCount(), ostl::LastPageIndex + 1);
    TextCheck check(codec);
    for (int page = 0; page < pages; ++page) {
        for (const PictureRecord& picture : document.reportPictures(page))
            (picture.layer == PictureLayer::Cells ? losses.icons : losses.pictures) = true;
        for (const TextRecord text : document.texts(page))
            losses.texts += check.isChanged(text.text()) ? 1 : 0;
    }
    return losses;
}

} // namespace pelloric
