// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_window.h"

#include "command_line.h"
#include "demo_code/demo_code.h"
#include "demo_grids.h"
#include "own_table.h"
#include "platform/qt/qt_phrase.h"
#include "platform/qt/qt_platform.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "table_model.h"
#include "table_source.h"
#include "tables/qt/csv_table.h"
#include "ui/qt/icon_set.h"
#include "ui/qt/named_boxes.h"
#include <pelloric/options.h>

#include <pelloric/kestrane.h>

#include <QCheckBox>
#include <QClipboard>
#include <QFile>
#include <QFontDatabase>
#include <QGridLayout>
#include <QGroupBox>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QRegularExpression>
#include <QScreen>
#include <QSpinBox>
#include <QSplitter>
#include <QSqlTableModel>
#include <QTabWidget>
#include <QTableView>
#include <QTableWidget>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <initializer_list>
#include <optional>

namespace pelloric::app {

namespace {

constexpr QSize FirstSize { 980, 680 }; ///< pixels

constexpr int Margin = 12; ///< pixels

constexpr int WidestColumn = 260; ///< of a view when it opens: pixels

constexpr int LastStartRow = 9999;

constexpr int ColumnAir = 18; ///< pixels

constexpr int RowHeight = 24; ///< of the tables: pixels

constexpr int CodeShare = 2; ///< of five parts of a page's width

/// The connection's name in the program.
const QString Connection = QStringLiteral("samples");

[[noreturn]] void refuseSample(const QString& file)
{
    throw CommandError(
        qt::phrased(u"%1 cannot be read; name the folder of the samples with --samples").arg(file));
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

/// The part of a file of host code that is shown.
QString shownCode(const char* name)
{
    QFile file(QStringLiteral(":/demo_code/") + QLatin1String(name));
    if (!file.open(QIODevice::ReadOnly))
        return {};
    const QString mark = QStringLiteral("//! [shown]\n");
    return QString::fromUtf8(file.readAll()).section(mark, 1, 1).trimmed();
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
    pages_->setAccessibleName(tr("Tables"));
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
    const TableGrid wines = readSample(samples + QStringLiteral("/wine.csv"));
    QTableWidget* const table = makeWineTable(wines);
    table->setHorizontalHeaderLabels(titlesOf(wines));
    arrange(*table);
    addPage({ QStringLiteral("FlexGrid"), tr("&Flex Grid"),
                tr("A table widget: 178 wines in 15 columns, more than one sheet is wide."),
                "flex_grid.cpp", [=, this] { previewTable(*facade_, *table, footer_->text()); } },
        table);
    QTreeWidget* const list = makeListView(samples + QStringLiteral("/countries-zh.csv"));
    addPage({ QStringLiteral("ListView"), tr("&List View"),
                tr("A tree widget in report mode: the countries of the world in English and "
                   "Chinese."),
                "list_view.cpp", [=, this] { previewList(*facade_, *list, footer_->text()); } },
        list);
    QTableView* const view = makeDataGrid(samples + QStringLiteral("/samples.sqlite"));
    addPage({ QStringLiteral("DataGrid"), tr("&Data Grid"),
                tr("A table view on an SQL table: time zones and their places."), "data_grid.cpp",
                [=, this] { previewQuery(*facade_, *view, footer_->text()); } },
        view);
    addShownPages(wines, samples);
    resize(FirstSize.boundedTo(screen()->availableSize() * 9 / 10));
}

/// Pages whose previews look as their views do.
void DemoWindow::addShownPages(const TableGrid& wines, const QString& samples)
{
    QTableWidget* const classes = makeWineClasses(wines);
    arrange(*classes);
    addPage({ QStringLiteral("Spans"), tr("&Spans"),
                tr("A table widget with spans, ticks and colours, printed as it is shown."),
                "as_shown.cpp",
                [=, this] {
                    previewAsShown(*facade_, *classes, tr("Classes of wines"), footer_->text());
                } },
        classes);
    QTreeWidget* const tree = makeZoneTree(readSample(samples + QStringLiteral("/time-zones.tsv")));
    fitColumns(*tree->header());
    addPage({ QStringLiteral("Tree"), tr("&Tree"),
                tr("A tree widget with branches, icons and ticks, printed as it is shown."),
                "as_shown.cpp",
                [=, this] { previewAsShown(*facade_, *tree, tr("Time zones"), footer_->text()); } },
        tree);
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
    auto* const row = new QWidget;
    auto* const heading = new QLabel(tr("Choose a table, say how it is to look, and preview it."));
    heading->setObjectName(QStringLiteral("labHeading"));
    heading->setWordWrap(true);
    QFont font = heading->font();
    font.setPointSizeF(font.pointSizeF() * 1.25);
    heading->setFont(font);
    auto* const own = new QPushButton(
        qt::libraryIcon(QStringLiteral("open"), palette()), tr("&Open your own table…"));
    own->setObjectName(QStringLiteral("openTable"));
    own->setToolTip(tr("A CSV or TSV file, or a table of an SQLite database"));
    connect(own, &QPushButton::clicked, this, &DemoWindow::addOwnTable);
    auto* const layout = new QHBoxLayout(row);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(heading, 1);
    layout->addWidget(own);
    return row;
}

QWidget* DemoWindow::makeReportBox()
{
    auto* const box = new QGroupBox(tr("Report"));
    auto* const layout = new QHBoxLayout(box);
    // A host places the control where it likes; it previews just as well when it is not shown.
    facade_->setParent(box);
    facade_->hide();
    showHeader_ = new QCheckBox(tr("Col&umn titles"));
    showHeader_->setObjectName(QStringLiteral("ShowHeader"));
    mergeGrid_ = new QCheckBox(tr("&Merge equal cells"));
    mergeGrid_->setObjectName(QStringLiteral("MergeGrid"));
    asShown_ = new QCheckBox(tr("As sho&wn"));
    asShown_->setObjectName(QStringLiteral("AsShown"));
    asShown_->setToolTip(tr("Cells look as the view shows them; F4 in the preview offers more"));
    startRow_ = new QSpinBox;
    startRow_->setObjectName(QStringLiteral("MarvenStartRow"));
    startRow_->setRange(1, LastStartRow);
    startRow_->setToolTip(tr("Of the flex grid; row 0 holds its titles"));
    qt::nameBox(*startRow_, tr("First row"));
    footer_ = new QLineEdit(QStringLiteral("[Page # of Pages #]"));
    footer_->setObjectName(QStringLiteral("Footer"));
    auto* const rowLabel = new QLabel(tr("First &row:"));
    rowLabel->setBuddy(startRow_);
    auto* const footerLabel = new QLabel(tr("Foot&er:"));
    footerLabel->setBuddy(footer_);
    for (QWidget* const part : std::initializer_list<QWidget*> {
             showHeader_, mergeGrid_, asShown_, rowLabel, startRow_, footerLabel })
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

/// The Tab key goes from the grid on to its button.
void DemoWindow::addPage(const Page& page, QAbstractItemView* view)
{
    auto* const holder = new QWidget;
    auto* const layout = new QVBoxLayout(holder);
    auto* const button
        = new QPushButton(qt::libraryIcon(QStringLiteral("whole-page"), palette()), tr("&Preview"));
    button->setObjectName(QStringLiteral("preview") + page.name);
    button->setAutoDefault(true);
    view->setObjectName(page.name);
    view->setAlternatingRowColors(true);
    view->setAccessibleName(page.about);
    auto* const top = new QHBoxLayout;
    auto* const text = new QLabel(page.about);
    text->setWordWrap(true);
    top->addWidget(text, 1);
    top->addWidget(button);
    layout->addLayout(top);
    auto* const parts = new QSplitter(Qt::Horizontal);
    parts->addWidget(view);
    parts->addWidget(makeCode(page));
    parts->setStretchFactor(0, 5 - CodeShare);
    parts->setStretchFactor(1, CodeShare);
    layout->addWidget(parts, 1);
    connect(button, &QPushButton::clicked, this, [this, preview = page.preview] {
        facade_->setReportOptions({ .asShown = asShown_->isChecked() });
        preview();
    });
    pages_->addTab(holder, page.title);
    setTabOrder(view, button);
    for (QWidget* const part : parts->widget(1)->findChildren<QWidget*>(
             QRegularExpression(QStringLiteral("^(code|copy)"))))
        setTabOrder(button, part);
}

/// What a host writes for a page, to read and to copy.
QWidget* DemoWindow::makeCode(const Page& page)
{
    auto* const box = new QWidget;
    auto* const caption = new QLabel(tr("Host code:"));
    auto* const code = new QPlainTextEdit(shownCode(page.code));
    code->setObjectName(QStringLiteral("code") + page.name);
    code->setReadOnly(true);
    code->setTabChangesFocus(true);
    code->setLineWrapMode(QPlainTextEdit::NoWrap);
    code->setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    code->setAccessibleName(tr("Host code"));
    auto* const copy = new QPushButton(tr("&Copy"));
    copy->setObjectName(QStringLiteral("copy") + page.name);
    copy->setToolTip(tr("Copies the code to the clipboard"));
    connect(copy, &QPushButton::clicked, code,
        [code] { QGuiApplication::clipboard()->setText(code->toPlainText()); });
    auto* const layout = new QGridLayout(box);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(caption, 0, 0);
    layout->addWidget(copy, 0, 1);
    layout->addWidget(code, 1, 0, 1, 2);
    layout->setColumnStretch(0, 1);
    return box;
}

/// Adds a page for a table that the person chooses.
void DemoWindow::addOwnTable()
{
    std::optional<OwnTable> own = askOwnTable(*this);
    if (!own)
        return;
    auto* const view = new QTableView;
    const QString name = own->name;
    view->setModel(new TableModel(std::move(own->table), view));
    view->setTabKeyNavigation(false);
    view->verticalHeader()->setDefaultSectionSize(RowHeight);
    fitColumns(*view->horizontalHeader());
    addPage({ QStringLiteral("OwnTable%1").arg(++ownTables_), QString(name).replace('&', "&&"),
                tr("A table of your own: %1.").arg(name), "own_table.cpp",
                [=, this] { previewView(*facade_, *view, name, footer_->text()); } },
        view);
    pages_->setCurrentIndex(pages_->count() - 1);
    view->setFocus();
}

/// Rows and columns as the demonstration shows them.
void DemoWindow::arrange(QTableWidget& view)
{
    view.setEditTriggers(QAbstractItemView::NoEditTriggers);
    view.setTabKeyNavigation(false);
    view.verticalHeader()->setDefaultSectionSize(RowHeight);
    fitColumns(*view.horizontalHeader());
}

QTreeWidget* DemoWindow::makeListView(const QString& file)
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

QTableView* DemoWindow::makeDataGrid(const QString& file)
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

} // namespace pelloric::app
