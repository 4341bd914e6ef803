// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "order_form.h"

#include <pelloric/pelloric.h>

#include <QFileDialog>
#include <QHeaderView>
#include <QLineEdit>
#include <QMessageBox>
#include <QSplitter>
#include <QTableView>
#include <QToolBar>

namespace {

constexpr int TypingPause = 250; ///< milliseconds
constexpr float FirstScale = 0.6F;

} // namespace

OrderForm::OrderForm()
    : filter_(new QLineEdit)
    , view_(new QTableView)
    , pages_(new pelloric::qt::Sorvane)
    , preview_(new pelloric::qt::Kestrane(this))
{
    orders_.setTable(QStringLiteral("orders"));
    orders_.select();
    left_.setSourceModel(&orders_);
    left_.setFilterKeyColumn(-1);
    left_.setFilterCaseSensitivity(Qt::CaseInsensitive);
    view_->setModel(&left_);
    view_->setSortingEnabled(true);
    view_->sortByColumn(0, Qt::AscendingOrder);
    view_->verticalHeader()->hide();
    view_->resizeColumnsToContents();
    preview_->hide();

    // A canvas of one's own paints nothing until it is told that it is no placeholder.
    pages_->setstrSCliectRect(QStringLiteral("full"));
    pelloric::ReportOptions options;
    options.fit.toSheet = true;
    options.totals = { { u"Pieces" }, { u"Amount" } };
    pages_->setReportOptions(options);
    pages_->setDispScale(FirstScale);

    auto* const halves = new QSplitter;
    halves->addWidget(view_);
    halves->addWidget(pages_);
    halves->setSizes({ 1, 1 });
    setCentralWidget(halves);
    addTools();
    resize(1200, 760);
    setWindowTitle(QStringLiteral("Orders"));
    buildPages();
}

void OrderForm::addTools()
{
    QToolBar* const tools = addToolBar(QStringLiteral("Tools"));
    filter_->setPlaceholderText(QStringLiteral("Filter"));
    filter_->setClearButtonEnabled(true);
    tools->addWidget(filter_);
    tools->addAction(QStringLiteral("Preview"), this, [this] { preview_->doPreview(view_); });
    tools->addAction(QStringLiteral("Save as PDF…"), this, &OrderForm::askForPdf);

    pause_.setSingleShot(true);
    pause_.setInterval(TypingPause);
    connect(filter_, &QLineEdit::textChanged, &pause_, qOverload<>(&QTimer::start));
    connect(&pause_, &QTimer::timeout, this, [this] {
        left_.setFilterFixedString(filter_->text());
        buildPages();
    });
    connect(view_->horizontalHeader(), &QHeaderView::sortIndicatorChanged, this,
        [this] { buildPages(); });
}

void OrderForm::buildPages() { pages_->doPreview(view_); }

bool OrderForm::savePdf(const QString& path)
{
    try {
        exportPdf(*pages_, { .path = path, .title = QStringLiteral("Orders") });
    } catch (const pelloric::RunTimeError& error) {
        QMessageBox::warning(this, windowTitle(), QString::fromUtf8(error.what()));
        return false;
    }
    return true;
}

void OrderForm::askForPdf()
{
    const QString path = QFileDialog::getSaveFileName(this, QStringLiteral("Save as PDF"),
        QStringLiteral("orders.pdf"), QStringLiteral("PDF (*.pdf)"));
    if (!path.isEmpty())
        savePdf(path);
}
