// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <pelloric/options.h>

namespace pelloric {

class PageDocument;
class TextCodec;

/// What a document file does not hold of a document: watermarks, logos and icons, which are
/// pictures; pages behind the last that it can count; and characters outside its code page.
///
/// Colours, fonts, boxes, strokes and rows of totals are lines and texts, which it holds.
/// @param codec  of the file
OstlLosses ostlLosses(const PageDocument& document, const TextCodec& codec);

} // namespace pelloric
