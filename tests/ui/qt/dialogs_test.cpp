// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/messages.h"
#include "fakes/fake_platform.h"
#include "platform/numbers.h"
#include "platform/qt/qt_text.h"
#include "print/paper_names.h"
#include "settings/default_settings.h"
#include "settings/settings_file.h"
#include "support/file_size_limit.h"
#include "ui/qt/color_picker.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/font_chooser.h"
#include "ui/qt/grid_style_dialog.h"
#include "ui/qt/page_setup_dialog.h"
#include "ui/qt/print_options_dialog.h"

#include <QAbstractSpinBox>
#include <QApplication>
#include <QCheckBox>
#include <QColorDialog>
#include <QComboBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QRadioButton>
#include <QTabWidget>
#include <QTest>
#include <QTimer>
#include <QToolButton>
#include <QToolTip>
#include <QTreeWidget>

namespace pelloric::qt {

namespace {

/// The visible text of a widget of whatever kind.
QString textOf(const QWidget* widget)
{
    if (const auto* label = qobject_cast<const QLabel*>(widget))
        return label->text();
    if (const auto* button = qobject_cast<const QAbstractButton*>(widget))
        return button->text();
    if (const auto* group = qobject_cast<const QGroupBox*>(widget))
        return group->title();
    if (const auto* edit = qobject_cast<const QLineEdit*>(widget))
        return edit->text();
    if (const auto* list = qobject_cast<const QComboBox*>(widget))
        return list->currentText();
    if (const auto* menu = qobject_cast<const QMenu*>(widget))
        return menu->title();
    return {};
}

/// A control of the inventory; an empty name stands for captions that have none.
struct Control {
    const char* kind; ///< a class that the widget is of
    const char* name;
    const char16_t* text;
};

void expectControls(const QWidget& dialog, const std::vector<Control>& controls)
{
    for (const Control& control : controls) {
        int found = 0;
        for (const QWidget* widget : dialog.findChildren<QWidget*>(QLatin1String(control.name))) {
            if (widget->inherits(control.kind)
                && textOf(widget) == QString::fromUtf16(control.text))
                ++found;
        }
        EXPECT_GE(found, 1) << control.kind << " " << control.name << " " << toUtf8(control.text);
    }
}

template <typename Widget> Widget& child(const QWidget& dialog, const char* name)
{
    auto* widget = dialog.findChild<Widget*>(QLatin1String(name));
    if (widget == nullptr)
        throw std::runtime_error(name);
    return *widget;
}

std::string boxText(const QWidget& dialog, const char* name)
{
    return child<QLineEdit>(dialog, name).text().toStdString();
}

QStringList tabTexts(const QWidget& dialog)
{
    QStringList texts;
    const auto& tabs = child<QTabWidget>(dialog, "tabStrip1");
    for (int tab = 0; tab < tabs.count(); ++tab)
        texts.append(tabs.tabText(tab));
    return texts;
}

QStringList columnTexts(const QTreeWidget& list)
{
    QStringList texts;
    for (int column = 0; column < list.columnCount(); ++column)
        texts.append(list.headerItem()->text(column));
    return texts;
}

void press(const QWidget& dialog, const char* button)
{
    QTest::mouseClick(&child<QAbstractButton>(dialog, button), Qt::LeftButton);
}

/// Replaces all of a box's text by typing.
void typeInto(QLineEdit& box, const QString& text)
{
    box.setFocus();
    box.selectAll();
    QTest::keyClick(&box, Qt::Key_Delete);
    QTest::keyClicks(&box, text);
}

void clickRow(QTreeWidget& list, int row)
{
    QTreeWidgetItem* item = list.topLevelItem(row);
    list.scrollToItem(item);
    QTest::mouseClick(list.viewport(), Qt::LeftButton, {}, list.visualItemRect(item).center());
}

void showTab(QDialog& dialog, int tab)
{
    child<QTabWidget>(dialog, "tabStrip1").setCurrentIndex(tab);
    dialog.show();
    ASSERT_TRUE(QTest::qWaitForWindowExposed(&dialog));
}

/// The default settings in a folder of their own, standard papers and two printers.
class DialogWorld : public testing::Test, public FakePlatform {
protected:
    DialogWorld()
    {
        deployDefaultSettings(services());
        printers.paperForms = standardPaperForms();
        printers.names = { u"First", u"第二台" };
        printers.current = u"First";
    }

    std::string file() const { return folder.read("OstlConfig.ini"); }

    std::string setting(TextView key) { return toUtf8(readSetting(services(), key)); }

    void store(TextView key, TextView value) { writeSetting(services(), key, value); }
};

/// Does something with the dialog that a press opens, which it ends.
template <typename Dialog, typename Answer>
void pressAndAnswer(const QWidget& dialog, const char* button, const Answer& answer)
{
    QTimer::singleShot(0, qApp, [&answer] {
        QWidget* const opened = QApplication::activeModalWidget();
        auto* const wanted = qobject_cast<Dialog*>(opened);
        ASSERT_TRUE(wanted);
        answer(*wanted);
        EXPECT_FALSE(opened->isVisible());
    });
    press(dialog, button);
}

const auto Escape = [](QWidget& opened) { QTest::keyClick(&opened, Qt::Key_Escape); };

/// Presses the button of a colour and chooses another.
void pickColor(const QWidget& dialog, const char* button, const QColor& color)
{
    pressAndAnswer<QColorDialog>(dialog, button, [&](QColorDialog& opened) {
        opened.setCurrentColor(color);
        opened.accept();
    });
}

/// Presses the button of a font and enters another into the dialog.
/// @return  what the dialog was opened with
ColoredFont enterFont(const QWidget& dialog, const char* button, const ColoredFont& font)
{
    ColoredFont preset;
    pressAndAnswer<FontChooser>(dialog, button, [&](FontChooser& opened) {
        preset = opened.chosen();
        typeInto(*child<QComboBox>(opened, "cboFace").lineEdit(), toQString(font.font.name));
        typeInto(*child<QComboBox>(opened, "cboSize").lineEdit(),
            toQString(formatSingle(font.font.size)));
        child<QCheckBox>(opened, "chkBold").setChecked(font.font.bold);
        child<QCheckBox>(opened, "chkItalic").setChecked(font.font.italic);
        child<QCheckBox>(opened, "chkStrikeOut").setChecked(font.font.strikethrough);
        child<QCheckBox>(opened, "chkUnderline").setChecked(font.font.underline);
        pickColor(opened, "clrFont", colorOf(font.color));
        press(opened, "cmdOk");
    });
    return preset;
}

ColoredFont blueArial()
{
    ColoredFont font;
    font.font = { .name = u"Arial", .size = 10.5F, .bold = true, .underline = true };
    font.color = 0xFF0000;
    return font;
}

using PageSetupDialogTest = DialogWorld;
using GridStyleDialogTest = DialogWorld;
using PrintOptionsDialogTest = DialogWorld;

} // namespace

TEST_F(PageSetupDialogTest, SaysBesideAValueWhileItIsTypedWhyItCannotBe)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 1);
    const auto& hint = child<QLabel>(dialog, "labMarginHint");
    EXPECT_EQ(hint.text(), "");
    const QSize before = dialog.size();
    typeInto(child<QLineEdit>(dialog, "txtTop"), "400");
    EXPECT_TRUE(hint.text().startsWith("Top 400 mm is printed as 640 mm; "))
        << hint.text().toStdString();
    EXPECT_EQ(dialog.size(), before);
    press(dialog, "cmdRestore");
    EXPECT_EQ(hint.text(), "");
    showTab(dialog, 0);
    typeInto(child<QLineEdit>(dialog, "txtWidth"), "200");
    EXPECT_TRUE(child<QLabel>(dialog, "labSizeHint").text().startsWith("Width \"200\" lacks"));
}

