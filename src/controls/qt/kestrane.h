// SPDX-FileCopyrightText: The Pelloric authors
// SPDX-License-Identifier: MIT

#pragma once

#include "controls/facade.h"
#include "controls/qt/member_calls.h"
#include "controls/qt/plain_calls.h"

#include <QVariant>

#include <memory>

namespace pelloric::qt {

class QtPlatform;

/// The facade: previews a grid in the preview window, and keeps header, footer and switches.
///
/// Every member is published by its name, too, and takes and answers variants there. No error
/// leaves a member: it becomes an error of the script that the control belongs to, or a message
/// box.
class Kestrane : public KestraneCalls {
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

    /// Previews a grid in the preview window, which keeps the adapter.
    void doPreview(std::unique_ptr<AutomationObject> PrintObj);
    /// The same with a view or any object that publishes a grid's members.
    /// @param PrintObj  borrowed as long as the window shows it
    void doPreview(QObject* PrintObj);
    void AddHeader(const QString& strHeader, pelloric::AlignmentType Location);
    void AddFooter(const QString& strFooter, pelloric::AlignmentType Location);
    bool ShowHeader() const;
    void setShowHeader(bool show);
    std::int32_t MarvenStartRow() const;
    void setMarvenStartRow(std::int32_t row);
    bool MergeGrid() const;
    void setMergeGrid(bool merge);

    Q_INVOKABLE void doPreview(const QVariant& PrintObj);
    Q_INVOKABLE void AddHeader(const QVariant& strHeader, const QVariant& Location);
    Q_INVOKABLE void AddFooter(const QVariant& strFooter, const QVariant& Location);

    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    struct Parts;

    QVariant getShowHeader() const { return ShowHeader(); }
    QVariant getMarvenStartRow() const { return MarvenStartRow(); }
    QVariant getMergeGrid() const { return MergeGrid(); }
    void putShowHeader(const QVariant& value);
    void putMarvenStartRow(const QVariant& value);
    void putMergeGrid(const QVariant& value);

    std::shared_ptr<Parts> parts_; ///< shared with the members that run
    Facade& facade_; ///< one of the parts
    MemberCalls calls_;
};

} // namespace pelloric::qt
