// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/report_tools.h"

#include "support/show_document.h"
#include "ui/qt/options_panel.h"
#include "ui/qt/preview_world.h"

#include <pelloric/preview.h>

#include <QAccessible>
#include <QCheckBox>
#include <QComboBox>
#include <QSpinBox>
#include <QStatusBar>
#include <QStyle>
#include <QStyleOptionComboBox>

#include <cstdlib>

namespace pelloric::qt {

namespace {

class ReportToolsTest : public PreviewWorld {
protected:
    /// A grid that is wider than upright paper, and shown with its panel.
    void previewWide()
    {
        std::vector<TableColumn> columns;
        for (int column = 1; column <= 5; ++column)
            columns.push_back({ u"C" + decimal(column), 3000 });
        auto grid = std::make_unique<TableGrid>(std::move(columns));
        const std::array<TextView, 5> row { u"a", u"b", u"c", u"d", u"e" };
        for (int count = 0; count < 3; ++count)
            grid->addRow(row);
        opener_.openPreview(std::move(grid));
        ASSERT_TRUE(QTest::qWaitForWindowActive(opener_.window()));
        press(Qt::Key_F4);
    }

    void press(Qt::Key key) { QTest::keyClick(QApplication::focusWidget(), key); }

    OptionsPanel& panel() { return *opener_.window()->findChild<OptionsPanel*>(); }

    template <typename Part> Part& part(const char* name)
    {
        return *panel().findChild<Part*>(QLatin1String(name));
    }

    std::string firstPage() { return textsOf(canvas().document(), 0); }

