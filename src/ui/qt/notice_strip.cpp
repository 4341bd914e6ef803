// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#include "ui/qt/notice_strip.h"

#include "platform/qt/qt_text.h"

#include <QAccessible>
#include <QBoxLayout>
#include <QEvent>
#include <QGuiApplication>
#include <QLabel>
#include <QPushButton>
#include <QStyle>
#include <QToolButton>

namespace pelloric::qt {

namespace {

constexpr int IconSize = 24; ///< pixels
constexpr int DarkGround = 128; ///< a window below this lightness is a dark one; 0 to 255

struct StripColors {
    QColor ground;
    QColor ink;
};

const StripColors LightColors { QColor(0xFF, 0xF4, 0xCE), QColor(0x33, 0x2A, 0x00) };
const StripColors DarkColors { QColor(0x43, 0x35, 0x19), QColor(0xFF, 0xF4, 0xCE) };

QPushButton* makeButton(const char* name, const QString& text, const QString& tip, QWidget* parent)
{
    auto* const button = new QPushButton(text, parent);
    button->setObjectName(QLatin1String(name));
    button->setToolTip(tip);
    button->setAutoDefault(false);
    return button;
}

} // namespace

NoticeStrip::NoticeStrip(QWidget* parent)
    : QFrame(parent)
    , icon_(new QLabel(this))
    , text_(new QLabel(this))
    , pageSetup_(makeButton("cmdNoticePageSetup", tr("Page &Setup..."),
          tr("Change paper, margins, header and footer"), this))
    , gridStyle_(makeButton("cmdNoticeGridStyle", tr("&Design Report..."),
          tr("Change fonts, colours and grid lines"), this))
    , defaults_(makeButton("cmdNoticeDefaults", tr("Restore De&faults"),
          tr("Give every setting that is missing or cannot be used its default value; the old "
             "file is kept beside"),
          this))
{
    setObjectName(QStringLiteral("Notice"));
    setAccessibleName(tr("Notice"));
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    text_->setObjectName(QStringLiteral("labNotice"));
    text_->setAccessibleName(tr("Notice"));
    text_->setTextFormat(Qt::PlainText);
    text_->setWordWrap(true);
    text_->setTextInteractionFlags(Qt::TextSelectableByMouse);
    text_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    auto* const close = new QToolButton(this);
    close->setObjectName(QStringLiteral("cmdNoticeClose"));
    close->setText(QStringLiteral("✕"));
    close->setAutoRaise(true);
    close->setToolTip(tr("Hide this notice"));
    close->setAccessibleName(tr("Hide this notice"));
    auto* const buttons = new QHBoxLayout;
    for (QPushButton* const button : { pageSetup_, gridStyle_, defaults_ })
        buttons->addWidget(button);
    buttons->addStretch();
    auto* const middle = new QVBoxLayout;
    middle->addWidget(text_);
    middle->addLayout(buttons);
    auto* const layout = new QHBoxLayout(this);
    layout->addWidget(icon_, 0, Qt::AlignTop);
    layout->addLayout(middle, 1);
    layout->addWidget(close, 0, Qt::AlignTop);
    connect(pageSetup_, &QPushButton::clicked, this, &NoticeStrip::pageSetupAsked);
    connect(gridStyle_, &QPushButton::clicked, this, &NoticeStrip::gridStyleAsked);
    connect(defaults_, &QPushButton::clicked, this, &NoticeStrip::defaultsAsked);
    connect(close, &QToolButton::clicked, this, &NoticeStrip::dismissed);
    chooseColors();
    drawIcon();
    hide();
}

void NoticeStrip::showNotice(const std::optional<PreviewNotice>& notice)
{
    if (notice == shown_)
        return;
    shown_ = notice;
    setVisible(notice.has_value());
    if (!notice)
        return;
    text_->setText(toQString(notice->text));
    pageSetup_->setVisible(notice->offersPageSetup);
    gridStyle_->setVisible(notice->offersGridStyle);
    defaults_->setVisible(notice->offersDefaults);
    text_->setAccessibleName(text_->text());
    setAccessibleDescription(text_->text());
    QAccessibleEvent alert(this, QAccessible::Alert);
    QAccessible::updateAccessibility(&alert);
}

void NoticeStrip::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::StyleChange)
        drawIcon();
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::StyleChange)
        chooseColors();
}

/// Dark on pale yellow, or the other way round where windows are dark.
void NoticeStrip::chooseColors()
{
    if (choosesColors_)
        return;
    choosesColors_ = true;
    const QPalette system = QGuiApplication::palette();
    const bool isDark = system.color(QPalette::Window).lightness() < DarkGround;
    const StripColors& colors = isDark ? DarkColors : LightColors;
    QPalette palette = this->palette();
    palette.setColor(QPalette::Window, colors.ground);
    palette.setColor(QPalette::WindowText, colors.ink);
    setPalette(palette);
    for (QPushButton* const button : { pageSetup_, gridStyle_, defaults_ })
        button->setPalette(system);
    choosesColors_ = false;
}

void NoticeStrip::drawIcon()
{
    const QIcon icon = style()->standardIcon(QStyle::SP_MessageBoxWarning, nullptr, this);
    icon_->setPixmap(icon.pixmap(QSize(IconSize, IconSize), devicePixelRatioF()));
}

} // namespace pelloric::qt
