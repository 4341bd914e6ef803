// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "report/report_pictures.h"

#include "platform/numbers.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "platform/services.h"
#include <pelloric/options.h>

#include <algorithm>

namespace pelloric {

namespace {

constexpr double LargestPart = 0.7; ///< of the paper's sides that a watermark's picture takes
constexpr Twips LogoGap = 72; ///< between a logo and what stands below it: twips

/// The size of a picture that fits into a room: twips.
Tpoint fitted(TextView file, Tpoint room, PictureService& pictures)
{
    const auto size = pictures.pixelSize(file);
    if (!size || size->x <= 0 || size->y <= 0)
        throw RunTimeError(ErrorNumber::FileNotFound, phrase(u"%1 is no picture", { file }));
    const double scale
        = std::min(static_cast<double>(room.x) / size->x, static_cast<double>(room.y) / size->y);
    return { std::max(1, roundToInt32(size->x * scale)),
        std::max(1, roundToInt32(size->y * scale)) };
}

PictureRecord placeWatermark(
    const Watermark& watermark, const PageSetup& setup, PictureService& pictures, TextStore& store)
{
    const Tpoint sheet { setup.myWidth, setup.myHeight };
    const auto layer = watermark.isAbove ? PictureLayer::Above : PictureLayer::Behind;
    if (!watermark.text.empty())
        return { layer, {}, sheet,
            store.add(pictures.writtenAcross(watermark.text, sheet, watermark.opacity)) };
    const Tpoint size = fitted(watermark.imageFile,
        { roundToInt32(sheet.x * LargestPart), roundToInt32(sheet.y * LargestPart) }, pictures);
    return { layer, { (sheet.x - size.x) / 2, (sheet.y - size.y) / 2 }, size,
        store.add(pictures.kept(watermark.imageFile, watermark.opacity)) };
}

PictureRecord placeLogo(
    const Logo& logo, const PageSetup& setup, PictureService& pictures, TextStore& store)
{
    const Twips room = setup.myWidth - setup.intLeft - setup.intRight;
    const Twips height = std::clamp(logo.height, 1, std::max(1, setup.myHeight / 4));
    const Tpoint size = fitted(logo.imageFile, { std::max(1, room), height }, pictures);
    const Twips right = setup.myWidth - setup.intRight - size.x;
    const Twips centre = (setup.myWidth - size.x) / 2;
    const Twips left = logo.slot == 0 ? setup.intLeft : logo.slot == 1 ? centre : right;
    return { PictureLayer::Behind, { left, setup.intTop }, size,
        store.add(pictures.kept(logo.imageFile, 1)) };
}

} // namespace

ReportPictures placeReportPictures(const ReportOptions& options, const PageSetup& setup,
    PictureService* pictures, TextStore& store)
{
    ReportPictures placed;
    if (pictures == nullptr)
        return placed;
    if (options.watermark.isAsked())
        placed.pictures.push_back(placeWatermark(options.watermark, setup, *pictures, store));
    if (options.logo.imageFile.empty())
        return placed;
    placed.pictures.push_back(placeLogo(options.logo, setup, *pictures, store));
    placed.headRoom = placed.pictures.back().size.y + LogoGap;
    return placed;
}

} // namespace pelloric