TEST_F(PageSetupDialogTest, HasEveryControlWithItsCaption)
{
    const PageSetupDialog dialog(services());
    EXPECT_EQ(dialog.windowTitle(), "Page Setup");
    EXPECT_TRUE(dialog.isModal());
    EXPECT_EQ(tabTexts(dialog), QStringList({ "Page", "Margins", "Header\\Footer" }));
    EXPECT_EQ(child<QTabWidget>(dialog, "tabStrip1").currentIndex(), 0);
    EXPECT_EQ(columnTexts(child<QTreeWidget>(dialog, "ListView1")),
        QStringList({ "name", "cx", "cy", "value" }));
    expectControls(dialog,
        {
            { "QGroupBox", "Frame1", u"Page" },
            { "QLabel", "labPagerSize", u"PagerSize" },
            { "QLabel", "", u"Width:" },
            { "QLineEdit", "txtWidth", u"210mm" },
            { "QLabel", "", u"Height:" },
            { "QLineEdit", "txtHeight", u"297mm" },
            { "QRadioButton", "Option1(1)", u"Portrait" },
            { "QRadioButton", "Option1(2)", u"Landscape" },
            { "QWidget", "ImgV", u"" },
            { "QWidget", "ImgH", u"" },
            { "QFrame", "Frame2", u"" },
            { "QLabel", "", u"Top:" },
            { "QLabel", "", u"Buttom:" },
            { "QLabel", "", u"Left:" },
            { "QLabel", "", u"Right:" },
            { "QLineEdit", "txtTop", u"10 mm" },
            { "QLineEdit", "txtButtom", u"10 mm" },
            { "QLineEdit", "txtLeft", u"10 mm" },
            { "QLineEdit", "txtRight", u"10 mm" },
            { "QAbstractSpinBox", "cmdTop", u"" },
            { "QAbstractSpinBox", "cmdButtom", u"" },
            { "QAbstractSpinBox", "cmdLeft", u"" },
            { "QAbstractSpinBox", "cmdRight", u"" },
            { "QPushButton", "cmdRestore", u"Restore Original" },
            { "QGroupBox", "fraBack", u"Preview" },
            { "QWidget", "PicPreview", u"" },
            { "QWidget", "PicTop(0)", u"" },
            { "QWidget", "PicTop(1)", u"" },
            { "QWidget", "PicTop(2)", u"" },
            { "QWidget", "PicTop(3)", u"" },
            { "QFrame", "Frame4", u"" },
            { "QFrame", "Frame5", u"" },
            { "QLabel", "Label3", u"Header" },
            { "QLabel", "Label4", u"Footer" },
            { "QLineEdit", "txtFormat(1)", u"" },
            { "QLineEdit", "txtFormat(2)", u"" },
            { "QLineEdit", "txtFormat(3)", u"" },
            { "QLineEdit", "txtFormat(4)", u"" },
            { "QLineEdit", "txtFormat(5)", u"[Page # of Pages #]" },
            { "QLineEdit", "txtFormat(6)", u"" },
            { "QLineEdit", "txtHeaderFont", u"9 pt. 宋体" },
            { "QLineEdit", "txtFooterFont", u"9 pt. 宋体" },
            { "QPushButton", "cmdHeaderFont", u"Font..." },
            { "QPushButton", "cmdFooterFont", u"Font..." },
            { "QMenu", "ActiveBar1", u"PopMenu" },
            { "QPushButton", "cmdOk", u"OK" },
            { "QPushButton", "cmdCancel", u"Cancel" },
        });
    EXPECT_TRUE(child<QPushButton>(dialog, "cmdOk").isDefault());
    EXPECT_TRUE(child<QLineEdit>(dialog, "txtHeaderFont").isReadOnly());
    EXPECT_FALSE(child<QWidget>(dialog, "ImgV").isHidden());
    EXPECT_TRUE(child<QWidget>(dialog, "ImgH").isHidden());
}

TEST_F(PageSetupDialogTest, ListsThePapersByTheirPlace)
{
    printers.paperForms
        = { { u"A4", 210, 297 }, { u"Envelope", 110, 220.005 }, { u"16开", 185, 260 } };
    const PageSetupDialog dialog(services());
    const auto& list = child<QTreeWidget>(dialog, "ListView1");
    ASSERT_EQ(list.topLevelItemCount(), 3);
    EXPECT_EQ(list.topLevelItem(0)->text(1), "210.00 mm");
    EXPECT_EQ(list.topLevelItem(2)->text(0), QStringLiteral("16开"));
    EXPECT_EQ(list.topLevelItem(2)->text(2), "260.00 mm");
    EXPECT_EQ(list.topLevelItem(2)->text(3), "3");
    EXPECT_TRUE(list.selectedItems().isEmpty());
}

TEST_F(PageSetupDialogTest, StaysWithoutPapersWhereThereAreNone)
{
    printers.paperForms.clear();
    PageSetupDialog dialog(services());
    EXPECT_EQ(child<QTreeWidget>(dialog, "ListView1").topLevelItemCount(), 0);
    press(dialog, "cmdOk");
    EXPECT_EQ(dialog.saved(), SaveOutcome::Written);
}

TEST_F(PageSetupDialogTest, CancelLeavesTheFileByteForByte)
{
    const std::string before = file();
    PageSetupDialog dialog(services());
    typeInto(child<QLineEdit>(dialog, "txtTop"), "33");
    press(dialog, "cmdRestore");
    press(dialog, "cmdCancel");
    EXPECT_EQ(file(), before);
    EXPECT_EQ(dialog.result(), QDialog::Rejected);
    EXPECT_FALSE(dialog.saved());
    PageSetupDialog escaped(services());
    QTest::keyClick(&escaped, Qt::Key_Escape);
    EXPECT_EQ(file(), before);
}

TEST_F(PageSetupDialogTest, OkWithoutAChangeWritesWhatWasThere)
{
    const std::string before = file();
    PageSetupDialog dialog(services());
    press(dialog, "cmdOk");
    EXPECT_EQ(dialog.saved(), SaveOutcome::Written);
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    std::string written = before;
    written.erase(0, 3); // both quotes enclose the text, which begins with a line end
    EXPECT_EQ(file(), "\"\r\n" + written);
}

