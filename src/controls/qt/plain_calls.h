// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include <QWidget>

namespace pelloric::qt {

/// What a program may hand to members of `Sorvane` by name besides variants, as in
/// `QMetaObject::invokeMethod(canvas, "SaveFile", Q_ARG(QString, path))`.
///
/// Each checks its numbers as the member itself does. They are private, so that no script sees
/// them: it would take the overload of the narrowest type and wrap a number that does not fit.
class SorvaneCalls : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;

private:
    Q_INVOKABLE void showMuliPage(short nPages);
    Q_INVOKABLE void showMuliPage(int nPages);
    Q_INVOKABLE void doPrint(bool bAllPrint, const QString& strPrintRange, short nPrintPageNum);
    Q_INVOKABLE void doPrint(bool bAllPrint, const QString& strPrintRange, int nPrintPageNum);
    Q_INVOKABLE void doPreview(QObject* PrintObj);
    Q_INVOKABLE void SetShowStyle(short nPages, short nStartPage, short nEndPage);
    Q_INVOKABLE void SetShowStyle(int nPages, int nStartPage, int nEndPage);
    Q_INVOKABLE void SaveFile(const QString& FilePath);
    Q_INVOKABLE void OpenFile(const QString& FilePath);
    Q_INVOKABLE void ReDrawZoom(QObject* PrintObj);
};

/// The same for members of `Kestrane`.
class KestraneCalls : public QWidget {
    Q_OBJECT
public:
    using QWidget::QWidget;

private:
    Q_INVOKABLE void doPreview(QObject* PrintObj);
    Q_INVOKABLE void AddHeader(const QString& strHeader, short Location);
    Q_INVOKABLE void AddHeader(const QString& strHeader, int Location);
    Q_INVOKABLE void AddFooter(const QString& strFooter, short Location);
    Q_INVOKABLE void AddFooter(const QString& strFooter, int Location);
};

/// Makes the published records known by their names to the meta-type system; more than once is
/// harmless.
void registerRecords();

} // namespace pelloric::qt
