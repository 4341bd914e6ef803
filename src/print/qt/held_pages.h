// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "view/held_drawing.h"

#include <vector>

class QPagedPaintDevice;

namespace pelloric::qt {

class QtFonts;

/// Draws pages with the toolkit.
/// @param device  its origin is that of the pages
/// @return        false: it did not take them all
bool paintHeldPages(
    const std::vector<HeldDrawing>& pages, QPagedPaintDevice& device, QtFonts& fonts);

} // namespace pelloric::qt