TEST_F(PageSetupDialogTest, OkWritesTheChangedKeysAndNoOther)
{
    const std::string before = file();
    PageSetupDialog dialog(services());
    showTab(dialog, 0);
    clickRow(child<QTreeWidget>(dialog, "ListView1"), 7);
    child<QRadioButton>(dialog, "Option1(2)").click();
    typeInto(child<QLineEdit>(dialog, "txtTop"), "12.5");
    child<QLineEdit>(dialog, "txtFormat(1)").setText("  页眉 & [Page #]  ");
    enterFont(dialog, "cmdFooterFont", blueArial());
    press(dialog, "cmdOk");
    std::string expected = before;
    const auto change = [&expected](const std::string& from, const std::string& to) {
        const auto place = expected.find("\r\n" + from + "\r\n");
        ASSERT_NE(place, std::string::npos) << from;
        expected.replace(place + 2, from.size(), to);
    };
    change("PagerSize= A4", "PagerSize= A3");
    change("PagerSizeValue= 9", "PagerSizeValue= 8");
    change("PagerOrientation= 1", "PagerOrientation= 2");
    change("PagerWidth= 210", "PagerWidth= 420.00");
    change("PagerHeight= 297", "PagerHeight= 297.00");
    change("Top= 10", "Top= 12.5");
    change("HeaderLeft= ", "HeaderLeft= 页眉 & [Page #]");
    change("FooterFontName= 宋体", "FooterFontName= Arial");
    change("FooterFontSize= 9", "FooterFontSize= 10.5");
    change("FooterFontBold= 0", "FooterFontBold= 1");
    change("FooterFontUnderline= 0", "FooterFontUnderline= 1");
    change("FooterFontColor= 0", "FooterFontColor= 16711680");
    // "420.00 " is what stands before "mm"; trailing blanks go with the line that is read.
    EXPECT_EQ(setting(u"PagerWidth"), "420.00");
    std::string written = file();
    for (const std::string size : { "420.00 \r", "297.00 \r" }) {
        const auto place = written.find(size);
        if (place != std::string::npos)
            written.erase(place + size.size() - 2, 1);
    }
    EXPECT_EQ(written, expected);
}

TEST_F(PageSetupDialogTest, AMissingKeyStopsTheSaveSilently)
{
    std::string bytes = file();
    bytes.erase(bytes.find("FooterRight"), std::string("FooterRight= \r\n").size());
    folder.write("OstlConfig.ini", bytes);
    PageSetupDialog dialog(services());
    typeInto(child<QLineEdit>(dialog, "txtTop"), "20");
    press(dialog, "cmdOk");
    EXPECT_EQ(file(), bytes);
    EXPECT_EQ(dialog.saved(), SaveOutcome::NothingWritten);
    EXPECT_FALSE(dialog.isVisible());
}

TEST_F(PageSetupDialogTest, ASizeWithoutUnitStopsTheSaveAndAnEmptyOneKeepsItsKey)
{
    const std::string before = file();
    PageSetupDialog without(services());
    typeInto(child<QLineEdit>(without, "txtWidth"), "200");
    press(without, "cmdOk");
    EXPECT_EQ(without.saved(), SaveOutcome::NothingWritten);
    EXPECT_EQ(file(), before);
    PageSetupDialog empty(services());
    typeInto(child<QLineEdit>(empty, "txtWidth"), "");
    typeInto(child<QLineEdit>(empty, "txtHeight"), "300mm");
    press(empty, "cmdOk");
    EXPECT_EQ(setting(u"PagerWidth"), "210");
    EXPECT_EQ(setting(u"PagerHeight"), "300");
}

TEST_F(PageSetupDialogTest, ClickingAPaperFillsTheBoxesByOrientation)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 0);
    auto& list = child<QTreeWidget>(dialog, "ListView1");
    clickRow(list, 10);
    EXPECT_EQ(textOf(&child<QLabel>(dialog, "labPagerSize")), "PagerSize: A5");
    EXPECT_EQ(boxText(dialog, "txtWidth"), "148.00 mm");
    child<QRadioButton>(dialog, "Option1(2)").click();
    EXPECT_EQ(boxText(dialog, "txtWidth"), "210.00 mm");
    EXPECT_TRUE(child<QWidget>(dialog, "ImgV").isHidden());
    EXPECT_FALSE(child<QWidget>(dialog, "ImgH").isHidden());
    clickRow(list, 7);
    EXPECT_EQ(boxText(dialog, "txtWidth"), "420.00 mm");
    EXPECT_EQ(boxText(dialog, "txtHeight"), "297.00 mm");
}

TEST_F(PageSetupDialogTest, ThePaperInForceStandsOutAndTheLabelWaitsForAClick)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 0);
    auto& list = child<QTreeWidget>(dialog, "ListView1");
    ASSERT_EQ(list.selectedItems().size(), 1);
    EXPECT_EQ(list.indexOfTopLevelItem(list.selectedItems().front()), 8);
    EXPECT_EQ(child<QLabel>(dialog, "labPagerSize").text(), "PagerSize");
    EXPECT_EQ(boxText(dialog, "txtWidth"), "210mm");
    clickRow(list, 8);
    EXPECT_EQ(child<QLabel>(dialog, "labPagerSize").text(), "PagerSize: A4");
    EXPECT_EQ(boxText(dialog, "txtWidth"), "210.00 mm");
}

TEST_F(PageSetupDialogTest, ExchangesTheSizesByTheirTexts)
{
    PageSetupDialog dialog(services());
    typeInto(child<QLineEdit>(dialog, "txtWidth"), "1000mm");
    child<QRadioButton>(dialog, "Option1(2)").click();
    EXPECT_EQ(boxText(dialog, "txtWidth"), "297mm");
    EXPECT_EQ(boxText(dialog, "txtHeight"), "1000mm");
}

TEST_F(PageSetupDialogTest, AnyOtherOrientationOpensInLandscape)
{
    store(u"PagerOrientation", u"7");
    const PageSetupDialog dialog(services());
    EXPECT_TRUE(child<QRadioButton>(dialog, "Option1(2)").isChecked());
    EXPECT_EQ(boxText(dialog, "txtWidth"), "297mm");
}

TEST_F(PageSetupDialogTest, TypingKeepsDigitsAndPointsAndTheCaret)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 1);
    auto& box = child<QLineEdit>(dialog, "txtLeft");
    typeInto(box, "a1b2c.5x");
    EXPECT_EQ(box.text(), "12.5 mm");
    EXPECT_EQ(box.cursorPosition(), 4);
    box.setCursorPosition(1);
    QTest::keyClick(&box, '9');
    EXPECT_EQ(box.text(), "192.5 mm");
    EXPECT_EQ(box.cursorPosition(), 2);
    typeInto(box, "");
    EXPECT_EQ(box.text(), " mm");
    press(dialog, "cmdOk");
    EXPECT_EQ(setting(u"HeaderLeft"), "");
    EXPECT_NE(file().find("\r\nLeft= 0\r\n"), std::string::npos);
}

