// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "demo_grids.h"

#include "grids/table_grid.h"
#include "platform/qt/qt_text.h"

#include <QCoreApplication>
#include <QHeaderView>
#include <QPainter>
#include <QPixmap>
#include <QTableWidget>
#include <QTreeWidget>

#include <algorithm>
#include <array>
#include <map>
#include <vector>

namespace pelloric::app {

namespace {

constexpr int ClassColumn = 1; ///< of the wines
constexpr double StrongAlcohol = 14; ///< percent
constexpr int AlcoholColumn = 2;
constexpr int IconPixels = 32;

/// The classes' colours; further ones begin anew.
constexpr auto ClassColors = std::to_array<QRgb>({ 0xFFFDECEA, 0xFFEAF4FD, 0xFFEFF8EA });
constexpr auto ClassInks = std::to_array<QRgb>({ 0xFFB3261E, 0xFF1A5FB4, 0xFF2E7D32 });

/// A measure of the wines that classes are compared by.
struct Measure {
    const char* title;
    int column;
};

constexpr auto Measures = std::to_array<Measure>({
    { "Alcohol", 2 },
    { "Malic acid", 3 },
    { "Magnesium", 6 },
    { "Color intensity", 11 },
    { "Proline", 14 },
});

QString textOf(const TableGrid& table, std::int64_t row, int column)
{
    return qt::toQString(table.cell(row, column));
}

QTableWidgetItem* numberItem(const QString& text)
{
    auto* const item = new QTableWidgetItem(text);
    item->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
    return item;
}

QTableWidgetItem* boldItem(const QString& text)
{
    auto* const item = new QTableWidgetItem(text);
    QFont font;
    font.setBold(true);
    item->setFont(font);
    return item;
}

/// The classes of the wines in the order of their names, each with its number from 0.
std::map<QString, std::size_t> classesOf(const TableGrid& wines)
{
    std::map<QString, std::size_t> classes;
    for (std::int64_t row = 0; row < wines.rowCount(); ++row)
        classes.emplace(textOf(wines, row, ClassColumn), 0);
    std::size_t number = 0;
    for (auto& [name, place] : classes)
        place = number++;
    return classes;
}

/// The numbers of a column of the wines of a class, sorted.
std::vector<double> numbersOf(const TableGrid& wines, const QString& name, int column)
{
    std::vector<double> numbers;
    for (std::int64_t row = 0; row < wines.rowCount(); ++row) {
        if (textOf(wines, row, ClassColumn) == name)
            numbers.push_back(textOf(wines, row, column).toDouble());
    }
    std::sort(numbers.begin(), numbers.end());
    return numbers;
}

void addClass(QTableWidget& view, const TableGrid& wines, const QString& name, std::size_t place)
{
    const int first = view.rowCount();
    view.setRowCount(first + static_cast<int>(Measures.size()));
    auto* const title = boldItem(name);
    title->setTextAlignment(Qt::AlignCenter);
    title->setForeground(QColor(ClassInks[place % ClassInks.size()]));
    title->setBackground(QColor(ClassColors[place % ClassColors.size()]));
    view.setItem(first, 0, title);
    view.setSpan(first, 0, static_cast<int>(Measures.size()), 1);
    for (std::size_t number = 0; number < Measures.size(); ++number) {
        const int row = first + static_cast<int>(number);
        const auto values = numbersOf(wines, name, Measures[number].column);
        auto* const measure = new QTableWidgetItem(QLatin1String(Measures[number].title));
        measure->setCheckState(number % 2 == 0 ? Qt::Checked : Qt::Unchecked);
        view.setItem(row, 1, measure);
        view.setItem(row, 2, numberItem(QString::number(values.front())));
        view.setItem(row, 3, numberItem(QString::number(values[values.size() / 2])));
        view.setItem(row, 4, numberItem(QString::number(values.back())));
    }
}

/// A disc of a colour.
QIcon discOf(QRgb color)
{
    QPixmap disc(IconPixels, IconPixels);
    disc.fill(Qt::transparent);
    QPainter painter(&disc);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(QColor(color));
    painter.drawEllipse(disc.rect().adjusted(3, 3, -3, -3));
    return { disc };
}

QTreeWidgetItem* addRegion(QTreeWidget& view, const QString& name)
{
    auto* const region = new QTreeWidgetItem(&view, { name });
    QFont font;
    font.setBold(true);
    region->setFont(0, font);
    region->setBackground(0, QColor(0xFFE8EEF7));
    region->setIcon(0,
        discOf(ClassInks[static_cast<std::size_t>(view.topLevelItemCount()) % ClassInks.size()]));
    region->setFirstColumnSpanned(true);
    return region;
}

} // namespace

QTableWidget* makeWineTable(const TableGrid& wines)
{
    auto* const view = new QTableWidget(static_cast<int>(wines.rowCount()), wines.columnCount());
    const auto classes = classesOf(wines);
    for (int row = 0; row < view->rowCount(); ++row) {
        for (int column = 0; column < view->columnCount(); ++column) {
            const QString text = textOf(wines, row, column);
            view->setItem(
                row, column, column == ClassColumn ? new QTableWidgetItem(text) : numberItem(text));
        }
        const std::size_t place = classes.at(view->item(row, ClassColumn)->text());
        view->item(row, ClassColumn)
            ->setBackground(QColor(ClassColors[place % ClassColors.size()]));
        QTableWidgetItem& alcohol = *view->item(row, AlcoholColumn);
        if (alcohol.text().toDouble() < StrongAlcohol)
            continue;
        alcohol.setForeground(QColor(ClassInks.front()));
        QFont font = alcohol.font();
        font.setBold(true);
        alcohol.setFont(font);
    }
    return view;
}

QTableWidget* makeWineClasses(const TableGrid& wines)
{
    auto* const view = new QTableWidget(0, 5);
    view->setHorizontalHeaderLabels({ QCoreApplication::translate("DemoGrids", "Class"),
        QCoreApplication::translate("DemoGrids", "Measure"),
        QCoreApplication::translate("DemoGrids", "Least"),
        QCoreApplication::translate("DemoGrids", "Median"),
        QCoreApplication::translate("DemoGrids", "Most") });
    for (int column = 2; column < view->columnCount(); ++column)
        view->horizontalHeaderItem(column)->setTextAlignment(Qt::AlignRight | Qt::AlignVCenter);
    for (const auto& [name, place] : classesOf(wines))
        addClass(*view, wines, name, place);
    return view;
}

QTreeWidget* makeZoneTree(const TableGrid& zones)
{
    constexpr int Country = 1;
    constexpr int Zone = 2;
    constexpr int Coordinates = 3;
    auto* const view = new QTreeWidget;
    view->setUniformRowHeights(true); // rows that are laid out before have no height then
    view->setHeaderLabels({ QCoreApplication::translate("DemoGrids", "Zone"),
        QCoreApplication::translate("DemoGrids", "Country"),
        QCoreApplication::translate("DemoGrids", "Coordinates") });
    std::map<QString, QTreeWidgetItem*> regions;
    for (std::int64_t row = 0; row < zones.rowCount(); ++row) {
        const QString zone = textOf(zones, row, Zone);
        QTreeWidgetItem*& region = regions[zone.section(QLatin1Char('/'), 0, 0)];
        if (!region)
            region = addRegion(*view, zone.section(QLatin1Char('/'), 0, 0));
        auto* const item = new QTreeWidgetItem(region,
            { zone.section(QLatin1Char('/'), 1), textOf(zones, row, Country),
                textOf(zones, row, Coordinates) });
        item->setCheckState(0, row % 3 == 0 ? Qt::Checked : Qt::Unchecked);
        item->setTextAlignment(2, Qt::AlignRight | Qt::AlignVCenter);
    }
    view->expandAll();
    return view;
}

} // namespace pelloric::app
