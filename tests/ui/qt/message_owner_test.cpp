// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "fakes/temp_folder.h"
#include "platform/qt/qt_platform.h"
#include "ui/qt/preview_opener.h"
#include "ui/qt/preview_window.h"

#include <pelloric/kestrane.h>

#include <QApplication>
#include <QDialog>
#include <QMessageBox>
#include <QSettings>
#include <QTableWidget>
#include <QTest>
#include <QTimer>

#include <gmock/gmock.h>

#include <vector>

namespace pelloric::qt {

namespace {

/// A host's form whose previews fail, and the windows that the boxes belong to.
class MessageOwners : public testing::Test {
protected:
    MessageOwners()
    {
        QSettings::setPath(QSettings::IniFormat, QSettings::UserScope,
            QString::fromStdString(folder_.path().string()));
        platform_.folders().setSystemDirectory(folder_.file("none"));
        facade_.setPreviewOpener(&opener_);
        form_.show();
        QObject::connect(&answers_, &QTimer::timeout, [this] {
            if (auto* const box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget())) {
                owners_.push_back(box->parentWidget());
                box->close();
            }
        });
        answers_.start(5);
    }

    TempFolder folder_;
    QtPlatform platform_;
    QtPreviewOpener opener_ { platform_ };
    QWidget form_;
    Kestrane facade_ { platform_, &form_ };
    QTableWidget table_ { 1, 1 };
    QTimer answers_;
    std::vector<QWidget*> owners_;
};

} // namespace

TEST_F(MessageOwners, AreTheWindowsThatTheErrorsAreAbout)
{
    facade_.doPreview(&table_);
    facade_.doPreview(static_cast<QObject*>(nullptr));
    EXPECT_THAT(owners_, testing::ElementsAre(static_cast<QWidget*>(opener_.window()), &form_));
}

TEST_F(MessageOwners, AreNoWindowsThatOnlyHappenToBeActive)
{
    QWidget other;
    other.show();
    other.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&other));
    facade_.doPreview(static_cast<QObject*>(nullptr));
    EXPECT_THAT(owners_, testing::ElementsAre(&form_));
}

TEST_F(MessageOwners, AreDialogsThatLetNoOtherWindowAnswer)
{
    QDialog dialog(&form_);
    dialog.setModal(true);
    dialog.show();
    facade_.doPreview(static_cast<QObject*>(nullptr));
    EXPECT_THAT(owners_, testing::ElementsAre(&dialog));
}

} // namespace pelloric::qt