TEST_F(PageSetupDialogTest, SpinsByOneMillimetreAndOnlyDownFromAboveZero)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 1);
    auto& spin = child<QAbstractSpinBox>(dialog, "cmdRight");
    spin.stepUp();
    EXPECT_EQ(boxText(dialog, "txtRight"), "11 mm");
    struct Case {
        const char* typed;
        const char* down;
    };
    for (const Case& step : { Case { "0", "0 mm" }, { "0.5", "-0.5 mm" }, { "12.5", "11.5 mm" } }) {
        typeInto(child<QLineEdit>(dialog, "txtRight"), QLatin1String(step.typed));
        spin.stepDown();
        EXPECT_EQ(boxText(dialog, "txtRight"), step.down);
    }
    QTest::keyClick(&child<QLineEdit>(dialog, "txtRight"), Qt::Key_Up);
    EXPECT_EQ(boxText(dialog, "txtRight"), "12.5 mm");
}

TEST_F(PageSetupDialogTest, RestoresTenMillimetresAndOpensAStoredZeroSo)
{
    store(u"Top", u"0");
    PageSetupDialog dialog(services());
    EXPECT_EQ(boxText(dialog, "txtTop"), "10 mm");
    typeInto(child<QLineEdit>(dialog, "txtTop"), "44");
    typeInto(child<QLineEdit>(dialog, "txtButtom"), "55");
    press(dialog, "cmdRestore");
    for (const char* box : { "txtTop", "txtButtom", "txtLeft", "txtRight" })
        EXPECT_EQ(boxText(dialog, box), "10 mm");
}

TEST_F(PageSetupDialogTest, AFieldReplacesTheWholeBoxThatHadTheFocus)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 2);
    dialog.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&dialog));
    const auto& menu = child<QMenu>(dialog, "ActiveBar1");
    const QStringList captions { "Date Printed", "Time Printed", "Date and Time Printed",
        "Page # of Pages #", "Total Pages", "Page Number" };
    const QStringList fields { "[Date Printed]", "[Time Printed]", "[Date & Time Printed]",
        "[Page # of Pages #]", "[Total Pages]", "[Page #]" };
    ASSERT_EQ(menu.actions().size(), captions.size());
    for (int entry = 0; entry < captions.size(); ++entry) {
        auto& box = child<QLineEdit>(dialog, entry % 2 == 0 ? "txtFormat(3)" : "txtFormat(4)");
        box.setText("other text");
        box.setFocus();
        EXPECT_EQ(menu.actions().at(entry)->text(), captions.at(entry));
        menu.actions().at(entry)->trigger();
        EXPECT_EQ(box.text(), fields.at(entry));
    }
}

TEST_F(PageSetupDialogTest, OpensTheFieldsByTheButtonAndByTheRightButton)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 2);
    auto& menu = child<QMenu>(dialog, "ActiveBar1");
    press(dialog, "cmdField(6)");
    ASSERT_TRUE(menu.isVisible());
    QTest::keyClick(&menu, Qt::Key_Down);
    QTest::keyClick(&menu, Qt::Key_Return);
    EXPECT_EQ(boxText(dialog, "txtFormat(6)"), "[Date Printed]");
    auto& box = child<QLineEdit>(dialog, "txtFormat(2)");
    QContextMenuEvent asked(QContextMenuEvent::Mouse, QPoint(3, 3), box.mapToGlobal(QPoint(3, 3)));
    QApplication::sendEvent(&box, &asked);
    ASSERT_TRUE(menu.isVisible());
    menu.actions().at(5)->trigger();
    menu.hide();
    EXPECT_EQ(boxText(dialog, "txtFormat(2)"), "[Page #]");
}

TEST_F(PageSetupDialogTest, TakesTheFontThatWasChosenAndNoneThatWasCancelled)
{
    PageSetupDialog dialog(services());
    pressAndAnswer<FontChooser>(dialog, "cmdHeaderFont", Escape);
    EXPECT_EQ(boxText(dialog, "txtHeaderFont"), "9 pt. 宋体");
    EXPECT_EQ(enterFont(dialog, "cmdHeaderFont", blueArial()).font.name, u"宋体");
    EXPECT_EQ(boxText(dialog, "txtHeaderFont"), "10.5 pt. Arial [ Bold Underline ]");
    EXPECT_EQ(boxText(dialog, "txtFooterFont"), "9 pt. 宋体");
    EXPECT_EQ(child<QLineEdit>(dialog, "txtHeaderFont").palette().color(QPalette::Text),
        QColor(0, 0, 255));
    ColoredFont nameless = blueArial();
    nameless.font.name.clear();
    enterFont(dialog, "cmdHeaderFont", nameless);
    EXPECT_EQ(boxText(dialog, "txtHeaderFont"), "10.5 pt. 宋体 [ Bold Underline ]");
}

TEST_F(PageSetupDialogTest, MarginLinesAreDraggedWithTheMouse)
{
    struct Case {
        const char* line;
        const char* box;
        QPoint way;
        Qt::CursorShape shape;
    };
    const Case cases[] = {
        { "PicTop(0)", "txtTop", { 0, 60 }, Qt::SizeVerCursor },
        { "PicTop(1)", "txtRight", { -60, 0 }, Qt::SizeHorCursor },
        { "PicTop(2)", "txtButtom", { 0, -60 }, Qt::SizeVerCursor },
        { "PicTop(3)", "txtLeft", { 60, 0 }, Qt::SizeHorCursor },
    };
    PageSetupDialog dialog(services());
    showTab(dialog, 1);
    const double pixelsPerMm = child<QWidget>(dialog, "PicPreview").width() / (5964 / 28.4);
    for (const Case& drag : cases) {
        auto& line = child<QWidget>(dialog, drag.line);
        const QPoint grip = line.rect().center();
        const QPoint before = line.pos();
        QTest::mouseMove(&line, grip);
        EXPECT_EQ(line.cursor().shape(), drag.shape) << drag.line;
        QTest::mousePress(&line, Qt::LeftButton, {}, grip);
        QTest::mouseMove(&line, grip + drag.way);
        EXPECT_NEAR((line.pos() - before - drag.way).manhattanLength(), 0, 1) << drag.line;
        QTest::mouseRelease(&line, Qt::LeftButton, {}, line.rect().center());
        const QString text = child<QLineEdit>(dialog, drag.box).text();
        EXPECT_NEAR(text.chopped(3).toDouble(), 10 + 60 / pixelsPerMm, 1) << text.toStdString();
        EXPECT_EQ(text.indexOf(QLatin1Char('.')), text.size() - 6) << text.toStdString();
    }
}