    QString status()
    {
        auto* const bar = opener_.window()->findChild<QStatusBar*>();
        return bar && bar->isVisible() ? bar->currentMessage() : QString();
    }
};

/// Keeps the panel, in light and in dark, where the environment says, to be looked at.
void keepPictures(OptionsPanel& panel, const QString& name)
{
    const char* const folder = std::getenv("PELLORIC_PICTURES");
    if (!folder)
        return;
    const QString file = QString::fromUtf8(folder) + QStringLiteral("/panel-") + name;
    EXPECT_TRUE(panel.grab().save(file + QStringLiteral(".png")));
    const QPalette light = panel.palette();
    panel.setPalette(QPalette(QColor(0x35, 0x35, 0x35)));
    EXPECT_TRUE(panel.grab().save(file + QStringLiteral("-dark.png")));
    panel.setPalette(light);
}

} // namespace

TEST_F(ReportToolsTest, HideThePanelUntilF4AsksForItAndGiveThePagesTheKeyboardBack)
{
    preview(3);
    EXPECT_FALSE(panel().isVisible());
    EXPECT_EQ(status(), QString());
    press(Qt::Key_F4);
    EXPECT_TRUE(panel().isVisible());
    EXPECT_TRUE(part<QCheckBox>("asShown").hasFocus());
    press(Qt::Key_F4);
    EXPECT_FALSE(panel().isVisible());
    EXPECT_TRUE(opener_.window()->canvas().hasFocus());
    press(Qt::Key_F4);
    press(Qt::Key_Escape);
    EXPECT_FALSE(panel().isVisible()) << "Escape closes the panel first";
    EXPECT_TRUE(opener_.window()->isVisible());
}

TEST_F(ReportToolsTest, BuildThePagesAnewAtOnceAndSayWhatWasDoneToTheWidth)
{
    previewWide();
    EXPECT_EQ(canvas().Totalpages(), 2);
    part<QComboBox>("fit").setFocus();
    press(Qt::Key_Down);
    EXPECT_EQ(canvas().Totalpages(), 1);
    EXPECT_EQ(status(), QStringLiteral("The table fits on turned paper."));
    part<QComboBox>("fit").setFocus();
    press(Qt::Key_Up);
    EXPECT_EQ(canvas().Totalpages(), 2);
    EXPECT_EQ(status(), QString());
    part<QSpinBox>("keyColumns").setFocus();
    press(Qt::Key_Up);
    EXPECT_EQ(firstPage().substr(0, 8), "C1|C2|C3");
    EXPECT_EQ(textsOf(canvas().document(), 1).substr(0, 8), "C1|C4|C5");
}

TEST_F(ReportToolsTest, TakeATextWhenItIsEnteredAndTellAnErrorWithoutLosingThePages)
{
    previewWide();
    auto& columns = part<QLineEdit>("columns");
    columns.setFocus();
    QTest::keyClicks(&columns, QStringLiteral("C5, C1"));
    EXPECT_EQ(firstPage().substr(0, 5), "C1|C2") << "not before Enter";
    QTest::keyClick(&columns, Qt::Key_Return);
    EXPECT_EQ(firstPage(), "C5|C1|e|a|e|a|e|a|1 of [Pages]");
    columns.selectAll();
    QTest::keyClicks(&columns, QStringLiteral("Nothing"));
    QTest::keyClick(&columns, Qt::Key_Return);
    const auto boxes = messages_.take();
    ASSERT_EQ(boxes.size(), 1U);
    EXPECT_NE(toUtf8(boxes[0].text).find("Nothing"), std::string::npos);
    EXPECT_EQ(firstPage(), "C5|C1|e|a|e|a|e|a|1 of [Pages]");
    EXPECT_EQ(
        opener_.window()->canvas().reportOptions().columns, (std::vector<Text> { u"C5", u"C1" }));
}

TEST_F(ReportToolsTest, ShowTheOptionsOfTheHostAndKeepWhatTheyHaveNoPartFor)
{
    ReportOptions options;
    options.asShown = true;
    options.fit.pagesAcross = 3;
    options.fit.leastSize = 4;
    options.whereColumn = u"C1";
    options.whereText = u"a";
    options.totals = { { u"C1", AggregateFunction::Count }, { u"C2", AggregateFunction::Maximum } };
    options.watermark.text = u"Draft";
    opener_.setReportOptions(options);
    previewWide();
    EXPECT_TRUE(part<QCheckBox>("asShown").isChecked());
    EXPECT_EQ(part<QSpinBox>("pagesAcross").value(), 3);
    EXPECT_EQ(part<QLineEdit>("watermark").text(), QStringLiteral("Draft"));
    part<QCheckBox>("asShown").setChecked(false);
    const ReportOptions& now = opener_.window()->canvas().reportOptions();
    EXPECT_FALSE(now.asShown);
    EXPECT_EQ(now.fit, options.fit);
    EXPECT_EQ(now.whereColumn, u"C1");
    EXPECT_EQ(now.totals, options.totals);
    EXPECT_EQ(canvas().document().reportPictures(0).size(), 1U);
}

TEST_F(ReportToolsTest, ShowWhatAHostGaveTheCanvasItselfWhenThePanelIsAskedFor)
{
    previewWide();
    press(Qt::Key_F4);
    ReportOptions options;
    options.fit.toSheet = true;
    options.columns = { u"C1", u"C2, net" };
    opener_.window()->canvas().setReportOptions(options);
    press(Qt::Key_F4);
    EXPECT_EQ(part<QComboBox>("fit").currentIndex(), 1);
    EXPECT_EQ(part<QLineEdit>("columns").text(), QStringLiteral("C1, \"C2, net\""));
}

TEST_F(ReportToolsTest, ShowHintsThatCanBeReadInADarkPalette)
{
    const QPalette light = QApplication::palette();
    QPalette dark(QColor(0x35, 0x35, 0x35));
    dark.setColor(QPalette::PlaceholderText, QColor(0, 0, 0, 128)); // as many hosts leave it
    QApplication::setPalette(dark);
    previewWide();
    const QPalette shown = part<QLineEdit>("columns").palette();
    QApplication::setPalette(light);
    EXPECT_EQ(shown.color(QPalette::PlaceholderText).rgb(), shown.color(QPalette::Text).rgb());
    EXPECT_GT(shown.color(QPalette::Text).lightness(), 200);
}

TEST_F(ReportToolsTest, SayThatADocumentFileHoldsNoWatermark)
{
    ReportOptions options;
    options.watermark.text = u"Draft";
    opener_.setReportOptions(options);
    answerFiles(file("kept.ostl"));
    preview(3);
    click(21);
    EXPECT_NE(status().indexOf(QStringLiteral("without watermark")), -1);
    opener_.setReportOptions({});
    opener_.openPreview(gridOf(3));
    EXPECT_EQ(status(), QString());
    click(21);
    EXPECT_EQ(status(), QString()) << "nothing is missing";
}

TEST_F(ReportToolsTest, ClipNoEntryOfTheirLists)
{
    for (const char* const language : { "en", "de", "zh_CN" }) {
        installTranslation(QLocale(QString::fromLatin1(language)));
        OptionsPanel own;
        own.show();
        own.resize(own.minimumSizeHint().width(), 600);
        QCoreApplication::processEvents();
        keepPictures(own, QString::fromLatin1(language));
        for (const QComboBox* const box : own.findChildren<QComboBox*>()) {
            int longest = 0;
            for (int entry = 0; entry < box->count(); ++entry)
                longest
                    = std::max(longest, box->fontMetrics().horizontalAdvance(box->itemText(entry)));
            QStyleOptionComboBox option;
            option.initFrom(box);
            const QRect room = box->style()->subControlRect(
                QStyle::CC_ComboBox, &option, QStyle::SC_ComboBoxEditField, box);
            EXPECT_GE(room.width(), longest) << language << " " << box->objectName().toStdString();
        }
    }
    installTranslation(QLocale::c());
}

TEST_F(ReportToolsTest, SayWhatTotalsLeaveOutAndHowManyPagesLieAcross)
{
    ReportOptions options;
    options.totals = { { u"C2" } };
    options.fit.toSheet = true;
    options.fit.leastScale = 1;
    opener_.setReportOptions(options);
    std::vector<TableColumn> columns;
    for (int column = 1; column <= 8; ++column)
        columns.push_back({ u"C" + decimal(column), 3000 });
    auto grid = std::make_unique<TableGrid>(std::move(columns));
    const std::array<TextView, 2> row { u"a", u"no number" };
    grid->addRow(row);
    opener_.openPreview(std::move(grid));
    EXPECT_EQ(status(),
        QStringLiteral("Too wide to be shrunk: printed in bands. Pages across: 3. Cells of C2 that "
                       "show no number and that its total leaves out: 1."));
}

TEST_F(ReportToolsTest, GiveEveryPartAName)
{
    previewWide();
    int parts = 0;
    for (QWidget* const widget : panel().widget()->findChildren<QWidget*>()) {
        const QString name = widget->objectName();
        const bool isOwn = !name.isEmpty() && !name.startsWith(QLatin1String("qt_"));
        if (!isOwn || !(widget->focusPolicy() & Qt::TabFocus) || widget->focusProxy())
            continue;
        ++parts;
        EXPECT_FALSE(
            QAccessible::queryAccessibleInterface(widget)->text(QAccessible::Name).isEmpty())
            << name.toStdString();
    }
    EXPECT_EQ(parts, 21);
}

} // namespace pelloric::qt
