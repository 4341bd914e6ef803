// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/canvas.h"
#include "fakes/fake_printer.h"
#include "fakes/fake_services.h"
#include "fakes/temp_folder.h"
#include "grids/table_grid.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "ui/qt/choice_box.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"

#include <pelloric/sorvane.h>

#include <QApplication>
#include <QLineEdit>
#include <QSettings>
#include <QTest>
#include <QTimer>
#include <QToolButton>

#include <gtest/gtest.h>

#include <array>

namespace pelloric::qt {

/// A preview window on services of its own.
class PreviewWorld : public testing::Test {
protected:
    PreviewWorld()
    {
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope,
            QString::fromStdString(folder_.path().string()));
        platform_.folders().setSystemDirectory(folder_.path());
        platform_.useMessages(messages_);
        platform_.usePrinter(printer_, printers_);
        deployDefaultSettings(platform_.record());
    }

    PreviewWindow& show()
    {
        PreviewWindow& window = opener_.showWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&window));
        return window;
    }

    PreviewWindow& preview(int rows)
    {
        opener_.openPreview(gridOf(rows));
        EXPECT_TRUE(QTest::qWaitForWindowActive(opener_.window()));
        return *opener_.window();
    }

    static std::unique_ptr<AutomationObject> gridOf(int rows)
    {
        auto grid = std::make_unique<TableGrid>(
            std::vector<TableColumn> { { u"Number", 3000 }, { u"Square", 3000 } });
        for (int row = 1; row <= rows; ++row) {
            const Text number = decimal(row);
            const Text square = decimal(row * row);
            grid->addRow(std::array<TextView, 2> { number, square });
        }
        return grid;
    }

    /// A million rows of four columns: their build takes longer than a person needs for a key.
    static std::unique_ptr<AutomationObject> longGrid()
    {
        const std::array<TextView, 4> row { u"a text", u"another", u"a third", u"a fourth" };
        auto grid = std::make_unique<TableGrid>(std::vector<TableColumn> {
            { u"A", 2000 }, { u"B", 2000 }, { u"C", 2000 }, { u"D", 2000 } });
        for (int count = 0; count < 1'000'000; ++count)
            grid->addRow(row);
        return grid;
    }

    Canvas& canvas() { return opener_.window()->canvas().canvas(); }

    QToolButton* button(int id)
    {
        for (QToolButton* const found : opener_.window()->findChildren<QToolButton*>()) {
            if (found->property("toolId") == id)
                return found;
        }
        return nullptr;
    }

    void click(int id) { button(id)->click(); }

    /// Whether first, previous, next and last are enabled, such as "0011".
    std::string navigation()
    {
        std::string states;
        for (const int id : { 5, 6, 7, 8 })
            states += button(id)->isEnabled() ? '1' : '0';
        return states;
    }

    ChoiceBox* box(const char* name)
    {
        return opener_.window()->findChild<ChoiceBox*>(QString::fromLatin1(name));
    }

    void enter(const char* name, const QString& text)
    {
        box(name)->setFocus();
        box(name)->lineEdit()->selectAll();
        QTest::keyClicks(box(name), text);
        QTest::keyClick(box(name), Qt::Key_Return);
    }

    /// What the window asks for a file answers this path.
    void answerFiles(const QString& path)
    {
        PreviewPrompts prompts;
        prompts.chooseFile = [this, path](QWidget&, const FileQuestion& question) {
            asked_.push_back(question);
            return path;
        };
        prompts.showAbout = [this](QWidget&) { ++aboutBoxes_; };
        opener_.setPrompts(prompts);
    }

    QString file(const char* name) const
    {
        return QString::fromStdString(folder_.file(name).string());
    }

    /// Whether the program ends by itself before long.
    static bool programEnds()
    {
        constexpr int TooLate = 3;
        QTimer patience;
        patience.setSingleShot(true);
        QObject::connect(&patience, &QTimer::timeout, [] { QCoreApplication::exit(TooLate); });
        patience.start(20000);
        return QApplication::exec() == 0;
    }

    TempFolder folder_;
    FakeMessages messages_;
    FakePrinter printer_;
    FakePrinterSystem printers_;
    QtPlatform platform_;
    QtPreviewOpener opener_ { platform_ };
    std::vector<FileQuestion> asked_;
    int aboutBoxes_ = 0;
};

} // namespace pelloric::qt