TEST_F(PageSetupDialogTest, NoMarginLinePassesTheOppositeOne)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 1);
    auto& line = child<QWidget>(dialog, "PicTop(0)");
    const QPoint grip = line.rect().center();
    QTest::mouseMove(&line, grip);
    QTest::mousePress(&line, Qt::LeftButton, {}, grip);
    QTest::mouseMove(&line, grip + QPoint(0, 5000));
    QTest::mouseRelease(&line, Qt::LeftButton, {}, grip);
    EXPECT_LE(line.y(), child<QWidget>(dialog, "PicTop(2)").y());
    EXPECT_GT(line.y(), child<QWidget>(dialog, "PicPreview").height() / 2);
}

TEST_F(PageSetupDialogTest, NoMarginLineIsDraggedOffTheSheet)
{
    PageSetupDialog dialog(services());
    showTab(dialog, 1);
    struct Case {
        const char* line;
        const char* box;
        QPoint way;
    };
    const Case cases[] = {
        { "PicTop(0)", "txtTop", { 0, -400 } },
        { "PicTop(1)", "txtRight", { 400, 0 } },
        { "PicTop(2)", "txtButtom", { 0, 400 } },
        { "PicTop(3)", "txtLeft", { -400, 0 } },
    };
    for (const Case& row : cases) {
        auto& line = child<QWidget>(dialog, row.line);
        const QPoint start = line.rect().center();
        QTest::mouseMove(&dialog, { 1, 1 });
        QTest::mouseMove(&line, start);
        QTest::mousePress(&line, Qt::LeftButton, {}, start);
        QTest::mouseMove(&line, start + row.way);
        QTest::mouseRelease(&line, Qt::LeftButton, {}, start);
        const std::string text = boxText(dialog, row.box);
        EXPECT_LT(std::stod(text), 2.0) << row.line;
        EXPECT_GT(std::stod(text), 0.0) << row.line;
    }
}

TEST_F(PageSetupDialogTest, OpensWithoutASettingsFile)
{
    std::filesystem::remove(settingsPath(services()));
    PageSetupDialog dialog(services());
    EXPECT_EQ(boxText(dialog, "txtTop"), "10 mm");
    press(dialog, "cmdOk");
    EXPECT_EQ(dialog.saved(), SaveOutcome::NothingWritten);
    EXPECT_EQ(file(), "(no file)");
}

#if defined(__unix__)
TEST_F(PageSetupDialogTest, AnswersThatTheFileCouldNotBeWritten)
{
    const std::string before = file();
    PageSetupDialog dialog(services());
    GridStyleDialog style(services());
    {
        const FileSizeLimit full(16);
        press(dialog, "cmdOk");
        press(style, "cmdOk");
    }
    EXPECT_EQ(dialog.saved(), SaveOutcome::WriteFailed);
    EXPECT_EQ(style.saved(), SaveOutcome::WriteFailed);
    EXPECT_EQ(file(), before);
}
#endif

TEST_F(PageSetupDialogTest, TabGoesThroughTheBoxesAsTheyStand)
{
    PageSetupDialog dialog(services());
    const QStringList orders[] = {
        { "ListView1", "txtWidth", "txtHeight", "Option1(1)" },
        { "cmdTop", "cmdButtom", "cmdLeft", "cmdRight", "cmdRestore" },
        { "txtFormat(1)", "txtFormat(2)", "txtFormat(3)", "txtHeaderFont", "cmdHeaderFont",
            "txtFormat(4)", "txtFormat(5)", "txtFormat(6)", "txtFooterFont", "cmdFooterFont" },
    };
    int tab = 0;
    for (const QStringList& order : orders) {
        showTab(dialog, tab++);
        dialog.activateWindow();
        ASSERT_TRUE(QTest::qWaitForWindowActive(&dialog));
        child<QWidget>(dialog, order.front().toLatin1().constData()).setFocus();
        for (const QString& name : order) {
            EXPECT_EQ(QApplication::focusWidget()->objectName(), name);
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        }
    }
}

TEST_F(GridStyleDialogTest, HasEveryControlWithItsCaption)
{
    const GridStyleDialog dialog(services());
    EXPECT_EQ(dialog.windowTitle(), "Report Face Designer");
    EXPECT_TRUE(dialog.isModal());
    EXPECT_EQ(tabTexts(dialog), QStringList({ "Options", "Colors", "Fonts" }));
    const auto& list = child<QTreeWidget>(dialog, "ListView1");
    EXPECT_EQ(columnTexts(list), QStringList({ "name", "value" }));
    ASSERT_EQ(list.topLevelItemCount(), 3);
    EXPECT_EQ(list.topLevelItem(0)->text(0), "Font");
    EXPECT_EQ(list.topLevelItem(1)->text(0), "Header Font");
    EXPECT_EQ(list.topLevelItem(2)->text(0), "Footer Font");
    EXPECT_EQ(list.topLevelItem(2)->text(1), QStringLiteral("9 pt. 宋体"));
    EXPECT_TRUE(list.selectedItems().isEmpty());
    expectControls(dialog,
        {
            { "QLabel", "Label1", u"Show" },
            { "QCheckBox", "ChkShow", u"Headers" },
            { "QLabel", "Label1", u"Grid" },
            { "QCheckBox", "ChkGrid(0)", u"Horizontal  Grid" },
            { "QCheckBox", "ChkGrid(1)", u"Vertical  Grid" },
            { "QCheckBox", "ChkMerge", u"Merge Cell" },
            { "QLabel", "Label2", u"Header Color" },
            { "pelloric::qt::ColorPicker", "clrHeader", u"" },
            { "QLabel", "Label2", u"Grid Line Color" },
            { "pelloric::qt::ColorPicker", "clrGrid", u"" },
            { "QPushButton", "cmdFont", u"Change Font..." },
            { "QPushButton", "cmdOk", u"OK" },
            { "QPushButton", "cmdCancel", u"Cancel" },
        });
    EXPECT_TRUE(child<QCheckBox>(dialog, "ChkShow").isTristate());
    EXPECT_FALSE(child<QCheckBox>(dialog, "ChkMerge").isTristate());
    EXPECT_EQ(child<ColorPicker>(dialog, "clrHeader").color(), 14737632);
}

TEST_F(GridStyleDialogTest, AGreyBoxIsTwoAndReadsBackAsSet)
{
    GridStyleDialog dialog(services());
    child<QCheckBox>(dialog, "ChkShow").setCheckState(Qt::PartiallyChecked);
    child<QCheckBox>(dialog, "ChkGrid(1)").click();
    child<QCheckBox>(dialog, "ChkMerge").click();
    press(dialog, "cmdOk");
    EXPECT_EQ(setting(u"ShowHeaders"), "2");
    EXPECT_EQ(setting(u"GridHor"), "1");
    EXPECT_EQ(setting(u"GridVer"), "0");
    EXPECT_EQ(setting(u"GridMerge"), "1");
    const GridStyleDialog again(services());
    EXPECT_EQ(child<QCheckBox>(again, "ChkShow").checkState(), Qt::Checked);
}

