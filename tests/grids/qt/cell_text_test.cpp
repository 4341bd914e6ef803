// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "grids/qt/cell_text.h"

#include "platform/qt/qt_text.h"

#include <QApplication>
#include <QBitArray>
#include <QColor>
#include <QDateTime>
#include <QHeaderView>
#include <QItemDelegate>
#include <QJsonValue>
#include <QKeySequence>
#include <QLine>
#include <QPixmap>
#include <QPoint>
#include <QProxyStyle>
#include <QRect>
#include <QStandardItemModel>
#include <QTableView>
#include <QUrl>
#include <QUuid>
#include <QVersionNumber>

#include <gtest/gtest.h>

#include <cstdio>

namespace pelloric::qt {

namespace {

struct NamedValue {
    const char* name;
    QVariant value;
};

std::vector<NamedValue> valuesOfAllTypes()
{
    const QDate date(2004, 10, 23);
    return {
        { "text", QStringLiteral("45000") },
        { "text of lines", QStringLiteral("Unit\nprice") },
        { "empty text", QStringLiteral("") },
        { "no text", QString() },
        { "nothing", QVariant() },
        { "truth", true },
        { "int", 45000 },
        { "negative int", -1234567 },
        { "unsigned", 4000000000U },
        { "short", QVariant::fromValue<short>(-12345) },
        { "unsigned short", QVariant::fromValue<unsigned short>(54321) },
        { "long", QVariant::fromValue<long>(-9876543210L) },
        { "unsigned long", QVariant::fromValue<unsigned long>(9876543210UL) },
        { "long long", QVariant(Q_INT64_C(-123456789012345678)) },
        { "unsigned long long", QVariant(Q_UINT64_C(12345678901234567890)) },
        { "signed char", QVariant::fromValue<signed char>(-7) },
        { "unsigned char", QVariant::fromValue<unsigned char>(200) },
        { "character", QVariant(QChar(u'数')) },
        { "float", 1234.5F },
        { "double", 1234567.891 },
        { "small double", 0.1 + 0.2 },
        { "large double", 1e21 },
        { "date", date },
        { "time", QTime(13, 5, 9) },
        { "moment", QDateTime(date, QTime(13, 5, 9)) },
        { "bytes", QByteArray("bytes 1000") },
        { "list of texts", QStringList { QStringLiteral("a") } },
        { "list", QVariantList { 1, 2 } },
        { "address", QUrl(QStringLiteral("https://example.org/a b")) },
        { "identifier", QUuid(QStringLiteral("{67c8770b-44f1-410a-ab9a-f9b5446f13ee}")) },
        { "colour", QColor(Qt::red) },
        { "keys", QKeySequence(Qt::CTRL | Qt::Key_P) },
        { "point", QPoint(1000, 2000) },
        { "size", QSize(1000, 2000) },
        { "rectangle", QRect(1, 2, 3, 4) },
        { "line", QLine(1, 2, 3, 4) },
        { "bits", QBitArray(3) },
        { "json", QJsonValue(1234.5) },
        { "locale", QLocale(QLocale::German) },
        { "picture", QPixmap(4, 4) },
        { "enumerator", QVariant::fromValue(Qt::AlignRight) },
    };
}

/// Keeps the texts of the items that a view paints.
class PaintedTexts : public QProxyStyle {
public:
    void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
        const QWidget* widget) const override
    {
        if (const auto* item = qstyleoption_cast<const QStyleOptionViewItem*>(option);
            item && element == CE_ItemViewItem)
            painted = item->text;
        QProxyStyle::drawControl(element, option, painter, widget);
    }

    mutable QString painted;
};

class CellTextTest : public testing::Test {
protected:
    CellTextTest()
    {
        model_.setRowCount(1);
        model_.setColumnCount(1);
        view_.setModel(&model_);
        view_.setStyle(&style_);
        view_.resize(400, 120);
        view_.horizontalHeader()->resizeSection(0, 300);
    }

    QString painted()
    {
        style_.painted.clear();
        view_.grab();
        return style_.painted.replace(QChar(QChar::LineSeparator), QLatin1Char('\n'));
    }

    QString read()
    {
        CellText text;
        text.take(view_);
        return toQString(text.of(view_, cell()));
    }

    QModelIndex cell() const { return model_.index(0, 0); }

