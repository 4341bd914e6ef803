// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

// What the short pieces of code in the guides take for granted.

#include <pelloric/pelloric.h>

#include <QPrinter>
#include <QTextDocument>
#include <QtWidgets>

extern QTableView* view;
extern QAbstractItemModel* model;
extern QPushButton* button;
extern pelloric::qt::Kestrane* preview;
extern pelloric::qt::Sorvane* pages;