TEST_F(GridStyleDialogTest, ClicksOnHeadersGoOnAndOffAndLeaveAGreyBoxAtTwo)
{
    GridStyleDialog dialog(services());
    dialog.show();
    auto& headers = child<QCheckBox>(dialog, "ChkShow");
    EXPECT_EQ(headers.checkState(), Qt::Checked);
    for (const Qt::CheckState expected : { Qt::Unchecked, Qt::Checked, Qt::Unchecked }) {
        headers.click();
        EXPECT_EQ(headers.checkState(), expected);
    }
    headers.setCheckState(Qt::PartiallyChecked);
    QTest::keyClick(&headers, Qt::Key_Space);
    EXPECT_EQ(headers.checkState(), Qt::Checked);
    headers.click();
    press(dialog, "cmdOk");
    EXPECT_EQ(setting(u"ShowHeaders"), "0");
}

TEST_F(GridStyleDialogTest, CancelLeavesTheFileAndOkWritesColours)
{
    const std::string before = file();
    const QColor red(255, 16, 0);
    GridStyleDialog cancelled(services());
    pickColor(cancelled, "clrGrid", red);
    press(cancelled, "cmdCancel");
    EXPECT_EQ(file(), before);
    EXPECT_FALSE(cancelled.saved());
    GridStyleDialog dialog(services());
    pickColor(dialog, "clrGrid", red);
    pressAndAnswer<QColorDialog>(dialog, "clrGrid", Escape);
    press(dialog, "cmdOk");
    EXPECT_EQ(dialog.saved(), SaveOutcome::Written);
    EXPECT_EQ(setting(u"GridLineColor"), "4351");
    EXPECT_EQ(setting(u"HeaderColor"), "14737632");
}

TEST_F(GridStyleDialogTest, ChangesTheFontOfTheChosenRowOnly)
{
    GridStyleDialog dialog(services());
    press(dialog, "cmdFont"); // opens nothing
    const std::vector<Message> shown = messages.take();
    ASSERT_EQ(shown.size(), 1U);
    EXPECT_EQ(shown.front().text, u"请选择一项进行设置");
    EXPECT_EQ(shown.front().title, u"Font");
    EXPECT_EQ(shown.front().icon, MessageIcon::Information);
    showTab(dialog, 2);
    auto& list = child<QTreeWidget>(dialog, "ListView1");
    clickRow(list, 1);
    enterFont(dialog, "cmdFont", blueArial());
    EXPECT_EQ(list.topLevelItem(1)->text(1), "10.5 pt. Arial [ Bold Underline ]");
    EXPECT_EQ(list.topLevelItem(0)->text(1), QStringLiteral("9 pt. 宋体"));
    clickRow(list, 0);
    pressAndAnswer<FontChooser>(dialog, "cmdFont", Escape);
    EXPECT_EQ(list.topLevelItem(0)->text(1), QStringLiteral("9 pt. 宋体"));
    press(dialog, "cmdOk");
    EXPECT_EQ(setting(u"HeaderFontName"), "Arial");
    EXPECT_EQ(setting(u"HeaderFontColor"), "16711680");
    EXPECT_EQ(setting(u"FontName"), "宋体");
    EXPECT_EQ(setting(u"FooterFontName"), "宋体");
}

TEST_F(GridStyleDialogTest, AKeyThatIsMissingIsPassedOver)
{
    std::string bytes = file();
    bytes.erase(bytes.find("GridHor"), std::string("GridHor= 1\r\n").size());
    folder.write("OstlConfig.ini", bytes);
    GridStyleDialog dialog(services());
    child<QCheckBox>(dialog, "ChkMerge").click();
    press(dialog, "cmdOk");
    EXPECT_EQ(dialog.saved(), SaveOutcome::Written);
    EXPECT_EQ(setting(u"GridMerge"), "1");
    EXPECT_EQ(file().find("GridHor"), std::string::npos);
}

TEST_F(PrintOptionsDialogTest, HasEveryControlWithItsCaption)
{
    const PrintOptionsDialog dialog(services(), {});
    EXPECT_EQ(dialog.objectName(), "frmPrintPar");
    EXPECT_EQ(dialog.windowTitle(), "Print");
    EXPECT_TRUE(dialog.isModal());
    expectControls(dialog,
        {
            { "QGroupBox", "Frame3", u"Printer" },
            { "QLabel", "Label3", u"Name:" },
            { "QComboBox", "cboPrinter", u"First" },
            { "QGroupBox", "Frame1", u"Page Range" },
            { "QRadioButton", "Option1(0)", u"All" },
            { "QRadioButton", "Option1(1)", u"Range：" },
            { "QLineEdit", "Text1", u"" },
            { "QLabel", "Label1",
                u"Enter page number and/or page range  separated by commas.For example 1,3,5-12." },
            { "QGroupBox", "Frame2", u"Copies" },
            { "QLabel", "Label2", u"Number of Copies" },
            { "QLineEdit", "Text2", u"1" },
            { "QAbstractSpinBox", "UpDown1", u"" },
            { "QPushButton", "cmdOk", u"Print" },
            { "QPushButton", "cmdCancel", u"Close" },
        });
    EXPECT_TRUE(child<QRadioButton>(dialog, "Option1(0)").isChecked());
    EXPECT_FALSE(child<QLineEdit>(dialog, "Text1").isEnabled());
    EXPECT_TRUE(child<QPushButton>(dialog, "cmdOk").isDefault());
}

TEST_F(PrintOptionsDialogTest, HandsThePageListOn)
{
    struct Case {
        const char* typed;
        const char16_t* list;
    };
    const Case cases[] = {
        { "1,3,5-12", u"1,3,5,6,7,8,9,10,11,12" },
        { "1-3,5", u"1,2,3,5" },
        { "7", u"7" },
        { "2-2", u"2" },
        { "12-5", u"12,5" },
        { " 4 ", u"4" },
    };
    for (const Case& range : cases) {
        std::vector<PrintArguments> printed;
        PrintOptionsDialog dialog(services(), [&](const PrintArguments& arguments) {
            printed.push_back(arguments);
            return QString();
        });
        child<QRadioButton>(dialog, "Option1(1)").click();
        QTest::keyClicks(&child<QLineEdit>(dialog, "Text1"), range.typed);
        press(dialog, "cmdOk");
        ASSERT_EQ(printed.size(), 1U);
        EXPECT_EQ(toUtf8(printed.front().pageList), toUtf8(range.list));
        EXPECT_FALSE(printed.front().allPages);
        EXPECT_EQ(printed.front().copies, 1);
        EXPECT_EQ(dialog.result(), QDialog::Accepted);
    }
}

