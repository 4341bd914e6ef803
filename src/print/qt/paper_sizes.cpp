// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "print/qt/paper_sizes.h"

#include "platform/qt/qt_text.h"
#include "print/paper_names.h"

#include <QPrinterInfo>

#include <algorithm>
#include <cmath>

namespace pelloric::qt {

namespace {

/// Printers keep sizes in whole points; papers that differ by less are the same.
constexpr double SameSizeMm = 0.6;

constexpr std::size_t MostForms = 32767; ///< that a code can name

bool isSameSize(const PaperForm& one, const PaperForm& other)
{
    return std::abs(one.widthMm - other.widthMm) < SameSizeMm
        && std::abs(one.heightMm - other.heightMm) < SameSizeMm;
}

PaperForm formOf(const QPageSize& paper)
{
    const QSizeF size = paper.size(QPageSize::Millimeter);
    return { toText(paper.name()), size.width(), size.height() };
}

} // namespace

std::vector<PaperForm> formsOf(const QPrinterInfo& printer)
{
    if (printer.isNull())
        return {};
    std::vector<PaperForm> forms = standardPaperForms();
    const std::size_t standard = forms.size();
    for (const QPageSize& paper : printer.supportedPageSizes()) {
        const PaperForm own = formOf(paper);
        const auto end = forms.begin() + static_cast<std::ptrdiff_t>(standard);
        const bool isStandard = std::any_of(forms.begin(), end, [&own](const PaperForm& form) {
            return form.name == own.name && isSameSize(form, own);
        });
        if (!isStandard && forms.size() < MostForms)
            forms.push_back(own);
    }
    return forms;
}

QPageSize pageSizeOf(const QPrinterInfo& printer, std::int16_t code)
{
    const std::vector<PaperForm> forms = formsOf(printer);
    if (code < 1 || static_cast<std::size_t>(code) > forms.size())
        return QPageSize();
    const PaperForm& form = forms[static_cast<std::size_t>(code) - 1];
    QPageSize sameSize;
    for (const QPageSize& paper : printer.supportedPageSizes()) {
        const PaperForm own = formOf(paper);
        if (!isSameSize(own, form))
            continue;
        if (own.name == form.name)
            return paper;
        if (!sameSize.isValid())
            sameSize = paper;
    }
    if (sameSize.isValid())
        return sameSize;
    return QPageSize(QSizeF(form.widthMm, form.heightMm), QPageSize::Millimeter,
        toQString(form.name), QPageSize::FuzzyMatch);
}

std::int16_t formCodeOf(const QPrinterInfo& printer, const QPageSize& paper)
{
    const std::vector<PaperForm> forms = formsOf(printer);
    const PaperForm wanted = formOf(paper);
    const auto found = std::find_if(forms.begin(), forms.end(),
        [&wanted](const PaperForm& form) { return isSameSize(form, wanted); });
    return found == forms.end() ? std::int16_t { 0 }
                                : static_cast<std::int16_t>(found - forms.begin() + 1);
}

} // namespace pelloric::qt
