// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "controls/canvas.h"
#include "fakes/temp_folder.h"
#include "platform/qt/qt_platform.h"
#include "settings/default_settings.h"
#include "support/test_paths.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"
#include "ui_host_form.h"

#include <pelloric/sorvane.h>

#include <QDesignerCustomWidgetCollectionInterface>
#include <QFile>
#include <QFileInfo>
#include <QIcon>
#include <QPluginLoader>
#include <QSettings>
#include <QTableWidget>
#include <QUiLoader>

#include <gtest/gtest.h>

Q_IMPORT_PLUGIN(DesignerPlugin)

namespace pelloric::qt {

namespace {

void fill(QTableWidget& table)
{
    table.setColumnCount(2);
    table.setHorizontalHeaderLabels({ QStringLiteral("Town"), QStringLiteral("Code") });
    table.setRowCount(3);
    for (int row = 0; row < 3; ++row)
        table.setItem(row, 0, new QTableWidgetItem(QString::number(row)));
}

/// Settings of its own for whatever looks for the user's.
class DesignerTest : public testing::Test {
protected:
    DesignerTest()
    {
        const QString folder = QString::fromStdString(folder_.path().string());
        qputenv("XDG_CONFIG_HOME", folder.toUtf8());
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, folder);
        deployDefaultSettings(platform_.record());
    }

    ~DesignerTest() override { qunsetenv("XDG_CONFIG_HOME"); }

    TempFolder folder_;
    QtPlatform platform_;
};

} // namespace

TEST_F(DesignerTest, ThePluginDescribesBothControls)
{
    QDesignerCustomWidgetCollectionInterface* plugin = nullptr;
    for (QObject* const found : QPluginLoader::staticInstances()) {
        if (auto* const designer = qobject_cast<QDesignerCustomWidgetCollectionInterface*>(found))
            plugin = designer;
    }
    ASSERT_NE(plugin, nullptr);
    QStringList names;
    for (QDesignerCustomWidgetInterface* const control : plugin->customWidgets()) {
        names.append(control->name());
        EXPECT_EQ(control->group(), "Pelloric");
        EXPECT_FALSE(control->icon().isNull());
        EXPECT_GT(control->whatsThis().size(), 80);
        EXPECT_FALSE(control->toolTip().isEmpty());
        EXPECT_TRUE(control->domXml().contains(control->name()));
        EXPECT_FALSE(control->isContainer());
        const QFileInfo header(
            QStringLiteral(PELLORIC_TESTS_DIR "/../include/") + control->includeFile());
        EXPECT_TRUE(header.isFile()) << header.filePath().toStdString();
    }
    EXPECT_EQ(names, QStringList({ "pelloric::qt::Kestrane", "pelloric::qt::Sorvane" }));
}

TEST_F(DesignerTest, AFormIsLoadedAtRunTimeAndItsCanvasShowsPages)
{
    QUiLoader loader;
    ASSERT_TRUE(loader.availableWidgets().contains(QStringLiteral("pelloric::qt::Sorvane")));
    QFile form(QStringLiteral(PELLORIC_TESTS_DIR "/designer/qt/host_form.ui"));
    ASSERT_TRUE(form.open(QIODevice::ReadOnly));
    const std::unique_ptr<QWidget> host(loader.load(&form));
    ASSERT_NE(host, nullptr) << loader.errorString().toStdString();
    auto* const table = host->findChild<QTableWidget*>(QStringLiteral("table"));
    auto* const pages = host->findChild<QWidget*>(QStringLiteral("pages"));
    auto* const preview = host->findChild<QWidget*>(QStringLiteral("preview"));
    ASSERT_NE(pages, nullptr);
    EXPECT_STREQ(pages->metaObject()->className(), "pelloric::qt::Sorvane");
    EXPECT_STREQ(preview->metaObject()->className(), "pelloric::qt::Kestrane");
    EXPECT_EQ(pages->toolTip(), "The pages");
    fill(*table);
    host->show();
    ASSERT_TRUE(QMetaObject::invokeMethod(
        pages, "doPreview", Q_ARG(QVariant, QVariant::fromValue<QObject*>(table))));
    EXPECT_EQ(pages->property("Totalpages").toInt(), 1);
}

TEST_F(DesignerTest, ACompiledFormPreviewsItsTable)
{
    QtPreviewOpener& opener = installPreviewWindow(platform_);
    QWidget host;
    Ui::HostForm form;
    form.setupUi(&host);
    fill(*form.table);
    host.show();
    form.preview->doPreview(form.table);
    ASSERT_NE(opener.window(), nullptr);
    const Canvas& canvas = opener.window()->canvas().canvas();
    EXPECT_EQ(canvas.Totalpages(), 1);
    EXPECT_GE(canvas.document().texts(0).size(), 2U + 3 * 2);
    delete opener.window();
    Kestrane::setDefaultPreviewOpener(nullptr);
}

} // namespace pelloric::qt