    PaintedTexts style_;
    QStandardItemModel model_;
    QTableView view_;
};

/// Says what a cell is worth, in its own words.
class Worded : public QStyledItemDelegate {
public:
    QString displayText(const QVariant& value, const QLocale& locale) const override
    {
        return QStringLiteral("worth\n") + locale.toString(value.toInt());
    }
};

/// Decides about everything itself.
class Rewriting : public QStyledItemDelegate {
protected:
    void initStyleOption(QStyleOptionViewItem* option, const QModelIndex& index) const override
    {
        QStyledItemDelegate::initStyleOption(option, index);
        option->features
            |= QStyleOptionViewItem::HasDisplay | QStyleOptionViewItem::HasCheckIndicator;
        option->checkState = Qt::Checked;
        option->text = option->fontMetrics.elidedText(
            QStringLiteral("a text that is longer than many cells are wide"), Qt::ElideRight,
            option->rect.width());
    }
};

/// Shows what nobody can read.
class OnlyPainting : public QAbstractItemDelegate {
public:
    void paint(QPainter*, const QStyleOptionViewItem&, const QModelIndex&) const override { }
    QSize sizeHint(const QStyleOptionViewItem&, const QModelIndex&) const override { return {}; }
};

} // namespace

TEST_F(CellTextTest, SaysOfEveryTypeOfValueInEveryLocaleWhatTheViewPaints)
{
    const QLocale locales[] = { QLocale::c(), QLocale(QStringLiteral("en_US")),
        QLocale(QStringLiteral("de_DE")), QLocale(QStringLiteral("zh_CN")) };
    std::printf("%-20s | %-28s | %-28s | %-28s | %-28s\n", "value", "C", "en_US", "de_DE", "zh_CN");
    int compared = 0;
    for (const NamedValue& row : valuesOfAllTypes()) {
        std::printf("%-20s", row.name);
        model_.setData(cell(), row.value, Qt::DisplayRole);
        for (const QLocale& locale : locales) {
            view_.setLocale(locale);
            const QString expected = painted();
            EXPECT_EQ(read(), expected) << row.name << " in " << locale.name().toStdString();
            ++compared;
            QString oneLine = expected;
            std::printf(" | %-28s", qPrintable(oneLine.replace(QLatin1Char('\n'), QChar(u'⏎'))));
        }
        std::printf("\n");
    }
    EXPECT_GE(compared, 120);
}

TEST_F(CellTextTest, NumbersHaveNoGroupSeparatorsAsInEveryView)
{
    view_.setLocale(QLocale(QStringLiteral("de_DE")));
    model_.setData(cell(), 45000, Qt::DisplayRole);
    EXPECT_EQ(read(), QStringLiteral("45000"));
    model_.setData(cell(), 1234.5, Qt::DisplayRole);
    EXPECT_EQ(read(), QStringLiteral("1234,5"));
}

TEST_F(CellTextTest, ADelegatesOwnWordsAreTaken)
{
    Worded worded;
    view_.setItemDelegate(&worded);
    model_.setData(cell(), 45000, Qt::DisplayRole);
    EXPECT_EQ(read(), QStringLiteral("worth\n45000"));
    EXPECT_EQ(read(), painted());
    model_.setData(cell(), QVariant(), Qt::DisplayRole);
    EXPECT_EQ(read(), painted()) << "a cell without a value is not worded";
}

TEST_F(CellTextTest, ADelegatesOwnOptionIsTakenWithoutEliding)
{
    Rewriting rewriting;
    view_.setItemDelegate(&rewriting);
    EXPECT_EQ(read(), QStringLiteral("☑ a text that is longer than many cells are wide"));
}

TEST_F(CellTextTest, TheOlderDelegateShowsMoreDigits)
{
    QItemDelegate older;
    view_.setItemDelegate(&older);
    view_.setLocale(QLocale(QStringLiteral("de_DE")));
    model_.setData(cell(), 1234567.891, Qt::DisplayRole);
    EXPECT_EQ(read(), QStringLiteral("1234567,891"));
}

TEST_F(CellTextTest, OfADelegateThatOnlyPaintsTheModelsTextIsTaken)
{
    OnlyPainting onlyPainting;
    view_.setItemDelegate(&onlyPainting);
    model_.setData(cell(), QStringLiteral("17"), Qt::DisplayRole);
    EXPECT_EQ(read(), QStringLiteral("17"));
}

} // namespace pelloric::qt
