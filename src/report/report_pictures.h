// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "document/page_document.h"

#include <vector>

namespace pelloric {

class PictureService;
struct ReportOptions;

/// The pictures that stand on every page of a report, and what they take of the page.
struct ReportPictures {
    std::vector<PictureRecord> pictures; ///< their files' names live in the document's store
    Twips headRoom = 0; ///< what a logo takes of the page's top: twips
};

/// Places the watermark and the logo that the options ask for on the paper.
///
/// A picture as watermark covers as much of the paper as seven tenths of its sides let it. A logo
/// is no wider than the room between the margins and no higher than a quarter of the paper.
/// @param pictures  null: there are none
/// @throws RunTimeError FileNotFound: a picture cannot be read; WriteFailed: it cannot be kept
ReportPictures placeReportPictures(const ReportOptions& options, const PageSetup& setup,
    PictureService* pictures, TextStore& store);

} // namespace pelloric
