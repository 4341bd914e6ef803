// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/page_texts_tab.h"

#include "platform/qt/qt_text.h"
#include "platform/run_time_error.h"
#include "ui/qt/dialog_parts.h"
#include "ui/qt/font_chooser.h"

#include <QContextMenuEvent>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QToolButton>
#include <QVBoxLayout>

#include <algorithm>
#include <iterator>
#include <optional>

namespace pelloric::qt {

namespace {

constexpr const char* SlotHints[] = { QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Left"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Center"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Right") };

/// What assistive technology calls the boxes, in their order.
constexpr const char* BoxNames[] = { QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Header left"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Header center"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Header right"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Footer left"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Footer center"),
    QT_TRANSLATE_NOOP("pelloric::qt::PageTextsTab", "Footer right") };
static_assert(std::size(BoxNames) == PageSetupState::FormatBoxes);

/// While Alt is held the boxes show their number; the font boxes follow them.
constexpr char FirstBoxKey = '1';
constexpr char HeaderFontKey = '7';
constexpr char FooterFontKey = '8';

/// Wide enough for every field with its caret: pixels.
int fieldWidth(const QFontMetrics& metrics)
{
    int width = 0;
    for (const FieldEntry& entry : FieldEntries)
        width = std::max(width, metrics.horizontalAdvance(toQString(entry.field)));
    return width + 2 * metrics.averageCharWidth();
}

/// Where an event of a box asks for the menu of fields, on the screen; nothing: it does not.
std::optional<QPoint> menuPlaceOf(const QEvent& event, const QWidget& box)
{
    if (event.type() == QEvent::ContextMenu)
        return static_cast<const QContextMenuEvent&>(event).globalPos();
    if (event.type() != QEvent::KeyPress)
        return std::nullopt;
    const auto& key = static_cast<const QKeyEvent&>(event);
    const bool asks = key.key() == Qt::Key_Down && key.modifiers() == Qt::AltModifier;
    return asks ? std::optional(box.mapToGlobal(QPoint(0, box.height()))) : std::nullopt;
}

} // namespace

PageTextsTab::PageTextsTab(PageSetupState& state, QWidget* parent)
    : QWidget(parent)
    , state_(state)
{
    makeFieldMenu();
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(makeTextsGroup(true, this));
    layout->addWidget(makeTextsGroup(false, this));
    layout->addStretch();
    showFont(true);
    showFont(false);
}

QWidget* PageTextsTab::makeTextsGroup(bool isHeader, QWidget* parent)
{
    auto* frame = new QFrame(parent);
    frame->setObjectName(isHeader ? QStringLiteral("Frame4") : QStringLiteral("Frame5"));
    frame->setFrameShape(QFrame::StyledPanel);
    auto* grid = new QGridLayout(frame);
    const int first = isHeader ? 1 : PageSetupState::FormatBoxes / 2 + 1;
    for (int slot = 0; slot < 3; ++slot) {
        grid->addWidget(makeFormatBox(first + slot, frame), 1, slot);
        grid->setColumnStretch(slot, 1);
    }
    QLineEdit* firstBox = formatBoxes_[static_cast<std::size_t>(first - 1)];
    QLabel* caption = isHeader
        ? captionFor(QStringLiteral("Header"), 'H', firstBox, frame, QStringLiteral("Label3"))
        : captionFor(QStringLiteral("Footer"), 'F', firstBox, frame, QStringLiteral("Label4"));
    grid->addWidget(caption, 0, 0, 1, 3);
    auto* description = new QLineEdit(frame);
    description->setObjectName(
        isHeader ? QStringLiteral("txtHeaderFont") : QStringLiteral("txtFooterFont"));
    description->setReadOnly(true);
    (isHeader ? headerFont_ : footerFont_) = description;
    auto* change = new QPushButton(QStringLiteral("Font..."), frame);
    change->setObjectName(
        isHeader ? QStringLiteral("cmdHeaderFont") : QStringLiteral("cmdFooterFont"));
    change->setAutoDefault(false);
    setAltKey(*change, isHeader ? 'N' : 'T');
    connect(change, &QPushButton::clicked, this, [this, isHeader] { askFont(isHeader); });
    description->setAccessibleName(isHeader ? tr("Header font") : tr("Footer font"));
    setFocusKey(*description, isHeader ? HeaderFontKey : FooterFontKey, *description);
    change->setAccessibleName(
        isHeader ? tr("Change the header font") : tr("Change the footer font"));
    grid->addWidget(description, 2, 0, 1, 2);
    grid->addWidget(change, 2, 2, Qt::AlignLeft);
    return frame;
}

QWidget* PageTextsTab::makeFormatBox(int box, QWidget* parent)
{
    auto* holder = new QWidget(parent);
    const auto index = static_cast<std::size_t>(box - 1);
    const QString hint = tr(SlotHints[index % std::size(SlotHints)]);
    auto* text = new QLineEdit(toQString(state_.formatTexts[index]), holder);
    formatBoxes_[index] = text;
    text->setObjectName(elementName("txtFormat", box));
    text->setPlaceholderText(hint);
    text->setAccessibleName(tr(BoxNames[index]));
    text->setToolTip(tr("The Menu key or Alt+Down opens the fields"));
    setFocusKey(*text, static_cast<char>(FirstBoxKey + index), *text);
    text->setMinimumWidth(fieldWidth(text->fontMetrics()));
    text->setCursorPosition(0);
    text->installEventFilter(this);
    connect(text, &QLineEdit::textChanged, this,
        [this, index](const QString& now) { state_.formatTexts[index] = toText(now); });
    auto* fields = new QToolButton(holder);
    fields->setObjectName(elementName("cmdField", box));
    fields->setArrowType(Qt::DownArrow);
    fields->setFocusPolicy(Qt::NoFocus);
    fields->setToolTip(tr("Put in a field"));
    fields->setAccessibleName(fields->toolTip());
    connect(fields, &QToolButton::clicked, this,
        [this, box, text] { openFieldMenu(box, text->mapToGlobal(QPoint(0, text->height()))); });
    auto* layout = new QHBoxLayout(holder);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(1);
    layout->addWidget(text, 1);
    layout->addWidget(fields);
    return holder;
}

void PageTextsTab::makeFieldMenu()
{
    fields_ = new QMenu(QStringLiteral("PopMenu"), this);
    fields_->setObjectName(QStringLiteral("ActiveBar1"));
    for (std::size_t entry = 0; entry < FieldEntries.size(); ++entry) {
        QAction* action = fields_->addAction(toQString(FieldEntries[entry].caption));
        connect(action, &QAction::triggered, this,
            [this, entry] { chooseField(static_cast<int>(entry)); });
    }
}

bool PageTextsTab::eventFilter(QObject* watched, QEvent* event)
{
    for (std::size_t index = 0; index < formatBoxes_.size(); ++index) {
        if (watched != formatBoxes_[index])
            continue;
        const int box = static_cast<int>(index) + 1;
        if (event->type() == QEvent::FocusIn)
            state_.focusFormatBox(box);
        if (const std::optional<QPoint> place = menuPlaceOf(*event, *formatBoxes_[index])) {
            openFieldMenu(box, *place);
            return true;
        }
        break;
    }
    return QWidget::eventFilter(watched, event);
}

void PageTextsTab::openFieldMenu(int box, const QPoint& globalPosition)
{
    formatBoxes_[static_cast<std::size_t>(box - 1)]->setFocus();
    state_.focusFormatBox(box);
    fields_->popup(globalPosition);
}

void PageTextsTab::chooseField(int entry)
{
    state_.chooseField(entry);
    const int box = state_.lastFormatBox();
    if (box == 0)
        return;
    const auto index = static_cast<std::size_t>(box - 1);
    formatBoxes_[index]->setText(toQString(state_.formatTexts[index]));
}

void PageTextsTab::askFont(bool isHeader)
{
    try {
        if (isHeader)
            state_.setHeaderFont(chooseFont(this, state_.headerFont));
        else
            state_.setFooterFont(chooseFont(this, state_.footerFont));
        showFont(isHeader);
    } catch (const RunTimeError&) {
        // The user cancelled: the font stays.
    }
}

void PageTextsTab::showFont(bool isHeader)
{
    QLineEdit& box = isHeader ? *headerFont_ : *footerFont_;
    box.setText(toQString(isHeader ? state_.headerFontText() : state_.footerFontText()));
    box.setCursorPosition(0);
    showInColor(box, isHeader ? state_.headerFont.color : state_.footerFont.color);
}

} // namespace pelloric::qt
