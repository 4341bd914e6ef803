// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_grids.h"
#include "export/qt/pdf_equals_toolkit.h"
#include "grids/qt/grid_for.h"
#include "support/qt/sample_grids.h"

#include <QTableWidget>
#include <QTreeWidget>

#include <memory>

namespace pelloric::qt {

namespace {

constexpr Sample Wines { "wine.csv", u',' };
constexpr Sample Zones { "time-zones.tsv", u'\t' };

/// The grids of the demonstration, each of them plainly and as its view shows it.
class DemoPages : public PdfEqualsToolkit, public testing::WithParamInterface<bool> {
protected:
    void expectEqualPages(AutomationObject& grid, PrintObjKind kind = PrintObjKind::MSFlexGrid)
    {
        ReportOptions options;
        options.asShown = GetParam();
        expectEqualReport(grid, options, 1, kind);
    }
};

} // namespace

TEST_P(DemoPages, OfATableEqualTheToolkits)
{
    const std::unique_ptr<QTableWidget> wines(app::makeWineTable(gridOf(Wines)));
    expectEqualPages(*gridFor(*wines));
}

TEST_P(DemoPages, OfSpansEqualTheToolkits)
{
    const std::unique_ptr<QTableWidget> classes(app::makeWineClasses(gridOf(Wines)));
    expectEqualPages(*gridFor(*classes));
}

TEST_P(DemoPages, OfATreeEqualTheToolkits)
{
    const std::unique_ptr<QTreeWidget> zones(app::makeZoneTree(gridOf(Zones)));
    expectEqualPages(*gridFor(*zones), PrintObjKind::ListView);
}

INSTANTIATE_TEST_SUITE_P(PlainAndAsShown, DemoPages, testing::Bool());

} // namespace pelloric::qt
