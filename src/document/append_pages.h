// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric {

class PageDocument;

/// Puts the pages of a document behind those of another, as they would be printed by themselves:
/// every "[Pages]" is the number of pages of the document that it comes from. Placed pictures stay
/// out.
///
/// @param first  whether the first page of `pages`, which every document has, is still unused
/// @throws RunTimeError Overflow: there would be more than 32767 pages; those that fit are there
void appendPages(PageDocument& pages, const PageDocument& further, bool first);

} // namespace pelloric
