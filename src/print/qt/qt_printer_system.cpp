// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/qt_printer_system.h"

#include "platform/qt/qt_text.h"
#include "print/paper_names.h"
#include "print/qt/paper_sizes.h"
#include "print/qt/spooler.h"

#include <QPrinterInfo>
#include <QStringList>

namespace pelloric::qt {

std::vector<Text> QtPrinterSystem::printerNames() const
{
    std::vector<Text> names;
    for (const QString& name : QPrinterInfo::availablePrinterNames())
        names.push_back(toText(name));
    return names;
}

Text QtPrinterSystem::currentPrinter() const
{
    if (!current_.empty())
        return current_;
    QString name = QPrinterInfo::defaultPrinterName();
    if (name.isEmpty())
        name = QPrinterInfo::availablePrinterNames().value(0);
    current_ = toText(name);
    return current_;
}

void QtPrinterSystem::makeCurrent(TextView name)
{
    if (QPrinterInfo::availablePrinterNames().contains(borrowed(name)))
        current_ = name;
}

bool QtPrinterSystem::opens(TextView name) const
{
    return !name.empty() && refusal(name).isEmpty();
}

QString QtPrinterSystem::refusal(TextView name) const { return refusalOf(toQString(name)); }

std::vector<PaperForm> QtPrinterSystem::forms() const
{
    const Text name = currentPrinter();
    return name.empty() ? standardPaperForms()
                        : formsOf(QPrinterInfo::printerInfo(toQString(name)));
}

} // namespace pelloric::qt
