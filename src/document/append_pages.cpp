// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "document/append_pages.h"

#include "document/page_document.h"

namespace pelloric {

namespace {

void appendPage(PageDocument& pages, const PageDocument& further, int page)
{
    for (const LineRecord& line : further.lines(page)) {
        LineRecord copy = line;
        copy.pen = pages.penNumber(further.pen(line.pen));
        pages.append(copy);
    }
    Text buffer;
    for (const TextRecord& text : further.texts(page)) {
        const TextView kept
            = pages.store().add(withPageCount(text.text(), further.Totalpages, buffer));
        TextRecord copy = text;
        copy.units = kept.data();
        copy.length = static_cast<std::uint32_t>(kept.size());
        copy.style = pages.styleNumber(further.style(text.style));
        pages.append(copy);
    }
    for (const PictureRecord& picture : further.reportPictures(page)) {
        PictureRecord copy = picture;
        copy.file = pages.store().add(picture.file);
        pages.addPicture(pages.currentPage, copy);
    }
}

} // namespace

void appendPages(PageDocument& pages, const PageDocument& further, bool first)
{
    for (int page = 0; page < further.pageCount(); ++page) {
        if (page > 0 || !first)
            pages.newPage();
        appendPage(pages, further, page);
    }
}

} // namespace pelloric