TEST_F(PrintOptionsDialogTest, CountsCopiesByTypingAndByItsButtons)
{
    std::vector<PrintArguments> printed;
    PrintOptionsDialog dialog(services(), [&](const PrintArguments& arguments) {
        printed.push_back(arguments);
        return QString();
    });
    auto& copies = child<QLineEdit>(dialog, "Text2");
    auto& steps = child<QAbstractSpinBox>(dialog, "UpDown1");
    typeInto(copies, "a1x");
    EXPECT_EQ(copies.text(), "1");
    steps.stepUp();
    EXPECT_EQ(copies.text(), "2");
    for (int step = 0; step < 4; ++step)
        steps.stepDown();
    EXPECT_EQ(copies.text(), "0");
    typeInto(copies, "");
    press(dialog, "cmdOk");
    ASSERT_EQ(printed.size(), 1U);
    EXPECT_EQ(printed.front(), (PrintArguments { true, u"", 1 }));
}

TEST_F(PrintOptionsDialogTest, MakesTheChosenPrinterTheCurrentOne)
{
    const PrintOptionsDialog dialog(services(), {});
    auto& list = child<QComboBox>(dialog, "cboPrinter");
    list.setFocus();
    QTest::keyClick(&list, Qt::Key_Down);
    EXPECT_EQ(printers.current, u"第二台");
}

TEST_F(PrintOptionsDialogTest, RefusesWithAMessageAndStaysOpen)
{
    const auto print = [](const PrintArguments&) {
        ADD_FAILURE() << "nothing can be printed";
        return QString();
    };
    printers.closed = { u"First" };
    PrintOptionsDialog closed(services(), print);
    closed.show();
    press(closed, "cmdOk");
    EXPECT_TRUE(closed.isVisible());
    std::vector<Message> shown = messages.take();
    ASSERT_EQ(shown.size(), 1U);
    EXPECT_EQ(shown.front().text, u"First打印机没有正常工作，不能打印");
    EXPECT_EQ(shown.front().title, u"提示");
    EXPECT_EQ(shown.front().icon, MessageIcon::Information);
    printers.names.clear();
    printers.current.clear();
    PrintOptionsDialog none(services(), print);
    none.show();
    press(none, "cmdOk");
    EXPECT_TRUE(none.isVisible());
    shown = messages.take();
    ASSERT_EQ(shown.size(), 1U);
    EXPECT_EQ(shown.front().text, u"对不起，不能打印，系统没有默认的打印机");
    EXPECT_EQ(shown.front().icon, MessageIcon::Information);
}

TEST_F(PrintOptionsDialogTest, PrintsOnceHoweverOftenItIsPressed)
{
    int printed = 0;
    PrintOptionsDialog* shown = nullptr;
    PrintOptionsDialog dialog(services(), [&](const PrintArguments&) {
        ++printed;
        child<QPushButton>(*shown, "cmdOk").click();
        QTest::keyClick(shown, Qt::Key_Escape);
        EXPECT_TRUE(shown->isVisible());
        return QString();
    });
    shown = &dialog;
    dialog.show();
    press(dialog, "cmdOk");
    EXPECT_EQ(printed, 1);
    EXPECT_FALSE(dialog.isVisible());
}

TEST_F(PrintOptionsDialogTest, TooManyCopiesPrintNothingAndAreShown)
{
    PrintOptionsDialog dialog(services(), [](const PrintArguments&) {
        ADD_FAILURE();
        return QString();
    });
    dialog.show();
    typeInto(child<QLineEdit>(dialog, "Text2"), "40000");
    press(dialog, "cmdOk");
    EXPECT_TRUE(dialog.isVisible());
    EXPECT_EQ(child<QLineEdit>(dialog, "Text2").selectedText(), "40000");
    QToolTip::hideText();
}

TEST_F(PrintOptionsDialogTest, SaysWhileItIsTypedWhatWouldPrintNothing)
{
    PrintOptionsDialog dialog(services(), {}, { .count = 12 });
    dialog.show();
    const auto hint = [&](const char* name) {
        const auto& label = child<QLabel>(dialog, name);
        return label.isVisible() ? label.text().toStdString() : std::string();
    };
    auto& range = child<QLineEdit>(dialog, "Text1");
    auto& copies = child<QLineEdit>(dialog, "Text2");
    EXPECT_EQ(hint("labRangeHint"), "");
    EXPECT_EQ(hint("labCopiesHint"), "");
    child<QRadioButton>(dialog, "Option1(1)").click();
    EXPECT_EQ(hint("labRangeHint"), "No page is named yet, so nothing would be printed.");
    typeInto(range, "13-20");
    EXPECT_EQ(hint("labRangeHint"), "None of these pages exists: the last one is 12.");
    typeInto(range, "12-20");
    EXPECT_EQ(hint("labRangeHint"), "");
    typeInto(range, "x");
    EXPECT_NE(hint("labRangeHint"), "");
    child<QRadioButton>(dialog, "Option1(0)").click();
    EXPECT_EQ(hint("labRangeHint"), "");
    typeInto(copies, "0");
    EXPECT_EQ(hint("labCopiesHint"), "Without a copy nothing would be printed.");
    typeInto(copies, "40000");
    EXPECT_EQ(hint("labCopiesHint"), "These are more copies than can be printed.");
    typeInto(copies, "");
    EXPECT_EQ(hint("labCopiesHint"), "");
}

TEST_F(PrintOptionsDialogTest, ShowsWhatIsSentAndStaysToSayWhereItWasEnded)
{
    PrintOptionsDialog* shown = nullptr;
    int stops = 0;
    PrintOptionsDialog dialog(services(), [&](const PrintArguments&) {
        shown->showSent(3, 12);
        EXPECT_TRUE(child<QPushButton>(*shown, "cmdStop").isVisible());
        EXPECT_EQ(child<QLabel>(*shown, "labSent").text(), "3 of 12 pages sent");
        child<QPushButton>(*shown, "cmdStop").click();
        QTest::keyClick(shown, Qt::Key_Escape);
        EXPECT_TRUE(shown->isVisible());
        return QStringLiteral("3 of 12 pages were sent.");
    });
    shown = &dialog;
    dialog.onStop([&] { ++stops; });
    dialog.show();
    press(dialog, "cmdOk");
    EXPECT_EQ(stops, 2);
    EXPECT_TRUE(dialog.isVisible());
    EXPECT_FALSE(child<QPushButton>(dialog, "cmdStop").isVisible());
    EXPECT_EQ(child<QLabel>(dialog, "labEnd").text(), "3 of 12 pages were sent.");
    EXPECT_TRUE(child<QComboBox>(dialog, "cboPrinter").isEnabled());
    QTest::keyClick(&dialog, Qt::Key_Escape);
    EXPECT_FALSE(dialog.isVisible());
}

