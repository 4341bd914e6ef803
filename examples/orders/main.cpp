// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

// A larger host: orders of a database with a filter, the pages of what is left beside them, the
// preview window with its tools, and a PDF file without asking anybody. Called with --pdf FILE or
// --picture FILE it leaves the pages, or what it looks like, in a file and ends.

#include "order_form.h"

#include <pelloric/preview.h>

#include <QApplication>
#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QVariant>

#include <cstdio>

namespace {

constexpr int Orders = 120;

/// A database in memory with made-up orders.
bool fillDatabase()
{
    QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"));
    database.setDatabaseName(QStringLiteral(":memory:"));
    if (!database.open())
        return false;
    QSqlQuery query(QStringLiteral("CREATE TABLE orders (\"Order\" INTEGER PRIMARY KEY, "
                                   "Day TEXT, Customer TEXT, Article TEXT, Pieces INTEGER, "
                                   "Amount TEXT)"));
    const QStringList customers { QStringLiteral("Ferreira Lda"), QStringLiteral("海鸥五金"),
        QStringLiteral("Lindqvist AB"), QStringLiteral("Marzena Nowak") };
    const QStringList articles { QStringLiteral("Copper wire"), QStringLiteral("轴承 6204"),
        QStringLiteral("Gasket set") };
    database.transaction();
    query.prepare(QStringLiteral("INSERT INTO orders VALUES (?, ?, ?, ?, ?, ?)"));
    for (int order = 0; order < Orders; ++order) {
        const int pieces = 1 + order * 7 % 40;
        query.addBindValue(1000 + order);
        query.addBindValue(QStringLiteral("2025-%1-%2")
                               .arg(1 + order / 28, 2, 10, QLatin1Char('0'))
                               .arg(1 + order % 28, 2, 10, QLatin1Char('0')));
        query.addBindValue(customers[order * 5 % customers.size()]);
        query.addBindValue(articles[order % articles.size()]);
        query.addBindValue(pieces);
        query.addBindValue(QString::number(pieces * 12.5, 'f', 2));
        if (!query.exec())
            return false;
    }
    return database.commit();
}

} // namespace

int main(int count, char** arguments)
{
    QApplication application(count, arguments);
    pelloric::qt::usePreviewWindow();
    if (!fillDatabase()) {
        std::fprintf(stderr, "%s\n", qPrintable(QSqlDatabase::database().lastError().text()));
        return 1;
    }
    OrderForm form;
    const QStringList words = QApplication::arguments();
    if (words.value(1) == QLatin1String("--pdf"))
        return form.savePdf(words.value(2)) ? 0 : 1;
    form.show();
    QApplication::processEvents();
    if (words.value(1) == QLatin1String("--picture"))
        return form.grab().save(words.value(2)) ? 0 : 1;
    return QApplication::exec();
}
