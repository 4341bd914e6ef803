// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_window.h"

#include "command_line.h"
#include "controls/qt/kestrane.h"
#include "grids/qt/data_view_grid.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "table_source.h"
#include "tables/qt/csv_table.h"
#include "ui/qt/icon_set.h"

#include <QCheckBox>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSpinBox>
#include <QSqlTableModel>
#include <QTabWidget>
#include <QTableView>
#include <QTableWidget>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <initializer_list>
#include <memory>

namespace pelloric::app {

namespace {

constexpr QSize FirstSize { 980, 680 }; ///< pixels

constexpr int Margin = 12; ///< pixels

constexpr int WidestColumn = 260; ///< of a view when it opens: pixels

constexpr int LastStartRow = 9999;

constexpr int ColumnAir = 18; ///< pixels

constexpr int RowHeight = 24; ///< of the tables: pixels

constexpr int FacadeSize = 28; ///< pixels

/// The connection's name in the program.
const QString Connection = QStringLiteral("samples");

[[noreturn]] void refuseSample(const QString& file)
{
    throw CommandError(
        QStringLiteral("%1 cannot be read; name the folder of the samples with --samples")
            .arg(file));
}

TableGrid readSample(const QString& file)
{
    try {
        return qt::readCsv(pathOf(file), {});
    } catch (const RunTimeError&) {
        refuseSample(file);
    }
}

QString cellText(const TableGrid& table, std::int64_t row, int column)
{
    return qt::toQString(table.cell(row, column));
}

QStringList titlesOf(const TableGrid& table)
{
    QStringList titles;
    for (int column = 0; column < table.columnCount(); ++column)
        titles.append(qt::toQString(table.column(column).title));
    return titles;
}

/// Columns as wide as what they hold, with some air; the report takes these widths.
void fitColumns(QHeaderView& header)
{
    header.resizeSections(QHeaderView::ResizeToContents);
    for (int section = 0; section < header.count(); ++section)
        header.resizeSection(
            section, std::min(header.sectionSize(section) + ColumnAir, WidestColumn));
}

} // namespace

DemoWindow::DemoWindow(qt::QtPlatform& platform, const QString& samples)
    : facade_(new qt::Kestrane(platform))
    , pages_(new QTabWidget)
{
    setObjectName(QStringLiteral("frmDemo"));
    setWindowTitle(tr("Pelloric Demonstration"));
    setWindowIcon(qt::libraryIcon(QStringLiteral("whole-page"), palette()));
    auto* const body = new QWidget(this);
    auto* const layout = new QVBoxLayout(body);
    layout->setContentsMargins(Margin, Margin, Margin, Margin);
    layout->setSpacing(Margin);
    layout->addWidget(makeHeading());
    layout->addWidget(pages_, 1);
    layout->addWidget(makeReportBox());
    setCentralWidget(body);
    addPage(QStringLiteral("FlexGrid"), tr("&Flex Grid"),
        tr("A table widget: 178 wines in 15 columns, more than one sheet is wide."),
        makeFlexGrid(samples + QStringLiteral("/wine.csv")));
    addPage(QStringLiteral("ListView"), tr("&List View"),
        tr("A tree widget in report mode: the countries of the world in English and Chinese."),
        makeListView(samples + QStringLiteral("/countries-zh.csv")));
    addPage(QStringLiteral("DataGrid"), tr("&Data Grid"),
        tr("A table view on an SQL table, which is walked in place: time zones and their places."),
        makeDataGrid(samples + QStringLiteral("/samples.sqlite")));
    resize(FirstSize);
}

DemoWindow::~DemoWindow()
{
    delete centralWidget(); // the model goes before its connection
    database_.close();
    database_ = {};
    QSqlDatabase::removeDatabase(Connection);
}

QWidget* DemoWindow::makeHeading()
{
    auto* const heading = new QLabel(tr("Choose a table, say how it is to look, and preview it."));
    heading->setObjectName(QStringLiteral("labHeading"));
    QFont font = heading->font();
    font.setPointSizeF(font.pointSizeF() * 1.25);
    heading->setFont(font);
    return heading;
}

QWidget* DemoWindow::makeReportBox()
{
    auto* const box = new QGroupBox(tr("Report"));
    auto* const layout = new QHBoxLayout(box);
    facade_->setToolTip(tr("The control Kestrane, which previews the tables"));
    facade_->setFixedSize(FacadeSize, FacadeSize);
    showHeader_ = new QCheckBox(tr("Column &titles"));
    showHeader_->setObjectName(QStringLiteral("ShowHeader"));
    mergeGrid_ = new QCheckBox(tr("&Merge equal cells"));
    mergeGrid_->setObjectName(QStringLiteral("MergeGrid"));
    startRow_ = new QSpinBox;
    startRow_->setObjectName(QStringLiteral("MarvenStartRow"));
    startRow_->setRange(1, LastStartRow);
    startRow_->setToolTip(tr("Of the flex grid; row 0 holds its titles"));
    footer_ = new QLineEdit(QStringLiteral("[Page # of Pages #]"));
    footer_->setObjectName(QStringLiteral("Footer"));
    auto* const rowLabel = new QLabel(tr("First &row:"));
    rowLabel->setBuddy(startRow_);
    auto* const footerLabel = new QLabel(tr("F&ooter:"));
    footerLabel->setBuddy(footer_);
    for (QWidget* const part : std::initializer_list<QWidget*> {
             facade_, showHeader_, mergeGrid_, rowLabel, startRow_, footerLabel })
        layout->addWidget(part);
    layout->addWidget(footer_, 1);
    layout->setSpacing(Margin);
    connect(showHeader_, &QCheckBox::toggled, facade_, &qt::Kestrane::setShowHeader);
    connect(mergeGrid_, &QCheckBox::toggled, facade_, &qt::Kestrane::setMergeGrid);
    connect(startRow_, &QSpinBox::valueChanged, facade_, &qt::Kestrane::setMarvenStartRow);
    showHeader_->setChecked(true);
    facade_->setMergeGrid(false);
    return box;
}

void DemoWindow::addPage(
    const QString& name, const QString& title, const QString& about, QAbstractItemView* view)
{
    auto* const page = new QWidget;
    auto* const layout = new QVBoxLayout(page);
    auto* const button
        = new QPushButton(qt::libraryIcon(QStringLiteral("whole-page"), palette()), tr("&Preview"));
    button->setObjectName(QStringLiteral("preview") + name);
    button->setAutoDefault(true);
    view->setObjectName(name);
    view->setAlternatingRowColors(true);
    view->setAccessibleName(about);
    auto* const top = new QHBoxLayout;
    auto* const text = new QLabel(about);
    text->setWordWrap(true);
    top->addWidget(text, 1);
    top->addWidget(button);
    layout->addLayout(top);
    layout->addWidget(view, 1);
    const QString header = QString(title).remove(QLatin1Char('&'));
    connect(button, &QPushButton::clicked, this, [=, this] { preview(view, header); });
    pages_->addTab(page, title);
}

QAbstractItemView* DemoWindow::makeFlexGrid(const QString& file)
{
    const TableGrid table = readSample(file);
    auto* const view = new QTableWidget(static_cast<int>(table.rowCount()), table.columnCount());
    view->setHorizontalHeaderLabels(titlesOf(table));
    for (int row = 0; row < view->rowCount(); ++row) {
        for (int column = 0; column < view->columnCount(); ++column)
            view->setItem(row, column, new QTableWidgetItem(cellText(table, row, column)));
    }
    view->setEditTriggers(QAbstractItemView::NoEditTriggers);
    view->setTabKeyNavigation(false);
    view->verticalHeader()->setDefaultSectionSize(RowHeight);
    fitColumns(*view->horizontalHeader());
    return view;
}

QAbstractItemView* DemoWindow::makeListView(const QString& file)
{
    const TableGrid table = readSample(file);
    auto* const view = new QTreeWidget;
    view->setRootIsDecorated(false);
    view->setUniformRowHeights(true);
    view->setHeaderLabels(titlesOf(table));
    for (std::int64_t row = 0; row < table.rowCount(); ++row) {
        auto* const item = new QTreeWidgetItem(view);
        for (int column = 0; column < table.columnCount(); ++column)
            item->setText(column, cellText(table, row, column));
    }
    fitColumns(*view->header());
    return view;
}

QAbstractItemView* DemoWindow::makeDataGrid(const QString& file)
{
    database_ = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), Connection);
    database_.setConnectOptions(QStringLiteral("QSQLITE_OPEN_READONLY"));
    database_.setDatabaseName(file);
    if (!database_.open())
        refuseSample(file);
    auto* const view = new QTableView;
    auto* const model = new QSqlTableModel(view, database_);
    model->setTable(QStringLiteral("time_zones"));
    model->select();
    while (model->canFetchMore())
        model->fetchMore();
    view->setModel(model);
    view->setEditTriggers(QAbstractItemView::NoEditTriggers);
    view->setTabKeyNavigation(false);
    view->verticalHeader()->setDefaultSectionSize(RowHeight);
    fitColumns(*view->horizontalHeader());
    return view;
}

void DemoWindow::preview(QAbstractItemView* view, const QString& title)
{
    facade_->AddHeader(title, pelloric::AlignmentType::LocLeft);
    facade_->AddHeader(QStringLiteral("[Date Printed]"), pelloric::AlignmentType::LocRight);
    facade_->AddFooter(footer_->text(), pelloric::AlignmentType::LocCenter);
    auto* const table = qobject_cast<QTableView*>(view);
    if (table != nullptr && view->objectName() == QLatin1String("DataGrid"))
        facade_->doPreview(std::make_unique<qt::DataViewGrid>(*table));
    else
        facade_->doPreview(view);
}

} // namespace pelloric::app
