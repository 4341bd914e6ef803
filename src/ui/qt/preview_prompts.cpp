// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_prompts.h"

#include "platform/qt/qt_text.h"
#include "ui/qt/icon_set.h"
#include "ui/tool_table.h"

#include <QFileDialog>
#include <QMessageBox>

namespace pelloric::qt {

namespace {

constexpr int AboutPictureSize = 64; ///< pixels

QString chooseFile(QWidget& window, const FileQuestion& question)
{
    QFileDialog dialog(&window, question.title, question.folder, question.filter);
    dialog.setAcceptMode(question.isSave ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    dialog.setFileMode(question.isSave ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    if (dialog.exec() != QDialog::Accepted || dialog.selectedFiles().isEmpty())
        return {};
    return dialog.selectedFiles().front();
}

void showAbout(QWidget& window)
{
    QMessageBox box(&window);
    box.setObjectName(QStringLiteral("frmAbout"));
    box.setWindowTitle(QObject::tr("About"));
    box.setIconPixmap(
        libraryIcon(QStringLiteral("print"), window.palette())
            .pixmap(QSize(AboutPictureSize, AboutPictureSize), window.devicePixelRatioF()));
    box.setTextFormat(Qt::PlainText);
    box.setText(QStringLiteral("Pelloric " PELLORIC_VERSION));
    box.setInformativeText(QObject::tr("Print preview and printing of grids."));
    box.setStandardButtons(QMessageBox::Ok);
    box.exec();
}

FileQuestion question(TextView title, bool isSave)
{
    return { .title = toQString(title),
        .folder = toQString(InitialFileFolder),
        .filter = toQString(FileFilterName),
        .isSave = isSave };
}

} // namespace

PreviewPrompts standardPrompts() { return { .chooseFile = chooseFile, .showAbout = showAbout }; }

FileQuestion openFileQuestion() { return question(OpenFileTitle, false); }

FileQuestion saveFileQuestion() { return question(SaveFileTitle, true); }

} // namespace pelloric::qt
