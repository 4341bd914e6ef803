// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/preview_prompts.h"

#include "platform/qt/qt_text.h"
#include "ui/qt/icon_set.h"
#include "ui/qt/named_boxes.h"
#include "ui/tool_table.h"

#include <pelloric/version.h>

#include <QComboBox>
#include <QCoreApplication>
#include <QFileDialog>
#include <QFileInfo>
#include <QMessageBox>
#include <QPushButton>
#include <QUrl>

#include <utility>

namespace pelloric::qt {

namespace {

constexpr int AboutPictureSize = 64; ///< pixels

/// The suffix of a filter: "PDF document (*.pdf)".
QString suffixOf(const QString& filter) { return filter.section(u'.', -1).section(u')', 0, 0); }

bool endsInOneOf(const QString& path, const QStringList& suffixes)
{
    return suffixes.isEmpty() || suffixes.contains(QFileInfo(path).suffix(), Qt::CaseInsensitive);
}

/// The toolkit tells its boxes by their values.
void nameBoxes(QFileDialog& dialog)
{
    const std::pair<const char*, const char*> names[] = {
        { "lookInCombo", QT_TRANSLATE_NOOP("pelloric::qt::FileBox", "Folder") },
        { "fileTypeCombo", QT_TRANSLATE_NOOP("pelloric::qt::FileBox", "Kind of files") },
    };
    for (const auto& [box, name] : names) {
        if (auto* const combo = dialog.findChild<QComboBox*>(QLatin1String(box)))
            nameBox(*combo, QCoreApplication::translate("pelloric::qt::FileBox", name));
    }
}

/// The toolkit's own dialog, which has a side bar for the places.
void prepare(QFileDialog& dialog, const FileQuestion& question)
{
    dialog.setOption(QFileDialog::DontUseNativeDialog);
    dialog.setAcceptMode(question.isSave ? QFileDialog::AcceptSave : QFileDialog::AcceptOpen);
    dialog.setFileMode(question.isSave ? QFileDialog::AnyFile : QFileDialog::ExistingFile);
    QList<QUrl> places = dialog.sidebarUrls();
    for (const QString& place : question.places) {
        const QUrl url = QUrl::fromLocalFile(place);
        if (!places.contains(url) && QFileInfo(place).isDir())
            places.append(url);
    }
    dialog.setSidebarUrls(places);
    nameBoxes(dialog);
    if (!question.name.isEmpty())
        dialog.selectFile(question.name);
    if (question.suffixes.isEmpty())
        return;
    dialog.setDefaultSuffix(question.suffixes.front());
    QObject::connect(&dialog, &QFileDialog::filterSelected, &dialog,
        [&dialog](const QString& filter) { dialog.setDefaultSuffix(suffixOf(filter)); });
}

/// A name with a foreign ending gets the right one and is shown once more, so that an older file of
/// that name is not overwritten unasked.
QString chooseFile(QWidget& window, const FileQuestion& question)
{
    QFileDialog dialog(&window, question.title, question.folder, question.filter);
    prepare(dialog, question);
    while (dialog.exec() == QDialog::Accepted && !dialog.selectedFiles().isEmpty()) {
        const QString path = dialog.selectedFiles().front();
        if (endsInOneOf(path, question.suffixes))
            return path;
        dialog.selectFile(path + QLatin1Char('.') + dialog.defaultSuffix());
    }
    return {};
}

bool mayReplace(QWidget& window, const QStringList& files)
{
    const auto words = [](const char* text) {
        return QCoreApplication::translate("pelloric::qt::ReplaceBox", text);
    };
    const QString name = QFileInfo(files.front()).fileName();
    QMessageBox box(&window);
    box.setObjectName(QStringLiteral("frmReplace"));
    box.setIcon(QMessageBox::Warning);
    box.setWindowTitle(words(QT_TRANSLATE_NOOP("pelloric::qt::ReplaceBox", "Replace Files")));
    box.setTextFormat(Qt::PlainText);
    box.setText(files.size() == 1
            ? words(QT_TRANSLATE_NOOP("pelloric::qt::ReplaceBox", "%1 already exists.")).arg(name)
            : words(QT_TRANSLATE_NOOP(
                        "pelloric::qt::ReplaceBox", "%1 files already exist, such as %2."))
                  .arg(files.size())
                  .arg(name));
    box.setInformativeText(words(QT_TRANSLATE_NOOP("pelloric::qt::ReplaceBox",
        "Every page becomes a file of its own. Do you want to replace what is there?")));
    QPushButton* const replace = box.addButton(
        words(QT_TRANSLATE_NOOP("pelloric::qt::ReplaceBox", "&Replace")), QMessageBox::AcceptRole);
    box.setDefaultButton(box.addButton(QMessageBox::Cancel));
    box.exec();
    return box.clickedButton() == replace;
}

void showAbout(QWidget& window)
{
    QMessageBox box(&window);
    box.setObjectName(QStringLiteral("frmAbout"));
    box.setWindowTitle(QCoreApplication::translate("pelloric::qt::AboutBox", "About"));
    box.setIconPixmap(
        libraryIcon(QStringLiteral("print"), window.palette())
            .pixmap(QSize(AboutPictureSize, AboutPictureSize), window.devicePixelRatioF()));
    box.setTextFormat(Qt::PlainText);
    box.setText(QStringLiteral("Pelloric ") + QLatin1String(pelloric::version()));
    box.setInformativeText(QCoreApplication::translate(
        "pelloric::qt::AboutBox", "Print preview and printing of grids."));
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

PreviewPrompts standardPrompts()
{
    return { .chooseFile = chooseFile,
        .beforeBuild = {},
        .mayReplace = mayReplace,
        .showAbout = showAbout };
}

FileQuestion openFileQuestion() { return question(OpenFileTitle, false); }

FileQuestion saveFileQuestion() { return question(SaveFileTitle, true); }

} // namespace pelloric::qt
