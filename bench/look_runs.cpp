// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// Measures what it costs to print cells as their view shows them, beside the plain page:
//   pelloric_bench_looks [ROWS]    100,000 rows unless given

#include "judgement.h"
#include "sample_table.h"

#include "controls/canvas.h"
#include "grids/qt/grid_for.h"
#include "platform/automation_object.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"

#include <QAbstractTableModel>
#include <QApplication>
#include <QBrush>
#include <QFont>
#include <QTableView>
#include <QTemporaryDir>

#include <algorithm>
#include <array>
#include <cstdlib>
#include <initializer_list>

namespace {

using namespace pelloric;

constexpr int Repeats = 3;

/// The sample table as a model, each cell of which has a font, colours and an alignment of its own.
class LookModel final : public QAbstractTableModel {
public:
    LookModel(const TableGrid& table, bool hasLooks)
        : table_(table)
        , hasLooks_(hasLooks)
    {
        font_.setBold(true);
        font_.setUnderline(true);
    }

    int rowCount(const QModelIndex& parent) const override
    {
        return parent.isValid() ? 0 : static_cast<int>(table_.rowCount());
    }

    int columnCount(const QModelIndex& parent) const override
    {
        return parent.isValid() ? 0 : table_.columnCount();
    }

    QVariant data(const QModelIndex& index, int role) const override
    {
        if (role == Qt::DisplayRole) {
            const TextView text = table_.cell(index.row(), index.column());
            return QString::fromUtf16(text.data(), static_cast<qsizetype>(text.size()));
        }
        if (!hasLooks_)
            return {};
        switch (role) {
        case Qt::FontRole:
            return index.column() % 2 == 0 ? font_ : QFont();
        case Qt::TextAlignmentRole:
            return static_cast<int>(Qt::AlignRight | Qt::AlignVCenter);
        case Qt::ForegroundRole:
            return QBrush(index.row() % 2 == 0 ? Qt::darkBlue : Qt::darkRed);
        case Qt::BackgroundRole:
            return QBrush(index.column() % 2 == 0 ? QColor(0xFFF2F2F2) : QColor(0xFFE8F0FE));
        default:
            return {};
        }
    }

private:
    const TableGrid& table_;
    bool hasLooks_;
    QFont font_;
};

/// What asking a model for some roles of every cell takes, whatever is done with the answers.
double walkSeconds(const QAbstractItemModel& model, std::initializer_list<int> roles)
{
    double least = 1e9;
    for (int repeat = 0; repeat < Repeats; ++repeat) {
        const bench::StopWatch watch;
        for (int row = 0; row < model.rowCount(); ++row) {
            for (int column = 0; column < model.columnCount(); ++column) {
                const QModelIndex index = model.index(row, column);
                for (const int role : roles)
                    index.data(role);
            }
        }
        least = std::min(least, watch.seconds());
    }
    return least;
}

class Runs {
public:
    Runs()
    {
        platform_.folders().setSystemDirectory(folder_.path().toStdString());
        record_ = std::make_unique<Platform>(platform_.record());
        deployDefaultSettings(*record_);
    }

    void all(std::int64_t rows)
    {
        TableGrid table = bench::sampleTable(rows);
        LookModel shown(table, true);
        bench::print("bare walk of the model, the text of every cell", rows,
            walkSeconds(shown, { Qt::DisplayRole, Qt::CheckStateRole }), "");
        bench::print("bare walk of the model, its look besides", rows,
            walkSeconds(shown,
                { Qt::DisplayRole, Qt::CheckStateRole, Qt::FontRole, Qt::TextAlignmentRole,
                    Qt::ForegroundRole, Qt::BackgroundRole, Qt::CheckStateRole,
                    Qt::DecorationRole }),
            "");
        const auto [plain, asShown] = compare(shown);
        bench::print("plain page of a view", rows, plain, "");
        bench::print("as shown, a look in every cell", rows, asShown, "");
        bench::judge("as shown / plain, looks everywhere", asShown / plain, 2, true);
        const auto [tablePlain, tableShown] = compare(table);
        bench::print("plain page of a table without view", rows, tablePlain, "");
        bench::print("as shown, no view", rows, tableShown, "");
        bench::judge("as shown / plain, no looks to read", tableShown / tablePlain, 1.1, true);
    }

private:
    using Pair = std::array<double, 2>; ///< plain and as shown: seconds

    Pair compare(LookModel& model)
    {
        QTableView view;
        view.setModel(&model);
        for (int column = 0; column < model.columnCount({}); ++column)
            view.setColumnWidth(column, 80);
        const auto grid = qt::gridFor(view);
        return compare(*grid);
    }

    /// The best of some runs that take turns, so that both meet the same machine.
    Pair compare(AutomationObject& grid)
    {
        Pair best { 1e9, 1e9 };
        for (int repeat = 0; repeat < Repeats; ++repeat) {
            for (const bool asShown : { false, true }) {
                Canvas canvas(*record_);
                canvas.options.asShown = asShown;
                const bench::StopWatch watch;
                canvas.doPreview(grid);
                double& seconds = best[asShown ? 1 : 0];
                seconds = std::min(seconds, watch.seconds());
            }
        }
        return best;
    }

    QTemporaryDir folder_;
    qt::QtPlatform platform_;
    std::unique_ptr<Platform> record_;
};

} // namespace

int main(int count, char** arguments)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(count, arguments);
    Runs().all(count > 1 ? std::atoll(arguments[1]) : 100'000);
    return 0;
}
