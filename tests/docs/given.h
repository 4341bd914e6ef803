// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

// What the short pieces of code in the guides take for granted.

#include <controls/qt/default_platform.h>
#include <controls/qt/kestrane.h>
#include <controls/qt/sorvane.h>
#include <export/qt/page_export.h>
#include <platform/run_time_error.h>
#include <report/report_options.h>
#include <settings/default_settings.h>
#include <ui/qt/preview_opener.h>
#include <ui/qt/translation.h>

#include <QPrinter>
#include <QTextDocument>
#include <QtWidgets>

extern QTableView* view;
extern QAbstractItemModel* model;
extern QPushButton* button;
extern pelloric::qt::Kestrane* preview;
extern pelloric::qt::Sorvane* pages;
extern const pelloric::Canvas& canvas;
extern pelloric::qt::QtPlatform& platform;
