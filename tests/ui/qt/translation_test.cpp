// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/translation.h"

#include "fakes/fake_platform.h"
#include "platform/phrase.h"
#include "platform/run_time_error.h"
#include "support/test_paths.h"
#include "ui/preview_notice.h"
#include "ui/qt/font_chooser.h"
#include "ui/qt/grid_style_dialog.h"
#include "ui/qt/page_setup_dialog.h"
#include "ui/qt/preview_world.h"
#include "ui/qt/print_options_dialog.h"

#include <QCheckBox>
#include <QFile>
#include <QGroupBox>
#include <QLabel>
#include <QMenu>
#include <QPushButton>
#include <QTabWidget>
#include <QXmlStreamReader>

#include <map>
#include <set>

namespace pelloric::qt {

namespace {

constexpr const char* Languages[] = { "de", "en", "zh_CN" };

constexpr const char* Catalogues[] = { "src/ui/qt/translations/pelloric_%1.ts",
    "apps/pelloric/translations/pelloric_program_%1.ts" };

/// What windows show in every language, to the blank.
constexpr const char* ToolTexts[]
    = { "Design  Report", "ReFresh", "Zoom In", "Zoom Out", "The First Page", "Previous Page",
          "Next Page", "the Last Page", " Show More Pages", "Show One Page", "Move Smoth", "Print",
          "Page Setup", " Show Whole Page", "Show Two Page", "Exit", "Show Four Page", "About",
          "Open File", "Save File", "Maximum ", "Minimum", "Clear  All Pages" };
constexpr const char* PageSetupTexts[]
    = { "Page Setup", "Page", "Margins", "Header\\Footer", "Width:", "Height:", "Portrait",
          "Landscape", "Top:", "Buttom:", "Left:", "Right:", "Restore Original", "Preview",
          "Header", "Footer", "Font...", "Cancel", "Date Printed", "Time Printed",
          "Date and Time Printed", "Page # of Pages #", "Total Pages", "Page Number" };
constexpr const char* GridStyleTexts[] = { "Report Face Designer", "Options", "Colors", "Fonts",
    "Show", "Headers", "Grid", "Horizontal  Grid", "Vertical  Grid", "Merge Cell", "Header Color",
    "Grid Line Color", "Change Font...", "OK", "Cancel" };
constexpr const char* PrintTexts[] = { "Printer", "Name:", "Page Range", "All", "Range：",
    "Enter page number and/or page range  separated by commas.For example 1,3,5-12.", "Copies",
    "Number of Copies", "Print", "Close" };
constexpr const char* MessageTexts[] = { "无下一页！", "文件格式不正确，打开失败", "提示",
    "非法纸张参数！", "请选择一项进行设置", "对不起，不能打印，系统没有默认的打印机",
    "打印机没有正常工作，不能打印", "Print Preview " };

/// Words that a published caption has, too: what uses them here is none.
const std::set<std::pair<QString, QString>> SameWords {
    { "Phrase", "Minimum" }, // a total on paper
    { "pelloric::qt::AboutBox", "About" }, // the box behind the tool, whose title is left open
    { "pelloric::qt::FontChooser", "OK" }, { "pelloric::qt::FontChooser", "Cancel" },
    { "pelloric::qt::GridStyleDialog", "Fonts" }, // what a screen reader calls the list
    { "pelloric::qt::OptionsPanel", "All" }, // rows
    { "pelloric::qt::OptionsPanel", "Minimum" }, // of a column
    { "pelloric::qt::PreviewWindow", "Cancel" }, // of saving pages
    { "pelloric::qt::PrintOptionsDialog", "Cancel" }, // of the print job that runs
};

/// The texts that a window shows now: its title, and those of buttons, labels, frames, tabs, menus.
QStringList shownTexts(QWidget& window)
{
    QStringList texts { window.windowTitle() };
    for (const auto* const button : window.findChildren<QAbstractButton*>())
        texts << button->text();
    for (const auto* const label : window.findChildren<QLabel*>())
        texts << label->text();
    for (const auto* const box : window.findChildren<QGroupBox*>())
        texts << box->title();
    for (const auto* const action : window.findChildren<QAction*>())
        texts << action->text();
    for (const auto* const tabs : window.findChildren<QTabWidget*>()) {
        for (int tab = 0; tab < tabs->count(); ++tab)
            texts << tabs->tabText(tab);
    }
    return texts;
}

template <std::size_t Count>
void expectTexts(QWidget& window, const char* const (&wanted)[Count], const char* language)
{
    const QStringList shown = shownTexts(window);
    for (const char* const text : wanted)
        EXPECT_TRUE(shown.contains(QString::fromUtf8(text))) << language << ": " << text;
}

/// A text of a catalogue.
struct Message {
    QString source;
    QString translation;
    bool isUnfinished = false;
};

/// By the context and the source.
using Catalogue = std::map<std::pair<QString, QString>, Message>;

Catalogue readCatalogue(const QString& name)
{
    QFile file(QStringLiteral(PELLORIC_TESTS_DIR "/../") + name);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << name.toStdString();
    QXmlStreamReader xml(&file);
    Catalogue catalogue;
    QString context;
    Message message;
    while (!xml.atEnd()) {
        xml.readNext();
        if (xml.isEndElement() && xml.name() == QLatin1String("message"))
            catalogue[{ context, message.source }] = message;
        if (!xml.isStartElement())
            continue;
        if (xml.name() == QLatin1String("message"))
            message = {};
        else if (xml.name() == QLatin1String("name"))
            context = xml.readElementText();
        else if (xml.name() == QLatin1String("source"))
            message.source = xml.readElementText();
        else if (xml.name() == QLatin1String("translation")) {
            message.isUnfinished = xml.attributes().hasAttribute(QStringLiteral("type"));
            message.translation = xml.readElementText();
        }
    }
    EXPECT_FALSE(xml.hasError()) << name.toStdString();
    EXPECT_FALSE(catalogue.empty()) << name.toStdString();
    return catalogue;
}

/// The places for values in a text: "%1", "%L2", in the order of their numbers.
QStringList placesIn(const QString& text)
{
    QStringList places;
    for (qsizetype at = text.indexOf(u'%'); at >= 0; at = text.indexOf(u'%', at + 1)) {
        const qsizetype digit = text.mid(at + 1, 1) == u"L" ? at + 2 : at + 1;
        if (digit < text.size() && text[digit].isDigit())
            places << text.mid(at, digit + 1 - at);
    }
    places.sort();
    return places;
}

class TranslationTest : public PreviewWorld {
protected:
    ~TranslationTest() override { installTranslation(QLocale::c()); }
};

} // namespace

TEST_F(TranslationTest, ExplainsTheToolsInGermanWhereAskedTo)
{
    EXPECT_EQ(show().findChild<QAction*>("SavePages")->text(), "Save as PDF");
    EXPECT_TRUE(button(7)->toolTip().contains("Go on to the next page"));
    opener_.window()->close();
    QApplication::processEvents();

    EXPECT_TRUE(installTranslation(QLocale("de_AT")));
    EXPECT_TRUE(show().findChild<QAction*>("SavePages")->text().endsWith(" PDF speichern"));
    EXPECT_TRUE(button(7)->toolTip().contains("Weiter zur nächsten Seite"));
    EXPECT_EQ(opener_.window()->canvas().accessibleName(), "Seitenvorschau");
}

TEST_F(TranslationTest, SpeaksSimplifiedChineseAndNoOtherChinese)
{
    EXPECT_FALSE(installTranslation(QLocale("zh_TW")));
    EXPECT_EQ(FontChooser(ColoredFont {}).windowTitle(), "Font");
    EXPECT_TRUE(installTranslation(QLocale("zh")));
    EXPECT_EQ(FontChooser(ColoredFont {}).windowTitle(), "字体");
}

TEST_F(TranslationTest, GoesBackToEnglishForALanguageThatIsNotThere)
{
    EXPECT_TRUE(installTranslation(QLocale("de")));
    EXPECT_FALSE(installTranslation(QLocale("fi")));
    EXPECT_EQ(FontChooser(ColoredFont {}).windowTitle(), "Font");
    EXPECT_TRUE(installTranslation(QLocale("de")));
    EXPECT_TRUE(installTranslation(QLocale("en_GB")));
    EXPECT_EQ(FontChooser(ColoredFont {}).windowTitle(), "Font");
}

TEST_F(TranslationTest, TranslatesWhatTheCoreSays)
{
    ASSERT_TRUE(installTranslation(QLocale("de")));
    EXPECT_EQ(
        RunTimeError(ErrorNumber::FileNotFound, u"a.ini").text(), u"Datei nicht gefunden: a.ini");
    const auto notice = noticeOfError(
        RunTimeError(ErrorNumber::SubscriptOutOfRange, noSuchItem(phrase(u"page"), 9, 5)));
    EXPECT_EQ(notice.text, u"Index außerhalb des Bereichs: Seite 9; es gibt 5.");
    ASSERT_TRUE(installTranslation(QLocale("zh_CN")));
    EXPECT_EQ(RunTimeError(ErrorNumber::FileNotFound, u"a.ini").text(), u"文件未找到: a.ini");
    installTranslation(QLocale("fi"));
    EXPECT_EQ(RunTimeError(ErrorNumber::FileNotFound, u"a.ini").text(), u"File not found: a.ini");
}

TEST_F(TranslationTest, LeavesWhatIsPublishedAsItStandsInEveryLanguage)
{
    for (const char* const language : Languages) {
        ASSERT_TRUE(installTranslation(QLocale(QString::fromLatin1(language))));
        PreviewWindow& window = show();
        EXPECT_EQ(window.windowTitle(), "Print Preview ");
        expectTexts(window, ToolTexts, language);
        PageSetupDialog pageSetup(platform_.record());
        expectTexts(pageSetup, PageSetupTexts, language);
        GridStyleDialog gridStyle(platform_.record());
        expectTexts(gridStyle, GridStyleTexts, language);
        PrintOptionsDialog print(platform_.record(), PrintOptionsDialog::Print());
        expectTexts(print, PrintTexts, language);
        window.close();
        QApplication::processEvents();
    }
}

TEST(Catalogues, HoldNoPublishedText)
{
    std::set<QString> published;
    const auto add = [&published](const auto& texts) {
        for (const char* const text : texts)
            published.insert(QString::fromUtf8(text));
    };
    add(ToolTexts);
    add(PageSetupTexts);
    add(GridStyleTexts);
    add(PrintTexts);
    add(MessageTexts);
    // The sides of a slot hint at which of three boxes is which; the margins' captions have a
    // colon.
    for (const auto& [key, message] : readCatalogue(QString(Catalogues[0]).arg("de"))) {
        EXPECT_TRUE(!published.contains(message.source) || SameWords.contains(key))
            << key.first.toStdString() << ": " << message.source.toStdString();
    }
}

TEST(Catalogues, TranslateEveryTextInEveryLanguage)
{
    for (const char* const name : Catalogues) {
        const Catalogue english = readCatalogue(QString(name).arg("en"));
        for (const char* const language : Languages) {
            const Catalogue catalogue = readCatalogue(QString(name).arg(language));
            EXPECT_EQ(catalogue.size(), english.size()) << name << " " << language;
            for (const auto& [key, message] : catalogue) {
                SCOPED_TRACE(std::string(language) + ": " + message.source.toStdString());
                EXPECT_TRUE(english.contains(key));
                EXPECT_FALSE(message.isUnfinished);
                EXPECT_FALSE(message.translation.isEmpty());
                EXPECT_EQ(placesIn(message.translation), placesIn(message.source));
                EXPECT_EQ(message.translation.count(u'&'), message.source.count(u'&'));
            }
        }
        for (const auto& [key, message] : english)
            EXPECT_EQ(message.translation, message.source);
    }
}

} // namespace pelloric::qt
