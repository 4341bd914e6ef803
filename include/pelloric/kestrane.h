// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

/// @file
/// `Kestrane`, the facade: a small control that previews a grid in the preview window.
///
/// @code
/// auto* preview = new pelloric::qt::Kestrane(form);
/// preview->AddFooter("[Page # of Pages #]", pelloric::AlignmentType::LocRight);
/// connect(button, &QPushButton::clicked, preview, [=] { preview->doPreview(tableView); });
/// @endcode

#include <pelloric/options.h>
#include <pelloric/version.h>

#include <QVariant>
#include <QWidget>

#include <cstdint>
#include <memory>

namespace pelloric {

class AutomationObject;
class PreviewOpener;
struct ReportOptions;

} // namespace pelloric

namespace pelloric::qt {

class QtPlatform;

/// What a program may hand to members of `Kestrane` by name besides variants.
///
/// Each checks its numbers as the member itself does. They are private, so that no script sees
/// them.
class PELLORIC_EXPORT KestraneCalls : public QWidget {
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

/// The facade: previews a grid in the preview window, and keeps header, footer and switches.
///
/// Every member is published by its name, too, and takes and answers variants there. No error
/// leaves a member: it becomes an error of the script that the control belongs to, or a message
/// box.
class PELLORIC_EXPORT Kestrane : public KestraneCalls {
    Q_OBJECT
    Q_PROPERTY(
        QVariant ShowHeader READ getShowHeader WRITE putShowHeader DESIGNABLE false STORED false)
    Q_PROPERTY(QVariant MarvenStartRow READ getMarvenStartRow WRITE putMarvenStartRow
            DESIGNABLE false STORED false)
    Q_PROPERTY(
        QVariant MergeGrid READ getMergeGrid WRITE putMergeGrid DESIGNABLE false STORED false)

public:
    /// Slots of a header or footer line, by name for scripts.
    enum AlignmentType { LocLeft, LocCenter, LocRight };
    Q_ENUM(AlignmentType)

    /// A facade on the default services.
    Q_INVOKABLE explicit Kestrane(QWidget* parent = nullptr);
    /// @param platform  outlives the control
    explicit Kestrane(QtPlatform& platform, QWidget* parent = nullptr);
    ~Kestrane() override;

    /// Who opens the preview window of this control.
    /// @param opener  borrowed; null: the default one
    void setPreviewOpener(PreviewOpener* opener);

    /// Who opens the preview window of every control that was given nobody else.
    /// @param opener  borrowed, or null
    static void setDefaultPreviewOpener(PreviewOpener* opener);

    /// What the previews of this control do beyond the plain page; everything is off at first. What
    /// people switch in the window holds until the next preview.
    void setReportOptions(const ReportOptions& options);
    /// What was set last.
    const ReportOptions& reportOptions() const;

    /// Previews a grid in the preview window, which keeps the adapter.
    void doPreview(std::unique_ptr<AutomationObject> PrintObj);
    /// The same with a view or any object that publishes a grid's members.
    /// @param PrintObj  borrowed as long as the window shows it
    void doPreview(QObject* PrintObj);

    /// Writes a text of the line above every page into the settings file, where it stays for later
    /// previews of all programs. A file that cannot be written is passed over without a word.
    /// @param strHeader  may hold one of the fields, as "[Page #]"; line breaks become blanks
    void AddHeader(const QString& strHeader, pelloric::AlignmentType Location);
    /// The same for the line below every page.
    void AddFooter(const QString& strFooter, pelloric::AlignmentType Location);

    /// Whether the row of column titles is printed; what was set last on this control, false at
    /// first. Setting it writes the settings file as `AddHeader` does.
    bool ShowHeader() const;
    /// Writes what the member of that name answers.
    void setShowHeader(bool show);

    /// The first row of a flex grid that is printed, 1 at first and again with every new facade;
    /// one value for all of them.
    std::int32_t MarvenStartRow() const;
    /// Writes what the member of that name answers.
    void setMarvenStartRow(std::int32_t row);

    /// Whether equal neighbouring cells are printed once; like `ShowHeader`.
    bool MergeGrid() const;
    /// Writes what the member of that name answers.
    void setMergeGrid(bool merge);

    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void doPreview(const QVariant& PrintObj);
    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void AddHeader(const QVariant& strHeader, const QVariant& Location);
    /// The same for callers by name: the variants are checked.
    Q_INVOKABLE void AddFooter(const QVariant& strFooter, const QVariant& Location);

    /// As every widget has it.
    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QVariant getShowHeader() const { return ShowHeader(); }
    QVariant getMarvenStartRow() const { return MarvenStartRow(); }
    QVariant getMergeGrid() const { return MergeGrid(); }
    void putShowHeader(const QVariant& value);
    void putMarvenStartRow(const QVariant& value);
    void putMergeGrid(const QVariant& value);

    struct Parts;
    std::unique_ptr<Parts> parts_;
};

} // namespace pelloric::qt
