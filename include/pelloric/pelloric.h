// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// Everything of the component `widgets`: print preview and printing of grids.
///
/// @code
/// QApplication application(argc, argv);
/// pelloric::qt::usePreviewWindow();
/// pelloric::qt::Kestrane preview;
/// preview.AddHeader("Stock list", pelloric::AlignmentType::LocCenter);
/// preview.doPreview(tableView);
/// @endcode

#include <pelloric/errors.h>
#include <pelloric/export.h>
#include <pelloric/grids.h>
#include <pelloric/kestrane.h>
#include <pelloric/options.h>
#include <pelloric/preview.h>
#include <pelloric/printing.h>
#include <pelloric/records.h>
#include <pelloric/report.h>
#include <pelloric/sorvane.h>
#include <pelloric/version.h>
