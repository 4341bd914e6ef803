// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

namespace pelloric {

class Canvas;
struct PageRect;

/// The two ways in which a report is read.
enum class ReadingWay { On, Back };

/// Brings both scroll bars to their start, as moving them by hand would; a page that is centred
/// afterwards stands where its bars say.
void barsToStart(Canvas& canvas);

/// Brings both scroll bars to their end.
void barsToEnd(Canvas& canvas);

/// Moves on by what the viewport shows: down, and at the end to the top of the next part to the
/// right; or back the same way.
/// @return  false: all that is shown was seen, nothing has moved
bool readWithinPages(Canvas& canvas, ReadingWay way);

/// Whether `readWithinPages` would jump or do nothing, as it does at the upper or lower end.
bool rests(const Canvas& canvas, ReadingWay way);

/// Scrolls until something of a page is seen: with a large scale the first step of the bars may
/// show nothing but the grey around the pages.
void keepPageInSight(Canvas& canvas);

/// Scrolls until a part of a surface is seen, as little as that takes.
/// @param surface  from 0
/// @param part     page twips
void bringIntoSight(Canvas& canvas, int surface, const PageRect& part);

/// Scrolls so that a surface stands at the viewport's corner, as far as the bars reach.
void bringToTop(Canvas& canvas, int surface);

} // namespace pelloric
