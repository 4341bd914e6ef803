// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/font_chooser.h"

#include "platform/numbers.h"
#include "platform/qt/qt_fonts.h"
#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "ui/qt/color_picker.h"
#include "ui/qt/dialog_parts.h"

#include <QCheckBox>
#include <QFontComboBox>
#include <QGridLayout>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace pelloric::qt {

namespace {

/// Points; any other size may be typed.
constexpr auto UsualSizes
    = std::to_array<double>({ 8, 9, 10, 10.5, 11, 12, 14, 16, 18, 20, 22, 24, 26, 28, 36, 48, 72 });

constexpr double LargestSize = 1638; ///< points
constexpr double LargestSample = 20; ///< points; larger fonts are shown in this size
constexpr int SampleHeight = 72; ///< pixels

bool isUsableSize(double size) { return size > 0 && size <= LargestSize; }

} // namespace

ColoredFont chooseFont(QWidget* parent, const ColoredFont& present)
{
    FontChooser chooser(present, parent);
    if (chooser.exec() != QDialog::Accepted)
        throw RunTimeError(ErrorNumber::Cancelled);
    return chooser.chosen();
}

FontChooser::FontChooser(const ColoredFont& present, QWidget* parent)
    : QDialog(parent)
{
    setObjectName(QStringLiteral("CdlTest"));
    setWindowTitle(tr("Font"));
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(makeFaceGroup());
    layout->addWidget(makeStyleGroup());
    layout->addWidget(makeSample(), 1);
    ok_ = addClosingButtons(*this, *layout, { tr("OK"), 'O' }, { tr("Cancel"), 'N' }).ok;
    connect(ok_, &QPushButton::clicked, this, &QDialog::accept);
    showFont(present);
    connect(face_, &QComboBox::editTextChanged, this, &FontChooser::showSample);
    connect(size_, &QComboBox::editTextChanged, this, &FontChooser::showSample);
    for (QCheckBox* style : { bold_, italic_, strikeOut_, underline_ })
        connect(style, &QCheckBox::toggled, this, &FontChooser::showSample);
    connect(color_, &ColorPicker::colorChanged, this, &FontChooser::showSample);
}

QWidget* FontChooser::makeFaceGroup()
{
    auto* group = new QWidget(this);
    auto* grid = new QGridLayout(group);
    grid->setContentsMargins(0, 0, 0, 0);
    face_ = new QFontComboBox(group);
    face_->setObjectName(QStringLiteral("cboFace"));
    face_->setInsertPolicy(QComboBox::NoInsert);
    face_->setMinimumContentsLength(18);
    size_ = new QComboBox(group);
    size_->setObjectName(QStringLiteral("cboSize"));
    size_->setEditable(true);
    size_->setInsertPolicy(QComboBox::NoInsert);
    for (const double size : UsualSizes)
        size_->addItem(toQString(formatNumber(size)));
    grid->addWidget(captionFor(tr("Font:"), 'F', face_, group), 0, 0);
    grid->addWidget(captionFor(tr("Size:"), 'S', size_, group), 0, 1);
    grid->addWidget(face_, 1, 0);
    grid->addWidget(size_, 1, 1);
    grid->setColumnStretch(0, 1);
    return group;
}

QWidget* FontChooser::makeStyleGroup()
{
    auto* group = new QGroupBox(tr("Effects"), this);
    auto* grid = new QGridLayout(group);
    struct StyleRow {
        QCheckBox*& box;
        const char* name;
        QString text;
        char key;
    };
    const StyleRow rows[] = {
        { bold_, "chkBold", tr("Bold"), 'B' },
        { italic_, "chkItalic", tr("Italic"), 'I' },
        { strikeOut_, "chkStrikeOut", tr("Strikeout"), 'T' },
        { underline_, "chkUnderline", tr("Underline"), 'U' },
    };
    int place = 0;
    for (const StyleRow& row : rows) {
        row.box = new QCheckBox(row.text, group);
        row.box->setObjectName(QLatin1String(row.name));
        setAltKey(*row.box, row.key);
        grid->addWidget(row.box, place % 2, place / 2);
        ++place;
    }
    color_ = new ColorPicker(QStringLiteral("clrFont"), group);
    grid->addWidget(captionFor(tr("Color:"), 'C', color_, group), 0, 3);
    grid->addWidget(color_, 1, 3);
    grid->setColumnStretch(2, 1);
    return group;
}

QWidget* FontChooser::makeSample()
{
    sample_ = new QLineEdit(QStringLiteral("AaBbYyZz 中文字样"), this);
    sample_->setObjectName(QStringLiteral("txtSample"));
    sample_->setAccessibleName(tr("Sample"));
    sample_->setReadOnly(true);
    sample_->setFocusPolicy(Qt::NoFocus);
    sample_->setAlignment(Qt::AlignCenter);
    sample_->setMinimumHeight(SampleHeight);
    // However large its font, the sample leaves the dialog's width to the boxes.
    sample_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Expanding);
    return sample_;
}

void FontChooser::showFont(const ColoredFont& font)
{
    face_->setCurrentIndex(face_->findText(toQString(font.font.name), Qt::MatchFixedString));
    face_->setEditText(toQString(font.font.name));
    size_->setEditText(toQString(formatSingle(font.font.size)));
    bold_->setChecked(font.font.bold);
    italic_->setChecked(font.font.italic);
    strikeOut_->setChecked(font.font.strikethrough);
    underline_->setChecked(font.font.underline);
    color_->setColor(font.color);
    showSample();
}

ColoredFont FontChooser::chosen() const
{
    ColoredFont result;
    result.font.name = trimmed(toText(face_->currentText()));
    result.font.size = static_cast<float>(leadingNumber(toText(size_->currentText())));
    result.font.bold = bold_->isChecked();
    result.font.italic = italic_->isChecked();
    result.font.strikethrough = strikeOut_->isChecked();
    result.font.underline = underline_->isChecked();
    result.color = color_->color();
    return result;
}

void FontChooser::showSample()
{
    const Text typed = toText(size_->currentText());
    const double size = leadingNumber(typed);
    ok_->setEnabled(isNumber(typed) && isUsableSize(size));
    if (!ok_->isEnabled())
        return;
    const Font wanted = chosen().font;
    QFont font(QtFonts::resolve(toQString(wanted.name)));
    font.setPointSizeF(std::min(size, LargestSample));
    font.setBold(wanted.bold);
    font.setItalic(wanted.italic);
    font.setStrikeOut(wanted.strikethrough);
    font.setUnderline(wanted.underline);
    sample_->setFont(font);
    showInColor(*sample_, color_->color());
}

} // namespace pelloric::qt