TEST_F(PrintOptionsDialogTest, OffersAFileWhereThereIsNoPrinter)
{
    PrintOptionsDialog printing(services(), {});
    printing.show();
    EXPECT_FALSE(child<QPushButton>(printing, "cmdSavePages").isVisible());
    printers.names.clear();
    printers.current.clear();
    PrintOptionsDialog dialog(services(), {});
    dialog.show();
    EXPECT_EQ(child<QLabel>(dialog, "labPrinterHint").text(), "There is no printer.");
    EXPECT_FALSE(dialog.wantsFile());
    press(dialog, "cmdSavePages");
    EXPECT_TRUE(dialog.wantsFile());
    EXPECT_FALSE(dialog.isVisible());
}

TEST_F(PrintOptionsDialogTest, WarnsOfASheetOfAnotherSize)
{
    const PaperRequest pages { .code = 9, .width = 15309, .height = 22113 };
    const PrintOptionsDialog fitting(services(), {}, { .paper = pages });
    EXPECT_EQ(child<QLabel>(fitting, "labPrinterHint").text(), "");
    printers.sheet = PaperForm { u"A4", 210, 297 };
    const PrintOptionsDialog dialog(services(), {}, { .paper = pages });
    EXPECT_EQ(child<QLabel>(dialog, "labPrinterHint").text(),
        "The pages are 270 x 390 mm, the printer's sheet is A4 (210 x 297 mm): what does not fit "
        "on it is lost.");
}

namespace {

/// Printers of a system that tells about them late, or never.
class LatePrinters final : public FakePrinterSystem {
public:
    class Late final : public PrinterInquiry {
    public:
        explicit Late(const LatePrinters& system)
            : system_(system)
        {
        }

        const PrinterFacts* facts(std::chrono::milliseconds) override
        {
            return system_.answer ? &*system_.answer : nullptr;
        }

    private:
        const LatePrinters& system_;
    };

    std::unique_ptr<PrinterInquiry> inquire(const PaperRequest&) const override
    {
        return std::make_unique<Late>(*this);
    }

    std::optional<PrinterFacts> answer;
};

/// A platform whose print system answers late.
struct LateWorld : DialogWorld {
    LatePrinters late;

    Platform platform()
    {
        const Platform& known = services();
        return { known.metrics, known.codec, known.messages, known.loop, known.clock, known.folders,
            known.files, known.printer, late, known.library };
    }
};

using LatePrintersTest = LateWorld;

} // namespace

TEST_F(LatePrintersTest, PageSetupOpensWithTheStandardPapersUntilThePrinterTellsItsOwn)
{
    PageSetupDialog dialog(platform());
    dialog.show();
    auto& list = child<QTreeWidget>(dialog, "ListView1");
    EXPECT_EQ(list.topLevelItemCount(), static_cast<int>(standardPaperForms().size()));
    clickRow(list, 10);
    EXPECT_EQ(child<QLabel>(dialog, "labPagerSize").text(), "PagerSize: A5");
    late.answer.emplace().forms = standardPaperForms();
    late.answer->forms.push_back({ u"16开", 197, 273 });
    ASSERT_TRUE(QTest::qWaitFor([&] { return list.topLevelItemCount() == 48; }));
    EXPECT_EQ(list.topLevelItem(47)->text(0), "16开");
    EXPECT_TRUE(list.topLevelItem(10)->isSelected());
    EXPECT_EQ(child<QLabel>(dialog, "labPapersHint").text(), "");
}

TEST_F(LatePrintersTest, PageSetupSaysThatThePrintSystemIsSilent)
{
    PageSetupDialog dialog(platform());
    dialog.show();
    late.answer.emplace().forms = standardPaperForms();
    late.answer->trouble = u"the print system does not answer";
    auto& hint = child<QLabel>(dialog, "labPapersHint");
    ASSERT_TRUE(QTest::qWaitFor([&] { return hint.isVisible(); }));
    EXPECT_EQ(hint.text(), "These are the standard papers: the print system does not answer.");
}

TEST_F(LatePrintersTest, PrintOpensAtOnceAndThePrintersComeIn)
{
    PrintOptionsDialog dialog(platform(), {});
    dialog.show();
    auto& list = child<QComboBox>(dialog, "cboPrinter");
    EXPECT_EQ(list.count(), 0);
    late.answer.emplace().names = { u"First", u"第二台" };
    late.answer->current = u"第二台";
    ASSERT_TRUE(QTest::qWaitFor([&] { return list.count() == 2; }));
    EXPECT_EQ(list.currentText(), "第二台");
}

TEST(FontChooser, AnswersWhatItWasOpenedWith)
{
    ColoredFont font = blueArial();
    font.font.name = u"宋体";
    font.font.italic = true;
    font.font.strikethrough = true;
    const FontChooser chooser(font);
    EXPECT_EQ(chooser.objectName(), "CdlTest");
    EXPECT_EQ(chooser.chosen(), font);
}

TEST(FontChooser, TakesAFaceASizeStylesAndAColour)
{
    FontChooser chooser({});
    typeInto(*child<QComboBox>(chooser, "cboFace").lineEdit(), "Nowhere Sans");
    typeInto(*child<QComboBox>(chooser, "cboSize").lineEdit(), "12.5");
    child<QCheckBox>(chooser, "chkUnderline").click();
    pickColor(chooser, "clrFont", QColor(1, 2, 3));
    const ColoredFont chosen = chooser.chosen();
    EXPECT_EQ(chosen.font.name, u"Nowhere Sans");
    EXPECT_EQ(chosen.font.size, 12.5F);
    EXPECT_TRUE(chosen.font.underline);
    EXPECT_FALSE(chosen.font.bold);
    EXPECT_EQ(chosen.color, 0x030201);
}

TEST(FontChooser, RefusesASizeThatIsNone)
{
    FontChooser chooser({});
    for (const char* size : { "0", "-3", "big", "99999", "12x" }) {
        typeInto(*child<QComboBox>(chooser, "cboSize").lineEdit(), size);
        EXPECT_FALSE(child<QPushButton>(chooser, "cmdOk").isEnabled()) << size;
    }
    typeInto(*child<QComboBox>(chooser, "cboSize").lineEdit(), "8");
    EXPECT_TRUE(child<QPushButton>(chooser, "cmdOk").isEnabled());
}

TEST(FontChooser, CancellingIsAnErrorInside)
{
    const auto cancelled = [] {
        QTimer::singleShot(
            0, [] { QTest::keyClick(QApplication::activeModalWidget(), Qt::Key_Escape); });
        chooseFont(nullptr, {});
    };
    try {
        cancelled();
        FAIL();
    } catch (const RunTimeError& error) {
        EXPECT_EQ(error.number(), ErrorNumber::Cancelled);
    }
}

TEST(DialogColours, AreBlueGreenRed)
{
    EXPECT_EQ(colorOf(0xFF0000), QColor(0, 0, 255));
    EXPECT_EQ(numberOf(QColor(255, 16, 0)), 4351);
    EXPECT_EQ(colorOf(-1), QColor(255, 255, 255));
}

} // namespace pelloric::qt
